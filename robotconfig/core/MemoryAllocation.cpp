// Memory sizes of a program: the MemorySize line in both directions, the
// compile results the host reports back, and the RAM map records.
#include "robotconfig/core/MemoryAllocation.h"

#include <algorithm>
#include <array>
#include <climits>
#include <cmath>
#include <cstdint>

#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"

namespace {

/// The word that leaves a size to the compiler.
constexpr const wchar_t *kAutoWord = L"auto";

/// Largest value of each MemorySize parameter (the first two share one).
constexpr int32_t kMaxStreamSize = 65535;
constexpr int32_t kMaxTaskStackSize = 4096;

/// Share the two streams split into when nothing says otherwise.
constexpr float kEvenShare = 0.5f;

/// Bytes the debug stream is sized in.
constexpr int64_t kDebugStreamGranule = 4;

/// `nValue` kept within the 32-bit range (sizes are stored as 32-bit words).
int32_t saturate(int64_t nValue) { return static_cast<int32_t>(std::clamp<int64_t>(nValue, INT32_MIN, INT32_MAX)); }

/// `fValue` truncated toward zero, kept within the 32-bit range; NaN gives 0.
int32_t truncateToInt(float fValue) {
  if (std::isnan(fValue)) return 0;
  const double fTruncated = std::trunc(static_cast<double>(fValue));
  return static_cast<int32_t>(std::clamp(fTruncated, static_cast<double>(INT32_MIN), static_cast<double>(INT32_MAX)));
}

/// Converts one MemorySize parameter: a number from -1 up to `nUpperBound`.
/// On success empties `sError`; otherwise sets its message and gives false.
bool bConvertMemorySize(const CString &sWord, int32_t nUpperBound, int32_t &nValue, CString &sError) {
  bool bNumber = false;
  const int nConverted = getInteger(sWord, bNumber);
  if (!bNumber) {
    sError.Format(L"'%s' is not a numeric value", sWord);
    return false;
  }
  if (nConverted < -1 || nConverted > nUpperBound) {
    sError.Format(L"'%s' is not in the range %d..%d", sWord, -1, nUpperBound);
    return false;
  }
  sError.Empty();
  nValue = nConverted;
  return true;
}

}  // namespace

// ---- RAM map ------------------------------------------------------------------

void TRamMemoryLimits::loadDefaultMemorySettings() {
  if (pPlatformData == nullptr) return;
  nDefaultTaskStackSize = pPlatformData->getDefaultSingleTaskStackSize();
  nMaxSingleFunctionStack = pPlatformData->getMaxSingleFunctionStackMemoryInBytes();
  nDefaultDatalogStreamSize = pPlatformData->getDefaultDatalogStreamSize();
  nDefaultDebugStreamSize = pPlatformData->getDefaultDebugStreamSize();
  nNumbOfTasks = pPlatformData->getNumbOfTasksPerProgramOnBrick();
}

void TMemoryAllocation::setDebugStreamPercentage(float fFraction) {
  const int64_t nTotal = int64_t{nDatalogStreamSize} + nDebugStreamSize;
  // A share outside 0..1 would size one stream negative.
  const float fShare = std::clamp(fFraction, 0.0f, 1.0f);
  int64_t nDebug = truncateToInt(static_cast<float>(nTotal) * fShare);
  nDebug -= nDebug % kDebugStreamGranule;
  nDebugStreamSize = saturate(nDebug);
  nDatalogStreamSize = saturate(nTotal - nDebug);
}

float TMemoryAllocation::getDebugStreamPercentage() const {
  const int64_t nTotal = int64_t{nDatalogStreamSize} + nDebugStreamSize;
  // An automatic ("negative") stream has no share of its own.
  if (nDatalogStreamSize < 0 || nDebugStreamSize < 0 || nTotal <= 0) return kEvenShare;
  return static_cast<float>(nDebugStreamSize) / static_cast<float>(nTotal);
}

bool TMemoryAllocation::bAutoSizeStreams() const {
  if (nDatalogStreamSize < 0 || nDebugStreamSize < 0) return true;
  const int64_t nDifference = int64_t{nDatalogStreamSize} - nDebugStreamSize;
  return nDifference >= -kDebugStreamGranule && nDifference <= kDebugStreamGranule;
}

bool TMemoryAllocation::bAutoSizeTaskStack() const {
  return nRequestedTaskStackSize < 0 || nRequestedTaskStackSize == nDefaultTaskStackSize;
}

