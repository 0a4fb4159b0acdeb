// Files that no one would write by hand: the tool gives a clear result within
// bounded time and memory, never a crash.
#include <gtest/gtest.h>

#include <chrono>
#include <fstream>
#include <random>
#include <string>

#include "tests/subprocess.h"

namespace {

using testing_support::CTempDir;
using testing_support::runRobotcfg;

std::string writeTemp(const CTempDir &dir, const std::string &sName, const std::string &sBytes) {
  const std::string sPath = dir.file(sName);
  std::ofstream(sPath, std::ios::binary) << sBytes;
  return sPath;
}

TEST(HostileInput, BinaryDataNulBytesAndInvalidUtf8) {
  CTempDir dir;
  std::mt19937 random(7);
  std::string sBinary(1 << 16, '\0');
  for (char &c : sBinary) c = static_cast<char>(random());
  const std::string sMixed = std::string("#pragma config(DatalogSeries, a\0b, \xff\xfe, \"\x80\")\n", 44) +
                             "int x; // \xc0\xaf\n" + std::string(1000, '\0') + "\n";
  for (const std::string &sBytes : {sBinary, sMixed}) {
    const std::string sPath = writeTemp(dir, "p.c", sBytes);
    for (const char *pzCommand : {"check", "format", "generate", "show"}) {
      const auto r = runRobotcfg({pzCommand, "--platform", "arduino", sPath});
      EXPECT_TRUE(r.nExit == 0 || r.nExit == 1) << pzCommand << " exit " << r.nExit << "\n" << r.sErr;
    }
  }
  // What format keeps outside the block is byte for byte what the file held.
  const std::string sTail("\xff\xfe\x00\x80 tail\n", 10);
  const std::string sPath = writeTemp(dir, "q.c", "#pragma config(CLICK)\n" + sTail);
  const auto r = runRobotcfg({"format", "--platform", "arduino", sPath});
  EXPECT_EQ(r.nExit, 0);
  EXPECT_EQ(r.sOut.substr(r.sOut.size() - sTail.size()), sTail);
}

TEST(HostileInput, HugeLineAndMillionLinesFinishInBoundedTime) {
  CTempDir dir;
  const auto start = std::chrono::steady_clock::now();
  const std::string sHuge = writeTemp(dir, "huge.c", "int x; /* " + std::string(100u << 20, 'a') + " */\n");
  auto r = runRobotcfg({"check", "--platform", "arduino", sHuge});
  EXPECT_EQ(r.nExit, 0) << r.sErr;

  std::string sMany;
  sMany.reserve(40u << 20);
  // The sanitizers make every line about ten times dearer; a quarter of the
  // lines still shows that the cost grows with the lines and no faster.
#if defined(__SANITIZE_ADDRESS__)
  const int nLines = 250000;
#else
  const int nLines = 1000000;
#endif
  for (int i = 0; i < nLines; ++i) sMany += "#pragma config(DatalogSeries, " + std::to_string(i) + ", v)\n";
  const std::string sManyPath = writeTemp(dir, "many.c", sMany);
  r = runRobotcfg({"check", "--platform", "arduino", sManyPath});
  EXPECT_EQ(r.nExit, 0) << r.sErr.substr(0, 200);
  // Generous even for a sanitizer build on a loaded machine.
  EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(240));
}

}  // namespace
