#pragma config(Hubs,  S1, HTServo,  HTMotor,  none,     none)
#pragma config(Hubs,  S2, MatrxRbtcs, none,   none,     none)
#pragma config(Sensor, S1,     ,               sensorI2CMuxController)
#pragma config(Sensor, S2,     ,               sensorI2CMuxController)
#pragma config(Motor,  mtr_S1_C2_1,     lift,          tmotorTetrix, openLoop)
#pragma config(Servo,  srvo_S1_C1_1,    claw,                 tServoStandard)
#pragma config(Servo,  srvo_S1_C1_2,    wrist,                tServoWinch)
#pragma config(Servo,  srvo_Matrix_S2_1, pan,                 tServoContinuousRotation)
#pragma config(SrvoPosition,  clawOpen,   200)
#pragma config(SrvoPosition,  clawClosed,  40, 128, 0, 255)
#pragma config(SrvoPosition,  parked)

// Servos on a servo controller chained behind the motor controller's port and
// on a four-servo controller; three named sets of positions.
task main()
{
  servo[claw] = 200;
  wait1Msec(500);
  servo[claw] = 40;
}
