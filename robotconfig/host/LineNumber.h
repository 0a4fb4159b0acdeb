// Source positions kept by the configuration record for each definition.
#pragma once

#include <cstdint>

/// Two-word source position of a line. `nLine` is the 1-based line number
/// (0 = no line); `nSourceIndex` tells which source buffer the line belongs
/// to (-1 = none). The record stores these and never interprets them.
struct TLineNumber {
  int32_t nLine = 0;
  int32_t nSourceIndex = -1;

  TLineNumber() = default;
  constexpr TLineNumber(int32_t line, int32_t sourceIndex) : nLine(line), nSourceIndex(sourceIndex) {}

  bool operator==(const TLineNumber &o) const { return nLine == o.nLine && nSourceIndex == o.nSourceIndex; }
  bool operator!=(const TLineNumber &o) const { return !(*this == o); }
};

/// The position of no line.
extern const TLineNumber emptyLineNumber;
/// The position of the first line of the first source buffer.
extern const TLineNumber firstLineNumber;
