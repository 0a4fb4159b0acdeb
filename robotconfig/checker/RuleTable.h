// The table of the checker's rules: one row per code, the single source of
// the codes, their names, default severities and help texts.
#pragma once

#include <cstddef>

#include "robotconfig/checker/Finding.h"

/// One rule of the checker. Codes are never reused.
struct TCheckRule {
  const char *pzCode;     ///< "RC101"
  const char *pzName;     ///< kebab-case name
  TSeverity nSeverity;    ///< default severity
  const char *pzSummary;  ///< one line: what it finds
  const char *pzHelp;     ///< why it matters and what to do
};

/// Every rule, ordered by code.
const TCheckRule *checkRules(size_t &nCount);
/// The rule of a code; null when there is none.
const TCheckRule *findCheckRule(const char *pzCode);
