// RAM map of a program: what the platform offers (TRamMemoryLimits) and what
// a program asks for and gets (TMemoryAllocation). Sizes are in bytes.
//
// The configuration record keeps the three sizes of a "MemorySize" line
// (`nMemorySizes`, -1 = auto) and the compile results the host reports
// (`updateCompileCodeSizeResults`); how a host maps them onto these records
// is the host's choice.
#pragma once

#include <cstdint>

/// What the current platform offers a program.
struct TRamMemoryLimits {
  int32_t nNumbOfTasks = 0;               ///< tasks a program may have
  int32_t nDefaultDatalogStreamSize = 0;  ///< default size of the datalog stream
  int32_t nDefaultDebugStreamSize = 0;    ///< default size of the debug stream
  int32_t nDefaultTaskStackSize = 0;      ///< default stack of one task
  int32_t nMaxSingleFunctionStack = 0;    ///< largest stack one function may use
  int32_t nReserved = 0;                  ///< not used by the library
  int32_t nOtherRamSize = 0;              ///< further RAM counted into the total; the host fills it

  /// Fills the platform's defaults from the current platform (`pPlatformData`):
  /// task stack, largest function stack, datalog stream, debug stream, task
  /// count. `nOtherRamSize` and `nReserved` are left as they are.
  void loadDefaultMemorySettings();
};

/// What a program asks for and, after calculateDerivedValues, what it gets.
struct TMemoryAllocation {
  int32_t nReserved1 = 0;               ///< not used by the library
  int32_t nDatalogStreamSize = -1;      ///< -1 = auto
  int32_t nDebugStreamSize = -1;        ///< -1 = auto
  int32_t nDefaultTaskStackSize = 0;    ///< stack size that counts as "not requested"
  int32_t nReserved2 = 0;               ///< not used by the library
  int32_t nNumbOfTasks = 0;             ///< tasks the program uses; < 1 = the platform's count
  int32_t nFixedRamSize = 0;            ///< RAM taken off before the streams are sized
  int32_t nReserved3 = 0;               ///< not used by the library
  int32_t nTotalUsed = 0;               ///< output: stacks, fixed RAM and both streams
  int32_t nTotalTaskStack = 0;          ///< output: all task stacks
  int32_t nTotalRam = 0;                ///< output: RAM the platform offers
  int32_t nRequestedTaskStackSize = 0;  ///< <= 0 = not requested

  /// Splits the two streams' combined size anew: the debug stream gets
  /// `fFraction` (0..1) of it, cut down to a multiple of 4; the datalog
  /// stream the rest.
  void setDebugStreamPercentage(float fFraction);
  /// The debug stream's share of both streams; 0.5 while the streams are
  /// sized automatically or empty.
  float getDebugStreamPercentage() const;
  /// True when the streams are sized automatically: either is negative, or
  /// the two differ by at most 4 bytes.
  bool bAutoSizeStreams() const;
  /// True when no task stack size was requested, or the requested one is the default.
  bool bAutoSizeTaskStack() const;
  /// Works out the totals, the task stacks and both stream sizes from the
  /// platform's limits and this allocation's requests.
  void calculateDerivedValues(const TRamMemoryLimits &limits);
};
