// The words of the configuration language that do not depend on the board:
// motor, sensor and servo types, sensor modes, motor and servo port names,
// secondary ports and the drive-train, gripper and joystick menus. One row
// per keyword; the lookups live in DeviceCatalog.cpp.
#include "robotconfig/host/CatalogRows.h"

#include <array>

namespace robotconfig_catalog {

namespace {

// Hardware bits of the motor types. The motor rules hand the catalog a mask
// of the bits a motor port can drive, and only types meeting it are offered.
constexpr uint32_t kHwAnyMotorPort = 0xFFFFFFFFu;
constexpr uint32_t kHwControllerPort = 0x8;        // plain motor port of a controller
constexpr uint32_t kHwBrickPort = 0x10;            // motor port of a brick
constexpr uint32_t kHwHubMotorController = 0x20;   // two-motor controller on a sensor-port chain
constexpr uint32_t kHwMatrixController = 0x40;     // four-motor controller on a sensor-port chain
constexpr uint32_t kHwSharedPort = 0x80;           // port shared between motors and sensors
constexpr uint32_t kHwServoSignal = 0x100;         // servo pulse output
constexpr uint32_t kHwDirectionPin = 0x200;        // PWM plus direction pin
constexpr uint32_t kHwPwmPinPair = 0x400;          // two PWM pins, one per direction
constexpr uint32_t kHwDriverChip = 0x800;          // H-bridge driver chip on the board
constexpr uint32_t kHwTwoPinBridge = 0x1000;       // discrete two-pin H-bridge
constexpr uint32_t kHwPwmPin = 0x2000;             // single PWM pin
constexpr uint32_t kHwSpeakerPin = 0x4000;         // tone output
constexpr uint32_t kHwVexHBridge = 0x8000;         // built-in H-bridge of a VEX controller
constexpr uint32_t kHwVexMotorController = 0x10000;  // external VEX motor controller on a PWM port

constexpr uint32_t kHwDcMotor = kHwControllerPort | kHwTwoPinBridge | kHwPwmPinPair | kHwDirectionPin;
constexpr uint32_t kHwServo = kHwControllerPort | kHwServoSignal;

// Platforms whose hardware has a sensor: the brick sensors (the brick's own and
// the third-party sensors of its sensor ports) exist on the brick platforms
// only, the VEX I2C bus sensors on the VEX controller only; the rest (touch,
// analog and digital inputs, the VEX and board sensors, claimed pins) wherever
// a port can take them.
constexpr uint32_t kBrickSensors = platformBit(platformNxt) | platformBit(platformBrick4Motor);
constexpr uint32_t kVexI2CSensors = platformBit(platformVexI2c);

// Sensor-type groups that share sensor modes.
constexpr uint32_t kModeGroupAny = 0x1;
constexpr uint32_t kModeGroupDigital = 0x2;
constexpr uint32_t kModeGroupAnalog = 0x4;
constexpr uint32_t kModeGroupGyro = 0x8;
constexpr uint32_t kModeGroupTemperature = 0x10;
constexpr uint32_t kModeGroupColor = 0x20;

struct TSensorModeGroupRow {
  TSensorTypes nType;
  uint32_t nGroups;
};

// Sensor types that offer more than the raw mode.
constexpr std::array<TSensorModeGroupRow, 25> kSensorModeGroupRows = {{
    {1, kModeGroupDigital},       // sensorTouch
    {2, kModeGroupAnalog},        // sensorLightActive
    {3, kModeGroupAnalog},        // sensorAnalog
    {4, kModeGroupDigital},       // sensorDigitalIn
    {5, kModeGroupAnalog},        // sensorLightInactive
    {6, kModeGroupAnalog},        // sensorSoundDB
    {7, kModeGroupAnalog},        // sensorSoundDBA
    {9, kModeGroupColor},         // sensorColorNxtFULL
    {22, kModeGroupGyro},         // sensorAnalogGyro
    {42, kModeGroupColor},        // sensorColorRGB
    {43, kModeGroupDigital},      // sensorTiltSwitch
    {45, kModeGroupDigital},      // sensorLimitSwitch
    {46, kModeGroupAnalog},       // sensorPotentiometer
    {47, kModeGroupAnalog},       // sensorLineFollower
    {48, kModeGroupAnalog},       // sensorReflection
    {49, kModeGroupGyro},         // sensorGyro
    {50, kModeGroupAnalog},       // sensorAccelAnalog
    {63, kModeGroupAnalog},       // sensorPhotoResistor
    {69, kModeGroupTemperature},  // sensorI2CTemperature
    {72, kModeGroupColor},        // sensorI2CColor
    {73, kModeGroupAnalog},       // sensorThermistor
    {82, kModeGroupDigital},      // sensorBrickTouch
    {83, kModeGroupColor},        // sensorBrickColor
    {85, kModeGroupGyro},         // sensorBrickGyro
    {87, kModeGroupTemperature},  // sensorTemperature
}};

}  // namespace

uint32_t getSensorModeGroups(TSensorTypes nType) {
  for (const TSensorModeGroupRow &row : kSensorModeGroupRows) {
    if (row.nType == nType) return kModeGroupAny | row.nGroups;
  }
  return kModeGroupAny;
}

const TDeviceTypeMenuItem kMotorTypeNames[] = {
    menuRow(kAllPlatforms, 0, L"tmotorNone", L"No motor", kHwAnyMotorPort),
    menuRow(kAllPlatforms, 1, L"tmotorSpeaker", L"Speaker", kHwSpeakerPin),
    menuRow(kAllPlatforms, 2, L"tmotorTwoPin", L"Two-pin DC motor", kHwDcMotor),
    menuRow(kAllPlatforms, 3, L"tmotorStandard", L"Standard DC motor", kHwDcMotor),
    menuRow(kAllPlatforms, 4, L"tmotorServoContinuousRotation", L"Continuous-rotation servo", kHwServo),
    menuRow(kAllPlatforms, 5, L"tmotorServoStandard", L"Standard servo", kHwServo),
    menuRow(kAllPlatforms, 6, L"tmotorVex269_HBridge", L"VEX 269 motor (H-bridge)", kHwVexHBridge),
    menuRow(kAllPlatforms, 7, L"tmotorVex393_HBridge", L"VEX 393 motor (H-bridge)", kHwVexHBridge),
    menuRow(kAllPlatforms, 8, L"tmotorVex393HighSpeed_HBridge", L"VEX 393 high-speed motor (H-bridge)",
            kHwVexHBridge),
    menuRow(kAllPlatforms, 9, L"tmotorVex393Turbo_HBridge", L"VEX 393 turbo motor (H-bridge)", kHwVexHBridge),
    menuRow(kAllPlatforms, 10, L"tmotorVex269_MC29", L"VEX 269 motor (MC29)", kHwVexMotorController),
    menuRow(kAllPlatforms, 11, L"tmotorVex393_MC29", L"VEX 393 motor (MC29)", kHwVexMotorController),
    menuRow(kAllPlatforms, 12, L"tmotorVex393HighSpeed_MC29", L"VEX 393 high-speed motor (MC29)", kHwVexMotorController),
    menuRow(kAllPlatforms, 13, L"tmotorVex393Turbo_MC29", L"VEX 393 turbo motor (MC29)", kHwVexMotorController),
    menuRow(kAllPlatforms, 14, L"tmotorSharedPort", L"Motor on shared port", kHwSharedPort),
    menuRow(kAllPlatforms, 15, L"tmotorMicro9", L"Micro servo motor", kHwSharedPort | kHwServoSignal),
    menuRow(kAllPlatforms, 16, L"tmotorDCMotorPWM", L"DC motor (PWM and direction)", kHwPwmPin | kHwDirectionPin),
    menuRow(kAllPlatforms, 17, L"tmotorNxt", L"NXT motor", kHwBrickPort),
    menuRow(kAllPlatforms, 18, L"tmotorBrickLarge", L"Large brick motor", kHwBrickPort),
    menuRow(kAllPlatforms, 19, L"tmotorBrickMedium", L"Medium brick motor", kHwBrickPort),
    menuRow(kAllPlatforms, 20, L"tmotorTetrix", L"Motor on hub controller", kHwHubMotorController),
    menuRow(kAllPlatforms, 21, L"tmotorMatrix", L"Motor on four-motor controller", kHwMatrixController),
    menuRow(kAllPlatforms, 22, L"tmotorL298", L"L298 driver", kHwDriverChip),
    menuRow(kAllPlatforms, 23, L"tmotorL293", L"L293 driver", kHwDriverChip),
    menuRow(kAllPlatforms, 24, L"tmotorTB6612", L"TB6612 driver", kHwDriverChip),
    menuRow(kAllPlatforms, 25, L"tmotorDRV8833", L"DRV8833 driver", kHwDriverChip),
    menuRow(kAllPlatforms, 26, L"tmotorNormal", L"Normal motor (legacy)", kHwControllerPort | kHwBrickPort),
    menuRow(kAllPlatforms, 27, L"tmotorNxtEncoder", L"NXT motor with encoder (legacy)", kHwBrickPort),
    menuRow(kAllPlatforms, 28, L"tmotorNxtEncoderClosedLoop", L"NXT motor, closed loop (legacy)", kHwBrickPort),
    menuRow(kAllPlatforms, 29, L"tmotorReversed", L"Reversed motor (legacy)", kHwControllerPort | kHwBrickPort),
    menuRow(kAllPlatforms, 30, L"tmotorTetrixEncoder", L"Hub motor with encoder (legacy)", kHwHubMotorController),
    menuRow(kAllPlatforms, 31, L"tmotorTetrixEncoderPID", L"Hub motor, closed loop (legacy)", kHwHubMotorController),
    kEndOfTable,
};

const TDeviceTypeMenuItem kSensorTypeNames[] = {
    menuRow(kAllPlatforms, 0, L"sensorNone", L"No sensor"),
    menuRow(kAllPlatforms, 1, L"sensorTouch", L"Touch"),
    menuRow(kBrickSensors, 2, L"sensorLightActive", L"Light (active)"),
    menuRow(kAllPlatforms, 3, L"sensorAnalog", L"Analog input"),
    menuRow(kAllPlatforms, 4, L"sensorDigitalIn", L"Digital input"),
    menuRow(kBrickSensors, 5, L"sensorLightInactive", L"Light (ambient)"),
    menuRow(kBrickSensors, 6, L"sensorSoundDB", L"Sound (dB)"),
    menuRow(kBrickSensors, 7, L"sensorSoundDBA", L"Sound (dBA)"),
    menuRow(kBrickSensors, 8, L"sensorSONAR", L"Ultrasonic"),
    menuRow(kBrickSensors, 9, L"sensorColorNxtFULL", L"Color (full)"),
    menuRow(kBrickSensors, 10, L"sensorColorNxtRED", L"Color (red light)"),
    menuRow(kBrickSensors, 11, L"sensorColorNxtGREEN", L"Color (green light)"),
    menuRow(kBrickSensors, 12, L"sensorColorNxtBLUE", L"Color (blue light)"),
    menuRow(kBrickSensors, 13, L"sensorColorNxtNONE", L"Color (no light)"),
    menuRow(kAllPlatforms, 14, L"sensorI2CCustom", L"I2C custom"),
    menuRow(kAllPlatforms, 15, L"sensorI2CCustomFast", L"I2C custom (fast)"),
    menuRow(kAllPlatforms, 16, L"sensorI2CCustom9V", L"I2C custom (9V)"),
    menuRow(kAllPlatforms, 17, L"sensorI2CCustomFast9V", L"I2C custom (fast, 9V)"),
    menuRow(kBrickSensors, 18, L"sensorCompass", L"Compass"),
    menuRow(kBrickSensors, 19, L"sensorAccelerometer", L"Accelerometer"),
    menuRow(kBrickSensors, 20, L"sensorIRSeeker", L"IR seeker"),
    menuRow(kBrickSensors, 21, L"sensorIRSeekerModulated", L"IR seeker (modulated)"),
    menuRow(kBrickSensors, 22, L"sensorAnalogGyro", L"Gyro (brick)"),
    menuRow(kBrickSensors, 23, L"sensorTouchMux", L"Touch multiplexer"),
    menuRow(kBrickSensors, 24, L"sensorProtoBoard", L"Prototype board"),
    menuRow(kBrickSensors, 25, L"sensorLightArray", L"Light array"),
    menuRow(kBrickSensors, 26, L"sensorI2CMuxController", L"Motor/servo controller chain"),
    menuRow(kBrickSensors, 27, L"sensorI2CHubController", L"Motor/servo controller chain (alternate)"),
    menuRow(kBrickSensors, 28, L"sensorMagnetic", L"Magnetic field"),
    menuRow(kBrickSensors, 29, L"sensorBarometer", L"Barometer"),
    menuRow(kBrickSensors, 30, L"sensorEOPD", L"Optical proximity"),
    menuRow(kBrickSensors, 31, L"sensorForce", L"Force"),
    menuRow(kBrickSensors, 32, L"sensorPIR", L"Passive infrared"),
    menuRow(kBrickSensors, 33, L"sensorAngle", L"Angle"),
    menuRow(kBrickSensors, 34, L"sensorIRLink", L"IR link"),
    menuRow(kBrickSensors, 35, L"sensorIRReceiver", L"IR receiver"),
    menuRow(kBrickSensors, 36, L"sensorCurrent", L"Current"),
    menuRow(kBrickSensors, 37, L"sensorVoltage", L"Voltage"),
    menuRow(kBrickSensors, 38, L"sensorDistanceLong", L"Distance (long range)"),
    menuRow(kBrickSensors, 39, L"sensorDistanceShort", L"Distance (short range)"),
    menuRow(kBrickSensors, 40, L"sensorLineLeader", L"Line leader"),
    menuRow(kBrickSensors, 41, L"sensorRFIDReader", L"RFID reader"),
    menuRow(kBrickSensors, 42, L"sensorColorRGB", L"Color (RGB)"),
    menuRow(kBrickSensors, 43, L"sensorTiltSwitch", L"Tilt switch"),
    menuRow(kBrickSensors, 44, L"sensorRotation", L"Rotation"),
    menuRow(kAllPlatforms, 45, L"sensorLimitSwitch", L"Limit switch"),
    menuRow(kAllPlatforms, 46, L"sensorPotentiometer", L"Potentiometer"),
    menuRow(kAllPlatforms, 47, L"sensorLineFollower", L"Line follower"),
    menuRow(kAllPlatforms, 48, L"sensorReflection", L"Light reflection"),
    menuRow(kAllPlatforms, 49, L"sensorGyro", L"Gyro"),
    menuRow(kAllPlatforms, 50, L"sensorAccelAnalog", L"Accelerometer (analog)"),
    menuRow(kAllPlatforms, 51, L"sensorDigitalOut", L"Digital output"),
    menuRow(kAllPlatforms, 52, L"sensorSONAR_cm", L"Ultrasonic (cm)"),
    menuRow(kAllPlatforms, 53, L"sensorSONAR_mm", L"Ultrasonic (mm)"),
    menuRow(kAllPlatforms, 54, L"sensorSONAR_inch", L"Ultrasonic (inch)"),
    menuRow(kAllPlatforms, 55, L"sensorSONAR_raw", L"Ultrasonic (raw)"),
    menuRow(kAllPlatforms, 56, L"sensorSONAR_SecondPort", L"Ultrasonic (second port)"),
    menuRow(kAllPlatforms, 57, L"sensorMotorIOPinPrimary", L"Motor IO pin (primary)"),
    menuRow(kAllPlatforms, 58, L"sensorMotorIOPinSecondary", L"Motor IO pin (secondary)"),
    menuRow(kAllPlatforms, 59, L"sensorMotorIOPinBoth", L"Motor IO pin (two-pin motor)"),
    menuRow(kAllPlatforms, 60, L"sensorUartPin", L"UART pin"),
    menuRow(kAllPlatforms, 61, L"sensorI2CPin", L"I2C pin"),
    menuRow(kAllPlatforms, 62, L"sensorPwmPin", L"PWM pin (reserved)"),
    menuRow(kAllPlatforms, 63, L"sensorPhotoResistor", L"Photo resistor"),
    menuRow(kAllPlatforms, 64, L"sensorSpiPin", L"SPI pin (reserved)"),
    menuRow(kAllPlatforms, 65, L"sensorBoardFixedPin", L"Pin fixed by the board"),
    menuRow(kAllPlatforms, 66, L"sensorReservedPin", L"Reserved pin"),
    menuRow(kVexI2CSensors, 67, L"sensorQuadEncoderOnI2CPort", L"Motor encoder (I2C)"),
    menuRow(kVexI2CSensors, 68, L"sensorI2CSensor", L"I2C bus sensor"),
    menuRow(kVexI2CSensors, 69, L"sensorI2CTemperature", L"I2C temperature"),
    menuRow(kVexI2CSensors, 70, L"sensorI2CCompass", L"I2C compass"),
    menuRow(kVexI2CSensors, 71, L"sensorI2CRangeFinder", L"I2C range finder"),
    menuRow(kVexI2CSensors, 72, L"sensorI2CColor", L"I2C color"),
    menuRow(kAllPlatforms, 73, L"sensorThermistor", L"Thermistor"),
    menuRow(kAllPlatforms, 74, L"sensorLEDtoVCC", L"LED (to VCC)"),
    menuRow(kAllPlatforms, 75, L"sensorFlexSensor", L"Flex sensor"),
    menuRow(kAllPlatforms, 76, L"sensorLEDtoGND", L"LED (to GND)"),
    menuRow(kAllPlatforms, 77, L"sensorBuzzer", L"Buzzer"),
    menuRow(kAllPlatforms, 78, L"sensorRelay", L"Relay"),
    menuRow(kAllPlatforms, 79, L"sensorSolenoid", L"Solenoid"),
    menuRow(kAllPlatforms, 80, L"sensorQuadEncoder", L"Quadrature encoder"),
    menuRow(kAllPlatforms, 81, L"sensorQuadEncoderSecondPort", L"Quadrature encoder (second port)"),
    menuRow(kBrickSensors, 82, L"sensorBrickTouch", L"Touch (brick)"),
    menuRow(kBrickSensors, 83, L"sensorBrickColor", L"Color (brick)"),
    menuRow(kBrickSensors, 84, L"sensorBrickUltrasonic", L"Ultrasonic (brick)"),
    menuRow(kBrickSensors, 85, L"sensorBrickGyro", L"Gyro (brick, digital)"),
    menuRow(kBrickSensors, 86, L"sensorBrickInfrared", L"Infrared (brick)"),
    menuRow(kAllPlatforms, 87, L"sensorTemperature", L"Temperature"),
    menuRow(kAllPlatforms, 88, L"sensorHumidity", L"Humidity"),
    menuRow(kAllPlatforms, 89, L"sensorPressure", L"Pressure"),
    menuRow(kAllPlatforms, 90, L"sensorBatteryVoltage", L"Battery voltage"),
    menuRow(kAllPlatforms, 91, L"sensorMotorOnSharedPort", L"Port used by a motor"),
    kEndOfTable,
};

// The attribute of a mode row holds the sensor-type groups it applies to.
const TDeviceTypeMenuItem kSensorModeNames[] = {
    menuRow(kAllPlatforms, 0, L"modeRaw", L"Raw value", kModeGroupAny),
    menuRow(kAllPlatforms, 1, L"modeBoolean", L"Boolean", kModeGroupDigital | kModeGroupAnalog),
    menuRow(kAllPlatforms, 2, L"modeEdge", L"Edge count", kModeGroupDigital),
    menuRow(kAllPlatforms, 3, L"modePulse", L"Pulse count", kModeGroupDigital),
    menuRow(kAllPlatforms, 4, L"modePercentage", L"Percentage", kModeGroupAnalog),
    menuRow(kAllPlatforms, 5, L"modeCelsius", L"Degrees Celsius", kModeGroupTemperature),
    menuRow(kAllPlatforms, 6, L"modeFahrenheit", L"Degrees Fahrenheit", kModeGroupTemperature),
    menuRow(kAllPlatforms, 7, L"modeDegrees", L"Heading (degrees)", kModeGroupGyro),
    menuRow(kAllPlatforms, 8, L"modeRate", L"Turn rate (degrees per second)", kModeGroupGyro),
    menuRow(kAllPlatforms, 9, L"modeColorNumber", L"Color number", kModeGroupColor),
    menuRow(kAllPlatforms, 10, L"modeRGB", L"Red, green and blue values", kModeGroupColor),
    kEndOfTable,
};

const TDeviceTypeMenuItem kServoTypeNames[] = {
    menuRow(kAllPlatforms, 0, L"tServoNone", L"No servo"),
    menuRow(kAllPlatforms, 1, L"tServoStandard", L"Standard servo"),
    menuRow(kAllPlatforms, 2, L"tServoContinuousRotation", L"Continuous-rotation servo"),
    menuRow(kAllPlatforms, 3, L"tServoWinch", L"Winch servo"),
    kEndOfTable,
};

// Servo index 6 * (4 * port + chain position) + servo, as a servo controller
// numbers them; a four-servo controller's servos are second names of the
// first four indexes of its sensor port.
const TDeviceTypeMenuItem kServoPortNames[] = {
    menuRow(kAllPlatforms, 0, L"srvo_S1_C1_1"),
    menuRow(kAllPlatforms, 1, L"srvo_S1_C1_2"),
    menuRow(kAllPlatforms, 2, L"srvo_S1_C1_3"),
    menuRow(kAllPlatforms, 3, L"srvo_S1_C1_4"),
    menuRow(kAllPlatforms, 4, L"srvo_S1_C1_5"),
    menuRow(kAllPlatforms, 5, L"srvo_S1_C1_6"),
    menuRow(kAllPlatforms, 6, L"srvo_S1_C2_1"),
    menuRow(kAllPlatforms, 7, L"srvo_S1_C2_2"),
    menuRow(kAllPlatforms, 8, L"srvo_S1_C2_3"),
    menuRow(kAllPlatforms, 9, L"srvo_S1_C2_4"),
    menuRow(kAllPlatforms, 10, L"srvo_S1_C2_5"),
    menuRow(kAllPlatforms, 11, L"srvo_S1_C2_6"),
    menuRow(kAllPlatforms, 12, L"srvo_S1_C3_1"),
    menuRow(kAllPlatforms, 13, L"srvo_S1_C3_2"),
    menuRow(kAllPlatforms, 14, L"srvo_S1_C3_3"),
    menuRow(kAllPlatforms, 15, L"srvo_S1_C3_4"),
    menuRow(kAllPlatforms, 16, L"srvo_S1_C3_5"),
    menuRow(kAllPlatforms, 17, L"srvo_S1_C3_6"),
    menuRow(kAllPlatforms, 18, L"srvo_S1_C4_1"),
    menuRow(kAllPlatforms, 19, L"srvo_S1_C4_2"),
    menuRow(kAllPlatforms, 20, L"srvo_S1_C4_3"),
    menuRow(kAllPlatforms, 21, L"srvo_S1_C4_4"),
    menuRow(kAllPlatforms, 22, L"srvo_S1_C4_5"),
    menuRow(kAllPlatforms, 23, L"srvo_S1_C4_6"),
    menuRow(kAllPlatforms, 24, L"srvo_S2_C1_1"),
    menuRow(kAllPlatforms, 25, L"srvo_S2_C1_2"),
    menuRow(kAllPlatforms, 26, L"srvo_S2_C1_3"),
    menuRow(kAllPlatforms, 27, L"srvo_S2_C1_4"),
    menuRow(kAllPlatforms, 28, L"srvo_S2_C1_5"),
    menuRow(kAllPlatforms, 29, L"srvo_S2_C1_6"),
    menuRow(kAllPlatforms, 30, L"srvo_S2_C2_1"),
    menuRow(kAllPlatforms, 31, L"srvo_S2_C2_2"),
    menuRow(kAllPlatforms, 32, L"srvo_S2_C2_3"),
    menuRow(kAllPlatforms, 33, L"srvo_S2_C2_4"),
    menuRow(kAllPlatforms, 34, L"srvo_S2_C2_5"),
    menuRow(kAllPlatforms, 35, L"srvo_S2_C2_6"),
    menuRow(kAllPlatforms, 36, L"srvo_S2_C3_1"),
    menuRow(kAllPlatforms, 37, L"srvo_S2_C3_2"),
    menuRow(kAllPlatforms, 38, L"srvo_S2_C3_3"),
    menuRow(kAllPlatforms, 39, L"srvo_S2_C3_4"),
    menuRow(kAllPlatforms, 40, L"srvo_S2_C3_5"),
    menuRow(kAllPlatforms, 41, L"srvo_S2_C3_6"),
    menuRow(kAllPlatforms, 42, L"srvo_S2_C4_1"),
    menuRow(kAllPlatforms, 43, L"srvo_S2_C4_2"),
    menuRow(kAllPlatforms, 44, L"srvo_S2_C4_3"),
    menuRow(kAllPlatforms, 45, L"srvo_S2_C4_4"),
    menuRow(kAllPlatforms, 46, L"srvo_S2_C4_5"),
    menuRow(kAllPlatforms, 47, L"srvo_S2_C4_6"),
    menuRow(kAllPlatforms, 48, L"srvo_S3_C1_1"),
    menuRow(kAllPlatforms, 49, L"srvo_S3_C1_2"),
    menuRow(kAllPlatforms, 50, L"srvo_S3_C1_3"),
    menuRow(kAllPlatforms, 51, L"srvo_S3_C1_4"),
    menuRow(kAllPlatforms, 52, L"srvo_S3_C1_5"),
    menuRow(kAllPlatforms, 53, L"srvo_S3_C1_6"),
    menuRow(kAllPlatforms, 54, L"srvo_S3_C2_1"),
    menuRow(kAllPlatforms, 55, L"srvo_S3_C2_2"),
    menuRow(kAllPlatforms, 56, L"srvo_S3_C2_3"),
    menuRow(kAllPlatforms, 57, L"srvo_S3_C2_4"),
    menuRow(kAllPlatforms, 58, L"srvo_S3_C2_5"),
    menuRow(kAllPlatforms, 59, L"srvo_S3_C2_6"),
    menuRow(kAllPlatforms, 60, L"srvo_S3_C3_1"),
    menuRow(kAllPlatforms, 61, L"srvo_S3_C3_2"),
    menuRow(kAllPlatforms, 62, L"srvo_S3_C3_3"),
    menuRow(kAllPlatforms, 63, L"srvo_S3_C3_4"),
    menuRow(kAllPlatforms, 64, L"srvo_S3_C3_5"),
    menuRow(kAllPlatforms, 65, L"srvo_S3_C3_6"),
    menuRow(kAllPlatforms, 66, L"srvo_S3_C4_1"),
    menuRow(kAllPlatforms, 67, L"srvo_S3_C4_2"),
    menuRow(kAllPlatforms, 68, L"srvo_S3_C4_3"),
    menuRow(kAllPlatforms, 69, L"srvo_S3_C4_4"),
    menuRow(kAllPlatforms, 70, L"srvo_S3_C4_5"),
    menuRow(kAllPlatforms, 71, L"srvo_S3_C4_6"),
    menuRow(kAllPlatforms, 72, L"srvo_S4_C1_1"),
    menuRow(kAllPlatforms, 73, L"srvo_S4_C1_2"),
    menuRow(kAllPlatforms, 74, L"srvo_S4_C1_3"),
    menuRow(kAllPlatforms, 75, L"srvo_S4_C1_4"),
    menuRow(kAllPlatforms, 76, L"srvo_S4_C1_5"),
    menuRow(kAllPlatforms, 77, L"srvo_S4_C1_6"),
    menuRow(kAllPlatforms, 78, L"srvo_S4_C2_1"),
    menuRow(kAllPlatforms, 79, L"srvo_S4_C2_2"),
    menuRow(kAllPlatforms, 80, L"srvo_S4_C2_3"),
    menuRow(kAllPlatforms, 81, L"srvo_S4_C2_4"),
    menuRow(kAllPlatforms, 82, L"srvo_S4_C2_5"),
    menuRow(kAllPlatforms, 83, L"srvo_S4_C2_6"),
    menuRow(kAllPlatforms, 84, L"srvo_S4_C3_1"),
    menuRow(kAllPlatforms, 85, L"srvo_S4_C3_2"),
    menuRow(kAllPlatforms, 86, L"srvo_S4_C3_3"),
    menuRow(kAllPlatforms, 87, L"srvo_S4_C3_4"),
    menuRow(kAllPlatforms, 88, L"srvo_S4_C3_5"),
    menuRow(kAllPlatforms, 89, L"srvo_S4_C3_6"),
    menuRow(kAllPlatforms, 90, L"srvo_S4_C4_1"),
    menuRow(kAllPlatforms, 91, L"srvo_S4_C4_2"),
    menuRow(kAllPlatforms, 92, L"srvo_S4_C4_3"),
    menuRow(kAllPlatforms, 93, L"srvo_S4_C4_4"),
    menuRow(kAllPlatforms, 94, L"srvo_S4_C4_5"),
    menuRow(kAllPlatforms, 95, L"srvo_S4_C4_6"),
    aliasRow(kAllPlatforms, 0, L"srvo_Matrix_S1_1"),
    aliasRow(kAllPlatforms, 1, L"srvo_Matrix_S1_2"),
    aliasRow(kAllPlatforms, 2, L"srvo_Matrix_S1_3"),
    aliasRow(kAllPlatforms, 3, L"srvo_Matrix_S1_4"),
    aliasRow(kAllPlatforms, 24, L"srvo_Matrix_S2_1"),
    aliasRow(kAllPlatforms, 25, L"srvo_Matrix_S2_2"),
    aliasRow(kAllPlatforms, 26, L"srvo_Matrix_S2_3"),
    aliasRow(kAllPlatforms, 27, L"srvo_Matrix_S2_4"),
    aliasRow(kAllPlatforms, 48, L"srvo_Matrix_S3_1"),
    aliasRow(kAllPlatforms, 49, L"srvo_Matrix_S3_2"),
    aliasRow(kAllPlatforms, 50, L"srvo_Matrix_S3_3"),
    aliasRow(kAllPlatforms, 51, L"srvo_Matrix_S3_4"),
    aliasRow(kAllPlatforms, 72, L"srvo_Matrix_S4_1"),
    aliasRow(kAllPlatforms, 73, L"srvo_Matrix_S4_2"),
    aliasRow(kAllPlatforms, 74, L"srvo_Matrix_S4_3"),
    aliasRow(kAllPlatforms, 75, L"srvo_Matrix_S4_4"),
    kEndOfTable,
};

// Brick platforms: built-in ports, then eight hub-motor indexes per sensor
// port (two per chain position; a four-motor controller's motors are second
// names of the port's first four). Other platforms number their ports.
const TDeviceTypeMenuItem kMotorPortNames[] = {
    menuRow(platformBit(platformNxt), 0, L"motorA"),
    menuRow(platformBit(platformNxt), 1, L"motorB"),
    menuRow(platformBit(platformNxt), 2, L"motorC"),
    menuRow(platformBit(platformNxt), 3, L"mtr_S1_C1_1"),
    menuRow(platformBit(platformNxt), 4, L"mtr_S1_C1_2"),
    menuRow(platformBit(platformNxt), 5, L"mtr_S1_C2_1"),
    menuRow(platformBit(platformNxt), 6, L"mtr_S1_C2_2"),
    menuRow(platformBit(platformNxt), 7, L"mtr_S1_C3_1"),
    menuRow(platformBit(platformNxt), 8, L"mtr_S1_C3_2"),
    menuRow(platformBit(platformNxt), 9, L"mtr_S1_C4_1"),
    menuRow(platformBit(platformNxt), 10, L"mtr_S1_C4_2"),
    menuRow(platformBit(platformNxt), 11, L"mtr_S2_C1_1"),
    menuRow(platformBit(platformNxt), 12, L"mtr_S2_C1_2"),
    menuRow(platformBit(platformNxt), 13, L"mtr_S2_C2_1"),
    menuRow(platformBit(platformNxt), 14, L"mtr_S2_C2_2"),
    menuRow(platformBit(platformNxt), 15, L"mtr_S2_C3_1"),
    menuRow(platformBit(platformNxt), 16, L"mtr_S2_C3_2"),
    menuRow(platformBit(platformNxt), 17, L"mtr_S2_C4_1"),
    menuRow(platformBit(platformNxt), 18, L"mtr_S2_C4_2"),
    menuRow(platformBit(platformNxt), 19, L"mtr_S3_C1_1"),
    menuRow(platformBit(platformNxt), 20, L"mtr_S3_C1_2"),
    menuRow(platformBit(platformNxt), 21, L"mtr_S3_C2_1"),
    menuRow(platformBit(platformNxt), 22, L"mtr_S3_C2_2"),
    menuRow(platformBit(platformNxt), 23, L"mtr_S3_C3_1"),
    menuRow(platformBit(platformNxt), 24, L"mtr_S3_C3_2"),
    menuRow(platformBit(platformNxt), 25, L"mtr_S3_C4_1"),
    menuRow(platformBit(platformNxt), 26, L"mtr_S3_C4_2"),
    menuRow(platformBit(platformNxt), 27, L"mtr_S4_C1_1"),
    menuRow(platformBit(platformNxt), 28, L"mtr_S4_C1_2"),
    menuRow(platformBit(platformNxt), 29, L"mtr_S4_C2_1"),
    menuRow(platformBit(platformNxt), 30, L"mtr_S4_C2_2"),
    menuRow(platformBit(platformNxt), 31, L"mtr_S4_C3_1"),
    menuRow(platformBit(platformNxt), 32, L"mtr_S4_C3_2"),
    menuRow(platformBit(platformNxt), 33, L"mtr_S4_C4_1"),
    menuRow(platformBit(platformNxt), 34, L"mtr_S4_C4_2"),
    aliasRow(platformBit(platformNxt), 3, L"mtr_Matrix_S1_1"),
    aliasRow(platformBit(platformNxt), 4, L"mtr_Matrix_S1_2"),
    aliasRow(platformBit(platformNxt), 5, L"mtr_Matrix_S1_3"),
    aliasRow(platformBit(platformNxt), 6, L"mtr_Matrix_S1_4"),
    aliasRow(platformBit(platformNxt), 11, L"mtr_Matrix_S2_1"),
    aliasRow(platformBit(platformNxt), 12, L"mtr_Matrix_S2_2"),
    aliasRow(platformBit(platformNxt), 13, L"mtr_Matrix_S2_3"),
    aliasRow(platformBit(platformNxt), 14, L"mtr_Matrix_S2_4"),
    aliasRow(platformBit(platformNxt), 19, L"mtr_Matrix_S3_1"),
    aliasRow(platformBit(platformNxt), 20, L"mtr_Matrix_S3_2"),
    aliasRow(platformBit(platformNxt), 21, L"mtr_Matrix_S3_3"),
    aliasRow(platformBit(platformNxt), 22, L"mtr_Matrix_S3_4"),
    aliasRow(platformBit(platformNxt), 27, L"mtr_Matrix_S4_1"),
    aliasRow(platformBit(platformNxt), 28, L"mtr_Matrix_S4_2"),
    aliasRow(platformBit(platformNxt), 29, L"mtr_Matrix_S4_3"),
    aliasRow(platformBit(platformNxt), 30, L"mtr_Matrix_S4_4"),
    menuRow(platformBit(platformBrick4Motor), 0, L"motorA"),
    menuRow(platformBit(platformBrick4Motor), 1, L"motorB"),
    menuRow(platformBit(platformBrick4Motor), 2, L"motorC"),
    menuRow(platformBit(platformBrick4Motor), 3, L"motorD"),
    menuRow(platformBit(platformBrick4Motor), 4, L"mtr_S1_C1_1"),
    menuRow(platformBit(platformBrick4Motor), 5, L"mtr_S1_C1_2"),
    menuRow(platformBit(platformBrick4Motor), 6, L"mtr_S1_C2_1"),
    menuRow(platformBit(platformBrick4Motor), 7, L"mtr_S1_C2_2"),
    menuRow(platformBit(platformBrick4Motor), 8, L"mtr_S1_C3_1"),
    menuRow(platformBit(platformBrick4Motor), 9, L"mtr_S1_C3_2"),
    menuRow(platformBit(platformBrick4Motor), 10, L"mtr_S1_C4_1"),
    menuRow(platformBit(platformBrick4Motor), 11, L"mtr_S1_C4_2"),
    menuRow(platformBit(platformBrick4Motor), 12, L"mtr_S2_C1_1"),
    menuRow(platformBit(platformBrick4Motor), 13, L"mtr_S2_C1_2"),
    menuRow(platformBit(platformBrick4Motor), 14, L"mtr_S2_C2_1"),
    menuRow(platformBit(platformBrick4Motor), 15, L"mtr_S2_C2_2"),
    menuRow(platformBit(platformBrick4Motor), 16, L"mtr_S2_C3_1"),
    menuRow(platformBit(platformBrick4Motor), 17, L"mtr_S2_C3_2"),
    menuRow(platformBit(platformBrick4Motor), 18, L"mtr_S2_C4_1"),
    menuRow(platformBit(platformBrick4Motor), 19, L"mtr_S2_C4_2"),
    menuRow(platformBit(platformBrick4Motor), 20, L"mtr_S3_C1_1"),
    menuRow(platformBit(platformBrick4Motor), 21, L"mtr_S3_C1_2"),
    menuRow(platformBit(platformBrick4Motor), 22, L"mtr_S3_C2_1"),
    menuRow(platformBit(platformBrick4Motor), 23, L"mtr_S3_C2_2"),
    menuRow(platformBit(platformBrick4Motor), 24, L"mtr_S3_C3_1"),
    menuRow(platformBit(platformBrick4Motor), 25, L"mtr_S3_C3_2"),
    menuRow(platformBit(platformBrick4Motor), 26, L"mtr_S3_C4_1"),
    menuRow(platformBit(platformBrick4Motor), 27, L"mtr_S3_C4_2"),
    menuRow(platformBit(platformBrick4Motor), 28, L"mtr_S4_C1_1"),
    menuRow(platformBit(platformBrick4Motor), 29, L"mtr_S4_C1_2"),
    menuRow(platformBit(platformBrick4Motor), 30, L"mtr_S4_C2_1"),
    menuRow(platformBit(platformBrick4Motor), 31, L"mtr_S4_C2_2"),
    menuRow(platformBit(platformBrick4Motor), 32, L"mtr_S4_C3_1"),
    menuRow(platformBit(platformBrick4Motor), 33, L"mtr_S4_C3_2"),
    menuRow(platformBit(platformBrick4Motor), 34, L"mtr_S4_C4_1"),
    menuRow(platformBit(platformBrick4Motor), 35, L"mtr_S4_C4_2"),
    aliasRow(platformBit(platformBrick4Motor), 4, L"mtr_Matrix_S1_1"),
    aliasRow(platformBit(platformBrick4Motor), 5, L"mtr_Matrix_S1_2"),
    aliasRow(platformBit(platformBrick4Motor), 6, L"mtr_Matrix_S1_3"),
    aliasRow(platformBit(platformBrick4Motor), 7, L"mtr_Matrix_S1_4"),
    aliasRow(platformBit(platformBrick4Motor), 12, L"mtr_Matrix_S2_1"),
    aliasRow(platformBit(platformBrick4Motor), 13, L"mtr_Matrix_S2_2"),
    aliasRow(platformBit(platformBrick4Motor), 14, L"mtr_Matrix_S2_3"),
    aliasRow(platformBit(platformBrick4Motor), 15, L"mtr_Matrix_S2_4"),
    aliasRow(platformBit(platformBrick4Motor), 20, L"mtr_Matrix_S3_1"),
    aliasRow(platformBit(platformBrick4Motor), 21, L"mtr_Matrix_S3_2"),
    aliasRow(platformBit(platformBrick4Motor), 22, L"mtr_Matrix_S3_3"),
    aliasRow(platformBit(platformBrick4Motor), 23, L"mtr_Matrix_S3_4"),
    aliasRow(platformBit(platformBrick4Motor), 28, L"mtr_Matrix_S4_1"),
    aliasRow(platformBit(platformBrick4Motor), 29, L"mtr_Matrix_S4_2"),
    aliasRow(platformBit(platformBrick4Motor), 30, L"mtr_Matrix_S4_3"),
    aliasRow(platformBit(platformBrick4Motor), 31, L"mtr_Matrix_S4_4"),
    menuRow(kVexPlatforms, 0, L"port1"),
    menuRow(kVexPlatforms, 1, L"port2"),
    menuRow(kVexPlatforms, 2, L"port3"),
    menuRow(kVexPlatforms, 3, L"port4"),
    menuRow(kVexPlatforms, 4, L"port5"),
    menuRow(kVexPlatforms, 5, L"port6"),
    menuRow(kVexPlatforms, 6, L"port7"),
    menuRow(kVexPlatforms, 7, L"port8"),
    menuRow(kVexPlatforms, 8, L"port9"),
    menuRow(kVexPlatforms, 9, L"port10"),
    menuRow(kNumberedMotorPlatforms, 0, L"motor1"),
    menuRow(kNumberedMotorPlatforms, 1, L"motor2"),
    menuRow(kNumberedMotorPlatforms, 2, L"motor3"),
    menuRow(kNumberedMotorPlatforms, 3, L"motor4"),
    menuRow(kNumberedMotorPlatforms, 4, L"motor5"),
    menuRow(kNumberedMotorPlatforms, 5, L"motor6"),
    menuRow(kNumberedMotorPlatforms, 6, L"motor7"),
    menuRow(kNumberedMotorPlatforms, 7, L"motor8"),
    menuRow(kNumberedMotorPlatforms, 8, L"motor9"),
    menuRow(kNumberedMotorPlatforms, 9, L"motor10"),
    menuRow(kNumberedMotorPlatforms, 10, L"motor11"),
    menuRow(kNumberedMotorPlatforms, 11, L"motor12"),
    kEndOfTable,
};

const TDeviceTypeMenuItem kSecondaryPortNames[] = {
    menuRow(kAllPlatforms, 0, L"secondaryPort1"),
    menuRow(kAllPlatforms, 1, L"secondaryPort2"),
    menuRow(kAllPlatforms, 2, L"secondaryPort3"),
    menuRow(kAllPlatforms, 3, L"secondaryPort4"),
    menuRow(kAllPlatforms, 4, L"secondaryPort5"),
    menuRow(kAllPlatforms, 5, L"secondaryPort6"),
    menuRow(kAllPlatforms, 6, L"secondaryPort7"),
    menuRow(kAllPlatforms, 7, L"secondaryPort8"),
    menuRow(kAllPlatforms, 8, L"secondaryPort9"),
    menuRow(kAllPlatforms, 9, L"secondaryPort10"),
    menuRow(kAllPlatforms, 10, L"secondaryPort11"),
    menuRow(kAllPlatforms, 11, L"secondaryPort12"),
    menuRow(kAllPlatforms, 12, L"secondaryPort13"),
    menuRow(kAllPlatforms, 13, L"secondaryPort14"),
    menuRow(kAllPlatforms, 14, L"secondaryPort15"),
    menuRow(kAllPlatforms, 15, L"secondaryPort16"),
    kEndOfTable,
};

}  // namespace robotconfig_catalog

