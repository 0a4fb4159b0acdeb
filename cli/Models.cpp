// robotcfg models and robotcfg save-model.
#include <cstdio>
#include <string>

#include "cli/Commands.h"
#include "cli/ReadProgram.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/program/StandardModelList.h"

namespace {

// Prints the library's error boxes as the tool's own errors, while it lives.
class CErrorPrinter : public CHostMessageSink {
 public:
  CErrorPrinter() : m_pPrevious(setHostMessageSink(this)) {}
  ~CErrorPrinter() override { setHostMessageSink(m_pPrevious); }
  CErrorPrinter(const CErrorPrinter &) = delete;
  CErrorPrinter &operator=(const CErrorPrinter &) = delete;

  int showMessage(const THostMessage &message) override {
    std::fprintf(stderr, "robotcfg: %s\n", message.sText.toUtf8().c_str());
    ++m_nShown;
    return 1;
  }

  /// How many messages were printed.
  int shown() const { return m_nShown; }

 private:
  CHostMessageSink *m_pPrevious;
  int m_nShown = 0;
};

}  // namespace

int runModels(const TOptions &) {
  if (!pStandardRobotModels) installHostStandardModelList();
  CString sName;
  for (int n = 0; n < pStandardRobotModels->getNumbOfModels(); ++n) {
    pStandardRobotModels->getModelName(n, sName);
    std::printf("%s\n", sName.toUtf8().c_str());
  }
  return kExitOk;
}

int runSaveModel(const TOptions &options) {
  const std::string &sPath = options.files.front();
  TReadProgram program;
  if (!readProgram(sPath, program)) return kExitUsage;
  // A line the record could not read would be missing from the model.
  if (reportDiagnostics(sPath, program)) return kExitRejected;
  CErrorPrinter errors;
  if (program.pConfig->SaveConfigurationAsModelFile(fileTypeRobotModel, CString::fromUtf8(options.sOutputPath)))
    return kExitOk;
  if (errors.shown() == 0) std::fprintf(stderr, "robotcfg: cannot write '%s'\n", options.sOutputPath.c_str());
  return kExitUsage;
}
