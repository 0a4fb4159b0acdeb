#include "robotconfig/drive_serial_network/SerialPorts.h"
#include "robotconfig/host/DeviceCatalog.h"

namespace {

constexpr uint32_t kVexAndBoards = 0x29C;   // kinds 2, 3, 4, 7, 9
constexpr uint32_t kVexI2cAndArduino = 0x18;  // kinds 3, 4
constexpr uint32_t kVexPic = 0x4;
constexpr uint32_t kVexI2c = 0x8;
constexpr uint32_t kArduino = 0x10;

// A row: platform mask, value, keyword, label, row attribute, and the field after the mask.
constexpr TDeviceTypeMenuItem row(uint32_t nMask, int32_t nValue, const wchar_t *pzKeyword, const wchar_t *pzLabel,
                                  int32_t nRowAttribute = 0, int32_t nSecondField = 0) {
  return {nMask, nSecondField, 0, 0, 0, 0xFE, nRowAttribute, nValue, pzKeyword, pzLabel, 0};
}
constexpr TDeviceTypeMenuItem kEndRow = {0, 0, 0, 0, 0, 0, 0, 0, nullptr, nullptr, 0};

}  // namespace

const TDeviceTypeMenuItem nUARTTypes[] = {
    row(kVexAndBoards, 0, L"uartNotUsed", L"UART Not Used"),
    row(kVexAndBoards, 1, L"uartSystemCommPort", L"System Comm Port", 0, 96),
    row(kVexAndBoards, 2, L"uartUserControl", L"User Program"),
    row(kVexAndBoards, 3, L"uartVEXLCD", L"VEX 2x16 LCD"),
    row(kVexAndBoards, 6, L"uartCMUCAM", L"CMU Camera"),
    row(kVexAndBoards, 7, L"uartSerialGPS", L"Serial GPS"),
    row(kVexAndBoards, 4, L"uartXBeeZigBee", L"XBee ZigBee"),
    row(kVexAndBoards, 5, L"uartXBeeWiFi", L"XBee WiFi"),
    row(kVexAndBoards, 0, L"NotAssigned", L"UART Not Used", kRowAttributeAlias),
    row(kVexAndBoards, 2, L"User_Control", L"User Program", kRowAttributeAlias),
    row(kVexAndBoards, 3, L"VEX_2x16_LCD", L"VEX 2x16 LCD", kRowAttributeAlias),
    kEndRow,
};

const TDeviceTypeMenuItem nUARTBaudRates[] = {
    row(kVexI2cAndArduino, 0, L"baudRate1200", L"1.2K bps"),
    row(kVexI2cAndArduino, 1, L"baudRate2400", L"2.4K bps"),
    row(kVexAndBoards, 2, L"baudRate4800", L"4.8K bps"),
    row(kVexAndBoards, 3, L"baudRate9600", L"9.6K bps"),
    row(kVexAndBoards, 5, L"baudRate19200", L"19.2K bps"),
    row(kVexAndBoards, 7, L"baudRate38400", L"38.4K bps"),
    row(kVexAndBoards, 8, L"baudRate57600", L"57.6K bps"),
    row(kVexI2cAndArduino, 10, L"baudRate100000", L"100K bps"),
    row(kVexAndBoards, 11, L"baudRate115200", L"115.2K bps"),
    row(kVexI2cAndArduino, 12, L"baudRate200000", L"200K bps"),
    row(kVexI2cAndArduino, 13, L"baudRate230400", L"230.4K bps"),
    row(kVexI2cAndArduino, 14, L"baudRate250000", L"250K bps"),
    kEndRow,
};

const TDeviceTypeMenuItem nUartIndex[] = {
    row(kVexPic, 1, L"UART1", nullptr),  row(kVexI2c, 1, L"UART1", nullptr),  row(kVexI2c, 2, L"UART2", nullptr),
    row(kArduino, 0, L"UART0", nullptr), row(kArduino, 1, L"UART1", nullptr), row(kArduino, 2, L"UART2", nullptr),
    row(kArduino, 3, L"UART3", nullptr), row(kArduino, 4, L"UART4", nullptr), row(kArduino, 5, L"UART5", nullptr),
    kEndRow,
};

const TDeviceTypeMenuItem nI2CIndex[] = {
    row(kVexI2c, 0, L"I2C1", nullptr),  row(kArduino, 0, L"I2C0", nullptr), row(kArduino, 1, L"I2C1", nullptr),
    row(kArduino, 2, L"I2C2", nullptr), row(kArduino, 3, L"I2C3", nullptr), row(kArduino, 4, L"I2C4", nullptr),
    row(kVexAndBoards, 5, L"I2C5", nullptr),
    kEndRow,
};

const TDeviceTypeMenuItem nI2CTypes[] = {
    row(kVexAndBoards, 0, L"NotAssigned", nullptr),
    row(kVexAndBoards, 1, L"i2cUser", L"User Control", 4),
    row(kVexAndBoards, 2, L"i2cSensors", L"Standard Sensors"),
    kEndRow,
};
