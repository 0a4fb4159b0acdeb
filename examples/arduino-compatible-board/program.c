#pragma config(CircuitBoardType, typeCktBoardUno)
#pragma config(CPU_Parameters, ATmega328P, 16000000)
#pragma config(PluginCircuitBoard, typeShieldSparkfunArdumoto)
#pragma config(PluginCircuitBoard, typeShieldDFRobotMotor)
#pragma config(Sensor, anlg0,  distance,       sensorAnalog)
#pragma config(Motor,  motor_5,         leftMotor,     tmotorDCMotorPWM, openLoop, IOPins, dgtl5, dgtl4)
#pragma config(Motor,  motor_6,         rightMotor,    tmotorDCMotorPWM, openLoop, reversed, IOPins, dgtl6, dgtl7)

// The IDE's robot kit board runs Uno programs unchanged, so it stays selected.
// The clock line names the board's own clock and is not written back.
task main()
{
  motor[leftMotor] = 60;
  motor[rightMotor] = 60;
  wait1Msec(1000);
}
