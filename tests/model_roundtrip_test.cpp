// Edits through the model, on every platform kind: whatever edit is accepted,
// the written block reads back as the edited record.
#include <gtest/gtest.h>

#include <random>

#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/model/ConfigurationDocument.h"
#include "robotconfig/model/ConfigurationEdits.h"
#include "robotconfig/program/ProgramText.h"

namespace {

using namespace robotconfig::model;
using json = nlohmann::ordered_json;

/// A random element of a list of words; "none" for an empty list.
std::string pick(std::mt19937 &random, const json &words) {
  if (!words.is_array() || words.empty()) return "none";
  return words[std::uniform_int_distribution<size_t>(0, words.size() - 1)(random)].get<std::string>();
}

/// A random edit among those the document's choices offer, now and then a
/// value no menu offers.
TEdit randomSingleEdit(std::mt19937 &random, const json &doc) {
  const json &choices = doc["choices"];
  auto chance = [&](int nPercent) { return std::uniform_int_distribution<int>(0, 99)(random) < nPercent; };
  auto device = [&](const char *pzList) -> const json * {
    const json &list = doc[pzList];
    if (list.empty()) return nullptr;
    return &list[std::uniform_int_distribution<size_t>(0, list.size() - 1)(random)];
  };
  static const char *const kNames[] = {"leftDrive", "arm", "bumper", "_x1", "sonar", ""};
  const std::string sName = kNames[std::uniform_int_distribution<size_t>(0, 5)(random)];
  switch (std::uniform_int_distribution<int>(0, 11)(random)) {
    case 0:
    case 1:
      if (const json *pMotor = device("motors")) {
        const std::string sPort = "motor." + (*pMotor)["port"].get<std::string>();
        if (chance(50)) return {sPort + ".type", chance(15) ? "none" : pick(random, (*pMotor)["choices"]["type"])};
        static const char *const kFlags[] = {".reversed", ".pidControl", ".encoder"};
        switch (std::uniform_int_distribution<int>(0, 4)(random)) {
          case 0: return {sPort + ".name", sName};
          case 1: return {sPort + ".driveSide", pick(random, (*pMotor)["choices"]["driveSide"])};
          case 2: return {sPort + ".encoderPort", pick(random, (*pMotor)["choices"]["encoderPort"])};
          default: return {sPort + kFlags[std::uniform_int_distribution<int>(0, 2)(random)], chance(50) ? "true" : "false"};
        }
      }
      break;
    case 2:
    case 3:
      if (const json *pSensor = device("sensors")) {
        const std::string sPort = "sensor." + (*pSensor)["port"].get<std::string>();
        if (chance(60)) return {sPort, chance(15) ? "none" : pick(random, (*pSensor)["choices"]["type"])};
        if (chance(50)) return {sPort + ".name", sName};
        return {sPort + ".mode", pick(random, (*pSensor)["choices"]["mode"])};
      }
      break;
    case 4:
      if (const json *pServo = device("servos")) {
        const std::string sPort = "servo." + (*pServo)["port"].get<std::string>();
        return chance(50) ? TEdit{sPort, pick(random, (*pServo)["choices"]["type"])} : TEdit{sPort + ".name", sName};
      }
      break;
    case 5: return {"board", pick(random, choices["board"])};
    case 6: return {"drive.type", pick(random, choices["driveTrain"])};
    case 7: return {chance(50) ? "drive.type" : "gripper.type", pick(random, chance(50) ? choices["driveTrain"] : choices["gripperArm"])};
    case 8: return {"joystick.type", pick(random, choices["joystickDrive"])};
    case 9:
      if (const json *pUart = device("uarts"))
        return {"uart." + (*pUart)["port"].get<std::string>() + (chance(50) ? ".use" : ".baud"),
                pick(random, chance(50) ? choices["uartUse"] : choices["baudRate"])};
      break;
    case 10: return {"programType", pick(random, choices["programType"])};
    default: return {"firmware." + pick(random, choices["firmware"]), chance(50) ? "true" : "false"};
  }
  return {"motor.nowhere", "tmotorNone"};
}

/// A random edit; a drive-train type comes with a motor for each of its slots.
std::vector<TEdit> randomEdits(std::mt19937 &random, const json &doc) {
  std::vector<TEdit> edits = {randomSingleEdit(random, doc)};
  if (edits[0].sPath == "drive.type" || edits[0].sPath == "gripper.type")
    for (int nSlot = 1; nSlot <= 4; ++nSlot)
      edits.push_back({edits[0].sPath.substr(0, edits[0].sPath.find('.')) + ".motor" + std::to_string(nSlot),
                       pick(random, doc["choices"]["motorPorts"])});
  return edits;
}

/// Offset of the first byte in which two settings blocks differ; -1 when none.
int firstDifferentByte(const TConfigurationSettings &a, const TConfigurationSettings &b) {
  const auto *pA = reinterpret_cast<const unsigned char *>(&a);
  const auto *pB = reinterpret_cast<const unsigned char *>(&b);
  for (size_t n = 0; n < sizeof a; ++n)
    if (pA[n] != pB[n]) return static_cast<int>(n);
  return -1;
}

/// "" when the block `config` writes reads back as `config`; else the block.
std::string roundTripProblem(const CHostRobotConfiguration &config) {
  CHostRobotConfiguration written(config);
  CString sBlock;
  written.buildSourceCodeForConfiguration(sBlock, false);
  CHostSelectionScope selection;
  CHostRobotConfiguration reread;
  const auto refused = readProgramConfiguration(reread, CProgramText(sBlock.toUtf8()));
  if (refused.empty() && written.compareConfiguration(reread) == configCompareSame) return std::string();
  if (!refused.empty()) return sBlock.toUtf8() + "refused: " + refused.front().sMessage.toUtf8();
  // What differs, as the documents show it.
  const nlohmann::json before = nlohmann::json::parse(configurationDocument(written, {true, false}).dump());
  const nlohmann::json after = nlohmann::json::parse(configurationDocument(reread, {true, false}).dump());
  return sBlock.toUtf8() + "differs: " + nlohmann::json::diff(before, after).dump() +
         " at settings byte " + std::to_string(firstDifferentByte(written.getSettings(), reread.getSettings()));
}

TEST(ModelRoundTrip, AcceptedEditsReadBackOnEveryPlatformKind) {
  CHostSelectionScope selection;
  CCapturingMessageSink quiet;
  std::mt19937 random(20261207);
  for (int nKind = 0; nKind < kNumbOfPlatformKinds; ++nKind) {
    // Hub controllers exist on the brick kinds only.
    const bool bBrick = nKind == platformNxt || nKind == platformBrick4Motor;
    for (bool bExternal : bBrick ? std::vector<bool>{false, true} : std::vector<bool>{false}) {
      selectHostPlatform(nKind, -1, bExternal);
      CHostRobotConfiguration config;
      config.clearConfigurationDefinition();
      int nAccepted = 0;
      for (int nStep = 0; nStep < 40; ++nStep) {
        const json doc = configurationDocument(config, {true, true});
        const std::vector<TEdit> edits = randomEdits(random, doc);
        const TEdit &edit = edits.front();
        CHostRobotConfiguration before(config);
        if (!applyEdits(config, edits).empty()) {
          ASSERT_EQ(config.compareConfiguration(before), configCompareSame) << "a refused edit changed the record";
          continue;
        }
        ++nAccepted;
        const std::string sProblem = roundTripProblem(config);
        ASSERT_EQ(sProblem, "") << "kind " << nKind << (bExternal ? " with controllers" : "") << ", edit "
                                << edit.sPath << "=" << edit.sValue;
      }
      EXPECT_GT(nAccepted, 0) << "kind " << nKind;
    }
  }
}

}  // namespace
