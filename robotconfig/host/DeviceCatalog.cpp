// Lookups of the device-name catalog: words to values and back over the
// name tables, limited to the rows of the current platform.
#include "robotconfig/host/DeviceCatalog.h"

#include <climits>
#include <cwchar>

#include "robotconfig/host/CatalogRows.h"
#include "robotconfig/host/Platform.h"

using namespace robotconfig_catalog;

namespace {

/// True for the end row of a table.
bool bIsEndOfTable(const TDeviceTypeMenuItem &row) { return row.nPlatformMask == 0; }

/// Platform mask of the current platform; 0 (no row matches) without a toggle service.
uint32_t currentPlatformMask() { return pToggles ? pToggles->getPlatformMask() : 0; }

/// True when the row is on the current platform and spells `sText`.
bool bRowSpells(const TDeviceTypeMenuItem &row, uint32_t nPlatformMask, const CString &sText) {
  return (row.nPlatformMask & nPlatformMask) != 0 && row.pzKeyword != nullptr &&
         sText == row.pzKeyword;  // the whole word: a NUL inside it is no end
}

/// Value of the first row on the platform that spells `sText` and passes
/// `bAccept`; -1 when none.
template <class TAccept>
int findValueOfKeyword(const TDeviceTypeMenuItem *pTable, const CString &sText, TAccept bAccept) {
  if (pTable == nullptr || sText.IsEmpty()) return -1;
  const uint32_t nPlatformMask = currentPlatformMask();
  for (const TDeviceTypeMenuItem *pRow = pTable; !bIsEndOfTable(*pRow); ++pRow) {
    if (bRowSpells(*pRow, nPlatformMask, sText) && bAccept(*pRow)) return pRow->nValue;
  }
  return -1;
}

/// Keyword of `nValue` among the rows on the platform that pass `bAccept`:
/// the first canonical row, else the first alias; "" when none.
template <class TAccept>
const wchar_t *findKeywordOfValue(const TDeviceTypeMenuItem *pTable, int nValue, TAccept bAccept) {
  if (pTable == nullptr) return L"";
  const uint32_t nPlatformMask = currentPlatformMask();
  const wchar_t *pzAlias = nullptr;
  for (const TDeviceTypeMenuItem *pRow = pTable; !bIsEndOfTable(*pRow); ++pRow) {
    if ((pRow->nPlatformMask & nPlatformMask) == 0 || pRow->nValue != nValue || pRow->pzKeyword == nullptr ||
        !bAccept(*pRow)) {
      continue;
    }
    if (pRow->nRowAttribute != kRowAttributeAlias) return pRow->pzKeyword;
    if (pzAlias == nullptr) pzAlias = pRow->pzKeyword;
  }
  return pzAlias ? pzAlias : L"";
}

/// Accepts every row.
constexpr auto kAnyRow = [](const TDeviceTypeMenuItem &) { return true; };

/// Accepts the motor-type rows whose hardware bits meet `nMask` (0 and -1 accept all).
auto motorTypeFilter(TSensorHWTypesMask nMask) {
  return [nMask](const TDeviceTypeMenuItem &row) {
    return nMask == 0 || nMask == -1 || (row.nAttribute & nMask) != 0;
  };
}

/// Accepts the sensor-mode rows that apply to sensor type `nType`.
auto sensorModeFilter(TSensorTypes nType) {
  const uint32_t nGroups = getSensorModeGroups(nType);
  return [nGroups](const TDeviceTypeMenuItem &row) { return (static_cast<uint32_t>(row.nAttribute) & nGroups) != 0; };
}

/// True for the blanks allowed around a number.
bool bIsBlank(wchar_t ch) { return ch == L' ' || ch == L'\t'; }

}  // namespace

int getTypedefIndex(const TDeviceTypeMenuItem *pTable, const CString &sText, bool /*bExact*/) {
  return findValueOfKeyword(pTable, sText, kAnyRow);
}

const wchar_t *getTypedefEnumString(const TDeviceTypeMenuItem *pTable, int nValue, TSensorHWTypesMask /*nMask*/) {
  return findKeywordOfValue(pTable, nValue, kAnyRow);
}

