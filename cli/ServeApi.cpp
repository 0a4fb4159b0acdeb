#include "cli/ServeApi.h"

#include <algorithm>
#include <filesystem>

#include <nlohmann/json.hpp>

#include "robotconfig/checker/ProgramChecker.h"
#include "robotconfig/checker/Render.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/model/ConfigurationDocument.h"
#include "robotconfig/model/WiringPicture.h"
#include "robotconfig/program/FileIO.h"
#include "robotconfig/program/ProgramText.h"

namespace {

using json = nlohmann::json;
using robotconfig::model::TEdit;

/// Most programs a folder contributes.
constexpr size_t kMaxProgramsPerFolder = 1000;

TServeResponse answer(int nStatus, const json &body) { return {nStatus, body.dump(), "application/json"}; }
TServeResponse failure(int nStatus, const std::string &sMessage) { return answer(nStatus, json{{"error", sMessage}}); }

/// The configuration lines of a text, one string a line, without line ends.
std::vector<std::string> blockLines(const std::string &sText) {
  std::vector<std::string> lines;
  const CProgramText program(sText);
  for (size_t n = 0; n < program.lines().size(); ++n) {
    const std::string sLine(program.lineText(n));
    if (sLine.rfind("#pragma config", 0) == 0) lines.push_back(sLine);
  }
  return lines;
}

/// A line diff of two short lists: kept lines with "  ", removed "- ", added "+ ".
json lineDiff(const std::vector<std::string> &before, const std::vector<std::string> &after) {
  const size_t nA = before.size(), nB = after.size();
  std::vector<std::vector<int>> common(nA + 1, std::vector<int>(nB + 1, 0));
  for (size_t i = nA; i-- > 0;)
    for (size_t j = nB; j-- > 0;)
      common[i][j] = before[i] == after[j] ? common[i + 1][j + 1] + 1 : std::max(common[i + 1][j], common[i][j + 1]);
  json diff = json::array();
  size_t i = 0, j = 0;
  while (i < nA || j < nB) {
    if (i < nA && j < nB && before[i] == after[j]) {
      diff.push_back("  " + before[i++]);
      ++j;
    } else if (j < nB && (i == nA || common[i][j + 1] >= common[i + 1][j])) {
      diff.push_back("+ " + after[j++]);
    } else {
      diff.push_back("- " + before[i++]);
    }
  }
  return diff;
}

/// Reads a request body that must be a JSON object naming a program.
bool readRequest(const std::string &sBody, json &request, std::string &sProgram, std::string &sError) {
  request = json::parse(sBody, nullptr, false);
  if (request.is_discarded() || !request.is_object()) {
    sError = "the request body must be a JSON object";
    return false;
  }
  const auto program = request.find("program");
  if (program == request.end() || !program->is_string()) {
    sError = "the request must name a \"program\"";
    return false;
  }
  sProgram = program->get<std::string>();
  return true;
}

/// The program's configuration after the session's edits; false with a message when the file has rejected lines.
struct TEditedProgram {
  std::unique_ptr<CProgramText> pText;
  CHostRobotConfiguration config;
  std::vector<TConfigurationDiagnostic> refused;
};

void readEdited(const std::string &sBytes, const std::vector<std::vector<TEdit>> &batches, TEditedProgram &edited) {
  edited.pText = std::make_unique<CProgramText>(sBytes);
  edited.refused = readProgramConfiguration(edited.config, *edited.pText);
  for (const std::vector<TEdit> &batch : batches) robotconfig::model::applyEdits(edited.config, batch);
}

}  // namespace

CServeApi::CServeApi(std::vector<std::string> programs) : m_programs(std::move(programs)) {}

TServeResponse CServeApi::programState(const std::string &sProgram, const TSession &session) {
  TEditedProgram edited;
  readEdited(session.sLoadedBytes, session.batches, edited);
  CString sBlock;
  robotconfig::model::TDocumentOptions options;
  options.bAll = true;
  options.bChoices = true;
  const nlohmann::ordered_json document = robotconfig::model::configurationDocument(edited.config, options);
  generateSettledBlock(edited.config, sBlock);
  const std::string sEditedText = edited.refused.empty() ? replaceConfigurationBlock(*edited.pText, sBlock)
                                                         : session.sLoadedBytes;
  TFileFindings findings;
  findings.sFile = sProgram;
  {
    CHostSelectionScope scope;
    findings.findings = checkProgramText(CProgramText(sEditedText)).findings;
  }
  json state;
  state["program"] = sProgram;
  state["document"] = json::parse(document.dump());
  state["block"] = encodeGeneratedBlock(sBlock, "\n");
  state["diff"] = lineDiff(blockLines(session.sLoadedBytes), blockLines(sEditedText));
  state["findings"] = json::parse(renderJson({findings}), nullptr, false);
  state["picture"] = robotconfig::model::wiringPicture(document);
  state["edits"] = session.batches.size();
  state["editable"] = edited.refused.empty();
  return answer(200, state);
}

