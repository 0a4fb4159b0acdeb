// Layer host, the lowest: services the record calls; includes nothing of robotconfig/ above host/.
// Platform, board and toggle services: what the configuration rules ask of
// the host about the current platform, its boards and its feature toggles.
#pragma once

#include <array>
#include <cstdint>

#include "robotconfig/host/CString.h"
#include "robotconfig/host/DeviceTypes.h"
#include "robotconfig/host/PidSettings.h"

struct TDeviceTypeMenuItem;

/// File kinds the host's file-name prompt distinguishes.
enum TTavrenFileTypes : int32_t {
  fileTypeSourceProgram = 0,
  fileTypeRobotModel = 1,
};

/// Feature-toggle service. The operations are virtual, in this order, so
/// that a host can substitute its own service.
class CToggles {
 public:
  /// Opaque platform-selection options, handed back unchanged to
  /// setIDEPlatformAndCircuitBoardType.
  virtual uint64_t getPlatformSelectionOptions() const = 0;
  /// Non-zero when the toggle is on; `nLevel` is always -10.
  virtual int bIsToggleEnabled(int nToggle, int nLevel) const = 0;
  /// Default PID settings of a motor type; never null.
  virtual const TPidSettings *getDefaultPidSettings(TMotorTypes nType) const = 0;
  /// Fills `settings` with the default PID settings of a motor type.
  virtual void copyDefaultPidSettings(TMotorTypes nType, TPidSettings &settings) const = 0;
  /// The controller board chosen in the IDE.
  virtual TControllerBoardType getIDECircuitBoardType() const = 0;
  /// The current platform kind, 0..14.
  virtual int getPlatformKind() const = 0;
  /// Bit 1 << kind of the current platform kind.
  virtual unsigned getPlatformMask() const = 0;
  /// Makes the IDE adopt a platform kind and board.
  virtual void setIDEPlatformAndCircuitBoardType(int nPlatformKind, TControllerBoardType nBoard, uint64_t nOptions) = 0;
  /// Asks the user for a file name; 0 = cancelled.
  virtual int bGetFileNameFromUser(TTavrenFileTypes nFileType, CString &sPath, unsigned nFlags1, unsigned nFlags2,
                                   int nReserved) = 0;
  virtual ~CToggles() = default;

  /// Silences the VEX port-order warnings for the whole IDE.
  bool bNeverShowVexPortWarnings = false;
};

/// The feature-toggle service in use.
extern CToggles *pToggles;

/// Motor facts of a platform.
struct TPlatformMotorParms {
  int32_t nNumbOfMotorPorts;
};

/// General facts of a platform.
struct TPlatformParms {
  const wchar_t *pPlatformName;
  int16_t nNumbOfSensorPorts;
  int16_t nNumbOfServoPorts;
  bool bSupportsBoardTypeSelection;
  bool bFirstMotorCanBeAudio;
  bool bSupportsDriveTrainConfig;
  bool bSupportsJoystickDriveConfig;
  bool bMotorsHaveIOPins;
};

/// Memory facts of a platform (sizes in bytes).
struct TPlatformMemoryParms {
  int32_t nDefaultDebugStreamSize;
  int32_t nDefaultDatalogStreamSize;
  int32_t nMaxSingleFunctionStackMemoryInBytes;
  int32_t nNumbOfTasksPerProgramOnBrick;
  int32_t nDefaultSingleTaskStackSize;
};

/// One platform kind of the catalog.
class CPlatformType {
 public:
  int32_t nPlatformKind;
  const wchar_t *pKeyword;  ///< short name used on command lines, e.g. "nxt"
  const TPlatformMotorParms *pMotorParms;
  const TPlatformParms *pPlatformParms;
  const TPlatformMemoryParms *pMemoryParms;
  TControllerBoardType nDefaultBoard;  ///< board the IDE selects with this platform
  bool bAssociatesEncoderSensorWithMotor;

  int getDefaultDebugStreamSize() const { return pMemoryParms->nDefaultDebugStreamSize; }
  int getDefaultDatalogStreamSize() const { return pMemoryParms->nDefaultDatalogStreamSize; }
  int getMaxSingleFunctionStackMemoryInBytes() const { return pMemoryParms->nMaxSingleFunctionStackMemoryInBytes; }
  int getNumbOfTasksPerProgramOnBrick() const { return pMemoryParms->nNumbOfTasksPerProgramOnBrick; }
  int getDefaultSingleTaskStackSize() const { return pMemoryParms->nDefaultSingleTaskStackSize; }
  bool bPlatformAssociatesEncoderSensorWithMotor() const { return bAssociatesEncoderSensorWithMotor; }
};

/// The current platform.
extern CPlatformType *pPlatformData;

/// The catalog entry of a platform kind; null outside 0..14.
const CPlatformType *getPlatformTypeForKind(int nPlatformKind);

/// Wiring of one UART or I2C port: `nFirstPin` and `nSecondPin` are sensor-port
/// indexes (-1 = none); `nHardwarePort` is the controller's own port number.
struct TSerialPortIOPinsDefn {
  int32_t nHardwarePort;
  int32_t nSecondPin;
  int32_t nFirstPin;
};

/// Serial ports of a board. Counts above 6 count as 6.
struct TSerialPortsInfo {
  bool bCanSystemUartBeReconfigured;
  int32_t nNumbOfUARTs;
  std::array<TSerialPortIOPinsDefn, 6> uartPins;
  int32_t nNumbOfI2Cs;
  std::array<TSerialPortIOPinsDefn, 6> i2cPins;
};

/// Description of one controller board.
struct TCktBoardInfo {
  TControllerBoardType nBoardType;
  const wchar_t *pCpuTypeName;
  int32_t nDefaultCpuClockSpeed;
  int32_t nFirstSensorPort;
  int32_t nLastSensorPort;
  const TSerialPortsInfo *pSerialPorts;
};

/// Description of a board; null for a number that is no board of the catalog.
const TCktBoardInfo *getCircuitBoardInfo(TControllerBoardType nBoard);
/// Display name of a board; "" for an unknown number.
const wchar_t *getCktBoardNameString(TControllerBoardType nBoard);
/// Selectable boards: value = board number, keyword = the CircuitBoardType word.
const TDeviceTypeMenuItem *getArduinoCircuitBoardTypeMenuDefn();

/// Host selection: the platform kind, IDE board and toggle 1 that the
/// reference services report. A board of -1 selects the platform's default
/// board. Switching is cheap and leaves no other state behind.
void selectHostPlatform(int nPlatformKind, TControllerBoardType nBoard = -1, bool bExternalControllers = false);
/// Turns the "External Motor/Servo Controllers" toggle on or off.
void setHostExternalControllers(bool bEnabled);
/// Sets any feature toggle of the reference service (toggle 1 included).
void setHostToggle(int nToggle, bool bEnabled);

/// Keeps the current host selection and restores it when it ends.
class CHostSelectionScope {
 public:
  CHostSelectionScope();
  ~CHostSelectionScope();
  CHostSelectionScope(const CHostSelectionScope &) = delete;
  CHostSelectionScope &operator=(const CHostSelectionScope &) = delete;

 private:
  int m_nPlatformKind;
  TControllerBoardType m_nBoard;
  uint32_t m_nToggles;
  bool m_bNeverShowVexPortWarnings;
  CToggles *m_pToggles;
  CPlatformType *m_pPlatformData;
};