void TMemoryAllocation::calculateDerivedValues(const TRamMemoryLimits &limits) {
  // 64-bit arithmetic throughout: the sizes come from the host and may be large.
  const int64_t nPlatformStacks = int64_t{limits.nNumbOfTasks} * limits.nDefaultTaskStackSize;
  const int64_t nTotal = int64_t{limits.nDefaultDatalogStreamSize} + limits.nDefaultDebugStreamSize +
                         limits.nOtherRamSize + nPlatformStacks;
  nTotalRam = saturate(nTotal);

  int64_t nStackPerTask = limits.nDefaultTaskStackSize;
  if (nNumbOfTasks >= 1) nStackPerTask = std::min<int64_t>(nPlatformStacks / nNumbOfTasks, limits.nMaxSingleFunctionStack);
  if (nRequestedTaskStackSize > 0) nStackPerTask = nRequestedTaskStackSize;
  const int64_t nTaskStacks = nNumbOfTasks >= 1 ? nNumbOfTasks * nStackPerTask : nPlatformStacks;
  nTotalTaskStack = saturate(nTaskStacks);

  const int64_t nAvailable = nTotal - nFixedRamSize - nTaskStacks;

  // The datalog stream's share: the program's own split, else the platform's, else even.
  float fDatalogShare = kEvenShare;
  const int64_t nRequestedStreams = int64_t{nDatalogStreamSize} + nDebugStreamSize;
  const int64_t nDefaultStreams = int64_t{limits.nDefaultDatalogStreamSize} + limits.nDefaultDebugStreamSize;
  if (nDatalogStreamSize >= 0 && nDebugStreamSize >= 0 && nRequestedStreams > 0)
    fDatalogShare = static_cast<float>(nDatalogStreamSize) / static_cast<float>(nRequestedStreams);
  else if (nDefaultStreams > 0)
    fDatalogShare = static_cast<float>(limits.nDefaultDatalogStreamSize) / static_cast<float>(nDefaultStreams);

  const int64_t nDatalog =
      limits.nDefaultDatalogStreamSize == 0 ? 0 : truncateToInt(static_cast<float>(nAvailable) * fDatalogShare);
  const int64_t nDebug = limits.nDefaultDebugStreamSize == 0 ? 0 : nAvailable - nDatalog;
  nDatalogStreamSize = saturate(nDatalog);
  nDebugStreamSize = saturate(nDebug);
  nTotalUsed = saturate(nTaskStacks + nFixedRamSize + nDatalog + nDebug);
}

// ---- The configuration record ------------------------------------------------------

void CRobotConfigurationBasic::updateCompileCodeSizeResults(int nSize1, int nSize2, int nSize3) {
  parseInfo.nCompileCodeSizeResults = {nSize1, nSize2, nSize3};
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineMemoryAllocation(const TTokenizedConfigParms &parms, bool,
                                                                          TLineNumber, CString &sError) {
  std::array<int32_t, kNumbOfMemorySizes> &sizes = settings.nMemorySizes;
  const CString &sFirst = parms.sParms[1];
  const CString &sSecond = parms.sParms[2];
  const CString &sThird = parms.sParms[3];
  // The first two sizes go together: either both are given or both are automatic.
  if (sFirst != kAutoWord && sSecond != kAutoWord) {
    if (!bConvertMemorySize(sFirst, kMaxStreamSize, sizes[0], sError)) return false;
    if (!bConvertMemorySize(sSecond, kMaxStreamSize, sizes[1], sError)) return false;
  } else {
    sizes[0] = -1;
    sizes[1] = -1;
  }
  if (sThird == kAutoWord) {
    sizes[2] = -1;
    return true;
  }
  return bConvertMemorySize(sThird, kMaxTaskStackSize, sizes[2], sError);
}

bool CRobotConfigurationBasic::buildSourceCodeForMemorySizes() {
  const std::array<int32_t, kNumbOfMemorySizes> &sizes = settings.nMemorySizes;
  const bool bAutoPair = sizes[0] < 0 || sizes[1] < 0;
  const bool bAutoThird = sizes[2] < 0;
  if (bAutoPair && bAutoThird) return false;
  CString sFirst(kAutoWord), sSecond(kAutoWord), sThird(kAutoWord);
  if (!bAutoPair) {
    sFirst.Format(L"%d", sizes[0]);
    sSecond.Format(L"%d", sizes[1]);
  }
  if (!bAutoThird) sThird.Format(L"%d", sizes[2]);
  CString sLine;
  sLine.Format(L"#pragma config(%s, %s, %s, %s)", TConfigTypeDefns::getConfigTypeName(configTypeMemorySize), sFirst,
               sSecond, sThird);
  addSourceLineToConfiguration(sLine);
  return true;
}
