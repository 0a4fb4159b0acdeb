#include "core/PendingKeywords.h"
#include "core/RobotConfiguration.h"
#include "host/StandardModels.h"

CStandardModelRobotConfigurationList *pStandardRobotModels = nullptr;

namespace {

// The name that stands for "no standard model chosen".
constexpr const wchar_t *kNoStandardModel = L"Select Configuration";

}  // namespace

bool CRobotConfigurationBasic::updateStandardModelName(const CString &) { return false; }
void CRobotConfigurationBasic::clearStandardModelName() { sStandardModelName.Empty(); }
bool CRobotConfigurationBasic::updateModelNameUserFile(const CString &) { return false; }
void CRobotConfigurationBasic::clearUserFileModelName() { sModelNameUserFile.Empty(); }
bool CRobotConfigurationBasic::SaveConfigurationAsModelFile(TTavrenFileTypes, const CString &) { return false; }

bool CRobotConfigurationBasic::bParseConfigDefinitionLineStandardModel(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::buildSourceCodeForStandardModel() {
  if (sStandardModelName.IsEmpty() || sStandardModelName == kNoStandardModel) return false;
  const CRobotConfigurationBasic *pModel =
      pStandardRobotModels ? pStandardRobotModels->findStandardModel(sStandardModelName) : nullptr;
  if (!pModel) return false;
  CString sLine;
  sLine.Format(L"#pragma config(%s, \"%s\")", TConfigTypeDefns::getConfigTypeName(configTypeStandardModel),
               sStandardModelName);
  addSourceLineToConfiguration(sLine);
  // Only the names the user changed are written; the model supplies the rest.
  for (int n = 0; n < getMaxNumbOfMotorPorts() && n < kMaxNumbOfMotors; ++n)
    if (sMotorNames[size_t(n)] != pModel->sMotorNames[size_t(n)]) buildSourceCodeForRenameMotor(n);
  const int nSensors = getMaxNumbOfSensorPorts();
  for (int port = 0; port < nSensors && port < kMaxNumbOfSensorPorts; ++port)
    if (sSensorNames[size_t(port)] != pModel->sSensorNames[size_t(port)]) buildSourceCodeForRenameSensor(port);
  return true;
}

void CRobotConfigurationBasic::buildSourceCodeStandardModelLowLevel() {}

bool CRobotConfigurationBasic::buildSourceCodeForFileNameForUserModel() { return false; }

void CRobotConfigurationBasic::buildSourceCodeForFileNameForUserModelLowLevel() {
  CString sLine;
  sLine.Format(L"#pragma config(%s, \"%s\")", TConfigTypeDefns::getConfigTypeName(configTypeUserModel),
               sModelNameUserFile);
  addSourceLineToConfiguration(sLine);
}
