#include "robotconfig/core/RobotConfiguration.h"

void CRobotConfigurationBasic::setMapEncoderToMotor(int nMotor, int nSensorPort) {
  if (bIsMotorIndex(nMotor)) settings.motors[size_t(nMotor)].nEncoderPort = nSensorPort < 0 ? -1 : nSensorPort;
}

void CRobotConfigurationBasic::removeMotorEncodersForSensorPort(int nSensorPort) {
  // -1 is "no encoder port", not a port: it must not strip the motors without encoders.
  if (nSensorPort < 0) return;
  for (TMotorSlot &motor : settings.motors)
    if (motor.nEncoderPort == nSensorPort) {
      motor.nEncoderPort = -1;
      motor.bEncoder = false;
      motor.bPIDControlled = false;
    }
}
