#pragma config(CircuitBoardType, typeCktBoardUNO)
#pragma config(PluginCircuitBoard, typeShieldDFRobotMotor)
#pragma config(PluginCircuitBoard, typeShieldSparkfunArdumoto)
#pragma config(PluginCircuitBoard, typeShieldDFRobotMotorOld)
#pragma config(PluginCircuitBoard, typeShieldParallaxBoeBot)
#pragma config(PluginCircuitBoard, typeShieldUnknown)
#pragma config(Servo,  srvo_S1_C1_1,    claw,                 tServoStandard)
#pragma config(SrvoPosition,  open,  300)
#pragma config(SrvoPosition,  , 10)

// Every line above that the configuration cannot hold is reported, so that
// formatting never drops it.
task main()
{
}
