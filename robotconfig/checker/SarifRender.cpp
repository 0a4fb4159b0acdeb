#include <map>
#include <nlohmann/json.hpp>

#include "robotconfig/checker/Render.h"
#include "robotconfig/checker/RuleTable.h"

namespace {

using json = nlohmann::ordered_json;

// SARIF levels are the severities' own words.
const char *sarifLevel(TSeverity nSeverity) { return severityWord(nSeverity); }

// A path as a relative URI reference: unreserved characters and '/' kept, the rest percent-encoded.
std::string uriOfPath(const std::string &sPath) {
  static const char *const kHex = "0123456789ABCDEF";
  std::string sUri;
  for (unsigned char c : sPath) {
    const bool bKeep = (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') || (c >= '0' && c <= '9') || c == '-' ||
                       c == '_' || c == '.' || c == '~' || c == '/';
    if (bKeep) {
      sUri += char(c);
    } else {
      sUri += '%';
      sUri += kHex[c >> 4];
      sUri += kHex[c & 15];
    }
  }
  return sUri.empty() ? "stdin" : sUri;
}

json physicalLocation(const std::string &sUri, int nLine, int nColumn) {
  json region = {{"startLine", nLine > 0 ? nLine : 1}};
  if (nLine > 0 && nColumn > 0) region["startColumn"] = nColumn;
  return {{"artifactLocation", {{"uri", sUri}}}, {"region", region}};
}

}  // namespace

std::string renderSarif(const std::vector<TFileFindings> &files, const std::string &sToolVersion) {
  // Only the rules that have results are listed, each once, in code order.
  std::map<std::string, int> ruleIndex;
  for (const TFileFindings &file : files)
    for (const TFinding &finding : file.findings) ruleIndex[finding.sCode] = 0;
  json rules = json::array();
  int nIndex = 0;
  for (auto &entry : ruleIndex) {
    entry.second = nIndex++;
    const TCheckRule *pRule = findCheckRule(entry.first.c_str());
    rules.push_back({{"id", entry.first},
                     {"name", pRule ? pRule->pzName : entry.first},
                     {"shortDescription", {{"text", pRule ? pRule->pzSummary : ""}}},
                     {"fullDescription", {{"text", pRule ? pRule->pzHelp : ""}}},
                     {"help", {{"text", pRule ? pRule->pzHelp : ""}}},
                     {"defaultConfiguration", {{"level", sarifLevel(pRule ? pRule->nSeverity : TSeverity::kError)}}}});
  }
  json results = json::array();
  for (const TFileFindings &file : files) {
    const std::string sUri = uriOfPath(file.sFile == "<stdin>" ? "" : file.sFile);
    for (const TFinding &finding : file.findings) {
      std::string sMessage = finding.sMessage;
      if (!finding.suggestions.empty()) {
        sMessage += " (did you mean";
        for (size_t i = 0; i < finding.suggestions.size(); ++i)
          sMessage += (i ? ", '" : " '") + finding.suggestions[i] + "'";
        sMessage += "?)";
      }
      json result = {{"ruleId", finding.sCode},
                     {"ruleIndex", ruleIndex[finding.sCode]},
                     {"level", sarifLevel(finding.nSeverity)},
                     {"message", {{"text", sMessage}}},
                     {"locations", json::array({{{"physicalLocation",
                                                  physicalLocation(sUri, finding.nLine, finding.nColumn)}}})}};
      if (!finding.related.empty()) {
        json related = json::array();
        int nId = 1;
        for (const TRelatedLocation &location : finding.related)
          related.push_back({{"id", nId++},
                             {"physicalLocation", physicalLocation(sUri, location.nLine, location.nColumn)},
                             {"message", {{"text", location.sMessage}}}});
        result["relatedLocations"] = related;
      }
      results.push_back(result);
    }
  }
  json log = {{"$schema", "https://json.schemastore.org/sarif-2.1.0.json"},
              {"version", "2.1.0"},
              {"runs", json::array({{{"tool", {{"driver", {{"name", "robotcfg"},
                                                           {"version", sToolVersion},
                                                           {"rules", rules}}}}},
                                     {"columnKind", "unicodeCodePoints"},
                                     {"results", results}}})}};
  return log.dump(2, ' ', false, json::error_handler_t::replace) + "\n";
}
