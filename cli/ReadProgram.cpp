#include "cli/ReadProgram.h"

#include <cstdio>
#include <utility>

#include "robotconfig/host/Platform.h"
#include "robotconfig/program/FileIO.h"

CWarningPrinter::CWarningPrinter(std::string sFile)
    : m_sFile(std::move(sFile)), m_pPrevious(setHostMessageSink(this)) {}

CWarningPrinter::~CWarningPrinter() { setHostMessageSink(m_pPrevious); }

int CWarningPrinter::showMessage(const THostMessage &message) {
  // A message box's paragraphs become one line, as compilers print them.
  CString sText(message.sText);
  sText.Replace(L"\n \n", L" ");
  sText.Replace(L'\n', L' ');
  std::fprintf(stderr, "%s: warning: %s\n", m_sFile.c_str(), sText.toUtf8().c_str());
  return 0;
}

namespace {
std::string &stdinFilename() {
  static std::string sName;
  return sName;
}
}  // namespace

void setStdinFilename(const std::string &sName) { stdinFilename() = sName; }

std::string displayName(const std::string &sPath) {
  if (sPath != "-") return sPath;
  return stdinFilename().empty() ? "<stdin>" : stdinFilename();
}

std::string programPath(const std::string &sPath) { return sPath == "-" ? stdinFilename() : sPath; }

bool loadProgram(const std::string &sPath, TReadProgram &program) {
  std::string sBytes, sError;
  if (!readProgramFile(sPath, sBytes, sError)) {
    std::fprintf(stderr, "robotcfg: %s\n", sError.c_str());
    return false;
  }
  program.pText = std::make_unique<CProgramText>(std::move(sBytes));
  program.pConfig = std::make_unique<CHostRobotConfiguration>();
  program.pConfig->setPathName(CString::fromUtf8(programPath(sPath)));
  return true;
}

bool readProgram(const std::string &sPath, TReadProgram &program) {
  if (!loadProgram(sPath, program)) return false;
  CWarningPrinter warnings(displayName(sPath));
  program.diagnostics = readProgramConfiguration(*program.pConfig, *program.pText);
  return true;
}

bool reportDiagnostics(const std::string &sPath, const TReadProgram &program) {
  for (const TConfigurationDiagnostic &diagnostic : program.diagnostics)
    std::fprintf(stderr, "%s:%d: error: %s\n", displayName(sPath).c_str(), diagnostic.nLine,
                 diagnostic.sMessage.toUtf8().c_str());
  return !program.diagnostics.empty();
}

bool readProgramNotingBoard(const std::string &sPath, TReadProgram &program) {
  // Every file starts from the command line's board, whatever board an earlier one named.
  CHostSelectionScope scope;
  const TControllerBoardType nBoardBefore = pToggles->getIDECircuitBoardType();
  if (!readProgram(sPath, program)) return false;
  const TControllerBoardType nBoard = pToggles->getIDECircuitBoardType();
  if (nBoard != nBoardBefore)
    std::fprintf(stderr, "%s: note: now assuming board '%s' (%d)\n", displayName(sPath).c_str(),
                 CString(getCktBoardNameString(nBoard)).toUtf8().c_str(), nBoard);
  return true;
}
