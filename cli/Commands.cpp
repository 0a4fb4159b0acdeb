#include "cli/Commands.h"

#include <cstdio>

#include "cli/CheckReport.h"
#include "cli/InputFiles.h"
#include "cli/ReadProgram.h"
#include "cli/Terminal.h"
#include "cli/UnifiedDiff.h"
#include "robotconfig/program/FileIO.h"
#include "robotconfig/host/Platform.h"

namespace {

// The configuration block the record generates.
// The settled block of a program's configuration; false (after saying so) when it does not settle.
// `pHeld`, when given, tells whether the program already holds that block.
bool settledBlock(const std::string &sPath, const TReadProgram &program, CString &sBlock, bool *pHeld = nullptr) {
  std::vector<TConfigurationDiagnostic> refused;
  if (generateSettledBlock(*program.pConfig, sBlock, &refused, program.pText.get(), pHeld)) return true;
  // In the user's words: what to change, not what the writer did.
  if (refused.empty()) {
    std::fprintf(stderr,
                 "%s: error: the configuration cannot be written: each regeneration of the block gives another; "
                 "run 'robotcfg check' and change the lines it reports\n",
                 displayName(sPath).c_str());
  }
  for (const TConfigurationDiagnostic &line : refused)
    std::fprintf(stderr,
                 "%s: error: the configuration cannot be written back: a regenerated line would be refused (%s); "
                 "run 'robotcfg check' for the line to change\n",
                 displayName(sPath).c_str(), line.sMessage.toUtf8().c_str());
  return false;
}

void writeStdout(const std::string &sBytes) { std::fwrite(sBytes.data(), 1, sBytes.size(), stdout); }

}  // namespace

int runCheck(const TOptions &options) { return runCheckCommand(options); }

int runFormat(const TOptions &options) {
  int nStatus = kExitOk;
  auto fail = [&nStatus](int nCode) {
    if (nCode == kExitUsage || nStatus == kExitOk) nStatus = nCode;
  };
  for (const std::string &sPath : options.files) {
    TReadProgram program;
    TFileFindings findings;
    selectPlatformForProgram(sPath, options);
    if (!readAndCheckProgram(sPath, options, program, findings)) {
      fail(kExitUsage);
      continue;
    }
    printFindingsText(findings, options);
    // A line the checker finds wrong would be lost or changed by regenerating the block.
    if (bHasErrors(findings)) {
      fail(kExitRejected);
      continue;
    }
    CString sBlock;
    bool bHeld = false;
    if (!settledBlock(sPath, program, sBlock, &bHeld)) {
      fail(kExitRejected);
      continue;
    }
    if (options.bCheckOnly) {
      if (!bHeld) {
        std::fprintf(stderr, "%s: configuration block is not in generated form\n", displayName(sPath).c_str());
        if (options.bList) std::printf("%s\n", displayName(sPath).c_str());
        fail(kExitRejected);
      }
      continue;
    }
    const std::string sFormatted = bHeld ? program.pText->bytes() : replaceConfigurationBlock(*program.pText, sBlock);
    const bool bChanges = !bHeld;
    if (options.bInPlace) {
      std::string sError;
      if (bChanges && !writeFileAtomically(sPath, sFormatted, sError)) {
        std::fprintf(stderr, "robotcfg: %s\n", sError.c_str());
        fail(kExitUsage);
        continue;
      }
      if (bChanges && options.bList) std::printf("%s\n", displayName(sPath).c_str());
      if (bChanges && options.bVerbose) std::fprintf(stderr, "reformatted %s\n", displayName(sPath).c_str());
    } else if (options.bDiff || options.bList) {
      // Shows what would change, changes nothing, and fails as --check does.
      if (!bChanges) continue;
      if (options.bList) std::printf("%s\n", displayName(sPath).c_str());
      if (options.bDiff) writeStdout(colouredDiff(unifiedDiff(program.pText->bytes(), sFormatted, displayName(sPath))));
      fail(kExitRejected);
    } else {
      writeStdout(sFormatted);
    }
  }
  return nStatus;
}

int runGenerate(const TOptions &options) {
  const std::string &sPath = options.files.front();
  TReadProgram program;
  if (!readProgramNotingBoard(sPath, program)) return kExitUsage;
  if (reportDiagnostics(sPath, program)) return kExitRejected;
  CString sBlock;
  if (!settledBlock(sPath, program, sBlock)) return kExitRejected;
  writeStdout(encodeGeneratedBlock(sBlock, program.pText->lineEnding()));
  return kExitOk;
}
