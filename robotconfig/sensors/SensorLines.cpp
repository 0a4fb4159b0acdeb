#include <algorithm>
#include <array>
#include <initializer_list>

#include "robotconfig/core/ParameterText.h"
#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"

namespace {

// Types a Sensor line names without storing anything: pins that motors,
// serial ports and boards claim for themselves.
constexpr std::array<TSensorTypes, 10> kClaimedPinTypes = {57, 58, 59, 60, 61, 62, 64, 65, 66, 91};
// Types the Sensor writer leaves out: second halves of two-port sensors (their
// partner's line brings them back) and claimed pins.
constexpr std::array<TSensorTypes, 12> kTypesNotWritten = {56, 57, 58, 59, 60, 61, 62, 64, 65, 66, 81, 91};
// Types whose I2C column is "AutoAssign".
constexpr std::array<TSensorTypes, 2> kAutoAssignedI2CTypes = {67, 68};
// Types whose I2C column is their bus address.
constexpr std::array<TSensorTypes, 4> kAddressedI2CTypes = {69, 70, 71, 72};
// Types of a port that has no sensor a rename line could rename.
constexpr std::array<TSensorTypes, 3> kTypesWithoutSensor = {0, 56, 81};

constexpr const wchar_t *kAutoAssign = L"AutoAssign";
constexpr const wchar_t *kClosingParenthesis = L")";

// The parameter after the type: the mode, or the column that moves up in its place.
constexpr int kFirstColumnAfterType = 4;

// True when `value` is one of `values`.
template <class T, size_t N>
bool bIsOneOf(const std::array<T, N> &values, T value) {
  return std::find(values.begin(), values.end(), value) != values.end();
}

// Parameter n of a tokenized line; empty past the last token slot.
const CString &parameter(const TTokenizedConfigParms &parms, int n) {
  static const CString sNone;
  return (n >= 0 && n < kMaxConfigTokens) ? parms.sParms[size_t(n)] : sNone;
}

// True when the text is a mode keyword of the sensor type.
bool bIsModeOfType(TSensorTypes nType, const CString &sText) {
  return !sText.IsEmpty() && getSensorModeIndex(nType, sText, true) != -1;
}

// True when the text can only be an I2C column: "AutoAssign" or a number, and
// no secondary-port keyword.
bool bIsI2CColumnOnly(const CString &sText) {
  bool bNumber = false;
  getInteger(sText, bNumber);
  return (sText == kAutoAssign || bNumber) && getSecondaryPortIndex(sText) == -1;
}

// The I2C column the writer gives a port: "AutoAssign", the address, or empty.
CString i2cColumn(TSensorTypes nType, int nAddress) {
  CString sColumn;
  if (bIsOneOf(kAutoAssignedI2CTypes, nType)) sColumn = kAutoAssign;
  else if (bIsOneOf(kAddressedI2CTypes, nType)) sColumn.Format(L"%d", nAddress);
  return sColumn;
}

}  // namespace

