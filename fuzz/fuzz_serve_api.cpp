// Hands arbitrary requests to the serve API: any method, path and body gets
// an answer with a status and a JSON body, and a refused request leaves the
// served file as it was.
#include <cstdio>
#include <filesystem>
#include <fstream>

#include <nlohmann/json.hpp>

#include "cli/ServeApi.h"
#include "fuzz/FuzzSupport.h"

namespace {

/// The one program the API may open: a file of the fuzzer's own.
const std::string &servedFile() {
  static const std::string sPath = [] {
    const std::string sFile = (std::filesystem::temp_directory_path() / "fuzz_serve_api_program.c").string();
    std::ofstream(sFile, std::ios::binary) << "#pragma config(Motor,  port2, left, tmotorVex393_MC29, openLoop)\n";
    return sFile;
  }();
  return sPath;
}

}  // namespace

// Input: the method byte (GET or POST), the path up to the first newline, then the body;
// "@" in the body stands for the served program's path.
extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size) {
  CHostSelectionScope scope;
  CCapturingMessageSink messages;
  selectPlatformFromInput(data, size);
  std::string sInput(reinterpret_cast<const char *>(data), size);
  const std::string sMethod = !sInput.empty() && (sInput[0] & 1) ? "POST" : "GET";
  if (!sInput.empty()) sInput.erase(0, 1);
  const size_t nNewline = sInput.find('\n');
  const std::string sPath = sInput.substr(0, nNewline);
  std::string sBody = nNewline == std::string::npos ? std::string() : sInput.substr(nNewline + 1);
  for (size_t n = sBody.find('@'); n != std::string::npos; n = sBody.find('@', n + servedFile().size()))
    sBody.replace(n, 1, servedFile());

  const std::string sBefore = [] {
    std::ifstream in(servedFile(), std::ios::binary);
    return std::string(std::istreambuf_iterator<char>(in), {});
  }();
  CServeApi api({servedFile()});
  // A load first, so that edits and saves reach the program.
  api.handle("POST", "/api/load", "{\"program\": \"" + servedFile() + "\"}");
  const TServeResponse response = api.handle(sMethod, sPath, sBody);
  fuzzCheck(response.nStatus >= 200 && response.nStatus < 600, "a status");
  fuzzCheck(!nlohmann::json::parse(response.sBody, nullptr, false).is_discarded(), "a JSON body");
  if (response.nStatus != 200) {
    std::ifstream in(servedFile(), std::ios::binary);
    fuzzCheck(std::string(std::istreambuf_iterator<char>(in), {}) == sBefore, "a refused request writes nothing");
  }
  return 0;
}
