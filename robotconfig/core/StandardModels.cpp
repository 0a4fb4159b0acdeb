// Standard robot models (a StandardModel line stands for a whole model
// configuration of the host's list), user-model file names, and saving a
// configuration as a model file.
#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <string>
#include <system_error>

#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/StandardModels.h"

CStandardModelRobotConfigurationList *pStandardRobotModels = nullptr;

namespace {

// The name that stands for "no standard model chosen".
constexpr const wchar_t *kNoStandardModel = L"Select Configuration";

// What the host's file-name prompt is given besides the file kind and path.
constexpr unsigned kModelFilePromptFlags = 0xF001;
constexpr unsigned kModelFilePromptOptions = 0x00800804;
constexpr int kModelFilePromptReserved = 0;

// Temporary names tried beside a model file before giving up.
constexpr int kMaxTemporaryNames = 100;

/// The host's model of that name, or null (also when the host has no list).
const CRobotConfigurationBasic *findStandardModelNamed(const CString &sName) {
  return pStandardRobotModels ? pStandardRobotModels->findStandardModel(sName) : nullptr;
}

/// Shows the error of a model file that cannot be written.
void reportModelFileNotOpened(const CString &sPath) {
  CString sText;
  sText.Format(L"Robot Configuration Standard file '%s' could not be opened", sPath);
  systemMessageBox(sText, L"TAVREN: Error!", kMessageStyleWarning);
}

/// Creates a new file beside `target` that no one else has open, and gives
/// its name in `temporary`; null when no such file can be created.
std::FILE *createFileBeside(const std::filesystem::path &target, std::filesystem::path &temporary) {
  for (int n = 0; n < kMaxTemporaryNames; ++n) {
    temporary = target;
    temporary += ".tmp" + std::to_string(n);
    // "x": fails when the name exists, so no other file is ever overwritten.
    if (std::FILE *pFile = std::fopen(temporary.string().c_str(), "wbx")) return pFile;
    if (errno != EEXIST) return nullptr;
  }
  return nullptr;
}

}  // namespace

bool CRobotConfigurationBasic::updateStandardModelName(const CString &sName) {
  if (sName == sStandardModelName) return false;
  if (sName == kNoStandardModel) sStandardModelName.Empty();
  else sStandardModelName = sName;
  return true;
}

void CRobotConfigurationBasic::clearStandardModelName() { sStandardModelName.Empty(); }

bool CRobotConfigurationBasic::updateModelNameUserFile(const CString &sName) {
  if (sName == sModelNameUserFile) return false;
  sModelNameUserFile = sName;
  return true;
}

void CRobotConfigurationBasic::clearUserFileModelName() { sModelNameUserFile.Empty(); }

bool CRobotConfigurationBasic::bParseConfigDefinitionLineStandardModel(const TTokenizedConfigParms &parms, bool,
                                                                       TLineNumber, CString &sError) {
  const CString &sName = parms.sParms[1];
  updateStandardModelName(sName);
  if (sName.IsEmpty()) return false;
  const CRobotConfigurationBasic *pModel = findStandardModelNamed(sStandardModelName);
  if (!pModel) {
    sError.Format(L"Standard robot model '%s' not found.", sName);
    return false;
  }
  // The model's own first line would stand for the program's.
  const TLineNumber firstConfigLine = parseInfo.firstConfigLine;
  const bool bFirstConfigLineSeen = parseInfo.bFirstConfigLineSeen;
  copyFrom(*pModel);
  parseInfo.firstConfigLine = firstConfigLine;
  parseInfo.bFirstConfigLineSeen = bFirstConfigLineSeen;
  return true;
}

