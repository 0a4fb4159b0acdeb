// Reading programs for the commands: the program's text, its configuration,
// the lines the configuration refused, and warnings printed as the tool's own.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/program/ProgramText.h"

/// Prints the library's messages as warnings of the file being read, while it lives.
class CWarningPrinter : public CHostMessageSink {
 public:
  explicit CWarningPrinter(std::string sFile);
  ~CWarningPrinter() override;
  CWarningPrinter(const CWarningPrinter &) = delete;
  CWarningPrinter &operator=(const CWarningPrinter &) = delete;

  /// Prints the message on one line; never silences later warnings.
  int showMessage(const THostMessage &message) override;

 private:
  std::string m_sFile;
  CHostMessageSink *m_pPrevious;
};

/// The name a path is reported under ("<stdin>" for "-", unless named).
std::string displayName(const std::string &sPath);
/// Names the program read from "-" (--stdin-filename); "" for none.
void setStdinFilename(const std::string &sName);
/// Where a program counts as being, for the files it names and its project
/// file: its path, or the --stdin-filename name for "-" ("" when none).
std::string programPath(const std::string &sPath);

/// One program read into a configuration.
struct TReadProgram {
  std::unique_ptr<CProgramText> pText;
  std::unique_ptr<CHostRobotConfiguration> pConfig;
  std::vector<TConfigurationDiagnostic> diagnostics;
};

/// Reads a program's bytes into `program` with a fresh record named after it,
/// without reading its configuration; false after printing why it cannot be read.
bool loadProgram(const std::string &sPath, TReadProgram &program);

/// Reads a program and its configuration; false (after printing why) when the
/// file cannot be read.
bool readProgram(const std::string &sPath, TReadProgram &program);

/// Prints the refused lines as FILE:LINE: error: MESSAGE; true when there were any.
bool reportDiagnostics(const std::string &sPath, const TReadProgram &program);

/// readProgram, noting on standard error when the program's board made the
/// IDE switch boards; every file starts from the command line's board.
bool readProgramNotingBoard(const std::string &sPath, TReadProgram &program);
