#include "cli/CheckReport.h"

#include <unistd.h>

#include <cstdio>
#include <memory>

#include "cli/Commands.h"
#include "cli/InputFiles.h"
#include "cli/Terminal.h"
#include "robotconfig/checker/ProgramChecker.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/program/FileIO.h"

#ifndef ROBOTCONFIG_VERSION
#define ROBOTCONFIG_VERSION "0.1.0"
#endif

bool readAndCheckProgram(const std::string &sPath, const TOptions &options, TReadProgram &program,
                         TFileFindings &findings) {
  // Every file starts from the command line's board, whatever board an earlier one named.
  CHostSelectionScope scope;
  if (!loadProgram(sPath, program)) return false;
  TCheckOptions checkOptions;
  checkOptions.bBoardChosen = options.nBoard >= 0;
  TCheckResult result = checkProgram(*program.pConfig, *program.pText, checkOptions);
  program.diagnostics = std::move(result.refused);
  findings.sFile = displayName(sPath);
  findings.pProgram = program.pText.get();
  findings.findings = std::move(result.findings);
  // Nothing chose the platform: say how to choose it once for a whole folder.
  if (bPlatformUnchosen(sPath, options))
    for (TFinding &finding : findings.findings)
      if (finding.sCode == "RC501")
        finding.sMessage += "; to set the platform of a folder, run 'robotcfg init --platform NAME' in it";
  if (options.bWarningsAreErrors)
    for (TFinding &finding : findings.findings)
      if (finding.nSeverity == TSeverity::kWarning) finding.nSeverity = TSeverity::kError;
  return true;
}

bool bHasErrors(const TFileFindings &findings) {
  for (const TFinding &finding : findings.findings)
    if (finding.nSeverity == TSeverity::kError) return true;
  return false;
}

void printFindingsText(const TFileFindings &findings, const TOptions &options) {
  TTextOptions textOptions;
  // A caret excerpt helps a person at a terminal; logs and pipes get plain lines.
  textOptions.bShowSource = options.bShowSource || isatty(STDERR_FILENO);
  textOptions.bErrorsOnly = options.bQuiet;
  const std::string sText = colouredDiagnostics(renderText(findings, textOptions));
  std::fwrite(sText.data(), 1, sText.size(), stderr);
}

int runCheckCommand(const TOptions &options) {
  int nStatus = kExitOk;
  // Only a JSON or SARIF document needs every file's text and findings at the end;
  // text reports are printed file by file, so memory stays flat over any number of files.
  const bool bDocument = options.sReportFormat != "text";
  std::vector<TReadProgram> programs(bDocument ? options.files.size() : 0);
  std::vector<TFileFindings> reports;
  for (size_t i = 0; i < options.files.size(); ++i) {
    TFileFindings findings;
    TReadProgram single;
    selectPlatformForProgram(options.files[i], options);
    if (!readAndCheckProgram(options.files[i], options, bDocument ? programs[i] : single, findings)) {
      nStatus = kExitUsage;
      continue;
    }
    if (bHasErrors(findings) && nStatus == kExitOk) nStatus = kExitRejected;
    if (options.sReportFormat == "text") printFindingsText(findings, options);
    if (options.bQuiet) {
      std::vector<TFinding> kept;
      for (TFinding &finding : findings.findings)
        if (finding.nSeverity == TSeverity::kError) kept.push_back(std::move(finding));
      findings.findings = std::move(kept);
    }
    if (bDocument) reports.push_back(std::move(findings));
  }
  std::string sDocument;
  if (options.sReportFormat == "json") sDocument = renderJson(reports);
  if (options.sReportFormat == "sarif") sDocument = renderSarif(reports, ROBOTCONFIG_VERSION);
  std::fwrite(sDocument.data(), 1, sDocument.size(), stdout);
  return nStatus;
}