using robotconfig_catalog::kAllPlatforms;
using robotconfig_catalog::kEndOfTable;
using robotconfig_catalog::menuRow;

const TDeviceTypeMenuItem nDriveTrainTypes[] = {
    menuRow(kAllPlatforms, 0, L"driveTrainNone", L"None"),
    menuRow(kAllPlatforms, 1, L"twoWheelDrive", L"Two-wheel drive"),
    menuRow(kAllPlatforms, 2, L"twoWheelSkidSteer", L"Two-wheel skid steer"),
    menuRow(kAllPlatforms, 3, L"fourWheelDrive", L"Four-wheel drive"),
    menuRow(kAllPlatforms, 4, L"mecanumDrive", L"Mecanum drive"),
    menuRow(kAllPlatforms, 5, L"xDriveOmni", L"X-drive (omni wheels)"),
    menuRow(kAllPlatforms, 6, L"threeWheelOmni", L"Three-wheel omni"),
    menuRow(kAllPlatforms, 7, L"fourWheelOmni", L"Four-wheel omni"),
    kEndOfTable,
};

const TDeviceTypeMenuItem nGripperArmTypes[] = {
    menuRow(kAllPlatforms, 0, L"gripperNone", L"None"),
    menuRow(kAllPlatforms, 1, L"gripperArmWithWrist", L"Arm with wrist"),
    menuRow(kAllPlatforms, 2, L"gripperClawLift", L"Claw and lift"),
    kEndOfTable,
};

const TDeviceTypeMenuItem nJoystickDriveTypes[] = {
    menuRow(kAllPlatforms, 0, L"joystickDriveNone", L"None"),
    menuRow(kAllPlatforms, 1, L"tankDrive", L"Tank drive"),
    menuRow(kAllPlatforms, 2, L"arcadeDriveLeftStick", L"Arcade drive (left stick)"),
    menuRow(kAllPlatforms, 3, L"arcadeDriveRightStick", L"Arcade drive (right stick)"),
    menuRow(kAllPlatforms, 4, L"splitArcadeDrive", L"Split arcade drive"),
    kEndOfTable,
};

const TDeviceTypeMenuItem nJoystickAxisScalingTypes[] = {
    menuRow(kAllPlatforms, 0, L"axisScalingLinear", L"Linear"),
    menuRow(kAllPlatforms, 1, L"axisScalingSquared", L"Squared"),
    menuRow(kAllPlatforms, 2, L"axisScalingCubed", L"Cubed"),
    kEndOfTable,
};
