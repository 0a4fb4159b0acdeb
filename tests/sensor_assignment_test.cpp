// Putting sensor types on ports and the rules that keep the record consistent,
// and the sensor side of the setup dialogs' menus.
#include <gtest/gtest.h>

#include <cstring>
#include <string>

#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/MenuButton.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/sensors/SensorMenus.h"

namespace {

class SensorAssignment : public ::testing::Test {
 protected:
  // Selects a platform (and board) and starts from a cleared record.
  void select(int nKind, TControllerBoardType nBoard = -1, bool bExternal = false) {
    selectHostPlatform(nKind, nBoard, bExternal);
    rec.clearConfigurationDefinition();
  }
  TSensorTypes type(int nPort) const { return rec.getSensorTypeInConfig(nPort); }

  CHostSelectionScope scope;
  CHostRobotConfiguration rec;
};

std::wstring str(const wchar_t *pz) { return pz ? pz : L"(null)"; }

TEST_F(SensorAssignment, TwoPortSensorsTakeTheirSuccessorOnTheI2CGroupOnly) {
  select(platformVexI2c);
  rec.setSensorTypeInConfig(4, 52);
  EXPECT_EQ(type(4), 52);
  EXPECT_EQ(type(5), 56);
  rec.removeSensorTypeInConfig(5);  // the second half takes its partner along
  EXPECT_EQ(type(4), 0);
  EXPECT_EQ(type(5), 0);

  rec.setSensorTypeInConfig(8, 80);
  EXPECT_EQ(type(9), 81);
  rec.setSensorTypeInConfig(8, 1);  // a one-port type releases the old partner
  EXPECT_EQ(type(8), 1);
  EXPECT_EQ(type(9), 0);

  rec.setSensorTypeInConfig(10, 80);
  rec.removeSensorTypeInConfig(10);
  EXPECT_EQ(type(11), 0);

  // A second half left alone on the successor does not take the new sensor down.
  rec.setSensorTypeInConfig(13, 56);
  rec.setSensorTypeInConfig(12, 53);
  EXPECT_EQ(type(12), 53);
  EXPECT_EQ(type(13), 56);

  // A second half on port 0 has no partner below it.
  rec.setSensorTypeInConfig(0, 56);
  rec.removeSensorTypeInConfig(0);
  EXPECT_EQ(type(0), 0);
  EXPECT_EQ(type(1), 0);

  for (int nKind : {platformNxt, platformVexPic, platformSharedPorts}) {
    select(nKind);
    rec.setSensorTypeInConfig(1, 52);
    rec.setSensorTypeInConfig(2, 80);
    EXPECT_EQ(type(1), 52) << nKind;
    EXPECT_EQ(type(2), 80) << nKind;
    EXPECT_EQ(type(3), 0) << nKind;
    rec.removeSensorTypeInConfig(1);
    EXPECT_EQ(type(2), 80) << nKind;
  }
}

TEST_F(SensorAssignment, TwoPortSensorOnTheLastPortTakesThatPortOnly) {
  select(platformArduino);
  const TConfigurationSettings before = rec.getSettings();
  rec.setSensorTypeInConfig(97, 54);
  EXPECT_EQ(type(97), 54);
  EXPECT_EQ(type(96), before.nSensorTypes[96]);
  rec.setSensorTypeInConfig(96, 55);  // its successor is taken over and released cleanly
  EXPECT_EQ(type(96), 55);
  EXPECT_EQ(type(97), 56);
  rec.setSensorTypeInConfig(97, 80);
  EXPECT_EQ(type(96), 0);
  EXPECT_EQ(type(97), 80);
  rec.removeSensorTypeInConfig(97);
  EXPECT_EQ(type(97), 0);
}

TEST_F(SensorAssignment, SameTypeChangesNothingAndPortsOutsideTheRecordAreIgnored) {
  select(platformVexI2c);
  rec.setSensorTypeInConfig(3, 1);
  rec.setSensorModeInConfig(3, 2);
  rec.settings.motors[2].nEncoderPort = 3;
  rec.setSensorTypeInConfig(3, 1);
  EXPECT_EQ(rec.getSensorModeInConfig(3), 2);
  EXPECT_EQ(rec.getMapEncoderToMotor(2), 3);

  // A new type drops the encoders that read the port and starts in mode 0.
  rec.setSensorTypeInConfig(3, 4);
  EXPECT_EQ(rec.getSensorModeInConfig(3), 0);
  EXPECT_EQ(rec.getMapEncoderToMotor(2), -1);

  const TConfigurationSettings before = rec.getSettings();
  for (int nPort : {-1, 98, 1000}) {
    rec.setSensorTypeInConfig(nPort, 52);
    rec.removeSensorTypeInConfig(nPort);
    rec.clearSensorTypeAndModeInConfig(nPort);
    rec.removeSensorModeInConfig(nPort);
    rec.setSensorModeInConfig(nPort, 1);
    rec.setSecondaryPort(nPort, 3);
    rec.setUserDefinedSensorNameInConfig(nPort, L"x", TLineNumber(1, 0));
    rec.updateDefaultSensorNameForPlatformOrControllerBoard(nPort, L"x");
    rec.setDefaultServoNameToEmpty(nPort);
  }
  EXPECT_EQ(std::memcmp(&before, &rec.getSettings(), sizeof before), 0);
}

TEST_F(SensorAssignment, ModeAndNameAccessorsHaveNoSideEffects) {
  select(platformVexI2c);
  rec.setSensorTypeInConfig(4, 52);
  rec.setSensorModeInConfig(4, 3);
  rec.removeSensorModeInConfig(4);  // clears the type, keeps the mode and the partner
  EXPECT_EQ(type(4), 0);
  EXPECT_EQ(rec.getSensorModeInConfig(4), 3);
  EXPECT_EQ(type(5), 56);
  rec.clearSensorTypeAndModeInConfig(5);
  EXPECT_EQ(type(5), 0);

  rec.setSecondaryPort(6, 2);
  EXPECT_EQ(rec.getSecondaryPort(6), 2);
  rec.setUserDefinedSensorNameInConfig(6, L"bumper", TLineNumber(7, 0));
  CString sName;
  rec.getUserDefinedSensorNameInConfig(6, sName);
  EXPECT_EQ(sName, L"bumper");
  EXPECT_EQ(rec.sensorNameLines[6], TLineNumber(7, 0));
  rec.updateDefaultSensorNameForPlatformOrControllerBoard(6, L"frontBumper");
  EXPECT_EQ(rec.sDefaultSensorNames[6], L"frontBumper");

  rec.getDefaultSensorNameInConfig(20, sName);
  EXPECT_EQ(sName, L"I2C_1");
  EXPECT_EQ(str(rec.getSensorPortString(28)), L"");
}

TEST_F(SensorAssignment, SerialPinsReleaseTheirPort) {
  select(platformArduino, 8);  // Uno layout: UART0 on 6 / 7, I2C0 on 4 / 5
  rec.setUARTType(0, 2);
  rec.setSensorTypeInConfig(6, 60);
  rec.setSensorTypeInConfig(7, 60);
  rec.removeSensorTypeInConfig(7);
  EXPECT_EQ(rec.getUARTType(0), 0);
  EXPECT_EQ(type(6), 0);
  EXPECT_EQ(type(7), 0);

  rec.settings.nI2CMode[0] = 1;
  rec.setSensorTypeInConfig(4, 61);
  rec.setSensorTypeInConfig(5, 61);
  rec.setSensorTypeInConfig(4, 3);  // a sensor on a pin releases the port too
  EXPECT_EQ(rec.settings.nI2CMode[0], 0);
  EXPECT_EQ(type(4), 3);
  EXPECT_EQ(type(5), 0);

  // A pin type on a port that serves no serial port clears only itself.
  rec.setUARTType(0, 2);
  rec.setSensorTypeInConfig(12, 60);
  rec.removeSensorTypeInConfig(12);
  EXPECT_EQ(rec.getUARTType(0), 2);
  EXPECT_EQ(type(12), 0);
}

TEST_F(SensorAssignment, I2CUsageFollowsTheI2CSensors) {
  select(platformVexI2c);
  rec.setSensorTypeInConfig(20, 67);
  EXPECT_EQ(rec.settings.nI2CMode[0], 2);
  rec.setSensorTypeInConfig(21, 68);
  rec.removeSensorTypeInConfig(20);
  rec.calculateI2CUsage();
  EXPECT_EQ(rec.settings.nI2CMode[0], 2);
  rec.setSensorTypeInConfig(21, 1);  // the last I2C sensor goes
  EXPECT_EQ(rec.settings.nI2CMode[0], 0);

  rec.settings.nI2CMode[0] = 1;  // a usage other than "sensors" is never touched
  rec.calculateI2CUsage();
  EXPECT_EQ(rec.settings.nI2CMode[0], 1);

  select(platformNxt);
  rec.setSensorTypeInConfig(0, 68);
  EXPECT_EQ(rec.settings.nI2CMode[0], 0);
}

TEST_F(SensorAssignment, SensorOnASharedMotorPortReplacesTheMotor) {
  select(platformSharedPorts);
  rec.setMotorTypeInConfig(3, 14);
  ASSERT_EQ(type(3), 91);
  rec.setSensorTypeInConfig(3, 1);
  EXPECT_EQ(type(3), 1);
  EXPECT_EQ(rec.getMotorTypeInConfig(3), 0);

  rec.setMotorTypeInConfig(4, 14);
  rec.setSensorTypeInConfig(4, 0);
  EXPECT_EQ(type(4), 0);
  EXPECT_EQ(rec.getMotorTypeInConfig(4), 0);

  // Elsewhere a port marked 91 is an ordinary port.
  select(platformVexI2c);
  rec.setMotorTypeInConfig(3, 11);
  rec.setSensorTypeInConfig(3, 91);
  rec.setSensorTypeInConfig(3, 1);
  EXPECT_EQ(rec.getMotorTypeInConfig(3), 11);
}

TEST_F(SensorAssignment, SensorPortCount) {
  // Board counts apply on the Arduino platform only.
  for (const auto &[nKind, nBoard, nPorts] : {std::array<int, 3>{platformArduino, 0, 70}, {platformArduino, 8, 20},
                                              {platformVexI2c, -1, 28}, {platformBoard10, -1, 24}}) {
    select(nKind, nBoard);
    EXPECT_EQ(rec.getMaxNumbOfSensorPorts(), nPorts) << nKind << ":" << nBoard;
  }
}

TEST_F(SensorAssignment, HubPortsAreTypedFromTheHubTable) {
  select(platformNxt);
  auto &hubs = rec.settings.nSensorPortHubs;
  hubs[0] = {hubHTMotor, -1, -1, -1};
  hubs[1] = {hubNone, hubHTServo, -1, -1};  // the walk of other rules stops at 0; this one looks at every slot
  hubs[2] = {hubHTTouch, -1, -1, -1};
  hubs[3] = {-1, -1, -1, -1};
  rec.setSensorTypeInConfig(2, 26);
  rec.setSensorTypeInConfig(3, 27);
  rec.setSensorModeInConfig(3, 1);

  rec.configureNXTSensorPortsForTetrixHubs();  // toggle off: nothing happens
  EXPECT_EQ(type(0), 0);
  EXPECT_EQ(type(3), 27);

  setHostExternalControllers(true);
  rec.configureNXTSensorPortsForTetrixHubs();
  EXPECT_EQ(type(0), 26);
  EXPECT_EQ(type(1), 26);
  EXPECT_EQ(type(2), 0);
  EXPECT_EQ(type(3), 0);
  EXPECT_EQ(rec.getSensorModeInConfig(3), 0);

  // Ports without hubs that hold other sensors keep them.
  hubs[0] = {-1, -1, -1, -1};
  rec.setSensorTypeInConfig(0, 26);
  rec.setSensorTypeInConfig(2, 1);
  rec.configureNXTSensorPortsForTetrixHubs();
  EXPECT_EQ(type(0), 0);
  EXPECT_EQ(type(2), 1);
}

TEST_F(SensorAssignment, EquippedHubsGiveDefaultMotorAndServoNames) {
  select(platformNxt, -1, true);
  auto &hubs = rec.settings.nSensorPortHubs;
  hubs[0] = {hubHTMotor, hubHTServo, hubNone, hubHTMotor};  // the last slot lies after the end of the chain
  hubs[1] = {hubMatrxRbtcs, -1, -1, -1};
  rec.setServoType(7, 3);                                      // winch servos keep an empty name
  rec.setUserDefinedServoNameInConfig(8, L"claw", TLineNumber(5, 0));
  rec.configureDefaultMotorAndServoNamesForEquippedHubs(false);

  auto motorName = [this](int n) { CString s; rec.getUserDefinedMotorNameInConfig(n, s); return s.str(); };
  auto servoName = [this](int n) { CString s; rec.getUserDefinedServoNameInConfig(n, s); return s.str(); };
  auto defaultServoName = [this](int n) { CString s; rec.getDefaultServoNameLowLevel(n, s, false); return s.str(); };
  for (int nMotor : {3, 4, 11, 12, 13, 14}) {
    CString sDefault;
    rec.getDefaultMotorName(nMotor, sDefault);
    EXPECT_FALSE(sDefault.IsEmpty());
    EXPECT_EQ(motorName(nMotor), sDefault.str()) << nMotor;
  }
  for (int nMotor : {5, 6, 9, 10, 15, 19}) EXPECT_EQ(motorName(nMotor), L"") << nMotor;

  for (int nServo : {6, 9, 10, 11, 24, 25, 26, 27}) {
    EXPECT_FALSE(servoName(nServo).empty()) << nServo;
    EXPECT_EQ(servoName(nServo), defaultServoName(nServo)) << nServo;
    EXPECT_EQ(rec.servoNameLines[size_t(nServo)], emptyLineNumber) << nServo;
  }
  EXPECT_EQ(servoName(7), L"");
  EXPECT_EQ(servoName(8), L"claw");
  EXPECT_EQ(rec.servoNameLines[8], TLineNumber(5, 0));
  for (int nServo : {0, 5, 12, 28}) EXPECT_EQ(servoName(nServo), L"") << nServo;
  EXPECT_TRUE(rec.bHubDefaultNamesConfigured);

  // Once configured, only a forced run names again.
  rec.sMotorNames[3].Empty();
  rec.configureDefaultMotorAndServoNamesForEquippedHubs(false);
  EXPECT_EQ(motorName(3), L"");
  rec.configureDefaultMotorAndServoNamesForEquippedHubs(true);
  EXPECT_NE(motorName(3), L"");

  // Four-motor bricks count hub motors from 4.
  select(platformBrick4Motor, -1, true);
  rec.settings.nSensorPortHubs[2] = {hubHTMotor, -1, -1, -1};
  rec.configureDefaultMotorAndServoNamesForEquippedHubs(false);
  EXPECT_NE(motorName(20), L"");
  EXPECT_NE(motorName(21), L"");
  EXPECT_EQ(motorName(19), L"");

  // Other platforms have no hubs to name.
  select(platformVexI2c);
  rec.settings.nSensorPortHubs[0] = {hubHTMotor, -1, -1, -1};
  rec.configureDefaultMotorAndServoNamesForEquippedHubs(true);
  EXPECT_EQ(motorName(3), L"");
  EXPECT_FALSE(rec.bHubDefaultNamesConfigured);
}

TEST_F(SensorAssignment, UnusedVexI2CEncodersAreCleared) {
  select(platformVexI2c);
  rec.setSensorTypeInConfig(20, 67);
  rec.setSensorTypeInConfig(21, 67);
  rec.setSensorTypeInConfig(22, 68);
  rec.settings.nSensorTypes[0] = 67;
  rec.setMotorTypeInConfig(1, 11);
  rec.settings.motors[1].nEncoderPort = 20;
  rec.settings.motors[4].nEncoderPort = 21;  // a port without a motor type does not count
  rec.clearUnusedVexI2CEncoders();
  EXPECT_EQ(type(20), 67);
  EXPECT_EQ(type(21) + type(0), 0);
  EXPECT_EQ(type(22), 68);
  EXPECT_EQ(rec.settings.motors[4].nEncoderPort, -1);
  EXPECT_EQ(rec.settings.nI2CMode[0], 2);

  rec.setSensorTypeInConfig(22, 0);
  rec.setMotorTypeInConfig(1, 0);
  rec.clearUnusedVexI2CEncoders();
  EXPECT_EQ(type(20), 0);
  EXPECT_EQ(rec.settings.nI2CMode[0], 0);

  select(platformArduino);
  rec.setSensorTypeInConfig(3, 67);
  rec.clearUnusedVexI2CEncoders();
  EXPECT_EQ(type(3), 67);
}

TEST_F(SensorAssignment, SensorPortMenuAndLookupsFollowTheBoard) {
  select(platformArduino, 8);
  CDropDownButtonOfDeviceTypeMenuItem button, other;
  addSensorPortsToMenu(rec, button, false, -1);
  addSensorPortsToMenu(rec, other, true, -1);
  ASSERT_EQ(button.items().size(), 20u);
  EXPECT_EQ(button.items()[6].sKeyword, L"dgtl0");
  EXPECT_EQ(button.items()[6].nValue, 6);
  EXPECT_EQ(button.getSelectedIndex(), -1);
  ASSERT_EQ(other.items().size(), button.items().size());
  for (size_t n = 0; n < button.items().size(); ++n) EXPECT_EQ(other.items()[n].sKeyword, button.items()[n].sKeyword);

  EXPECT_EQ(rec.getIndexForSensorName(L"dgtl0"), 6);
  EXPECT_EQ(rec.getIndexForSensorName(L"anlg5"), 5);
  EXPECT_EQ(rec.getIndexForSensorName(L"dgtl20"), -1);  // a Mega port
  EXPECT_EQ(rec.getIndexForSensorName(L"S1"), -1);

  // The configuration's own board counts, not the IDE's.
  rec.settings.nCircuitBoardType = 13;
  EXPECT_EQ(rec.getIndexForSensorName(L"dgtl0"), 16);
  EXPECT_EQ(rec.getIndexForSensorName(L"dgtl20"), 36);
  addSensorPortsToMenu(rec, button, false, 0);
  EXPECT_EQ(button.items().size(), 70u);

  select(platformVexI2c);
  EXPECT_EQ(rec.getIndexForSensorName(L"I2C_1"), 20);
  EXPECT_EQ(rec.getIndexForSensorName(L"dgtl0"), -1);
  EXPECT_EQ(rec.getIndexForSensorName(L""), -1);
  addSensorPortsToMenu(rec, button, false, -1);
  EXPECT_EQ(button.items().size(), 28u);

  EXPECT_EQ(rec.getIndexForDriveTrainType(L"mecanumDrive"), 4);
  EXPECT_EQ(rec.getIndexForJoystickDriveType(L"tankDrive"), 1);
  EXPECT_EQ(rec.getIndexForJoystickScalingType(L"axisScalingCubed"), 2);
  EXPECT_EQ(rec.getIndexForGripperArmType(L"gripperClawLift"), 2);
  EXPECT_LT(rec.getIndexForDriveTrainType(L"tankDrive"), 0);
  EXPECT_EQ(getTypedefIndex(nDriveSideMenu, L"Right", true), 2);
  EXPECT_EQ(getTypedefIndex(nDriveSideMenu, L"left", true), -1);
}

}  // namespace
