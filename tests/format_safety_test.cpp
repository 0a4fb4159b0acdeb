// `format -i` never loses a program: whatever goes wrong while rewriting it,
// the original stays intact, the tool says what happened and exits 2.
#include <gtest/gtest.h>

#include <sys/stat.h>
#include <unistd.h>

#include <dirent.h>

#include <fstream>
#include <sstream>
#include <string>

#include "robotconfig/program/FileIO.h"
#include "tests/subprocess.h"

namespace {

using testing_support::readFile;

using testing_support::runProcess;
using testing_support::runRobotcfg;
using testing_support::CTempDir;

// A program whose regenerated block differs from what it holds.
const std::string kProgram =
    "#pragma config(CPU_Parameters, x, 8000000)\n" + std::string(2000, '/') + "\nint main() { return 0; }\n";

void writeFile(const std::string &sPath, const std::string &sBytes) {
  std::ofstream(sPath, std::ios::binary) << sBytes;
}

// Names in a folder other than "." and "..".
int entriesIn(const std::string &sDir) {
  int n = 0;
  if (DIR *pDir = ::opendir(sDir.c_str())) {
    while (const dirent *pEntry = ::readdir(pDir))
      if (std::string(pEntry->d_name) != "." && std::string(pEntry->d_name) != "..") ++n;
    ::closedir(pDir);
  }
  return n;
}

TEST(FormatSafety, SymbolicLinkStaysALinkAndItsTargetIsRewritten) {
  CTempDir dir;
  writeFile(dir.file("target.c"), kProgram);
  ASSERT_EQ(::symlink("target.c", dir.file("link.c").c_str()), 0);
  const auto r = runRobotcfg({"format", "-i", "--platform", "arduino", dir.file("link.c")});
  EXPECT_EQ(r.nExit, 0) << r.sErr;
  struct stat info {};
  ASSERT_EQ(::lstat(dir.file("link.c").c_str(), &info), 0);
  EXPECT_TRUE(S_ISLNK(info.st_mode));
  EXPECT_NE(readFile(dir.file("target.c")), kProgram);
  EXPECT_NE(readFile(dir.file("target.c")).find("//*!!Code automatically generated"), std::string::npos);
  EXPECT_EQ(entriesIn(dir.path()), 2);  // no temporary file left behind
}

TEST(FormatSafety, FailedWriteLeavesTheProgramIntact) {
  CTempDir dir;
  writeFile(dir.file("p.c"), kProgram);
  // A file-size limit of one 512-byte block makes the write of the new text fail part-way.
  const auto r = runProcess({"/bin/sh", "-c", "ulimit -f 1; exec \"$0\" \"$@\"", ROBOTCFG_EXE, "format", "-i",
                             "--platform", "arduino", dir.file("p.c")});
  EXPECT_EQ(r.nExit, 2);
  // (A coverage build adds its own complaints about the limit after the tool's message.)
  const std::string sExpected = "robotcfg: cannot rewrite '" + dir.file("p.c") + "': File too large; the file is unchanged\n";
  EXPECT_EQ(r.sErr.substr(0, sExpected.size()), sExpected);
  EXPECT_EQ(readFile(dir.file("p.c")), kProgram);
  EXPECT_EQ(entriesIn(dir.path()), 1);
}

TEST(FormatSafety, ReadOnlyFolderLeavesTheProgramIntact) {
  if (::geteuid() == 0) GTEST_SKIP() << "permissions do not bind the superuser";
  CTempDir dir;
  writeFile(dir.file("p.c"), kProgram);
  ASSERT_EQ(::chmod(dir.path().c_str(), 0555), 0);
  const auto r = runRobotcfg({"format", "-i", "--platform", "arduino", dir.file("p.c")});
  ::chmod(dir.path().c_str(), 0755);
  EXPECT_EQ(r.nExit, 2);
  EXPECT_EQ(r.sErr, "robotcfg: cannot create a temporary file beside '" + dir.file("p.c") +
                        "': Permission denied; the file is unchanged\n");
  EXPECT_EQ(readFile(dir.file("p.c")), kProgram);
}

TEST(FormatSafety, VanishedFileIsNotRecreated) {
  CTempDir dir;
  std::string sError;
  EXPECT_FALSE(writeFileAtomically(dir.file("gone.c"), kProgram, sError));
  EXPECT_EQ(sError, "cannot rewrite '" + dir.file("gone.c") + "': No such file or directory");
  EXPECT_EQ(entriesIn(dir.path()), 0);
}

}  // namespace
