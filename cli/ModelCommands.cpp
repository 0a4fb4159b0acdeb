// show (text summary, --json, --svg), set and apply: the configuration as
// data, and edits made through the record's setters.
#include <cstdio>

#include "cli/Commands.h"
#include "cli/ReadProgram.h"
#include "cli/ShowSummary.h"
#include "robotconfig/model/ConfigurationDocument.h"
#include "robotconfig/model/ConfigurationEdits.h"
#include "robotconfig/model/WiringPicture.h"
#include "robotconfig/program/FileIO.h"

namespace {

using namespace robotconfig::model;

void writeStdout(const std::string &sBytes) { std::fwrite(sBytes.data(), 1, sBytes.size(), stdout); }

/// The document, text summary or picture that show prints for a configuration.
std::string showOutput(const CHostRobotConfiguration &config, const TOptions &options) {
  TDocumentOptions documentOptions;
  documentOptions.bAll = options.bAll;
  documentOptions.bChoices = options.bChoices;
  const nlohmann::ordered_json document = configurationDocument(config, documentOptions);
  if (options.bJson) return document.dump(2) + "\n";
  if (options.bSvg) return wiringPicture(document);
  return summaryText(document, options.bAll);
}

/// Applies the edits to the program's configuration and writes the program
/// (stdout, or the file with -i); nothing is written when any edit is refused.
int editProgram(const TOptions &options, const std::string &sPath, const std::vector<TEdit> &edits) {
  TReadProgram program;
  if (!readProgramNotingBoard(sPath, program)) return kExitUsage;
  // A line the record could not read would be lost by regenerating the block.
  if (reportDiagnostics(sPath, program)) return kExitRejected;
  CHostRobotConfiguration &config = *program.pConfig;
  const std::vector<std::string> refused = applyEdits(config, edits);
  for (const std::string &sMessage : refused)
    std::fprintf(stderr, "%s: error: %s\n", displayName(sPath).c_str(), sMessage.c_str());
  if (!refused.empty()) return kExitRejected;
  CString sBlock;
  if (!generateSettledBlock(config, sBlock)) {
    std::fprintf(stderr, "%s: error: the edited block does not settle when it is regenerated\n",
                 displayName(sPath).c_str());
    return kExitRejected;
  }
  const std::string sEdited = replaceConfigurationBlock(*program.pText, sBlock);
  if (!options.bInPlace) {
    writeStdout(sEdited);
    return kExitOk;
  }
  std::string sError;
  if (sEdited != program.pText->bytes() && !writeFileAtomically(sPath, sEdited, sError)) {
    std::fprintf(stderr, "robotcfg: %s\n", sError.c_str());
    return kExitUsage;
  }
  return kExitOk;
}

}  // namespace

int runShow(const TOptions &options) {
  if (options.files.empty()) {
    CHostRobotConfiguration config;
    CWarningPrinter warnings("robotcfg");
    config.clearConfigurationDefinition();
    writeStdout(showOutput(config, options));
    return kExitOk;
  }
  const std::string &sPath = options.files.front();
  TReadProgram program;
  if (!readProgramNotingBoard(sPath, program)) return kExitUsage;
  const bool bRejected = reportDiagnostics(sPath, program);
  writeStdout(showOutput(*program.pConfig, options));
  return bRejected ? kExitRejected : kExitOk;
}

int runSet(const TOptions &options) {
  std::vector<TEdit> edits;
  for (size_t n = 1; n < options.files.size(); ++n) {
    TEdit edit;
    std::string sError;
    if (!parseEditAssignment(options.files[n], edit, sError)) {
      std::fprintf(stderr, "robotcfg: %s\n", sError.c_str());
      return kExitUsage;
    }
    edits.push_back(edit);
  }
  return editProgram(options, options.files.front(), edits);
}

int runApply(const TOptions &options) {
  std::string sJson, sError;
  if (!readProgramFile(options.files[1], sJson, sError)) {
    std::fprintf(stderr, "robotcfg: %s\n", sError.c_str());
    return kExitUsage;
  }
  std::vector<TEdit> edits;
  if (!parseEditList(sJson, edits, sError)) {
    std::fprintf(stderr, "%s: error: %s\n", displayName(options.files[1]).c_str(), sError.c_str());
    return kExitUsage;
  }
  return editProgram(options, options.files.front(), edits);
}
