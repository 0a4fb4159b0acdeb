#include "robotconfig/sensors/ControllerBoards.h"

#include <algorithm>
#include <array>
#include <cstddef>

#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/drive_serial_network/ProgramTypes.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/Platform.h"

namespace {

constexpr uint32_t kArduinoOnly = 1u << platformArduino;

// A row of the plug-in board table: value, keyword, label.
constexpr TDeviceTypeMenuItem pluginRow(int32_t nValue, const wchar_t *pzKeyword, const wchar_t *pzLabel) {
  return {kArduinoOnly, 0, 0, 0, 0, 0xFE, 0, nValue, pzKeyword, pzLabel, 0};
}

// Pins the boards reserve: their system UART (type 60) and one fixed pin (65).
constexpr std::array<TBoardFixedPin, 3> kFixedPinsUnoLayout = {{{60, 6}, {60, 7}, {65, 19}}};
constexpr std::array<TBoardFixedPin, 3> kFixedPinsMegaLayout = {{{60, 16}, {60, 17}, {65, 29}}};

struct TBoardFixedPins {
  TControllerBoardType nBoard;
  const std::array<TBoardFixedPin, 3> *pPins;
};

constexpr std::array<TBoardFixedPins, 19> kBoardFixedPins = {{
    {8, &kFixedPinsUnoLayout},   {9, &kFixedPinsUnoLayout},   {10, &kFixedPinsUnoLayout},
    {11, &kFixedPinsUnoLayout},  {14, &kFixedPinsUnoLayout},  {15, &kFixedPinsUnoLayout},
    {16, &kFixedPinsUnoLayout},  {17, &kFixedPinsUnoLayout},  {18, &kFixedPinsUnoLayout},
    {19, &kFixedPinsUnoLayout},  {20, &kFixedPinsUnoLayout},  {21, &kFixedPinsUnoLayout},
    {22, &kFixedPinsUnoLayout},  {23, &kFixedPinsUnoLayout},  {27, &kFixedPinsUnoLayout},
    {28, &kFixedPinsUnoLayout},  {12, &kFixedPinsMegaLayout}, {13, &kFixedPinsMegaLayout},
    {24, &kFixedPinsMegaLayout},
}};

// Boards whose programs run on one another unchanged.
constexpr std::array<TControllerBoardType, 3> kUnoCompatibleBoards = {10, 11, 27};

// Boards that come with their platform and so need no CircuitBoardType line.
constexpr std::array<TControllerBoardType, 6> kPlatformOwnBoards = {0, 1, 2, 5, 6, 7};

// Program types the VEX PIC writes on its ProgramType line.
constexpr int kFirstWrittenProgramType = 1;
constexpr int kLastWrittenProgramType = 4;

template <class T, std::size_t N>
bool bContains(const std::array<T, N> &values, T value) {
  for (const T &v : values)
    if (v == value) return true;
  return false;
}

}  // namespace

const TDeviceTypeMenuItem nPluginCircuitBoardTypes[] = {
    pluginRow(0, L"typePluginBoardNone", L"None"),
    pluginRow(4, L"typeShieldParallaxBoeBot", L"Parallax Boe Bot Shield"),
    pluginRow(1, L"typeShieldDFRobotMotor", L"DFRobot Motor"),
    pluginRow(2, L"typeShieldDFRobotMotorOld", L"DFRobot Motor (Old)"),
    pluginRow(3, L"typeShieldSparkfunArdumoto", L"Sparkfun Ardumoto"),
    {0, 0, 0, 0, 0, 0, 0, 0, nullptr, nullptr, 0},
};

TBoardFixedPinList getControllerBoardFixedPins(TControllerBoardType nBoard) {
  for (const TBoardFixedPins &board : kBoardFixedPins)
    if (board.nBoard == nBoard) return {board.pPins->data(), static_cast<int32_t>(board.pPins->size())};
  return {nullptr, 0};
}

void CRobotConfigurationBasic::setDefaultFixedIOPinsForControllerBoard() {
  // Only this board's pins are claimed; pins an earlier board fixed are left as they are.
  const TBoardFixedPinList pins = getControllerBoardFixedPins(settings.nCircuitBoardType);
  for (int i = 0; i < pins.nCount; ++i) {
    const TBoardFixedPin &pin = pins.pPins[i];
    if (!bIsSensorIndex(pin.nSensorPort)) continue;
    if (settings.nSensorTypes[size_t(pin.nSensorPort)] == pin.nSensorType) continue;
    setSensorTypeInConfig(pin.nSensorPort, pin.nSensorType);
  }
}

void CRobotConfigurationBasic::setCircuitBoardType(TControllerBoardType nBoard) {
  settings.nCircuitBoardType = nBoard;
  updateCircuitBoardType();
}

void CRobotConfigurationBasic::updateCircuitBoardType() {
  setDefaultCircuitBoardCpuTypeAndClockSpeed();
  setDefaultFixedIOPinsForControllerBoard();
  setDefaultMotorIOPinsForControllerBoard();
  updateDefaultMotorNamesForIOPins();
}

void CRobotConfigurationBasic::updateCircuitBoardAndPlugInBoardTypes() {
  updateCircuitBoardType();
  // Applied after the board's own table, so that a shield's motor pins replace the board's.
  for (int nSlot = 0; nSlot < kNumbOfPluginSlots; ++nSlot) setDefaultMotorIOPinsForPlugInBoard(nSlot);
}