const wchar_t *getMotorTypedefString(TMotorTypes nType, TSensorHWTypesMask nMask) {
  return findKeywordOfValue(kMotorTypeNames, nType, motorTypeFilter(nMask));
}

TMotorTypes getMotorTypedefNameIndex(const CString &sText, TSensorHWTypesMask nMask) {
  return findValueOfKeyword(kMotorTypeNames, sText, motorTypeFilter(nMask));
}

const wchar_t *getServoTypedefString(TServoTypes nType) { return findKeywordOfValue(kServoTypeNames, nType, kAnyRow); }

TServoTypes getServoTypedefNameIndex(const CString &sText) { return findValueOfKeyword(kServoTypeNames, sText, kAnyRow); }

const wchar_t *getSensorTypeString(TSensorTypes nType) {
  // A record may hold a type its platform does not offer (set by a host or
  // carried from another platform); it keeps its word so that nothing is
  // written empty.
  const wchar_t *pzWord = findKeywordOfValue(kSensorTypeNames, nType, kAnyRow);
  if (*pzWord != 0) return pzWord;
  for (const TDeviceTypeMenuItem *pRow = kSensorTypeNames; !bIsEndOfTable(*pRow); ++pRow)
    if (pRow->nValue == nType && pRow->pzKeyword) return pRow->pzKeyword;
  return L"";
}

TSensorTypes getSensorTypeIndex(const CString &sText, bool /*bExact*/) {
  return findValueOfKeyword(kSensorTypeNames, sText, kAnyRow);
}

const wchar_t *getSensorModeString(TSensorTypes nType, TSensorModes nMode) {
  return findKeywordOfValue(kSensorModeNames, nMode, sensorModeFilter(nType));
}

TSensorModes getSensorModeIndex(TSensorTypes nType, const CString &sText, bool /*bExact*/) {
  return findValueOfKeyword(kSensorModeNames, sText, sensorModeFilter(nType));
}

int getServoIndex(const CString &sText) { return findValueOfKeyword(kServoPortNames, sText, kAnyRow); }

void getServoPortString(int nServo, CString &sName) { sName = findKeywordOfValue(kServoPortNames, nServo, kAnyRow); }

int getMotorIndexForNonArduinoPlatforms(const CString &sText) {
  return findValueOfKeyword(kMotorPortNames, sText, kAnyRow);
}

void getMotorPortStringForNonArduinoPlatforms(int nMotor, CString &sName) {
  sName = findKeywordOfValue(kMotorPortNames, nMotor, kAnyRow);
}

int getSecondaryPortIndex(const CString &sText) { return findValueOfKeyword(kSecondaryPortNames, sText, kAnyRow); }

const wchar_t *getSensorSecondaryPort(int nSecondary) {
  return findKeywordOfValue(kSecondaryPortNames, nSecondary, kAnyRow);
}

const TDeviceTypeMenuItem *getMotorTypeNameTable() { return kMotorTypeNames; }
const TDeviceTypeMenuItem *getSensorTypeNameTable() { return kSensorTypeNames; }
const TDeviceTypeMenuItem *getSensorModeNameTable() { return kSensorModeNames; }
const TDeviceTypeMenuItem *getServoTypeNameTable() { return kServoTypeNames; }

int getInteger(const CString &sText, bool &bOk) {
  bOk = false;
  const int nLength = sText.GetLength();
  int i = 0;
  while (i < nLength && bIsBlank(sText[i])) ++i;
  bool bNegative = false;
  if (i < nLength && (sText[i] == L'-' || sText[i] == L'+')) bNegative = sText[i++] == L'-';
  const int nFirstDigit = i;
  // Accumulate as a negative number so that INT_MIN fits.
  long long nValue = 0;
  for (; i < nLength && sText[i] >= L'0' && sText[i] <= L'9'; ++i) {
    nValue = nValue * 10 - (sText[i] - L'0');
    if (nValue < INT_MIN) return 0;
  }
  if (i == nFirstDigit) return 0;
  while (i < nLength && bIsBlank(sText[i])) ++i;
  if (i != nLength) return 0;
  if (!bNegative) {
    if (-nValue > INT_MAX) return 0;
    nValue = -nValue;
  }
  bOk = true;
  return static_cast<int>(nValue);
}
