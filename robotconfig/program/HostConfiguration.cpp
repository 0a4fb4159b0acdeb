#include "robotconfig/program/HostConfiguration.h"

#include <filesystem>
#include <fstream>
#include <string>
#include <system_error>

#include "robotconfig/core/ParameterText.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/program/ProgramText.h"

namespace {

// User-model files may name user models of their own, this many deep.
constexpr int kMaxUserModelDepth = 8;
// Largest user-model file read; a configuration block takes a few kilobytes.
constexpr std::streamsize kMaxUserModelFileSize = 1 << 20;

enum class TUserModelFileRead { kRead, kNotFound, kUnreadable, kTooLarge };

/// Where the user-model file a program names lives: an absolute name as it
/// stands, any other in the program's own folder (the current folder for a
/// program without one, such as standard input).
std::filesystem::path userModelPath(const CString &sName, const CString &sSourceFile) {
  const std::filesystem::path name = std::filesystem::u8path(sName.toUtf8());
  if (name.is_absolute()) return name;
  return std::filesystem::u8path(sSourceFile.toUtf8()).parent_path() / name;
}

/// Reads a user-model file; only a regular file of at most
/// kMaxUserModelFileSize bytes is read.
TUserModelFileRead readUserModelFile(const std::filesystem::path &path, std::string &sBytes) {
  std::error_code error;
  const std::filesystem::file_status status = std::filesystem::status(path, error);
  if (!std::filesystem::exists(status)) return TUserModelFileRead::kNotFound;
  if (!std::filesystem::is_regular_file(status)) return TUserModelFileRead::kUnreadable;
  std::ifstream in(path, std::ios::binary);
  if (!in) return TUserModelFileRead::kUnreadable;
  // The size is not taken from the file system: some files report none.
  sBytes.assign(size_t(kMaxUserModelFileSize) + 1, '\0');
  in.read(sBytes.data(), kMaxUserModelFileSize + 1);
  if (in.bad()) return TUserModelFileRead::kUnreadable;
  sBytes.resize(size_t(in.gcount()));
  if (in.gcount() > kMaxUserModelFileSize) return TUserModelFileRead::kTooLarge;
  return TUserModelFileRead::kRead;
}

bool bReadUserModelLine(CHostRobotConfiguration &config, const TTokenizedConfigParms &parms,
                        const CString &sSourceFile, int nDepth, CString &sError);

/// The configuration read from a user-model file. Its own "UserModel" lines
/// count one level deeper, so that files naming each other end.
class CUserModelConfiguration final : public CHostRobotConfiguration {
 public:
  explicit CUserModelConfiguration(int nDepth) : m_nDepth(nDepth) {}

 private:
  bool bParseConfigDefinitionLineFileNameForUserModel(const TTokenizedConfigParms &parms, bool, TLineNumber,
                                                      const CString &sSourceFile, CString &sError) override {
    return bReadUserModelLine(*this, parms, sSourceFile, m_nDepth, sError);
  }

  int m_nDepth;
};

/// Reads a "UserModel" line at a nesting depth: the configuration becomes
/// the one the named file describes and keeps the file's name as written.
bool bReadUserModelLine(CHostRobotConfiguration &config, const TTokenizedConfigParms &parms,
                        const CString &sSourceFile, int nDepth, CString &sError) {
  const CString &sFile = parms.sParms[1];
  if (sFile.IsEmpty()) {
    sError = L"Missing user model file name";
    return false;
  }
  // The name is written back between double quotes, so it cannot hold one.
  if (sFile.Find(L'"') >= 0) {
    sError.Format(L"User model file name '%s' cannot contain a double quote", sFile);
    return false;
  }
  if (nDepth >= kMaxUserModelDepth) {
    sError.Format(L"User model file '%s' nests user models too deeply", sFile);
    return false;
  }
  const std::filesystem::path path = userModelPath(sFile, sSourceFile);
  std::string sBytes;
  switch (readUserModelFile(path, sBytes)) {
    case TUserModelFileRead::kRead: break;
    case TUserModelFileRead::kNotFound: sError.Format(L"User model file '%s' not found", sFile); return false;
    case TUserModelFileRead::kUnreadable: sError.Format(L"User model file '%s' could not be read", sFile); return false;
    case TUserModelFileRead::kTooLarge: sError.Format(L"User model file '%s' is too large", sFile); return false;
  }

  CUserModelConfiguration model(nDepth + 1);
  model.setPathName(CString::fromUtf8(path.u8string()));
  std::vector<TConfigurationDiagnostic> diagnostics;
  {
    // The board and port rules are the program's business, checked after its
    // last line; the model must not switch the IDE's board or show warnings.
    CHostSelectionScope selection;
    CCapturingMessageSink messages;
    diagnostics = readProgramConfiguration(model, CProgramText(std::move(sBytes)));
  }
  if (!diagnostics.empty()) {
    sError.Format(L"User model file '%s', line %d: %s", sFile, diagnostics.front().nLine,
                  diagnostics.front().sMessage);
    return false;
  }
  // The model's own first line would stand for the program's.
  const TLineNumber firstConfigLine = config.parseInfo.firstConfigLine;
  const bool bFirstConfigLineSeen = config.parseInfo.bFirstConfigLineSeen;
  config.copyFrom(model);
  config.parseInfo.firstConfigLine = firstConfigLine;
  config.parseInfo.bFirstConfigLineSeen = bFirstConfigLineSeen;
  config.sModelNameUserFile = sFile;
  return true;
}

}  // namespace

