// What the library accepts comes back whole: a program is read, its block
// written, the block read again; the two records compare the same and the
// second writing gives the same text.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "robotconfig/host/Platform.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/program/ProgramText.h"

namespace {

std::string messagesOf(const std::vector<TConfigurationDiagnostic> &diagnostics) {
  std::string s;
  for (const TConfigurationDiagnostic &d : diagnostics) s += std::to_string(d.nLine) + ": " + d.sMessage.toUtf8() + "\n";
  return s;
}

/// The block `rec` writes, as UTF-8 with "\n" line ends.
std::string blockOf(CRobotConfigurationBasic &rec) {
  CString sText;
  rec.buildSourceCodeForConfiguration(sText, false);
  return encodeGeneratedBlock(sText, "\n");
}

/// Reads `sProgram` into `first`, writes it, reads the block into `second`
/// and checks that both records and both writings agree; returns the block.
std::string roundTrip(const std::string &sProgram, CHostRobotConfiguration &first, CHostRobotConfiguration &second) {
  const std::vector<TConfigurationDiagnostic> refused = readProgramConfiguration(first, CProgramText(sProgram));
  EXPECT_TRUE(refused.empty()) << messagesOf(refused);
  const std::string sBlock = blockOf(first);
  const std::vector<TConfigurationDiagnostic> again = readProgramConfiguration(second, CProgramText(sBlock));
  EXPECT_TRUE(again.empty()) << messagesOf(again) << sBlock;
  EXPECT_EQ(first.compareConfiguration(second), configCompareSame) << sBlock;
  EXPECT_EQ(blockOf(second), sBlock);
  return sBlock;
}

class LosslessRoundTrip : public ::testing::Test {
 protected:
  CHostSelectionScope scope;
};

TEST_F(LosslessRoundTrip, WordsWithANulInsideAreNotTheWord) {
  selectHostPlatform(platformArduino);
  static const char kProgram[] =
      "#pragma config(MemorySize\0zz, 100, 100, 100)\n"
      "#pragma config(Sensor, dgtl2, bump, sensorTouch\0zz)\n";
  CHostRobotConfiguration rec;
  const std::vector<TConfigurationDiagnostic> refused =
      readProgramConfiguration(rec, CProgramText(std::string(kProgram, sizeof kProgram - 1)));
  ASSERT_EQ(refused.size(), 1u) << messagesOf(refused);
  EXPECT_EQ(refused[0].sMessage.str(), std::wstring(L"Bad parameter type: 'MemorySize\0zz'", 36));
  EXPECT_EQ(blockOf(rec).find("sensorTouch"), std::string::npos);
}

}  // namespace
