// Program type and firmware features: reading the ProgramType and
// FirmwareFeatures lines, and writing the FirmwareFeatures line. (The
// ProgramType line is written with the board's IFI parameters.)
#include <algorithm>
#include <array>

#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/drive_serial_network/ProgramTypes.h"
#include "robotconfig/host/DeviceCatalog.h"

namespace {

/// One optional firmware service: its word and the settings flag it sets.
struct TFirmwareFeature {
  const wchar_t *pzKeyword;
  int32_t TConfigurationSettings::*pFlag;
};

/// The firmware features, in the order the written line names them.
constexpr std::array<TFirmwareFeature, 2> kFirmwareFeatures = {{
    {L"fwTimedServo", &TConfigurationSettings::bFwTimedServo},
    {L"fwSounds", &TConfigurationSettings::bFwSounds},
}};

/// The feature a word names exactly (with case); null when none.
const TFirmwareFeature *findFirmwareFeature(const CString &sWord) {
  for (const TFirmwareFeature &feature : kFirmwareFeatures)
    if (sWord == feature.pzKeyword) return &feature;
  return nullptr;
}

}  // namespace

bool CRobotConfigurationBasic::bParseConfigDefinitionLineProgramType(const TTokenizedConfigParms &parms, bool,
                                                                     TLineNumber, CString &sError) {
  settings.nProgramType = getTypedefIndex(nProgramTypes, parms.sParms[1], true);
  if (settings.nProgramType >= 0) return true;
  sError.Format(L"'%s' is an invalid program type for current platform", parms.sParms[1]);
  return false;
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineFirmwareFeatures(const TTokenizedConfigParms &parms, bool,
                                                                          TLineNumber, CString &sError) {
  // Every word is read; a bad one fails the line but does not stop the others.
  bool bAccepted = true;
  const int nTokens = std::clamp(parms.nNumbOfParms, 0, kMaxConfigTokens);
  for (int nToken = 1; nToken < nTokens; ++nToken) {
    const CString &sWord = parms.sParms[size_t(nToken)];
    if (const TFirmwareFeature *pFeature = findFirmwareFeature(sWord)) {
      settings.*(pFeature->pFlag) = true;
    } else {
      sError.Format(L"Invalid firmware feature '%s'.", sWord);
      bAccepted = false;
    }
  }
  return bAccepted;
}

bool CRobotConfigurationBasic::buildSourceCodeForFirmwareFeatures() {
  CString sFeatures;
  for (const TFirmwareFeature &feature : kFirmwareFeatures) {
    if (!(settings.*(feature.pFlag))) continue;
    sFeatures += L", ";
    sFeatures += feature.pzKeyword;
  }
  if (sFeatures.IsEmpty()) return false;
  CString sLine;
  sLine.Format(L"#pragma config(%s%s)", TConfigTypeDefns::getConfigTypeName(configTypeFirmwareFeatures), sFeatures);
  addSourceLineToConfiguration(sLine);
  return true;
}