bool CRobotConfigurationBasic::buildSourceCodeForStandardModel() {
  if (sStandardModelName.IsEmpty() || sStandardModelName == kNoStandardModel) return false;
  const CRobotConfigurationBasic *pModel = findStandardModelNamed(sStandardModelName);
  if (!pModel) return false;
  buildSourceCodeStandardModelLowLevel();
  // Only the names the user changed are written; the model supplies the rest.
  for (int n = 0; n < getMaxNumbOfMotorPorts() && n < kMaxNumbOfMotors; ++n)
    if (sMotorNames[size_t(n)] != pModel->sMotorNames[size_t(n)]) buildSourceCodeForRenameMotor(n);
  const int nSensors = getMaxNumbOfSensorPorts();
  for (int port = 0; port < nSensors && port < kMaxNumbOfSensorPorts; ++port)
    if (sSensorNames[size_t(port)] != pModel->sSensorNames[size_t(port)]) buildSourceCodeForRenameSensor(port);
  return true;
}

void CRobotConfigurationBasic::buildSourceCodeStandardModelLowLevel() {
  CString sLine;
  sLine.Format(L"#pragma config(%s, \"%s\")", TConfigTypeDefns::getConfigTypeName(configTypeStandardModel),
               sStandardModelName);
  addSourceLineToConfiguration(sLine);
}

bool CRobotConfigurationBasic::buildSourceCodeForFileNameForUserModel() {
  if (sModelNameUserFile.IsEmpty()) return false;
  buildSourceCodeForFileNameForUserModelLowLevel();
  return true;
}

void CRobotConfigurationBasic::buildSourceCodeForFileNameForUserModelLowLevel() {
  CString sLine;
  sLine.Format(L"#pragma config(%s, \"%s\")", TConfigTypeDefns::getConfigTypeName(configTypeUserModel),
               sModelNameUserFile);
  addSourceLineToConfiguration(sLine);
}

bool CRobotConfigurationBasic::SaveConfigurationAsModelFile(TTavrenFileTypes nFileType, const CString &sProposedPath) {
  CString sPath(sProposedPath);
  if (!pToggles || pToggles->bGetFileNameFromUser(nFileType, sPath, kModelFilePromptFlags, kModelFilePromptOptions,
                                                  kModelFilePromptReserved) == 0)
    return false;

  // The model is written to a new file beside the target, which then takes
  // the target's place: an existing model file is never left half written.
  // A symbolic link stays a link; the file it leads to is the one replaced.
  std::error_code error;
  std::filesystem::path target = std::filesystem::u8path(sPath.toUtf8());
  if (std::filesystem::is_symlink(target, error)) {
    const std::filesystem::path resolved = std::filesystem::weakly_canonical(target, error);
    if (!error) target = resolved;
  }
  std::filesystem::path temporary;
  std::FILE *pFile = sPath.IsEmpty() ? nullptr : createFileBeside(target, temporary);
  // A folder that takes no new file (or a name with no room for a suffix) may
  // still let the file itself be replaced: then it is written in place.
  const bool bInPlace = pFile == nullptr && !sPath.IsEmpty();
  if (bInPlace) pFile = std::fopen(target.string().c_str(), "wb");
  if (!pFile) {
    reportModelFileNotOpened(sPath);
    return false;
  }

  // Every device line by line, also for a configuration that uses a standard model.
  CString sText;
  buildSourceCodeForConfiguration(sText, true);
  const std::string sBytes = sText.toUtf8();
  bool bWritten = std::fwrite(sBytes.data(), 1, sBytes.size(), pFile) == sBytes.size();
  bWritten = std::fflush(pFile) == 0 && bWritten;
  bWritten = std::fclose(pFile) == 0 && bWritten;

  if (bInPlace) return bWritten;
  if (bWritten) {
    // The model file keeps the permissions an earlier file of that name had.
    const std::filesystem::file_status status = std::filesystem::status(target, error);
    if (std::filesystem::is_regular_file(status))
      std::filesystem::permissions(temporary, status.permissions(), error);
    std::filesystem::rename(temporary, target, error);
    if (!error) return true;
    reportModelFileNotOpened(sPath);
  }
  std::filesystem::remove(temporary, error);
  return false;
}
