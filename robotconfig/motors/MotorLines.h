// Rules shared by the readers and writers of the motor configuration lines.
#pragma once

/// The refusal of a line whose first parameter names no motor port.
inline constexpr const wchar_t *kBadMotorDeviceIndexMessage = L"Bad motor device index '%s'";

/// Number of motor indexes the Motor and MotorPidSetting writers walk: every
/// slot on the board platforms, else the platform's motor count, and never
/// more than the record's slots.
int getNumbOfMotorIndexesToWrite();
