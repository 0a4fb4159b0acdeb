#include "robotconfig/program/StandardModelList.h"

#include <array>
#include <utility>

#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/program/ProgramText.h"

namespace {

// The name that stands for "no standard model chosen".
constexpr const wchar_t *kNoStandardModel = L"Select Configuration";

struct TBuiltInModel {
  int nPlatformKind;
  const wchar_t *pzName;
  const wchar_t *pzText;
};

// The built-in robots, written as the configuration lines a program would hold.
constexpr std::array<TBuiltInModel, 5> kBuiltInModels = {{
    {platformNxt, L"NXT Rover",
     L"#pragma config(Sensor, S1,     bumper,         sensorTouch)\n"
     L"#pragma config(Sensor, S4,     sonar,          sensorSONAR)\n"
     L"#pragma config(Motor,  motorB,          leftMotor,     tmotorNxt, PIDControl, encoder)\n"
     L"#pragma config(Motor,  motorC,          rightMotor,    tmotorNxt, PIDControl, encoder)\n"},
    {platformNxt, L"NXT Line Tracker",
     L"#pragma config(Sensor, S1,     bumper,         sensorTouch)\n"
     L"#pragma config(Sensor, S3,     lineSensor,     sensorLightActive)\n"
     L"#pragma config(Motor,  motorA,          clawMotor,     tmotorNxt, PIDControl, encoder)\n"
     L"#pragma config(Motor,  motorB,          leftMotor,     tmotorNxt, PIDControl, encoder)\n"
     L"#pragma config(Motor,  motorC,          rightMotor,    tmotorNxt, PIDControl, encoder)\n"},
    {platformNxt, L"NXT Controller Base",
     L"#pragma config(Hubs,  S1, HTMotor,  none,     none,     none)\n"
     L"#pragma config(Sensor, S1,     ,               sensorI2CMuxController)\n"
     L"#pragma config(Motor,  mtr_S1_C1_1,     leftDrive,     tmotorTetrix, openLoop)\n"
     L"#pragma config(Motor,  mtr_S1_C1_2,     rightDrive,    tmotorTetrix, openLoop, reversed)\n"},
    {platformBrick4Motor, L"Brick Rover",
     L"#pragma config(Sensor, S1,     bumper,         sensorTouch)\n"
     L"#pragma config(Sensor, S3,     colorSensor,    sensorColorNxtFULL)\n"
     L"#pragma config(Sensor, S4,     sonar,          sensorSONAR)\n"
     L"#pragma config(Motor,  motorA,          armMotor,      tmotorBrickMedium, PIDControl, encoder)\n"
     L"#pragma config(Motor,  motorB,          leftMotor,     tmotorBrickLarge, PIDControl, encoder)\n"
     L"#pragma config(Motor,  motorC,          rightMotor,    tmotorBrickLarge, PIDControl, encoder)\n"},
    {platformBrick4Motor, L"Brick Controller Base",
     L"#pragma config(Hubs,  S1, HTMotor,  none,     none,     none)\n"
     L"#pragma config(Sensor, S1,     ,               sensorI2CMuxController)\n"
     L"#pragma config(Motor,  motorA,          armMotor,      tmotorBrickMedium, PIDControl, encoder)\n"
     L"#pragma config(Motor,  mtr_S1_C1_1,     leftDrive,     tmotorTetrix, openLoop)\n"
     L"#pragma config(Motor,  mtr_S1_C1_2,     rightDrive,    tmotorTetrix, openLoop, reversed)\n"},
}};

/// Reads a model's text into `record`; false when a line is rejected. The
/// read neither changes the IDE's board nor shows the port-rule warnings:
/// those belong to the program that names the model.
bool bReadModelText(const CString &sText, CHostRobotConfiguration &record) {
  CHostSelectionScope selection;
  CCapturingMessageSink messages;
  return readProgramConfiguration(record, CProgramText(sText.toUtf8())).empty();
}

}  // namespace

CHostStandardModelList::CHostStandardModelList() { restoreBuiltInModels(); }

CHostStandardModelList::~CHostStandardModelList() = default;

void CHostStandardModelList::restoreBuiltInModels() {
  m_entries.clear();
  for (const TBuiltInModel &model : kBuiltInModels)
    m_entries.push_back(TModelEntry{model.nPlatformKind, model.pzName, model.pzText, false});
  invalidate();
}

