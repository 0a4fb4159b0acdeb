// Applies an arbitrary JSON list of edits to a configuration: the list is
// refused as a whole or applied; an applied list leaves a record whose block
// reads back as the record, and the document of any record is well formed.
#include "fuzz/FuzzSupport.h"
#include "robotconfig/model/ConfigurationDocument.h"
#include "robotconfig/model/ConfigurationEdits.h"
#include "robotconfig/model/WiringPicture.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size) {
  CHostSelectionScope scope;
  CCapturingMessageSink messages;
  selectPlatformFromInput(data, size);
  std::vector<robotconfig::model::TEdit> edits;
  std::string sError;
  if (!robotconfig::model::parseEditList(std::string(reinterpret_cast<const char *>(data), size), edits, sError)) {
    fuzzCheck(!sError.empty() && edits.empty(), "a refused list says why and gives no edits");
    return 0;
  }
  CHostRobotConfiguration config;
  config.clearConfigurationDefinition();
  const CHostRobotConfiguration before(config);
  const std::vector<std::string> refused = robotconfig::model::applyEdits(config, edits);
  if (!refused.empty()) {
    fuzzCheck(config.compareConfiguration(before) == configCompareSame, "refused edits change nothing");
    return 0;
  }
  fuzzCheck(robotconfig::model::checkBlockReadsBack(config).empty(), "applied edits read back");
  const nlohmann::ordered_json doc = robotconfig::model::configurationDocument(config, {true, true});
  fuzzCheck(doc.contains("motors") && !robotconfig::model::wiringPicture(doc).empty(), "the document is drawn");
  return 0;
}
