// Rules shared by the writers of the motor configuration lines.
#pragma once

/// Number of motor indexes the Motor and MotorPidSetting writers walk: every
/// slot on the board platforms, else the platform's motor count, and never
/// more than the record's slots.
int getNumbOfMotorIndexesToWrite();
