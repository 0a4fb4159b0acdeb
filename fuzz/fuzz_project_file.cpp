// Reads arbitrary bytes as a project file: an error must name a place in the
// file, and an accepted file must hold values the tool can use.
#include <string>

#include "cli/ProjectFile.h"
#include "fuzz/FuzzSupport.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size) {
  const std::string sText(reinterpret_cast<const char *>(data), size);
  TProjectSettings settings;
  std::string sError;
  if (parseProjectText(sText, "robotcfg.toml", settings, sError)) {
    fuzzCheck(sError.empty(), "no message for an accepted file");
    fuzzCheck(!settings.bHasPlatform || (settings.nPlatformKind >= 0 && settings.nPlatformKind < kNumbOfPlatformKinds),
              "platform kind in range");
    fuzzCheck(!settings.bHasBoard || settings.nBoard >= 0, "board in range");
  } else {
    fuzzCheck(sError.rfind("robotcfg.toml:", 0) == 0, "an error names the file and its place");
  }
  return 0;
}
