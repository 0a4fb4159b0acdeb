// Layer record (with core/, motors/, sensors/): built on host/ alone.
// UART and I2C ports: default uses and the words of their configuration lines.
#pragma once

#include "robotconfig/host/DeviceTypes.h"

/// Baud rate a UART mode runs at by default.
TBaudRate getDefaultBaudRateForUartMode(TSerialPortMode nMode);

struct TDeviceTypeMenuItem;

/// Words of the UART_Usage and I2C_Usage lines.
extern const TDeviceTypeMenuItem nUARTTypes[];
extern const TDeviceTypeMenuItem nUARTBaudRates[];
extern const TDeviceTypeMenuItem nUartIndex[];
extern const TDeviceTypeMenuItem nI2CIndex[];
extern const TDeviceTypeMenuItem nI2CTypes[];
