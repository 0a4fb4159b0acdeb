#include "robotconfig/drive_serial_network/ProgramTypes.h"

#include "robotconfig/host/DeviceCatalog.h"

namespace {

constexpr uint32_t kVexAndBoards = 0x29C;  // kinds 2, 3, 4, 7, 9
constexpr uint32_t kVexI2cAndArduino = 0x18;  // kinds 3, 4
constexpr uint32_t kVexPicAndArduino = 0x14;  // kinds 2, 4

// A row: platform mask, value, keyword, label, row attribute.
constexpr TDeviceTypeMenuItem row(uint32_t nMask, int32_t nValue, const wchar_t *pzKeyword, const wchar_t *pzLabel,
                                  int32_t nRowAttribute = 0) {
  return {nMask, 0, 0, 0, 0, 0xFE, nRowAttribute, nValue, pzKeyword, pzLabel, 0};
}

}  // namespace

const TDeviceTypeMenuItem nProgramTypes[] = {
    row(kVexAndBoards, 255, L"NotYetAssigned", L"NotAssigned"),
    row(kVexI2cAndArduino, 1, L"StandaloneWithWiFi", L"Standalone via WiFi link"),
    row(kVexI2cAndArduino, 2, L"StandaloneWithUSBCable", L"Standalonevia USB Cable"),
    row(kVexI2cAndArduino, 1, L"StandaloneWiFi", L"Standalone via WiFi link", 5),
    row(kVexI2cAndArduino, 2, L"StandaloneUSBCable", L"Standalonevia USB Cable", 5),
    row(kVexAndBoards, 3, L"Competition", L"Competition"),
    row(kVexI2cAndArduino, 4, L"CompetitionAutonomous", L"Competition: Autonomous Only", 5),
    row(kVexI2cAndArduino, 3, L"CompetitionUserControl", L"Competition: User Control Only", 5),
    row(kVexAndBoards, 1, L"NonCompetition", L"NonCompetition", 5),
    row(kVexPicAndArduino, 2, L"StandaloneWithUSBCable", L"Standalone"),
    row(kVexPicAndArduino, 4, L"CompetitionAutonomous", L"Competition: Autonomous Only"),
    row(kVexPicAndArduino, 5, L"CompetitionUserControl", L"Competition: User Control Only", 3),
    {0, 0, 0, 0, 0, 0, 0, 0, nullptr, nullptr, 0},
};
