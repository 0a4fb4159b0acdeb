// How check reports: the caret excerpt, JSON and SARIF documents, --Werror
// and -q, and format refusing what the checker calls an error.
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

#include "tests/subprocess.h"

namespace {

using testing_support::runRobotcfg;
using testing_support::TRunResult;

// A sensor type typo (error) after a motor type the platform replaces (warning).
const std::string kProgram =
    "#pragma config(Motor,  port1,           leftMotor,     tmotorNxt, openLoop)\n"
    "#pragma config(Sensor, in1,    bumper,\tsensorTuch)\n"
    "#pragma config(Sensor, in2,    bumper,         sensorTouch)\n";

TEST(CheckerOutput, TextWithSourceExcerpt) {
  const TRunResult r = runRobotcfg({"check", "--platform", "vexpic", "--show-source", "-"}, kProgram);
  EXPECT_EQ(r.nExit, 1);
  EXPECT_EQ(r.sErr,
            "<stdin>:1:56: warning: 'tmotorNxt' does not exist on VEX PIC and becomes 'tmotorStandard' [RC103]\n"
            "    1 | #pragma config(Motor,  port1,           leftMotor,     tmotorNxt, openLoop)\n"
            "      |                                                        ^~~~~~~~~\n"
            "<stdin>:2:40: error: 'sensorTuch' is not a sensor type on VEX PIC [RC101]\n"
            "    2 | #pragma config(Sensor, in1,    bumper,\tsensorTuch)\n"
            "      |                                       \t^~~~~~~~~~\n"
            "<stdin>:2:40: note: did you mean 'sensorTouch'?\n"
            "<stdin>:3:32: error: the name 'bumper' is already given to another device on line 2 [RC401]\n"
            "    3 | #pragma config(Sensor, in2,    bumper,         sensorTouch)\n"
            "      |                                ^~~~~~\n"
            "<stdin>:2:32: note: first given here\n"
            "    2 | #pragma config(Sensor, in1,    bumper,\tsensorTuch)\n"
            "      |                                ^~~~~~\n");
}

TEST(CheckerOutput, WerrorAndQuiet) {
  const std::string kWarningOnly = "#pragma config(Motor,  port1,           leftMotor,     tmotorNxt, openLoop)\n";
  EXPECT_EQ(runRobotcfg({"check", "--platform", "vexpic", "-"}, kWarningOnly).nExit, 0);
  const TRunResult r = runRobotcfg({"check", "--platform", "vexpic", "--Werror", "-"}, kWarningOnly);
  EXPECT_EQ(r.nExit, 1);
  EXPECT_NE(r.sErr.find(": error: 'tmotorNxt'"), std::string::npos);
  EXPECT_EQ(runRobotcfg({"check", "--platform", "vexpic", "-q", "-"}, kWarningOnly).sErr, "");
  // format writes nothing for an error, and writes (with the warning) otherwise.
  EXPECT_EQ(runRobotcfg({"format", "--platform", "vexpic", "-"}, kProgram).sOut, "");
  EXPECT_NE(runRobotcfg({"format", "--platform", "vexpic", "-"}, kWarningOnly).sOut.find("tmotorStandard"),
            std::string::npos);
}

TEST(CheckerOutput, JsonDocument) {
  const TRunResult r = runRobotcfg({"check", "--platform", "vexpic", "--format", "json", "-"}, kProgram);
  EXPECT_EQ(r.nExit, 1);
  const nlohmann::json document = nlohmann::json::parse(r.sOut);
  ASSERT_TRUE(document.is_array());
  const nlohmann::json expected = nlohmann::json::parse(R"({
    "file": "<stdin>", "code": "RC401", "name": "duplicate-name", "severity": "error", "line": 3, "column": 32,
    "message": "the name 'bumper' is already given to another device on line 2", "suggestions": [],
    "related": [{"line": 2, "column": 32, "message": "first given here"}]})");
  EXPECT_EQ(document.back(), expected);
}

TEST(CheckerOutput, SarifLog) {
  const TRunResult r = runRobotcfg({"check", "--platform", "vexpic", "--format", "sarif", "-"}, kProgram);
  const nlohmann::json log = nlohmann::json::parse(r.sOut);
  EXPECT_EQ(log["version"], "2.1.0");
  const nlohmann::json &run = log["runs"][0];
  EXPECT_EQ(run["tool"]["driver"]["rules"].size(), 3u);  // only the rules with results
  const nlohmann::json &result = run["results"][1];
  EXPECT_EQ(result["ruleId"], "RC101");
  EXPECT_EQ(run["tool"]["driver"]["rules"][result["ruleIndex"].get<int>()]["id"], "RC101");
  EXPECT_EQ(result["level"], "error");
  EXPECT_EQ(result["locations"][0]["physicalLocation"]["region"], nlohmann::json::parse(R"({"startLine": 2, "startColumn": 40})"));
  EXPECT_EQ(run["results"][2]["relatedLocations"][0]["physicalLocation"]["region"]["startLine"], 2);
}

}  // namespace
