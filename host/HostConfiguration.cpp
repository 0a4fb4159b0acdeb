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
    if (pHost != this) {
      m_datalogSeries = pHost->m_datalogSeries;
      m_nSeriesHash = pHost->m_nSeriesHash;
    }
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
  // The name is written back between double quotes, so it cannot hold one.
  if (sFile.Find(L'"') >= 0) {
    sError.Format(L"User model file name '%s' cannot contain a double quote", sFile);
    return false;
  }
  sModelNameUserFile = sFile;
  return true;
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
