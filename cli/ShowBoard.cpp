// The board part of `show`: the CPU, the board's word, the pins the board
// reserves and the plug-in boards.
#include <string>

#include "cli/Commands.h"
#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/sensors/ControllerBoards.h"

namespace {

/// Appends one formatted line.
template <class... Args>
void appendLine(std::string &sOut, const wchar_t *pzFormat, const Args &...args) {
  CString sLine;
  sLine.Format(pzFormat, args...);
  sOut += sLine.toUtf8();
  sOut += '\n';
}

/// Label of a menu row's value, or its word when the row has no label; "" when none.
CString menuLabel(const TDeviceTypeMenuItem *pTable, int nValue) {
  for (const TDeviceTypeMenuItem *pRow = pTable; pRow && pRow->nPlatformMask != 0; ++pRow)
    if (pRow->nValue == nValue && pRow->pzLabel) return CString(pRow->pzLabel);
  return CString(getTypedefEnumString(pTable, nValue, -1));
}

/// The board's reserved pins as "port type" pairs, noting a pin that now holds something else.
void printFixedPins(const CRobotConfigurationBasic &config, std::string &sOut) {
  const TControllerBoardType nBoard = config.getCircuitBoardType();
  const TBoardFixedPinList pins = getControllerBoardFixedPins(nBoard);
  if (pins.nCount == 0) return;
  sOut += "Fixed pins:\n";
  for (int i = 0; i < pins.nCount; ++i) {
    const TBoardFixedPin &pin = pins.pPins[i];
    const TSensorTypes nNow = config.getSensorTypeInConfig(pin.nSensorPort);
    CString sPort(getSensorPortString(pin.nSensorPort, nBoard));
    if (sPort.IsEmpty()) sPort.Format(L"%d", pin.nSensorPort);
    if (nNow == pin.nSensorType)
      appendLine(sOut, L"  %-8s %s", sPort, getSensorTypeString(pin.nSensorType));
    else
      appendLine(sOut, L"  %-8s %s (now %s)", sPort, getSensorTypeString(pin.nSensorType), getSensorTypeString(nNow));
  }
}

/// The filled plug-in slots; only the Arduino platform takes plug-in boards.
void printPluginBoards(const CRobotConfigurationBasic &config, std::string &sOut) {
  if (config.getSettings().nPlatformKind != platformArduino) return;
  std::string sRows;
  const auto &slots = config.getSettings().nPluginBoardTypes;
  for (size_t nSlot = 0; nSlot < slots.size(); ++nSlot) {
    if (slots[nSlot] == 0) continue;
    appendLine(sRows, L"  slot %d  %-26s %s", static_cast<int>(nSlot) + 1,
               getTypedefEnumString(nPluginCircuitBoardTypes, slots[nSlot], -1),
               menuLabel(nPluginCircuitBoardTypes, slots[nSlot]));
  }
  if (sRows.empty()) {
    sOut += "Plug-in boards: none\n";
    return;
  }
  sOut += "Plug-in boards:\n";
  sOut += sRows;
}

}  // namespace

void printBoardDetails(CRobotConfigurationBasic &config, std::string &sOut) {
  const TControllerBoardType nBoard = config.getCircuitBoardType();
  if (const TCktBoardInfo *pInfo = getCircuitBoardInfo(nBoard))
    appendLine(sOut, L"CPU: %s, default clock %d", pInfo->pCpuTypeName, pInfo->nDefaultCpuClockSpeed);
  const CString sWord(getTypedefEnumString(getArduinoCircuitBoardTypeMenuDefn(), nBoard, -1));
  if (!sWord.IsEmpty()) appendLine(sOut, L"Board keyword: %s", sWord);
  printFixedPins(config, sOut);
  printPluginBoards(config, sOut);
}
