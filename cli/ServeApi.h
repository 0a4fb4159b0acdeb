// The JSON API of `robotcfg serve`, apart from any socket: each request is a
// method, a path and a body, each answer a status and a JSON body, so that
// the handling can be tested and fuzzed without a server.
#pragma once

#include <map>
#include <string>
#include <vector>

#include "robotconfig/model/ConfigurationEdits.h"

/// Largest request body the API reads.
constexpr size_t kMaxServeBodyBytes = 1 << 20;

struct TServeResponse {
  int nStatus = 200;
  std::string sBody;
  std::string sContentType = "application/json";
};

class CServeApi {
 public:
  /// `programs` are the only files the API opens, as the paths clients name them.
  explicit CServeApi(std::vector<std::string> programs);

  /// Handles one request to a path under /api/.
  TServeResponse handle(const std::string &sMethod, const std::string &sPath, const std::string &sBody);

 private:
  /// A program being edited: its bytes when loaded and the edits made since, in batches.
  struct TSession {
    std::string sLoadedBytes;
    std::vector<std::vector<robotconfig::model::TEdit>> batches;
  };

  TServeResponse programState(const std::string &sProgram, const TSession &session);
  TServeResponse load(const std::string &sProgram);
  TServeResponse edit(const std::string &sProgram, const std::string &sEditsJson);
  TServeResponse undo(const std::string &sProgram);
  TServeResponse save(const std::string &sProgram);

  std::vector<std::string> m_programs;
  std::map<std::string, TSession> m_sessions;
};

/// The programs a list of files and folders names: each file as given, and
/// the .c files under each folder (at most 1000, in name order).
std::vector<std::string> servedPrograms(const std::vector<std::string> &paths, std::string &sError);
