// Reading single configuration lines and looking at the generated ones: the
// helpers the line tests share.
#pragma once

#include <gtest/gtest.h>

#include <cstring>
#include <string>
#include <vector>

#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/StandardModels.h"

namespace test_support {

/// The tokens of a line that must be a configuration line.
inline TTokenizedConfigParms tokenize(const std::wstring &sLine) {
  TTokenizedConfigParms parms;
  EXPECT_EQ(CRobotConfigurationBasic::nTokenizeLine(CString(sLine), parms), lineTypeConfigPragma) << sLine;
  return parms;
}

/// Hands one line to the dispatcher, as the host does.
inline bool parseLine(CRobotConfigurationBasic &rec, const std::wstring &sLine, CString &sError,
                      TLineNumber line = TLineNumber(7, 0), const CString &sSourceFile = L"program.c") {
  return rec.bParseConfigDefinitionLine(tokenize(sLine), false, line, sSourceFile, sError);
}

/// Reads a line that must be accepted.
inline void accept(CRobotConfigurationBasic &rec, const std::wstring &sLine) {
  CString sError;
  EXPECT_TRUE(parseLine(rec, sLine, sError)) << sLine << ": " << sError.str();
}

/// The generated lines that start with `sPrefix`, without their line ends.
inline std::vector<std::wstring> generatedLines(CRobotConfigurationBasic &rec, const std::wstring &sPrefix) {
  CString sText;
  rec.buildSourceCodeForConfiguration(sText, false);
  std::vector<std::wstring> lines;
  const std::wstring &s = sText.str();
  for (size_t pos = 0; pos < s.size();) {
    size_t end = s.find(L"\r\n", pos);
    if (end == std::wstring::npos) end = s.size();
    if (s.compare(pos, sPrefix.size(), sPrefix) == 0) lines.push_back(s.substr(pos, end - pos));
    pos = end + 2;
  }
  return lines;
}

/// True when the record's settings block equals `settings` byte for byte.
inline bool bSameSettings(const CRobotConfigurationBasic &rec, const TConfigurationSettings &settings) {
  return std::memcmp(&rec.getSettings(), &settings, sizeof settings) == 0;
}

inline bool bSameSettings(const CRobotConfigurationBasic &a, const CRobotConfigurationBasic &b) {
  return bSameSettings(a, b.getSettings());
}

/// A standard-model list that holds one model under one name.
class COneModelList : public CStandardModelRobotConfigurationList {
 public:
  COneModelList(const CRobotConfigurationBasic &model, const wchar_t *pzName) : m_model(model), m_sName(pzName) {}
  virtual ~COneModelList() = default;
  int getNumbOfModels() const override { return 1; }
  const CRobotConfigurationBasic *getModel(int) const override { return &m_model; }
  void getModelName(int, CString &sName) const override { sName = m_sName; }
  bool bAddModel(const CString &, const CRobotConfigurationBasic &) override { return false; }
  bool bRemoveModel(const CString &) override { return false; }
  void removeAllModels() override {}
  bool bLoadModels(const CString &) override { return false; }
  bool bSaveModels(const CString &) const override { return false; }
  int findModelIndex(const CString &sName) const override { return sName == m_sName ? 0 : -1; }
  const CRobotConfigurationBasic *findStandardModel(const CString &sName) const override {
    return sName == m_sName ? &m_model : nullptr;
  }
  bool bIsModelModified(int) const override { return false; }
  void setModelModified(int, bool) override {}

 private:
  const CRobotConfigurationBasic &m_model;
  CString m_sName;
};

}  // namespace test_support
