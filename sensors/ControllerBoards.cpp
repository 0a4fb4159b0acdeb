#include "core/PendingKeywords.h"
#include "core/RobotConfiguration.h"
#include "host/Platform.h"

namespace {

struct TFixedPin {
  TSensorTypes nSensorType;
  int nSensorPort;
};

// Pins the boards reserve: their system UART (type 60) and one fixed pin (65).
constexpr TFixedPin kFixedPinsUnoLayout[] = {{60, 6}, {60, 7}, {65, 19}};
constexpr TFixedPin kFixedPinsMegaLayout[] = {{60, 16}, {60, 17}, {65, 29}};

struct TBoardFixedPins {
  TControllerBoardType nBoard;
  const TFixedPin *pPins;
  int nCount;
};

template <std::size_t N>
constexpr TBoardFixedPins boardPins(TControllerBoardType nBoard, const TFixedPin (&pins)[N]) {
  return {nBoard, pins, static_cast<int>(N)};
}

constexpr TBoardFixedPins kBoardFixedPins[] = {
    boardPins(8, kFixedPinsUnoLayout),   boardPins(9, kFixedPinsUnoLayout),   boardPins(10, kFixedPinsUnoLayout),
    boardPins(11, kFixedPinsUnoLayout),  boardPins(14, kFixedPinsUnoLayout),  boardPins(15, kFixedPinsUnoLayout),
    boardPins(16, kFixedPinsUnoLayout),  boardPins(17, kFixedPinsUnoLayout),  boardPins(18, kFixedPinsUnoLayout),
    boardPins(19, kFixedPinsUnoLayout),  boardPins(20, kFixedPinsUnoLayout),  boardPins(21, kFixedPinsUnoLayout),
    boardPins(22, kFixedPinsUnoLayout),  boardPins(23, kFixedPinsUnoLayout),  boardPins(27, kFixedPinsUnoLayout),
    boardPins(28, kFixedPinsUnoLayout),  boardPins(12, kFixedPinsMegaLayout), boardPins(13, kFixedPinsMegaLayout),
    boardPins(24, kFixedPinsMegaLayout),
};

}  // namespace

void CRobotConfigurationBasic::setDefaultFixedIOPinsForControllerBoard() {
  for (const TBoardFixedPins &board : kBoardFixedPins) {
    if (board.nBoard != settings.nCircuitBoardType) continue;
    for (int i = 0; i < board.nCount; ++i) {
      const TFixedPin &pin = board.pPins[i];
      if (pin.nSensorPort < 0 || pin.nSensorPort >= kMaxNumbOfSensorPorts) continue;
      setSensorTypeInConfig(pin.nSensorPort, pin.nSensorType);
    }
  }
}

void CRobotConfigurationBasic::setCircuitBoardType(TControllerBoardType) {}
void CRobotConfigurationBasic::updateCircuitBoardType() {}
void CRobotConfigurationBasic::updateCircuitBoardAndPlugInBoardTypes() {}
void CRobotConfigurationBasic::setDefaultCircuitBoardCpuTypeAndClockSpeed() {}
bool CRobotConfigurationBasic::bAreCktBoardTypesFullyCompatible(TControllerBoardType, TControllerBoardType) {
  return false;
}
void CRobotConfigurationBasic::modifyBoardTypeIfDifferentFromIDESetting() {}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineCPUType(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLinePluginBoardType(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::buildSourceCodeForCircuitBoardType() { return false; }
bool CRobotConfigurationBasic::buildSourceCodeForPluginBoards() { return false; }
bool CRobotConfigurationBasic::buildSourceCodeForIFIParms() { return false; }

bool CRobotConfigurationBasic::buildSourceCodeForCpuTypeAndClockSpeed() {
  if (pToggles->getPlatformKind() != platformArduino) return false;
  const TCktBoardInfo *pBoard = getCircuitBoardInfo(settings.nCircuitBoardType);
  if (!pBoard || settings.nCpuClockSpeed == pBoard->nDefaultCpuClockSpeed) return false;
  CString sLine;
  sLine.Format(L"#pragma config(%s, %s, %d)", TConfigTypeDefns::getConfigTypeName(configTypeCpuParameters),
               pBoard->pCpuTypeName, settings.nCpuClockSpeed);
  addSourceLineToConfiguration(sLine);
  return true;
}
