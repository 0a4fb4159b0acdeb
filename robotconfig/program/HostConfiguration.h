// The reference host configuration class: what an IDE adds to the library's
// configuration record. The command-line tool and the tests use it.
#pragma once

#include <vector>

#include "robotconfig/core/RobotConfiguration.h"

class CHostRobotConfiguration : public CRobotConfigurationBasic {
 public:
  CHostRobotConfiguration() = default;
  CHostRobotConfiguration(const CHostRobotConfiguration &source) = default;
  CHostRobotConfiguration &operator=(const CHostRobotConfiguration &source) {
    copyFrom(source);
    return *this;
  }

  void getPathName(CString &sPath) override { sPath = m_sPathName; }
  void setPathName(const CString &sPath) override { m_sPathName = sPath; }
  bool bIsHostDataEqual(int nOtherHostData) const override { return nHostData == nOtherHostData; }
  void copyHostData(int nSourceHostData) override { nHostData = nSourceHostData; }
  void setModified(bool bModified) override { m_bModified = bModified; }
  bool bIsModified() const override { return m_bModified; }
  /// Also forgets the data-log series of the previous program.
  void clearConfigurationDefinition() override;
  /// Also carries the data-log series of another host configuration.
  void copyFrom(const CRobotConfigurationBasic &source) override;
  /// Also compares the data-log series themselves with those of another host
  /// configuration: equal fingerprints do not make equal series.
  TConfigCompareResults compareConfiguration(const CRobotConfigurationBasic &other) const override;

  /// The parameters of each "DatalogSeries" line read, in order.
  const std::vector<std::vector<CString>> &getDatalogSeries() const { return m_datalogSeries; }
  void clearDatalogSeries();

 protected:
  bool bParseConfigDefinitionLineDatalogSeries(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                               CString &sError) override;
  bool buildSourceCodeForDatalogSeries() override;

 private:
  /// Accepts the user-model file a "UserModel" line names.
  bool bParseConfigDefinitionLineFileNameForUserModel(const TTokenizedConfigParms &parms, bool bFlag,
                                                      TLineNumber line, const CString &sSourceFile,
                                                      CString &sError) override;
  /// Keeps `nHostData` a fingerprint of the data-log series, so that the
  /// record's comparison sees a difference in them; call after each change
  /// (an append, or emptying the series).
  void updateHostDataFingerprint();

  CString m_sPathName;
  bool m_bModified = false;
  std::vector<std::vector<CString>> m_datalogSeries;
  uint32_t m_nSeriesHash = 2166136261u;  ///< running fingerprint of the series
};