void CRobotConfigurationBasic::setDefaultCircuitBoardCpuTypeAndClockSpeed() {
  const TCktBoardInfo *pBoard = getCircuitBoardInfo(settings.nCircuitBoardType);
  settings.nCpuClockSpeed = pBoard ? pBoard->nDefaultCpuClockSpeed : 0;
}

bool CRobotConfigurationBasic::bAreCktBoardTypesFullyCompatible(TControllerBoardType nBoardA,
                                                                TControllerBoardType nBoardB) {
  if (bContains(kUnoCompatibleBoards, nBoardA)) return bContains(kUnoCompatibleBoards, nBoardB);
  return nBoardA == nBoardB;
}

void CRobotConfigurationBasic::modifyBoardTypeIfDifferentFromIDESetting() {
  const TControllerBoardType nIdeBoard = pToggles->getIDECircuitBoardType();
  const TControllerBoardType nConfigBoard = settings.nCircuitBoardType;
  if (bAreCktBoardTypesFullyCompatible(nIdeBoard, nConfigBoard) || nConfigBoard == 0) return;
  CString sMessage;
  sMessage.Format(L"IDE Circuit Board type is being changed from '%s' to '%s' to match '#pragma config...' "
                  L"definition in user application program.",
                  getCktBoardNameString(nIdeBoard), getCktBoardNameString(nConfigBoard));
  myAppMessageBoxString(sMessage, kMessageStyleError);
  pToggles->setIDEPlatformAndCircuitBoardType(pToggles->getPlatformKind(), nConfigBoard,
                                              pToggles->getPlatformSelectionOptions());
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineCPUType(const TTokenizedConfigParms &parms, bool, TLineNumber,
                                                                 CString &sError) {
  const TPlatformParms &platform = *pPlatformData->pPlatformParms;
  if (!platform.bSupportsBoardTypeSelection) {
    sError.Format(L"Selected platform '%s' does not support programmable 'Board Type' selection",
                  platform.pPlatformName);
    return false;
  }
  const int nBoard = std::max(getTypedefIndex(getArduinoCircuitBoardTypeMenuDefn(), parms.sParms[1], true), 0);
  if (nBoard == settings.nCircuitBoardType) return true;
  setCircuitBoardType(nBoard);
  updateCircuitBoardAndPlugInBoardTypes();
  return true;
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLinePluginBoardType(const TTokenizedConfigParms &parms, bool,
                                                                         TLineNumber, CString &) {
  // A shield goes into the first free slot; with all three taken it is dropped.
  const int nPlugin = getTypedefIndex(nPluginCircuitBoardTypes, parms.sParms[1], true);
  if (nPlugin >= 1 && nPlugin <= 4) {
    for (int32_t &nSlot : settings.nPluginBoardTypes)
      if (nSlot == 0) {
        nSlot = nPlugin;
        break;
      }
  }
  // The board stays the same, so its clock does too: the generated block puts
  // CPU_Parameters before these lines, and re-applying the board would reset it.
  const int32_t nCpuClockSpeed = settings.nCpuClockSpeed;
  updateCircuitBoardAndPlugInBoardTypes();
  settings.nCpuClockSpeed = nCpuClockSpeed;
  return true;
}

bool CRobotConfigurationBasic::buildSourceCodeForCircuitBoardType() {
  if (bContains(kPlatformOwnBoards, settings.nCircuitBoardType)) return false;
  // A board without a word on this platform cannot be named; an empty word would make a line no reader accepts.
  const wchar_t *pzBoard = getTypedefEnumString(getArduinoCircuitBoardTypeMenuDefn(), settings.nCircuitBoardType, -1);
  if (!pzBoard || !*pzBoard) return false;
  CString sLine;
  sLine.Format(L"#pragma config(%s, %s)", TConfigTypeDefns::getConfigTypeName(configTypeCircuitBoardType), pzBoard);
  addSourceLineToConfiguration(sLine);
  return true;
}

bool CRobotConfigurationBasic::buildSourceCodeForPluginBoards() {
  if (pToggles->getPlatformKind() != platformArduino) return false;
  bool bWritten = false;
  CString sLine;
  for (const int32_t nPlugin : settings.nPluginBoardTypes) {
    if (nPlugin < 1 || nPlugin > 4) continue;
    sLine.Format(L"#pragma config(%s, %s)", TConfigTypeDefns::getConfigTypeName(configTypePluginCircuitBoard),
                 getTypedefEnumString(nPluginCircuitBoardTypes, nPlugin, -1));
    addSourceLineToConfiguration(sLine);
    bWritten = true;
  }
  return bWritten;
}

bool CRobotConfigurationBasic::buildSourceCodeForIFIParms() {
  if (pToggles->getPlatformKind() != platformVexPic) return false;
  const int nProgramType = settings.nProgramType;
  if (nProgramType < kFirstWrittenProgramType || nProgramType > kLastWrittenProgramType) return false;
  CString sLine;
  sLine.Format(L"#pragma config(%s, %s)", TConfigTypeDefns::getConfigTypeName(configTypeProgramType),
               getTypedefEnumString(nProgramTypes, nProgramType, -1));
  addSourceLineToConfiguration(sLine);
  return true;
}

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
