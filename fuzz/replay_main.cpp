// Runs a fuzz harness over stored inputs: every file named on the command
// line, and every file inside a named directory. Lets any compiler replay the
// corpus (crash regressions included) as an ordinary test.
#include <dirent.h>
#include <sys/stat.h>

#include <cstdint>
#include <cstdio>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size);

namespace {

// Replays one file; false when it cannot be read.
bool replayFile(const std::string &sPath) {
  std::ifstream in(sPath, std::ios::binary);
  if (!in) return false;
  const std::vector<char> bytes((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
  LLVMFuzzerTestOneInput(reinterpret_cast<const uint8_t *>(bytes.data()), bytes.size());
  return true;
}

}  // namespace

int main(int argc, char **argv) {
  int nReplayed = 0;
  for (int i = 1; i < argc; ++i) {
    const std::string sPath = argv[i];
    struct stat info {};
    if (::stat(sPath.c_str(), &info) != 0) {
      std::fprintf(stderr, "replay: cannot open %s\n", sPath.c_str());
      return 2;
    }
    if (!S_ISDIR(info.st_mode)) {
      if (!replayFile(sPath)) return 2;
      ++nReplayed;
      continue;
    }
    DIR *pDir = ::opendir(sPath.c_str());
    if (!pDir) return 2;
    while (const dirent *pEntry = ::readdir(pDir)) {
      const std::string sName = pEntry->d_name;
      if (sName == "." || sName == "..") continue;
      if (!replayFile(sPath + "/" + sName)) return 2;
      ++nReplayed;
    }
    ::closedir(pDir);
  }
  std::printf("replayed %d inputs\n", nReplayed);
  return 0;
}