void CHostRobotConfiguration::copyFrom(const CRobotConfigurationBasic &source) {
  CRobotConfigurationBasic::copyFrom(source);
  if (const auto *pHost = dynamic_cast<const CHostRobotConfiguration *>(&source)) {
    if (pHost != this) {
      m_datalogSeries = pHost->m_datalogSeries;
      m_nSeriesHash = pHost->m_nSeriesHash;
    }
  }
}

TConfigCompareResults CHostRobotConfiguration::compareConfiguration(const CRobotConfigurationBasic &other) const {
  const TConfigCompareResults nResult = CRobotConfigurationBasic::compareConfiguration(other);
  if (nResult == configCompareSettingsDiffer) return nResult;
  const auto *pHost = dynamic_cast<const CHostRobotConfiguration *>(&other);
  if (pHost != nullptr && pHost->m_datalogSeries != m_datalogSeries) return configCompareSettingsDiffer;
  return nResult;
}

void CHostRobotConfiguration::clearConfigurationDefinition() {
  CRobotConfigurationBasic::clearConfigurationDefinition();
  clearDatalogSeries();
}

void CHostRobotConfiguration::clearDatalogSeries() {
  m_datalogSeries.clear();
  updateHostDataFingerprint();
}

bool CHostRobotConfiguration::bParseConfigDefinitionLineDatalogSeries(const TTokenizedConfigParms &parms, bool,
                                                                      TLineNumber, CString &) {
  std::vector<CString> series;
  for (int i = 1; i < parms.nNumbOfParms && i < kMaxConfigTokens; ++i) series.push_back(parms.sParms[size_t(i)]);
  m_datalogSeries.push_back(std::move(series));
  updateHostDataFingerprint();
  return true;
}

bool CHostRobotConfiguration::buildSourceCodeForDatalogSeries() {
  for (const std::vector<CString> &series : m_datalogSeries) {
    CString sLine(L"#pragma config(DatalogSeries");
    for (const CString &sParm : series) {
      sLine += L", ";
      sLine += textAsParameter(sParm);
    }
    sLine += L')';
    addSourceLineToConfiguration(sLine);
  }
  return !m_datalogSeries.empty();
}

bool CHostRobotConfiguration::bParseConfigDefinitionLineFileNameForUserModel(const TTokenizedConfigParms &parms,
                                                                             bool, TLineNumber, const CString &sSourceFile,
                                                                             CString &sError) {
  return bReadUserModelLine(*this, parms, sSourceFile, 0, sError);
}

void CHostRobotConfiguration::updateHostDataFingerprint() {
  // FNV-1a, carried on from series to series so that reading stays linear.
  constexpr uint32_t kOffsetBasis = 2166136261u;
  if (m_datalogSeries.empty()) {
    m_nSeriesHash = kOffsetBasis;
    nHostData = 0;
    return;
  }
  auto mix = [this](uint32_t c) { m_nSeriesHash = (m_nSeriesHash ^ c) * 16777619u; };
  for (const CString &sParm : m_datalogSeries.back()) {
    for (int i = 0; i < sParm.GetLength(); ++i) mix(static_cast<uint32_t>(sParm[i]));
    mix(0x1F);
  }
  mix(0x1E);
  nHostData = static_cast<int32_t>(m_nSeriesHash);
}
