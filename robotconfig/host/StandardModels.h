// Standard robot models: the host's list of ready-made configurations that a
// program can name in a "StandardModel" line.
#pragma once

#include "robotconfig/host/CString.h"

class CRobotConfigurationBasic;

/// The host's list of standard models. The library asks only for a model by
/// name; the other operations serve the host's dialogs.
class CStandardModelRobotConfigurationList {
 public:
  CStandardModelRobotConfigurationList() = default;
  CStandardModelRobotConfigurationList(const CStandardModelRobotConfigurationList &) = default;

  virtual int getNumbOfModels() const = 0;
  virtual const CRobotConfigurationBasic *getModel(int nIndex) const = 0;
  virtual void getModelName(int nIndex, CString &sName) const = 0;
  virtual bool bAddModel(const CString &sName, const CRobotConfigurationBasic &model) = 0;
  virtual bool bRemoveModel(const CString &sName) = 0;
  virtual void removeAllModels() = 0;
  virtual bool bLoadModels(const CString &sFolder) = 0;
  virtual bool bSaveModels(const CString &sFolder) const = 0;
  virtual int findModelIndex(const CString &sName) const = 0;
  /// The model of that name, or null.
  virtual const CRobotConfigurationBasic *findStandardModel(const CString &sName) const = 0;
  virtual bool bIsModelModified(int nIndex) const = 0;
  virtual void setModelModified(int nIndex, bool bModified) = 0;

 protected:
  // Not virtual: the list is never deleted through this interface.
  ~CStandardModelRobotConfigurationList() = default;
};

/// The host's standard models; null until the host sets it.
extern CStandardModelRobotConfigurationList *pStandardRobotModels;
