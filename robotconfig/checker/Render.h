// Printing findings: as compilers print them (text), as one JSON document,
// and as a SARIF 2.1.0 log for code-scanning services.
#pragma once

#include <string>
#include <vector>

#include "robotconfig/checker/Finding.h"

class CProgramText;

/// The findings of one file.
struct TFileFindings {
  std::string sFile;                       ///< the name the file is reported under
  const CProgramText *pProgram = nullptr;  ///< its text, for source excerpts; may be null
  std::vector<TFinding> findings;
};

struct TTextOptions {
  bool bShowSource = false;  ///< the offending line and a caret under the token
  bool bErrorsOnly = false;  ///< leave out warnings and notes
};

/// "FILE:LINE:COL: error: MESSAGE [RC101]" lines with their notes; a refusal
/// of a reader (RC001) keeps its own form "FILE:LINE: error: MESSAGE".
std::string renderText(const TFileFindings &file, const TTextOptions &options);
/// One JSON document: an array of findings (schema in docs/DIAGNOSTICS.md).
std::string renderJson(const std::vector<TFileFindings> &files);
/// A SARIF 2.1.0 log with one run, the rules that have findings, and results.
std::string renderSarif(const std::vector<TFileFindings> &files, const std::string &sToolVersion);
