#include "host/HostConfiguration.h"

namespace {

// Characters that end an unquoted token of a configuration line.
bool bNeedsQuotes(const CString &sParm) {
  if (sParm.IsEmpty()) return true;  // a trailing empty parameter would be dropped
  for (int i = 0; i < sParm.GetLength(); ++i) {
    const wchar_t c = sParm[i];
    if (c == L' ' || c == L'\t' || c == L',' || c == L'(' || c == L')') return true;
  }
  return sParm[0] == L'"';
}

}  // namespace

void CHostRobotConfiguration::copyFrom(const CRobotConfigurationBasic &source) {
  CRobotConfigurationBasic::copyFrom(source);
  if (const auto *pHost = dynamic_cast<const CHostRobotConfiguration *>(&source)) {
    if (pHost != this) m_datalogSeries = pHost->m_datalogSeries;
  }
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
      if (bNeedsQuotes(sParm) && sParm.Find(L'"') < 0) sLine += L'"' + sParm + L'"';
      else sLine += sParm;
    }
    sLine += L')';
    addSourceLineToConfiguration(sLine);
  }
  return !m_datalogSeries.empty();
}

bool CHostRobotConfiguration::bParseConfigDefinitionLineFileNameForUserModel(const TTokenizedConfigParms &parms,
                                                                             bool, TLineNumber, const CString &,
                                                                             CString &sError) {
  const CString &sFile = parms.sParms[1];
  if (sFile.IsEmpty()) {
    sError = L"Missing user model file name";
    return false;
  }
  sModelNameUserFile = sFile;
  return true;
}

void CHostRobotConfiguration::updateHostDataFingerprint() {
  // FNV-1a over the series' characters, with separators between parameters.
  uint32_t nHash = 2166136261u;
  auto mix = [&nHash](uint32_t c) { nHash = (nHash ^ c) * 16777619u; };
  for (const std::vector<CString> &series : m_datalogSeries) {
    for (const CString &sParm : series) {
      for (int i = 0; i < sParm.GetLength(); ++i) mix(static_cast<uint32_t>(sParm[i]));
      mix(0x1F);
    }
    mix(0x1E);
  }
  nHostData = m_datalogSeries.empty() ? 0 : static_cast<int32_t>(nHash);
}