bool CRobotConfigurationBasic::bParseConfigDefinitionLineSensor(const TTokenizedConfigParms &parms, bool,
                                                                TLineNumber line, CString &sError) {
  const CString &sPortWord = parms.sParms[1];
  const int nPort = getIndexForSensorName(sPortWord);
  if (!bIsSensorIndex(nPort)) {
    sError.Format(L"Bad sensor device index '%s'", sPortWord);
    return false;
  }
  if (sPortWord != ::getSensorPortString(nPort, settings.nCircuitBoardType)) parseInfo.bNonCanonicalPortNames = true;

  const TSensorTypes nType = getSensorTypeIndex(parms.sParms[3], true);
  setSensorModeInConfig(nPort, 0);
  if (nType == 0) {
    setUserDefinedSensorNameInConfig(nPort, parms.sParms[2], line);
    return true;
  }
  if (bIsOneOf(kClaimedPinTypes, nType)) return true;
  setUserDefinedSensorNameInConfig(nPort, parms.sParms[2], line);
  setSensorTypeInConfig(nPort, nType);
  setSensorDefinitionLine(nPort, line);

  // The mode normally follows the type; without it the secondary port and
  // the I2C address move up one place. An empty fourth parameter stands for
  // an empty mode column.
  const CString &sFourth = parameter(parms, kFirstColumnAfterType);
  int nSecondaryAt = kFirstColumnAfterType + 1;
  int nI2CAt = kFirstColumnAfterType + 2;
  bool bModeRead = false;
  if (sFourth == kClosingParenthesis) {
    nSecondaryAt = kFirstColumnAfterType;
    nI2CAt = kFirstColumnAfterType + 1;
  } else if (sFourth.IsEmpty()) {
    // The writer leaves the fourth parameter empty for a sensor without a
    // secondary port whose I2C column follows: the address is then the fifth
    // parameter, which as a secondary port reads as none.
    const CString &sSixth = parameter(parms, kFirstColumnAfterType + 2);
    if (bIsI2CColumnOnly(parameter(parms, kFirstColumnAfterType + 1)) &&
        (sSixth.IsEmpty() || bIsModeOfType(nType, sSixth)))
      nI2CAt = kFirstColumnAfterType + 1;
  } else {
    const TSensorModes nMode = getSensorModeIndex(nType, sFourth, true);
    if (nMode != -1) {
      setSensorModeInConfig(nPort, nMode);
      bModeRead = true;
    } else {
      nSecondaryAt = kFirstColumnAfterType;
      nI2CAt = kFirstColumnAfterType + 1;
    }
  }

  // The writer puts the mode last, after the secondary-port and I2C columns:
  // a mode keyword there is the mode, and one in the I2C place means the line
  // has no I2C column.
  bool bHasI2CColumn = true;
  if (!bModeRead) {
    for (int n : {nI2CAt, nI2CAt + 1}) {
      if (!bIsModeOfType(nType, parameter(parms, n))) continue;
      setSensorModeInConfig(nPort, getSensorModeIndex(nType, parameter(parms, n), true));
      bHasI2CColumn = n != nI2CAt;
      break;
    }
  }

  const CString &sSecondary = parameter(parms, nSecondaryAt);
  if (sSecondary != kClosingParenthesis && !sSecondary.IsEmpty())
    setSecondaryPort(nPort, getSecondaryPortIndex(sSecondary));

  const CString &sI2C = parameter(parms, nI2CAt);
  if (!bHasI2CColumn || sI2C.IsEmpty()) return true;
  if (sI2C == kClosingParenthesis || sI2C == kAutoAssign) {
    setI2C_Address(nPort, 0);
  } else {
    bool bOk = false;
    setI2C_Address(nPort, getInteger(sI2C, bOk));
  }
  return true;
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineRenameSensor(const TTokenizedConfigParms &parms, bool,
                                                                      TLineNumber line, CString &sError) {
  const CString &sPortWord = parms.sParms[1];
  const int nPort = getIndexForSensorName(sPortWord);
  if (!bIsSensorIndex(nPort)) {
    sError.Format(L"Bad sensor device index '%s'", sPortWord);
    return false;
  }
  setUserDefinedSensorNameInConfig(nPort, parms.sParms[2], line);
  if (bIsOneOf(kTypesWithoutSensor, settings.nSensorTypes[size_t(nPort)])) {
    sError.Format(L"Renaming standard model sensor name for index '%s' with no sensor defined", sPortWord);
    return false;
  }
  return true;
}

bool CRobotConfigurationBasic::buildSourceCodeForSensors() {
  const wchar_t *pzKeyword = TConfigTypeDefns::getConfigTypeName(configTypeSensor);
  const int nPorts = std::clamp<int>(pPlatformData->pPlatformParms->nNumbOfSensorPorts, 0, kMaxNumbOfSensorPorts);
  bool bWritten = false;
  for (int port = 0; port < nPorts; ++port) {
    const TSensorTypes nStoredType = settings.nSensorTypes[size_t(port)];
    const TSensorTypes nType = nStoredType == -1 ? 0 : nStoredType;
    const CString &sName = sSensorNames[size_t(port)];
    if (bIsOneOf(kTypesNotWritten, nType) || (nType == 0 && sName.IsEmpty())) continue;

    const TSensorModes nMode = settings.nSensorModes[size_t(port)];
    const CString sPortColumn = CString(::getSensorPortString(port, settings.nCircuitBoardType)) + L",";
    const CString sNameColumn = nameAsParameter(sName) + L",";
    CString sTypeColumn = getSensorTypeString(nType);
    const CString sModeString = getSensorModeString(nType, nMode);
    const CString sModeColumn = (nMode != 0 && !sModeString.IsEmpty()) ? CString(L", ") + sModeString : CString();
    // A port without a sensor keeps only its name when read, so nothing else is written for it.
    CString sSecondaryColumn = nType == 0 ? CString() : CString(getSensorSecondaryPort(settings.nSecondaryPorts[size_t(port)]));
    const CString sI2CColumn = i2cColumn(nType, settings.nI2CAddresses[size_t(port)]);

    CString sLine;
    if (sSecondaryColumn.IsEmpty() && sI2CColumn.IsEmpty()) {
      sLine.Format(L"#pragma config(%s, %-7s %-15s %s%s)", pzKeyword, sPortColumn, sNameColumn, sTypeColumn,
                   sModeColumn);
    } else if (sI2CColumn.IsEmpty()) {
      sTypeColumn += L",";
      sLine.Format(L"#pragma config(%s, %-7s %-15s %s %s%s)", pzKeyword, sPortColumn, sNameColumn, sTypeColumn,
                   sSecondaryColumn, sModeColumn);
    } else {
      sTypeColumn += L",";
      sSecondaryColumn += L",";
      sLine.Format(L"#pragma config(%s, %-7s %-15s %-30s %-1s %s %s)", pzKeyword, sPortColumn, sNameColumn,
                   sTypeColumn, sSecondaryColumn, sI2CColumn, sModeColumn);
    }
    addSourceLineToConfiguration(sLine);
    bWritten = true;
  }
  return bWritten;
}

void CRobotConfigurationBasic::buildSourceCodeForRenameSensor(int nPort) {
  if (!bIsSensorIndex(nPort)) return;
  CString sLine;
  sLine.Format(L"#pragma config(%s, %s, %s)", TConfigTypeDefns::getConfigTypeName(configTypeRenameSensor),
               ::getSensorPortString(nPort, settings.nCircuitBoardType), nameAsParameter(sSensorNames[size_t(nPort)]));
  addSourceLineToConfiguration(sLine);
}
