// Engineering rules: the analog channel count and the VEX port-order warnings.
#include <gtest/gtest.h>

#include <string>

#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/Platform.h"

namespace {

const std::wstring kDigitalInText =
    L"VEX CPU is more efficient if digital input sensors are given higher port numbers than all analog sensors. "
    L"Firmware will still operate if this is not the case but in a less efficient fashion.\n \n"
    L"Analog port at 'in6' is higher 'number' than digital port at 'in3'.\n \n"
    L"Use \"Motor and Sensors Setup\" command (on the \"Robot\" menu) to modify configuration.";
const std::wstring kDigitalOutText =
    L"VEX CPU hardware optimizes placement of digital output ports.\n \n"
    L"Analog sensor at port 'in6' should be assigned to port lower in number than the digital output at port "
    L"'in4'!\n \n"
    L"Use \"Motor and Sensors Setup\" command (on the \"Robot\" menu) to modify configuration.";
const std::wstring kQuadText =
    L"VEX CPU hardware optimizes placement of quadrature motor encoders.\n \n"
    L"Analog sensor at port 'in6' should be assigned to port lower in number than the quadrature motor encoder at "
    L"port 'in3'!\n \n"
    L"Use \"Motor and Sensors Setup\" command (on the \"Robot\" menu) to modify configuration.";

constexpr TSensorTypes kAnalog = 3, kPotentiometer = 46, kTouch = 1, kDigitalOut = 51, kLed = 74, kQuad = 80;

class EngineeringRules : public ::testing::Test {
 protected:
  void select(int nKind) {
    selectHostPlatform(nKind);
    rec.clearConfigurationDefinition();
  }
  // Puts a sensor type on a port directly, without the assignment rules.
  void put(int nPort, TSensorTypes nType) { rec.settings.nSensorTypes[size_t(nPort)] = nType; }
  size_t shown() const { return sink.messages.size(); }

