// The checker's findings: what a check of a program reports, one record per
// mistake, independent of how it is printed.
//
// The checker sits above the program layer: it reads a program on the
// reading road and compares what each line says with what the record keeps.
#pragma once

#include <string>
#include <vector>

/// How bad a finding is; the order is that of increasing weight.
enum class TSeverity { kNote, kWarning, kError };

/// A second place a finding refers to (the earlier definition, the other claimant).
struct TRelatedLocation {
  int nLine = 0;    ///< 1-based
  int nColumn = 0;  ///< 1-based, in characters; 0 when the whole line is meant
  std::string sMessage;
};

/// One finding. Columns count characters (Unicode code points) from 1; a tab is one.
struct TFinding {
  std::string sCode;  ///< "RC101"; see the rule table
  TSeverity nSeverity = TSeverity::kError;
  int nLine = 0;
  int nColumn = 0;  ///< 0 for a finding about the whole file
  std::string sMessage;
  std::vector<std::string> suggestions;  ///< words that would be accepted, best first
  std::vector<TRelatedLocation> related;
};

/// Lower-case word of a severity, as compilers print it.
const char *severityWord(TSeverity nSeverity);
