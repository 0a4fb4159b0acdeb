// The controller boards: CPU, sensor ports, serial-port wiring, display names
// and the menu of boards a platform lets the user choose.
#include <array>

#include "robotconfig/host/CatalogRows.h"
#include "robotconfig/host/Platform.h"

using namespace robotconfig_catalog;

namespace {

// ---------------------------------------------------------------------------
// Sensor-port names, value = sensor-port index.

constexpr TDeviceTypeMenuItem kNoSensorPorts[] = {
    kEndOfTable,
};

constexpr TDeviceTypeMenuItem kBrickSensorPorts[] = {
    portRow(0, L"S1"),
    portRow(1, L"S2"),
    portRow(2, L"S3"),
    portRow(3, L"S4"),
    kEndOfTable,
};

constexpr TDeviceTypeMenuItem kVexPicSensorPorts[] = {
    portRow(0, L"in1"),
    portRow(1, L"in2"),
    portRow(2, L"in3"),
    portRow(3, L"in4"),
    portRow(4, L"in5"),
    portRow(5, L"in6"),
    portRow(6, L"in7"),
    portRow(7, L"in8"),
    portRow(8, L"in9"),
    portRow(9, L"in10"),
    portRow(10, L"in11"),
    portRow(11, L"in12"),
    portRow(12, L"in13"),
    portRow(13, L"in14"),
    portRow(14, L"in15"),
    portRow(15, L"in16"),
    kEndOfTable,
};

// Analog inputs, digital ports, then the motor encoders daisy-chained on the I2C bus.
constexpr TDeviceTypeMenuItem kVexI2cSensorPorts[] = {
    portRow(0, L"in1"),
    portRow(1, L"in2"),
    portRow(2, L"in3"),
    portRow(3, L"in4"),
    portRow(4, L"in5"),
    portRow(5, L"in6"),
    portRow(6, L"in7"),
    portRow(7, L"in8"),
    portRow(8, L"dgtl1"),
    portRow(9, L"dgtl2"),
    portRow(10, L"dgtl3"),
    portRow(11, L"dgtl4"),
    portRow(12, L"dgtl5"),
    portRow(13, L"dgtl6"),
    portRow(14, L"dgtl7"),
    portRow(15, L"dgtl8"),
    portRow(16, L"dgtl9"),
    portRow(17, L"dgtl10"),
    portRow(18, L"dgtl11"),
    portRow(19, L"dgtl12"),
    portRow(20, L"I2C_1"),
    portRow(21, L"I2C_2"),
    portRow(22, L"I2C_3"),
    portRow(23, L"I2C_4"),
    portRow(24, L"I2C_5"),
    portRow(25, L"I2C_6"),
    portRow(26, L"I2C_7"),
    portRow(27, L"I2C_8"),
    kEndOfTable,
};

constexpr TDeviceTypeMenuItem kSharedSensorPorts[] = {
    portRow(0, L"port1"),
    portRow(1, L"port2"),
    portRow(2, L"port3"),
    portRow(3, L"port4"),
    portRow(4, L"port5"),
    portRow(5, L"port6"),
    portRow(6, L"port7"),
    portRow(7, L"port8"),
    portRow(8, L"port9"),
    portRow(9, L"port10"),
    portRow(10, L"port11"),
    portRow(11, L"port12"),
    kEndOfTable,
};

constexpr TDeviceTypeMenuItem kClassroomSensorPorts[] = {
    portRow(0, L"in1"),
    portRow(1, L"in2"),
    portRow(2, L"in3"),
    portRow(3, L"in4"),
    portRow(4, L"in5"),
    portRow(5, L"in6"),
    portRow(6, L"in7"),
    portRow(7, L"in8"),
    portRow(8, L"dgtl1"),
    portRow(9, L"dgtl2"),
    portRow(10, L"dgtl3"),
    portRow(11, L"dgtl4"),
    portRow(12, L"dgtl5"),
    portRow(13, L"dgtl6"),
    portRow(14, L"dgtl7"),
    portRow(15, L"dgtl8"),
    kEndOfTable,
};

constexpr TDeviceTypeMenuItem kUnoSensorPorts[] = {
    portRow(0, L"anlg0"),
    portRow(1, L"anlg1"),
    portRow(2, L"anlg2"),
    portRow(3, L"anlg3"),
    portRow(4, L"anlg4"),
    portRow(5, L"anlg5"),
    portRow(6, L"dgtl0"),
    portRow(7, L"dgtl1"),
    portRow(8, L"dgtl2"),
    portRow(9, L"dgtl3"),
    portRow(10, L"dgtl4"),
    portRow(11, L"dgtl5"),
    portRow(12, L"dgtl6"),
    portRow(13, L"dgtl7"),
    portRow(14, L"dgtl8"),
    portRow(15, L"dgtl9"),
    portRow(16, L"dgtl10"),
    portRow(17, L"dgtl11"),
    portRow(18, L"dgtl12"),
    portRow(19, L"dgtl13"),
    kEndOfTable,
};

constexpr TDeviceTypeMenuItem kMegaSensorPorts[] = {
    portRow(0, L"anlg0"),
    portRow(1, L"anlg1"),
    portRow(2, L"anlg2"),
    portRow(3, L"anlg3"),
    portRow(4, L"anlg4"),
    portRow(5, L"anlg5"),
    portRow(6, L"anlg6"),
    portRow(7, L"anlg7"),
    portRow(8, L"anlg8"),
    portRow(9, L"anlg9"),
    portRow(10, L"anlg10"),
    portRow(11, L"anlg11"),
    portRow(12, L"anlg12"),
    portRow(13, L"anlg13"),
    portRow(14, L"anlg14"),
    portRow(15, L"anlg15"),
    portRow(16, L"dgtl0"),
    portRow(17, L"dgtl1"),
    portRow(18, L"dgtl2"),
    portRow(19, L"dgtl3"),
    portRow(20, L"dgtl4"),
    portRow(21, L"dgtl5"),
    portRow(22, L"dgtl6"),
    portRow(23, L"dgtl7"),
    portRow(24, L"dgtl8"),
    portRow(25, L"dgtl9"),
    portRow(26, L"dgtl10"),
    portRow(27, L"dgtl11"),
    portRow(28, L"dgtl12"),
    portRow(29, L"dgtl13"),
    portRow(30, L"dgtl14"),
    portRow(31, L"dgtl15"),
    portRow(32, L"dgtl16"),
    portRow(33, L"dgtl17"),
    portRow(34, L"dgtl18"),
    portRow(35, L"dgtl19"),
    portRow(36, L"dgtl20"),
    portRow(37, L"dgtl21"),
    portRow(38, L"dgtl22"),
    portRow(39, L"dgtl23"),
    portRow(40, L"dgtl24"),
    portRow(41, L"dgtl25"),
    portRow(42, L"dgtl26"),
    portRow(43, L"dgtl27"),
    portRow(44, L"dgtl28"),
    portRow(45, L"dgtl29"),
    portRow(46, L"dgtl30"),
    portRow(47, L"dgtl31"),
    portRow(48, L"dgtl32"),
    portRow(49, L"dgtl33"),
    portRow(50, L"dgtl34"),
    portRow(51, L"dgtl35"),
    portRow(52, L"dgtl36"),
    portRow(53, L"dgtl37"),
    portRow(54, L"dgtl38"),
    portRow(55, L"dgtl39"),
    portRow(56, L"dgtl40"),
    portRow(57, L"dgtl41"),
    portRow(58, L"dgtl42"),
    portRow(59, L"dgtl43"),
    portRow(60, L"dgtl44"),
    portRow(61, L"dgtl45"),
    portRow(62, L"dgtl46"),
    portRow(63, L"dgtl47"),
    portRow(64, L"dgtl48"),
    portRow(65, L"dgtl49"),
    portRow(66, L"dgtl50"),
    portRow(67, L"dgtl51"),
    portRow(68, L"dgtl52"),
    portRow(69, L"dgtl53"),
    kEndOfTable,
};

constexpr TDeviceTypeMenuItem kMakerSensorPorts[] = {
    portRow(0, L"anlg0"),
    portRow(1, L"anlg1"),
    portRow(2, L"anlg2"),
    portRow(3, L"anlg3"),
    portRow(4, L"anlg4"),
    portRow(5, L"anlg5"),
    portRow(6, L"anlg6"),
    portRow(7, L"anlg7"),
    portRow(8, L"dgtl0"),
    portRow(9, L"dgtl1"),
    portRow(10, L"dgtl2"),
    portRow(11, L"dgtl3"),
    portRow(12, L"dgtl4"),
    portRow(13, L"dgtl5"),
    portRow(14, L"dgtl6"),
    portRow(15, L"dgtl7"),
    portRow(16, L"dgtl8"),
    portRow(17, L"dgtl9"),
    portRow(18, L"dgtl10"),
    portRow(19, L"dgtl11"),
    portRow(20, L"dgtl12"),
    portRow(21, L"dgtl13"),
    portRow(22, L"dgtl14"),
    portRow(23, L"dgtl15"),
    kEndOfTable,
};

// ---------------------------------------------------------------------------
// Serial-port wiring. Pins are sensor-port indexes of the board's table.

/// Wiring of one serial port; -1 pins mean the port has no configurable pins.
constexpr TSerialPortIOPinsDefn serialPins(int32_t nHardwarePort, int32_t nFirstPin, int32_t nSecondPin) {
  return {nHardwarePort, nSecondPin, nFirstPin};
}

constexpr TSerialPortIOPinsDefn kNoPins = serialPins(-1, -1, -1);

constexpr TSerialPortsInfo kNoSerialPorts = {
    false, 0, {{kNoPins, kNoPins, kNoPins, kNoPins, kNoPins, kNoPins}},
    0,     {{kNoPins, kNoPins, kNoPins, kNoPins, kNoPins, kNoPins}},
};

constexpr TSerialPortsInfo kVexPicSerialPorts = {
    false, 2, {{serialPins(0, -1, -1), serialPins(1, -1, -1), kNoPins, kNoPins, kNoPins, kNoPins}},
    0,     {{kNoPins, kNoPins, kNoPins, kNoPins, kNoPins, kNoPins}},
};

constexpr TSerialPortsInfo kVexI2cSerialPorts = {
    false, 3, {{serialPins(0, -1, -1), serialPins(1, -1, -1), serialPins(2, -1, -1), kNoPins, kNoPins, kNoPins}},
    1,     {{serialPins(0, -1, -1), kNoPins, kNoPins, kNoPins, kNoPins, kNoPins}},
};

constexpr TSerialPortsInfo kSingleUartSerialPorts = {
    false, 1, {{serialPins(0, -1, -1), kNoPins, kNoPins, kNoPins, kNoPins, kNoPins}},
    0,     {{kNoPins, kNoPins, kNoPins, kNoPins, kNoPins, kNoPins}},
};

// Uno layout: RX/TX on dgtl0/dgtl1, SDA/SCL on anlg4/anlg5.
constexpr TSerialPortIOPinsDefn kUnoUart0 = serialPins(0, 6, 7);
constexpr TSerialPortIOPinsDefn kUnoI2c0 = serialPins(0, 4, 5);

// The USB link of the Uno-layout boards shares UART0 with the sketch.
constexpr TSerialPortsInfo kUnoSerialPorts = {
    false, 1, {{kUnoUart0, kNoPins, kNoPins, kNoPins, kNoPins, kNoPins}},
    1,     {{kUnoI2c0, kNoPins, kNoPins, kNoPins, kNoPins, kNoPins}},
};

// Boards with a native USB link leave UART0 to the program.
constexpr TSerialPortsInfo kUnoSerialPortsReconfigurable = {
    true, 1, {{kUnoUart0, kNoPins, kNoPins, kNoPins, kNoPins, kNoPins}},
    1,    {{kUnoI2c0, kNoPins, kNoPins, kNoPins, kNoPins, kNoPins}},
};

// Mega layout: the digital ports start at sensor port 16 (dgtl0).
constexpr TSerialPortIOPinsDefn kMegaUart0 = serialPins(0, 16, 17);
constexpr TSerialPortIOPinsDefn kMegaUart1 = serialPins(1, 35, 34);
constexpr TSerialPortIOPinsDefn kMegaUart2 = serialPins(2, 33, 32);
constexpr TSerialPortIOPinsDefn kMegaUart3 = serialPins(3, 31, 30);
constexpr TSerialPortIOPinsDefn kMegaI2c0 = serialPins(0, 36, 37);

constexpr TSerialPortsInfo kMegaSerialPorts = {
    true, 4, {{kMegaUart0, kMegaUart1, kMegaUart2, kMegaUart3, kNoPins, kNoPins}},
    1,    {{kMegaI2c0, kNoPins, kNoPins, kNoPins, kNoPins, kNoPins}},
};

// The expansion board reports more UARTs than the record can describe; only
// the first six are wired.
constexpr TSerialPortsInfo kMegaExpansionSerialPorts = {
    true,
    8,
    {{kMegaUart0, kMegaUart1, kMegaUart2, kMegaUart3, serialPins(4, 49, 48), serialPins(5, 51, 50)}},
    6,
    {{kMegaI2c0, serialPins(1, 38, 39), serialPins(2, 40, 41), serialPins(3, 42, 43), serialPins(4, 44, 45),
      serialPins(5, 46, 47)}},
};

// ---------------------------------------------------------------------------
// The boards, indexed by board number.

struct TBoardRecord {
  TCktBoardInfo info;
  const wchar_t *pzName;
  const TDeviceTypeMenuItem *pSensorPorts;
};

/// A board record; its sensor ports are those of its port table (which ends
/// with the end row), numbered from 0.
template <size_t N>
constexpr TBoardRecord board(TControllerBoardType nBoard, const wchar_t *pzName, const wchar_t *pzCpu, int32_t nClockHz,
                             const TDeviceTypeMenuItem (&sensorPorts)[N], const TSerialPortsInfo &serialPorts) {
  return {{nBoard, pzCpu, nClockHz, 0, static_cast<int32_t>(N) - 2, &serialPorts}, pzName, sensorPorts};
}

constexpr std::array<TBoardRecord, 37> kBoards = {{
    board(0, L"No Board", L"None", 0, kNoSensorPorts, kNoSerialPorts),
    board(1, L"NXT Brick", L"AT91SAM7S256", 48000000, kBrickSensorPorts, kNoSerialPorts),
    board(2, L"VEX PIC Controller", L"PIC18F8520", 10000000, kVexPicSensorPorts, kVexPicSerialPorts),
    board(3, L"Maker Board Classic", L"ATmega328P", 16000000, kMakerSensorPorts, kNoSerialPorts),
    board(4, L"Maker Board Mega", L"ATmega2560", 16000000, kMakerSensorPorts, kNoSerialPorts),
    board(5, L"VEX I2C Controller", L"STM32F103VD", 72000000, kVexI2cSensorPorts, kVexI2cSerialPorts),
    board(6, L"Shared Ports Controller", L"ATmega644P", 20000000, kSharedSensorPorts, kSingleUartSerialPorts),
    board(7, L"Classroom Controller", L"PIC24FJ256GB106", 32000000, kClassroomSensorPorts, kSingleUartSerialPorts),
    board(8, L"Arduino Duemilanove", L"ATmega328P", 16000000, kUnoSensorPorts, kUnoSerialPorts),
    board(9, L"Arduino Diecimila", L"ATmega168", 16000000, kUnoSensorPorts, kUnoSerialPorts),
    board(10, L"Arduino Uno", L"ATmega328P", 16000000, kUnoSensorPorts, kUnoSerialPorts),
    board(11, L"Arduino Uno SMD", L"ATmega328P", 16000000, kUnoSensorPorts, kUnoSerialPorts),
    board(12, L"Arduino Mega", L"ATmega1280", 16000000, kMegaSensorPorts, kMegaSerialPorts),
    board(13, L"Arduino Mega 2560", L"ATmega2560", 16000000, kMegaSensorPorts, kMegaSerialPorts),
    board(14, L"Arduino Nano", L"ATmega328P", 16000000, kUnoSensorPorts, kUnoSerialPorts),
    board(15, L"Arduino Pro Mini 5V", L"ATmega328P", 16000000, kUnoSensorPorts, kUnoSerialPorts),
    board(16, L"Arduino Pro Mini 3.3V", L"ATmega328P", 8000000, kUnoSensorPorts, kUnoSerialPorts),
    board(17, L"Arduino Uno Motor Controller", L"ATmega328P", 16000000, kUnoSensorPorts, kUnoSerialPorts),
    board(18, L"Arduino Uno Motor Controller Rev 2", L"ATmega328P", 16000000, kUnoSensorPorts,
          kUnoSerialPorts),
    board(19, L"Arduino Leonardo", L"ATmega32U4", 16000000, kUnoSensorPorts, kUnoSerialPortsReconfigurable),
    board(20, L"Arduino Micro", L"ATmega32U4", 16000000, kUnoSensorPorts, kUnoSerialPortsReconfigurable),
    board(21, L"Arduino Ethernet", L"ATmega328P", 16000000, kUnoSensorPorts, kUnoSerialPorts),
    board(22, L"Arduino Fio", L"ATmega328P", 8000000, kUnoSensorPorts, kUnoSerialPorts),
    board(23, L"Arduino LilyPad", L"ATmega328P", 8000000, kUnoSensorPorts, kUnoSerialPorts),
    board(24, L"Arduino Mega Expansion Board", L"ATmega2560", 16000000, kMegaSensorPorts,
          kMegaExpansionSerialPorts),
    board(25, L"Maker Board Mini", L"ATmega32U4", 16000000, kMakerSensorPorts, kNoSerialPorts),
    board(26, L"Maker Board Pro", L"SAM3X8E", 84000000, kMakerSensorPorts, kNoSerialPorts),
    board(27, L"Arduino Uno Robot Kit", L"ATmega328P", 16000000, kUnoSensorPorts, kUnoSerialPorts),
    board(28, L"Arduino Uno Servo Kit", L"ATmega328P", 16000000, kUnoSensorPorts, kUnoSerialPorts),
    board(29, L"Maker Board Edu", L"ATmega1284P", 20000000, kMakerSensorPorts, kNoSerialPorts),
    board(30, L"Maker Board Edu Plus", L"ATmega1284P", 20000000, kMakerSensorPorts, kNoSerialPorts),
    board(31, L"Maker Board Wireless", L"ESP32", 240000000, kMakerSensorPorts, kNoSerialPorts),
    board(32, L"Maker Board Sensor Hub", L"ATmega328PB", 16000000, kMakerSensorPorts, kNoSerialPorts),
    board(33, L"Maker Board Rover", L"ATmega2560", 16000000, kMakerSensorPorts, kNoSerialPorts),
    board(34, L"Maker Board Arm", L"STM32F401", 84000000, kMakerSensorPorts, kNoSerialPorts),
    board(35, L"Maker Board Lite", L"ATtiny1614", 20000000, kMakerSensorPorts, kNoSerialPorts),
    board(36, L"Generic board (user pins)", L"ATmega328P", 16000000, kUnoSensorPorts, kUnoSerialPorts),
}};

/// True when every record sits at the index of its board number.
constexpr bool bBoardsIndexedByNumber() {
  for (size_t i = 0; i < kBoards.size(); ++i) {
    if (kBoards[i].info.nBoardType != static_cast<TControllerBoardType>(i)) return false;
  }
  return true;
}
static_assert(bBoardsIndexedByNumber(), "board records must be in board-number order");

/// Record of a board number; null for a number outside the catalog.
const TBoardRecord *findBoard(TControllerBoardType nBoard) {
  if (nBoard < 0 || static_cast<size_t>(nBoard) >= kBoards.size()) return nullptr;
  return &kBoards[static_cast<size_t>(nBoard)];
}

constexpr uint32_t kArduinoOnly = platformBit(platformArduino);

// Boards the user may choose, one row per board; the label is the display name.
const TDeviceTypeMenuItem kSelectableBoards[] = {
    menuRow(kArduinoOnly, 8, L"typeCktBoardDuemilanove", L"Arduino Duemilanove"),
    menuRow(kArduinoOnly, 9, L"typeCktBoardDiecimila", L"Arduino Diecimila"),
    menuRow(kArduinoOnly, 10, L"typeCktBoardUno", L"Arduino Uno"),
    menuRow(kArduinoOnly, 11, L"typeCktBoardUnoSMD", L"Arduino Uno SMD"),
    menuRow(kArduinoOnly, 12, L"typeCktBoardMega", L"Arduino Mega"),
    menuRow(kArduinoOnly, 13, L"typeCktBoardMega2560", L"Arduino Mega 2560"),
    menuRow(kArduinoOnly, 14, L"typeCktBoardNano", L"Arduino Nano"),
    menuRow(kArduinoOnly, 15, L"typeCktBoardProMini5V", L"Arduino Pro Mini 5V"),
    menuRow(kArduinoOnly, 16, L"typeCktBoardProMini3V3", L"Arduino Pro Mini 3.3V"),
    menuRow(kArduinoOnly, 17, L"typeCktBoardUnoMotorController", L"Arduino Uno Motor Controller"),
    menuRow(kArduinoOnly, 18, L"typeCktBoardUnoMotorControllerRev2", L"Arduino Uno Motor Controller Rev 2"),
    menuRow(kArduinoOnly, 19, L"typeCktBoardLeonardo", L"Arduino Leonardo"),
    menuRow(kArduinoOnly, 20, L"typeCktBoardMicro", L"Arduino Micro"),
    menuRow(kArduinoOnly, 21, L"typeCktBoardEthernet", L"Arduino Ethernet"),
    menuRow(kArduinoOnly, 22, L"typeCktBoardFio", L"Arduino Fio"),
    menuRow(kArduinoOnly, 23, L"typeCktBoardLilyPad", L"Arduino LilyPad"),
    menuRow(kArduinoOnly, 24, L"typeCktBoardMegaExpansion", L"Arduino Mega Expansion Board"),
    menuRow(kArduinoOnly, 27, L"typeCktBoardUnoRobotKit", L"Arduino Uno Robot Kit"),
    menuRow(kArduinoOnly, 28, L"typeCktBoardUnoServoKit", L"Arduino Uno Servo Kit"),
    menuRow(kArduinoOnly, 36, L"typeCktBoardGeneric", L"Generic board (user pins)"),
    menuRow(kBoardPlatforms, 3, L"typeCktBoardMakerClassic", L"Maker Board Classic"),
    menuRow(kBoardPlatforms, 4, L"typeCktBoardMakerMega", L"Maker Board Mega"),
    menuRow(kBoardPlatforms, 25, L"typeCktBoardMakerMini", L"Maker Board Mini"),
    menuRow(kBoardPlatforms, 26, L"typeCktBoardMakerPro", L"Maker Board Pro"),
    menuRow(kBoardPlatforms, 29, L"typeCktBoardMakerEdu", L"Maker Board Edu"),
    menuRow(kBoardPlatforms, 30, L"typeCktBoardMakerEduPlus", L"Maker Board Edu Plus"),
    menuRow(kBoardPlatforms, 31, L"typeCktBoardMakerWireless", L"Maker Board Wireless"),
    menuRow(kBoardPlatforms, 32, L"typeCktBoardMakerSensorHub", L"Maker Board Sensor Hub"),
    menuRow(kBoardPlatforms, 33, L"typeCktBoardMakerRover", L"Maker Board Rover"),
    menuRow(kBoardPlatforms, 34, L"typeCktBoardMakerArm", L"Maker Board Arm"),
    menuRow(kBoardPlatforms, 35, L"typeCktBoardMakerLite", L"Maker Board Lite"),
    kEndOfTable,
};

}  // namespace

const TCktBoardInfo *getCircuitBoardInfo(TControllerBoardType nBoard) {
  const TBoardRecord *pBoard = findBoard(nBoard);
  return pBoard ? &pBoard->info : nullptr;
}

const wchar_t *getCktBoardNameString(TControllerBoardType nBoard) {
  const TBoardRecord *pBoard = findBoard(nBoard);
  return pBoard ? pBoard->pzName : L"";
}

const TDeviceTypeMenuItem *getArduinoCircuitBoardTypeMenuDefn() { return kSelectableBoards; }

const TDeviceTypeMenuItem *getSensorNameDefinitions(TControllerBoardType nBoard) {
  const TBoardRecord *pBoard = findBoard(nBoard);
  return pBoard ? pBoard->pSensorPorts : kNoSensorPorts;
}

const TDeviceTypeMenuItem *getSensorNameDefinitionsForCktBoards(TControllerBoardType nBoard) {
  return getSensorNameDefinitions(nBoard);
}

const wchar_t *getSensorPortString(int nPort, TControllerBoardType nBoard) {
  if (nPort == -1) return L"None";
  return getTypedefEnumString(getSensorNameDefinitions(nBoard), nPort, -1);
}
