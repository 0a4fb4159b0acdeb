// The reference host's standard robot models: ready-made configurations that
// a program names in a "StandardModel" line instead of listing its devices.
#pragma once

#include <cstddef>
#include <memory>
#include <vector>

#include "robotconfig/host/CString.h"
#include "robotconfig/host/DeviceTypes.h"
#include "robotconfig/host/StandardModels.h"

class CHostRobotConfiguration;

/// The models are kept as configuration text, each written for one platform
/// kind; the brick platforms (NXT and Brick 4 Motor) come with a few built-in
/// robots. A model is offered while the selected platform kind is its own and
/// its text reads without a rejected line under the current host selection
/// (a model with motor/servo controllers needs "External Motor/Servo
/// Controllers"). Each offered model's record is read from its text and
/// carries the model's name as its standard-model name.
///
/// Indexes count the offered models in list order. Records are read again
/// when the host selection or the list changes; a record pointer handed out
/// stays valid until then. The reference host keeps its models in memory
/// only: it has no model folder to load from or save to.
class CHostStandardModelList final : public CStandardModelRobotConfigurationList {
 public:
  /// A list holding the built-in models.
  CHostStandardModelList();
  ~CHostStandardModelList();
  CHostStandardModelList(const CHostStandardModelList &) = delete;
  CHostStandardModelList &operator=(const CHostStandardModelList &) = delete;

  int getNumbOfModels() const override;
  /// Null outside 0..getNumbOfModels()-1.
  const CRobotConfigurationBasic *getModel(int nIndex) const override;
  /// Empty outside the offered models.
  void getModelName(int nIndex, CString &sName) const override;
  /// Adds a model of the selected platform kind, kept as the configuration
  /// text the record writes without its standard model. False (nothing added)
  /// for an empty name, "Select Configuration", a name with a double quote
  /// (it could not be written back), a name already offered, or a record
  /// whose text does not read back.
  bool bAddModel(const CString &sName, const CRobotConfigurationBasic &model) override;
  /// Removes the model of that name of the selected platform kind.
  bool bRemoveModel(const CString &sName) override;
  /// Removes every model of every platform kind, the built-in ones included.
  void removeAllModels() override;
  /// Always false: the reference host has no model folder.
  bool bLoadModels(const CString &sFolder) override;
  /// Always false: the reference host has no model folder.
  bool bSaveModels(const CString &sFolder) const override;
  /// Index of the offered model of that name (exact case), or -1.
  int findModelIndex(const CString &sName) const override;
  /// The offered model of that name; null for none, for an empty name and
  /// for "Select Configuration".
  const CRobotConfigurationBasic *findStandardModel(const CString &sName) const override;
  bool bIsModelModified(int nIndex) const override;
  void setModelModified(int nIndex, bool bModified) override;

  /// Brings back exactly the built-in models, none of them marked modified.
  void restoreBuiltInModels();

 private:
  struct TModelEntry {
    int nPlatformKind;
    CString sName;
    CString sText;  ///< configuration lines, "\n" between them
    bool bModified;
  };
  /// What a model's record depends on besides its text.
  struct TSelection {
    int nPlatformKind;
    TControllerBoardType nBoard;
    bool bExternalControllers;
    bool operator==(const TSelection &o) const {
      return nPlatformKind == o.nPlatformKind && nBoard == o.nBoard && bExternalControllers == o.bExternalControllers;
    }
  };

  /// Reads the records of the selected platform kind's models again when the
  /// selection or the list has changed since they were read.
  void refresh() const;
  /// Forgets the records; the next query reads them again.
  void invalidate() { m_bRecordsValid = false; }
  /// The entry of an offered model; null outside them.
  const TModelEntry *offeredEntry(int nIndex) const;

  std::vector<TModelEntry> m_entries;
  mutable bool m_bRecordsValid = false;
  mutable bool m_bReading = false;
  mutable TSelection m_readFor{};
  mutable std::vector<size_t> m_offered;  ///< entry index of each offered model
  mutable std::vector<std::unique_ptr<CHostRobotConfiguration>> m_records;  ///< record of each offered model
};

/// The reference host's list of the process.
CHostStandardModelList &hostStandardModelList();
/// Makes the reference host's list the one the library asks (pStandardRobotModels).
void installHostStandardModelList();

/// For its lifetime the library asks the reference host's list, holding only
/// its built-in models; at the end the built-in models are restored again and
/// the list the library asked before is put back.
class CHostStandardModelScope {
 public:
  CHostStandardModelScope();
  ~CHostStandardModelScope();
  CHostStandardModelScope(const CHostStandardModelScope &) = delete;
  CHostStandardModelScope &operator=(const CHostStandardModelScope &) = delete;

 private:
  CStandardModelRobotConfigurationList *m_pPrevious;
};