  CHostSelectionScope scope;
  CCapturingMessageSink sink;
  CHostRobotConfiguration rec;
};

TEST_F(EngineeringRules, AnalogChannelsRunUpToTheHighestAnalogSensor) {
  for (int nKind = 0; nKind < kNumbOfPlatformKinds; ++nKind) {
    SCOPED_TRACE(nKind);
    select(nKind);
    const bool bReport = nKind != platformVexPic;  // only the VEX PIC warns
    EXPECT_EQ(rec.nGetNumberOfAnalogVexChannelsAndReportErrors(bReport), 0);
    put(0, kAnalog);
    put(2, kQuad);
    put(3, kDigitalOut);
    put(4, kTouch);
    put(5, kPotentiometer);
    if (bReport) rec.checkEngineeringRules(true);
    const bool bNoChannels = nKind == platformNone || nKind == platformKind5 || nKind == platformKind6;
    EXPECT_EQ(rec.nGetNumberOfAnalogVexChannelsAndReportErrors(bReport), bNoChannels ? 0 : 6);
    // Every analog type counts, ports far beyond the platform's own included.
    for (const TSensorTypes nType : {47, 48, 49, 50}) {
      put(90, nType);
      EXPECT_EQ(rec.nGetNumberOfAnalogVexChannelsAndReportErrors(false), bNoChannels ? 0 : 91);
    }
    put(90, 2);  // an active light sensor is no analog channel here
    EXPECT_EQ(rec.nGetNumberOfAnalogVexChannelsAndReportErrors(false), bNoChannels ? 0 : 6);
  }
  EXPECT_EQ(shown(), 0u);
}

TEST_F(EngineeringRules, WarningTextsAndHowTheyAreShown) {
  select(platformVexPic);
  put(5, kAnalog);
  put(2, kTouch);
  EXPECT_EQ(rec.nGetNumberOfAnalogVexChannelsAndReportErrors(true), 6);
  ASSERT_EQ(shown(), 1u);
  EXPECT_EQ(sink.messages[0].sText.str(), kDigitalInText);
  EXPECT_TRUE(sink.messages[0].bNeverRepeatPrompt);

  select(platformVexPic);
  put(5, kAnalog);
  put(3, kDigitalOut);
  rec.checkEngineeringRules(true);
  ASSERT_EQ(shown(), 2u);
  EXPECT_EQ(sink.messages[1].sText.str(), kDigitalOutText);
  EXPECT_EQ(sink.messages[1].nStyle, 0x40u);
  EXPECT_FALSE(sink.messages[1].bNeverRepeatPrompt);

  select(platformVexPic);
  put(5, kAnalog);
  put(2, kQuad);  // an encoder is a digital input too; the encoder rule comes first
  rec.checkEngineeringRules(true);
  ASSERT_EQ(shown(), 3u);
  EXPECT_EQ(sink.messages[2].sText.str(), kQuadText);
  EXPECT_EQ(sink.messages[2].nStyle, 0x40u);
}

TEST_F(EngineeringRules, EachWarningIsShownOnceUntilItsFlagIsCleared) {
  select(platformVexPic);
  put(5, kAnalog);
  put(2, kTouch);
  rec.checkEngineeringRules(true);
  rec.checkEngineeringRules(false);
  rec.nGetNumberOfAnalogVexChannelsAndReportErrors(true);
  EXPECT_EQ(shown(), 1u);
  rec.checkEngineeringRules(true);
  EXPECT_EQ(shown(), 2u);

  // Putting the ports in order clears the flag; breaking the order again warns again.
  put(2, 0);
  put(7, kTouch);
  rec.checkEngineeringRules(false);
  EXPECT_FALSE(rec.bDigitalPortWarningShown);
  put(2, kTouch);
  rec.checkEngineeringRules(false);
  EXPECT_EQ(shown(), 3u);

  // Encoder first; once it moves up, the digital output is reported on the next count.
  select(platformVexPic);
  const size_t nBefore = shown();
  put(5, kAnalog);
  put(2, kQuad);
  put(3, kLed);
  rec.checkEngineeringRules(true);
  ASSERT_EQ(shown(), nBefore + 1);
  EXPECT_EQ(sink.messages.back().sText.str(), kQuadText);
  rec.nGetNumberOfAnalogVexChannelsAndReportErrors(true);
  EXPECT_EQ(shown(), nBefore + 1);
  put(2, 0);
  put(9, kQuad);
  rec.nGetNumberOfAnalogVexChannelsAndReportErrors(true);
  ASSERT_EQ(shown(), nBefore + 2);
  EXPECT_EQ(sink.messages.back().sText.str(), kDigitalOutText);
  // The encoder flag stays set while the digital-output warning stands.
  EXPECT_TRUE(rec.bQuadPortErrorShown);
  put(3, 0);
  rec.nGetNumberOfAnalogVexChannelsAndReportErrors(true);
  EXPECT_FALSE(rec.bQuadPortErrorShown);
  EXPECT_FALSE(rec.bDigitalPortWarningShown);
}

TEST_F(EngineeringRules, NeverShowSilencesTheDigitalWarningsOnly) {
  select(platformVexPic);
  sink.nNeverRepeatAnswer = 1;
  put(5, kAnalog);
  put(2, kTouch);
  rec.checkEngineeringRules(true);
  EXPECT_EQ(shown(), 1u);
  EXPECT_TRUE(pToggles->bNeverShowVexPortWarnings);

  // The choice outlives the configuration.
  CHostRobotConfiguration other;
  other.settings.nSensorTypes[5] = kAnalog;
  other.settings.nSensorTypes[2] = kTouch;
  other.checkEngineeringRules(true);
  other.settings.nSensorTypes[3] = kDigitalOut;
  other.checkEngineeringRules(true);
  EXPECT_EQ(shown(), 1u);
  other.settings.nSensorTypes[2] = kQuad;
  other.checkEngineeringRules(true);
  ASSERT_EQ(shown(), 2u);
  EXPECT_EQ(sink.messages[1].sText.str(), kQuadText);
}

}  // namespace