void CHostStandardModelList::refresh() const {
  const TSelection selection{pToggles->getPlatformKind(), pToggles->getIDECircuitBoardType(),
                             pToggles->bIsToggleEnabled(kToggleExternalControllers, kToggleQueryLevel) != 0};
  if (m_bRecordsValid && m_readFor == selection) return;
  m_bReading = true;
  m_offered.clear();
  m_records.clear();
  for (size_t i = 0; i < m_entries.size(); ++i) {
    const TModelEntry &entry = m_entries[i];
    if (entry.nPlatformKind != selection.nPlatformKind) continue;
    auto pRecord = std::make_unique<CHostRobotConfiguration>();
    if (!bReadModelText(entry.sText, *pRecord)) continue;
    pRecord->updateStandardModelName(entry.sName);
    m_offered.push_back(i);
    m_records.push_back(std::move(pRecord));
  }
  m_readFor = selection;
  m_bRecordsValid = true;
  m_bReading = false;
}

const CHostStandardModelList::TModelEntry *CHostStandardModelList::offeredEntry(int nIndex) const {
  refresh();
  return (nIndex >= 0 && size_t(nIndex) < m_offered.size()) ? &m_entries[m_offered[size_t(nIndex)]] : nullptr;
}

int CHostStandardModelList::getNumbOfModels() const {
  refresh();
  return static_cast<int>(m_offered.size());
}

const CRobotConfigurationBasic *CHostStandardModelList::getModel(int nIndex) const {
  refresh();
  return (nIndex >= 0 && size_t(nIndex) < m_records.size()) ? m_records[size_t(nIndex)].get() : nullptr;
}

void CHostStandardModelList::getModelName(int nIndex, CString &sName) const {
  const TModelEntry *pEntry = offeredEntry(nIndex);
  sName = pEntry ? pEntry->sName : CString();
}

bool CHostStandardModelList::bAddModel(const CString &sName, const CRobotConfigurationBasic &model) {
  if (sName.IsEmpty() || sName == kNoStandardModel || sName.Find(L'"') >= 0 || findModelIndex(sName) >= 0)
    return false;
  CHostRobotConfiguration copy;
  copy.copyFrom(model);
  CString sText;
  copy.buildSourceCodeForConfiguration(sText, true);
  sText.Replace(L"\r\n", L"\n");
  m_entries.push_back(TModelEntry{pToggles->getPlatformKind(), sName, sText, false});
  invalidate();
  if (findModelIndex(sName) >= 0) return true;
  m_entries.pop_back();
  invalidate();
  return false;
}

bool CHostStandardModelList::bRemoveModel(const CString &sName) {
  const int nPlatformKind = pToggles->getPlatformKind();
  for (auto it = m_entries.begin(); it != m_entries.end(); ++it) {
    if (it->nPlatformKind != nPlatformKind || it->sName != sName) continue;
    m_entries.erase(it);
    invalidate();
    return true;
  }
  return false;
}

void CHostStandardModelList::removeAllModels() {
  m_entries.clear();
  invalidate();
}

bool CHostStandardModelList::bLoadModels(const CString &) { return false; }

bool CHostStandardModelList::bSaveModels(const CString &) const { return false; }

int CHostStandardModelList::findModelIndex(const CString &sName) const {
  refresh();
  for (size_t i = 0; i < m_offered.size(); ++i)
    if (m_entries[m_offered[i]].sName == sName) return static_cast<int>(i);
  return -1;
}

const CRobotConfigurationBasic *CHostStandardModelList::findStandardModel(const CString &sName) const {
  // A model's own text cannot name a model: the records are being read.
  if (m_bReading || sName.IsEmpty() || sName == kNoStandardModel) return nullptr;
  return getModel(findModelIndex(sName));
}

bool CHostStandardModelList::bIsModelModified(int nIndex) const {
  const TModelEntry *pEntry = offeredEntry(nIndex);
  return pEntry && pEntry->bModified;
}

void CHostStandardModelList::setModelModified(int nIndex, bool bModified) {
  if (const TModelEntry *pEntry = offeredEntry(nIndex)) m_entries[size_t(pEntry - m_entries.data())].bModified = bModified;
}

CHostStandardModelList &hostStandardModelList() {
  static CHostStandardModelList list;
  return list;
}

void installHostStandardModelList() { pStandardRobotModels = &hostStandardModelList(); }

CHostStandardModelScope::CHostStandardModelScope() : m_pPrevious(pStandardRobotModels) {
  hostStandardModelList().restoreBuiltInModels();
  installHostStandardModelList();
}

CHostStandardModelScope::~CHostStandardModelScope() {
  hostStandardModelList().restoreBuiltInModels();
  pStandardRobotModels = m_pPrevious;
}
