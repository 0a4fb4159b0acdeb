#include <nlohmann/json.hpp>

#include "robotconfig/checker/Render.h"
#include "robotconfig/checker/RuleTable.h"

namespace {

using json = nlohmann::ordered_json;

json findingToJson(const std::string &sFile, const TFinding &finding) {
  const TCheckRule *pRule = findCheckRule(finding.sCode.c_str());
  json related = json::array();
  for (const TRelatedLocation &location : finding.related)
    related.push_back({{"line", location.nLine}, {"column", location.nColumn}, {"message", location.sMessage}});
  return {{"file", sFile},
          {"code", finding.sCode},
          {"name", pRule ? pRule->pzName : ""},
          {"severity", severityWord(finding.nSeverity)},
          {"line", finding.nLine},
          {"column", finding.nColumn},
          {"message", finding.sMessage},
          {"suggestions", finding.suggestions},
          {"related", related}};
}

}  // namespace

std::string renderJson(const std::vector<TFileFindings> &files) {
  json document = json::array();
  for (const TFileFindings &file : files)
    for (const TFinding &finding : file.findings) document.push_back(findingToJson(file.sFile, finding));
  // Text that is not UTF-8 (a file's stray bytes) is replaced, never a reason to fail.
  return document.dump(2, ' ', false, json::error_handler_t::replace) + "\n";
}
