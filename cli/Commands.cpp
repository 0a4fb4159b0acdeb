#include "cli/Commands.h"

#include <cstdio>
#include <memory>

#include "host/FileIO.h"
#include "host/HostConfiguration.h"
#include "host/HostMessages.h"
#include "host/ProgramText.h"

namespace {

// Prints the library's messages as warnings of the file being read.
class CWarningPrinter : public CHostMessageSink {
 public:
  explicit CWarningPrinter(std::string sFile) : m_sFile(std::move(sFile)), m_pPrevious(setHostMessageSink(this)) {}
  ~CWarningPrinter() override { setHostMessageSink(m_pPrevious); }
  CWarningPrinter(const CWarningPrinter &) = delete;
  CWarningPrinter &operator=(const CWarningPrinter &) = delete;

  int showMessage(const THostMessage &message) override {
    // A message box's paragraphs become one line, as compilers print them.
    CString sText(message.sText);
    sText.Replace(L"\n \n", L" ");
    sText.Replace(L'\n', L' ');
    std::fprintf(stderr, "%s: warning: %s\n", m_sFile.c_str(), sText.toUtf8().c_str());
    return 0;  // never silences later warnings
  }

 private:
  std::string m_sFile;
  CHostMessageSink *m_pPrevious;
};

std::string displayName(const std::string &sPath) { return sPath == "-" ? "<stdin>" : sPath; }

// One program read into a configuration.
struct TReadProgram {
  std::unique_ptr<CProgramText> pText;
  std::unique_ptr<CHostRobotConfiguration> pConfig;
  std::vector<TConfigurationDiagnostic> diagnostics;
};

// Reads a program and its configuration; false (after printing why) when the
// file cannot be read.
bool readProgram(const std::string &sPath, TReadProgram &program) {
  std::string sBytes, sError;
  if (!readProgramFile(sPath, sBytes, sError)) {
    std::fprintf(stderr, "robotcfg: %s\n", sError.c_str());
    return false;
  }
  program.pText = std::make_unique<CProgramText>(std::move(sBytes));
  program.pConfig = std::make_unique<CHostRobotConfiguration>();
  program.pConfig->setPathName(CString::fromUtf8(sPath));
  CWarningPrinter warnings(displayName(sPath));
  program.diagnostics = readProgramConfiguration(*program.pConfig, *program.pText);
  return true;
}

// Prints the refused lines as FILE:LINE: error: MESSAGE; true when there were any.
bool reportDiagnostics(const std::string &sPath, const TReadProgram &program) {
  for (const TConfigurationDiagnostic &diagnostic : program.diagnostics)
    std::fprintf(stderr, "%s:%d: error: %s\n", displayName(sPath).c_str(), diagnostic.nLine,
                 diagnostic.sMessage.toUtf8().c_str());
  return !program.diagnostics.empty();
}

// The configuration block the record generates.
CString generatedBlock(CRobotConfigurationBasic &config) {
  CString sGenerated;
  config.buildSourceCodeForConfiguration(sGenerated, false);
  return sGenerated;
}

void writeStdout(const std::string &sBytes) { std::fwrite(sBytes.data(), 1, sBytes.size(), stdout); }

}  // namespace

int runCheck(const TOptions &options) {
  int nStatus = kExitOk;
  for (const std::string &sPath : options.files) {
    TReadProgram program;
    if (!readProgram(sPath, program)) {
      nStatus = kExitUsage;
      continue;
    }
    if (reportDiagnostics(sPath, program) && nStatus == kExitOk) nStatus = kExitRejected;
  }
  return nStatus;
}

int runFormat(const TOptions &options) {
  int nStatus = kExitOk;
  auto fail = [&nStatus](int nCode) {
    if (nCode == kExitUsage || nStatus == kExitOk) nStatus = nCode;
  };
  for (const std::string &sPath : options.files) {
    TReadProgram program;
    if (!readProgram(sPath, program)) {
      fail(kExitUsage);
      continue;
    }
    // A line the record could not read would be lost by regenerating the block.
    if (reportDiagnostics(sPath, program)) {
      fail(kExitRejected);
      continue;
    }
    const std::string sFormatted = replaceConfigurationBlock(*program.pText, generatedBlock(*program.pConfig));
    if (options.bCheckOnly) {
      if (sFormatted != program.pText->bytes()) {
        std::fprintf(stderr, "%s: configuration block is not in generated form\n", displayName(sPath).c_str());
        fail(kExitRejected);
      }
    } else if (options.bInPlace) {
      std::string sError;
      if (sFormatted != program.pText->bytes() && !writeFileAtomically(sPath, sFormatted, sError)) {
        std::fprintf(stderr, "robotcfg: %s\n", sError.c_str());
        fail(kExitUsage);
      }
    } else {
      writeStdout(sFormatted);
    }
  }
  return nStatus;
}

int runGenerate(const TOptions &options) {
  const std::string &sPath = options.files.front();
  TReadProgram program;
  if (!readProgram(sPath, program)) return kExitUsage;
  if (reportDiagnostics(sPath, program)) return kExitRejected;
  writeStdout(encodeGeneratedBlock(generatedBlock(*program.pConfig), program.pText->lineEnding()));
  return kExitOk;
}

int runShow(const TOptions &options) {
  std::string sOut;
  if (options.files.empty()) {
    CHostRobotConfiguration config;
    CWarningPrinter warnings("robotcfg");
    config.clearConfigurationDefinition();
    printConfiguration(config, sOut);
    writeStdout(sOut);
    return kExitOk;
  }
  const std::string &sPath = options.files.front();
  TReadProgram program;
  if (!readProgram(sPath, program)) return kExitUsage;
  const bool bRejected = reportDiagnostics(sPath, program);
  printConfiguration(*program.pConfig, sOut);
  writeStdout(sOut);
  return bRejected ? kExitRejected : kExitOk;
}