TServeResponse CServeApi::load(const std::string &sProgram) {
  std::string sBytes, sError;
  if (!readProgramFile(sProgram, sBytes, sError)) return failure(500, sError);
  TSession &session = m_sessions[sProgram];
  session = TSession{std::move(sBytes), {}};
  return programState(sProgram, session);
}

TServeResponse CServeApi::edit(const std::string &sProgram, const std::string &sEditsJson) {
  auto found = m_sessions.find(sProgram);
  if (found == m_sessions.end()) return failure(409, "load the program first");
  std::vector<TEdit> edits;
  std::string sError;
  if (!robotconfig::model::parseEditList(sEditsJson, edits, sError)) return failure(400, sError);
  TEditedProgram edited;
  readEdited(found->second.sLoadedBytes, found->second.batches, edited);
  if (!edited.refused.empty())
    return failure(422, "the program has lines the configuration refuses; fix them in the file first");
  const std::vector<std::string> refused = robotconfig::model::applyEdits(edited.config, edits);
  if (!refused.empty()) return answer(422, json{{"error", refused.front()}, {"errors", refused}});
  found->second.batches.push_back(edits);
  return programState(sProgram, found->second);
}

TServeResponse CServeApi::undo(const std::string &sProgram) {
  auto found = m_sessions.find(sProgram);
  if (found == m_sessions.end()) return failure(409, "load the program first");
  if (!found->second.batches.empty()) found->second.batches.pop_back();
  return programState(sProgram, found->second);
}

TServeResponse CServeApi::save(const std::string &sProgram) {
  auto found = m_sessions.find(sProgram);
  if (found == m_sessions.end()) return failure(409, "load the program first");
  TSession &session = found->second;
  std::string sNow, sError;
  if (!readProgramFile(sProgram, sNow, sError)) return failure(500, sError);
  if (sNow != session.sLoadedBytes)
    return answer(409, json{{"error", "the file changed on disk since it was loaded; reload it to see the change"},
                            {"conflict", true}});
  TEditedProgram edited;
  readEdited(session.sLoadedBytes, session.batches, edited);
  if (!edited.refused.empty()) return failure(422, "the program has lines the configuration refuses; nothing saved");
  CString sBlock;
  if (!generateSettledBlock(edited.config, sBlock)) return failure(422, "the block does not settle; nothing saved");
  const std::string sSaved = replaceConfigurationBlock(*edited.pText, sBlock);
  if (sSaved != sNow && !writeFileAtomically(sProgram, sSaved, sError)) return failure(500, sError);
  session = TSession{sSaved, {}};
  return answer(200, json{{"saved", true}});
}

TServeResponse CServeApi::handle(const std::string &sMethod, const std::string &sPath, const std::string &sBody) {
  // Every request runs on the command line's host selection; a program's board line moves it only meanwhile.
  CHostSelectionScope scope;
  CCapturingMessageSink quiet;
  if (sBody.size() > kMaxServeBodyBytes) return failure(413, "the request body is too large");
  if (sPath == "/api/programs") {
    if (sMethod != "GET") return failure(405, "use GET");
    return answer(200, json{{"programs", m_programs}});
  }
  static const char *const kActions[] = {"/api/load", "/api/edit", "/api/undo", "/api/save"};
  if (std::find_if(std::begin(kActions), std::end(kActions), [&](const char *pz) { return sPath == pz; }) ==
      std::end(kActions))
    return failure(404, "no such API path");
  if (sMethod != "POST") return failure(405, "use POST");
  json request;
  std::string sProgram, sError;
  if (!readRequest(sBody, request, sProgram, sError)) return failure(400, sError);
  if (std::find(m_programs.begin(), m_programs.end(), sProgram) == m_programs.end())
    return failure(403, "'" + sProgram + "' is not one of the programs this server opens");
  if (sPath == "/api/load") return load(sProgram);
  if (sPath == "/api/undo") return undo(sProgram);
  if (sPath == "/api/save") return save(sProgram);
  const auto edits = request.find("edits");
  if (edits == request.end()) return failure(400, "the request must hold \"edits\"");
  return edit(sProgram, edits->dump());
}

std::vector<std::string> servedPrograms(const std::vector<std::string> &paths, std::string &sError) {
  namespace fs = std::filesystem;
  std::vector<std::string> programs;
  for (const std::string &sPath : paths) {
    std::error_code error;
    if (fs::is_directory(sPath, error)) {
      std::vector<std::string> found;
      for (fs::recursive_directory_iterator it(sPath, fs::directory_options::skip_permission_denied, error), end;
           !error && it != end && found.size() < kMaxProgramsPerFolder; it.increment(error))
        if (it->is_regular_file(error) && it->path().extension() == ".c") found.push_back(it->path().string());
      std::sort(found.begin(), found.end());
      programs.insert(programs.end(), found.begin(), found.end());
    } else if (fs::is_regular_file(sPath, error)) {
      programs.push_back(sPath);
    } else {
      sError = "cannot serve '" + sPath + "': no such file or folder";
      return {};
    }
  }
  return programs;
}
