// The fifteen platform kinds, the reference feature-toggle service and the
// host selection (platform kind, IDE board, toggles) that both report.
#include <array>

#include "robotconfig/host/Platform.h"

namespace {

// ---------------------------------------------------------------------------
// Platform records, indexed by platform kind.

constexpr std::array<TPlatformMotorParms, kNumbOfPlatformKinds> kMotorParms = {{
    {0},   // platformNone
    {35},  // platformNxt: 3 built-in ports + 32 hub-motor indexes
    {8},   // platformVexPic
    {10},  // platformVexI2c
    {12},  // platformArduino
    {0},   // platformKind5
    {0},   // platformKind6
    {12},  // platformSharedPorts
    {36},  // platformBrick4Motor: 4 built-in ports + 32 hub-motor indexes
    {8},   // platformKind9
    // The motor-type rules give the board kinds no motor type, so they offer
    // no motor port: a Motor line there is refused instead of read as no motor.
    {0},   // platformBoard10
    {0},   // platformBoard11
    {0},   // platformBoard12
    {0},   // platformBoard13
    {0},   // platformBoard14
}};

// Columns: name, sensor ports, servo ports, board selection, first motor can
// be audio, drive train, joystick drive, motors have IO pins.
constexpr std::array<TPlatformParms, kNumbOfPlatformKinds> kPlatformParms = {{
    {L"None", 0, 0, false, false, false, false, false},
    {L"NXT", 4, 96, false, false, true, true, false},
    {L"VEX PIC", 16, 0, false, false, true, true, false},
    {L"VEX I2C", 28, 0, false, false, true, true, false},
    {L"Arduino", 70, 0, true, true, true, true, true},
    {L"Sensor Lab", 8, 0, false, false, false, false, false},
    {L"Data Logger", 4, 0, false, false, false, false, false},
    {L"Shared Ports", 12, 0, false, false, true, true, false},
    {L"Brick 4 Motor", 4, 96, false, false, true, true, false},
    {L"Classroom Controller", 16, 0, false, false, true, true, false},
    {L"Maker Board 10", 24, 0, true, false, true, true, true},
    {L"Maker Board 11", 24, 0, true, false, true, true, true},
    {L"Maker Board 12", 24, 0, true, false, true, true, true},
    {L"Maker Board 13", 24, 0, true, false, true, true, true},
    {L"Maker Board 14", 24, 0, true, false, true, true, true},
}};

// Columns (bytes): debug stream, datalog stream, largest stack of one
// function, tasks per program, default stack of one task.
constexpr std::array<TPlatformMemoryParms, kNumbOfPlatformKinds> kMemoryParms = {{
    {0, 0, 0, 0, 0},            // platformNone runs no program
    {1000, 5000, 2048, 10, 400},
    {256, 0, 256, 4, 128},
    {2000, 4000, 4096, 20, 800},
    {256, 512, 512, 4, 128},
    {512, 8192, 1024, 4, 256},
    {512, 16384, 1024, 4, 256},
    {512, 1024, 1024, 8, 256},
    {2000, 8000, 4096, 20, 1024},
    {512, 1024, 1024, 6, 256},
    {512, 1024, 1024, 8, 256},
    {512, 1024, 1024, 8, 256},
    {512, 1024, 1024, 8, 256},
    {512, 1024, 1024, 8, 256},
    {512, 1024, 1024, 8, 256},
}};

/// The catalog entry of a kind: its parameter rows, command-line keyword,
/// default board and whether encoders are sensors of their motor.
constexpr CPlatformType platform(int nKind, const wchar_t *pzKeyword, TControllerBoardType nDefaultBoard,
                                 bool bEncoderWithMotor) {
  return {nKind,
          pzKeyword,
          &kMotorParms[static_cast<size_t>(nKind)],
          &kPlatformParms[static_cast<size_t>(nKind)],
          &kMemoryParms[static_cast<size_t>(nKind)],
          nDefaultBoard,
          bEncoderWithMotor};
}

constexpr std::array<CPlatformType, kNumbOfPlatformKinds> kPlatforms = {{
    platform(platformNone, L"none", 0, false),
    platform(platformNxt, L"nxt", 1, false),
    platform(platformVexPic, L"vexpic", 2, false),
    platform(platformVexI2c, L"vexi2c", 5, true),
    platform(platformArduino, L"arduino", 8, false),
    platform(platformKind5, L"sensorlab", 7, false),
    platform(platformKind6, L"datalogger", 7, false),
    platform(platformSharedPorts, L"sharedports", 6, false),
    platform(platformBrick4Motor, L"brick4", 1, false),
    platform(platformKind9, L"classroom", 7, false),
    platform(platformBoard10, L"maker10", 3, false),
    platform(platformBoard11, L"maker11", 4, false),
    platform(platformBoard12, L"maker12", 25, false),
    platform(platformBoard13, L"maker13", 26, false),
    platform(platformBoard14, L"maker14", 29, false),
}};

// ---------------------------------------------------------------------------
// Default PID settings of the motor types that run under PID control by default.

struct TDefaultPidRow {
  TMotorTypes nType;
  TPidSettings settings;
};

constexpr std::array<TDefaultPidRow, 6> kDefaultPidSettings = {{
    {14, {2, 1, 10, 0, 400, 20, 50, 1000}},  // tmotorSharedPort
    {17, {4, 2, 20, 0, 720, 30, 60, 1000}},  // tmotorNxt
    {18, {4, 2, 20, 0, 760, 30, 60, 1050}},  // tmotorBrickLarge
    {19, {3, 2, 15, 0, 1200, 25, 40, 1560}},  // tmotorBrickMedium
    {28, {4, 2, 20, 0, 720, 30, 60, 1000}},  // tmotorNxtEncoderClosedLoop
    {31, {5, 3, 25, 0, 1440, 40, 80, 1000}},  // tmotorTetrixEncoderPID
}};

// ---------------------------------------------------------------------------
// Reference feature-toggle service.

/// Clamps a platform kind into the catalog; anything else is platformNone.
int clampPlatformKind(int nPlatformKind) {
  return (nPlatformKind >= 0 && nPlatformKind < kNumbOfPlatformKinds) ? nPlatformKind : platformNone;
}

class CReferenceToggles final : public CToggles {
 public:
  constexpr CReferenceToggles() = default;

  uint64_t getPlatformSelectionOptions() const override { return m_nOptions; }

  int bIsToggleEnabled(int nToggle, int /*nLevel*/) const override {
    return (nToggle >= 0 && nToggle < 32 && (m_nToggles & (1u << nToggle)) != 0) ? 1 : 0;
  }

  const TPidSettings *getDefaultPidSettings(TMotorTypes nType) const override {
    for (const TDefaultPidRow &row : kDefaultPidSettings) {
      if (row.nType == nType) return &row.settings;
    }
    return &emptyPidSettings;
  }

  void copyDefaultPidSettings(TMotorTypes nType, TPidSettings &settings) const override {
    settings = *getDefaultPidSettings(nType);
  }

  TControllerBoardType getIDECircuitBoardType() const override { return m_nBoard; }
  int getPlatformKind() const override { return m_nPlatformKind; }
  unsigned getPlatformMask() const override { return 1u << m_nPlatformKind; }

  void setIDEPlatformAndCircuitBoardType(int nPlatformKind, TControllerBoardType nBoard, uint64_t nOptions) override {
    m_nOptions = nOptions;
    select(nPlatformKind, nBoard);
  }

  // Nobody can be asked on this host: a path the caller already has is taken
  // as the user's choice, an empty one as a cancel.
  int bGetFileNameFromUser(TTavrenFileTypes /*nFileType*/, CString &sPath, unsigned /*nFlags1*/, unsigned /*nFlags2*/,
                           int /*nReserved*/) override {
    return sPath.IsEmpty() ? 0 : 1;
  }

  /// Selects a platform kind (clamped) and board (-1: the kind's default) and
  /// makes this service and that platform the current ones.
  void select(int nPlatformKind, TControllerBoardType nBoard);

  /// Turns one toggle on or off; numbers outside 0..31 are ignored.
  void setToggle(int nToggle, bool bEnabled) {
    if (nToggle < 0 || nToggle >= 32) return;
    if (bEnabled) {
      m_nToggles |= 1u << nToggle;
    } else {
      m_nToggles &= ~(1u << nToggle);
    }
  }

  /// The enabled toggles, bit n for toggle n.
  uint32_t getToggles() const { return m_nToggles; }
  /// Replaces all toggles at once, bit n for toggle n.
  void setToggles(uint32_t nToggles) { m_nToggles = nToggles; }

 private:
  int m_nPlatformKind = platformNone;
  TControllerBoardType m_nBoard = 0;
  uint32_t m_nToggles = 0;
  uint64_t m_nOptions = 0;
};

// The host selection. pPlatformData points at a copy of the selected catalog
// entry because the interface hands out a modifiable record.
CReferenceToggles g_referenceToggles;
CPlatformType g_selectedPlatform = kPlatforms[platformNone];

void CReferenceToggles::select(int nPlatformKind, TControllerBoardType nBoard) {
  m_nPlatformKind = clampPlatformKind(nPlatformKind);
  const CPlatformType &entry = kPlatforms[static_cast<size_t>(m_nPlatformKind)];
  m_nBoard = nBoard == -1 ? entry.nDefaultBoard : nBoard;
  g_selectedPlatform = entry;
  pToggles = &g_referenceToggles;
  pPlatformData = &g_selectedPlatform;
}

}  // namespace

CToggles *pToggles = &g_referenceToggles;
CPlatformType *pPlatformData = &g_selectedPlatform;

const CPlatformType *getPlatformTypeForKind(int nPlatformKind) {
  if (nPlatformKind < 0 || nPlatformKind >= kNumbOfPlatformKinds) return nullptr;
  return &kPlatforms[static_cast<size_t>(nPlatformKind)];
}

void selectHostPlatform(int nPlatformKind, TControllerBoardType nBoard, bool bExternalControllers) {
  g_referenceToggles.setToggle(kToggleExternalControllers, bExternalControllers);
  g_referenceToggles.select(nPlatformKind, nBoard);
}

void setHostExternalControllers(bool bEnabled) { g_referenceToggles.setToggle(kToggleExternalControllers, bEnabled); }

void setHostToggle(int nToggle, bool bEnabled) { g_referenceToggles.setToggle(nToggle, bEnabled); }

CHostSelectionScope::CHostSelectionScope()
    : m_nPlatformKind(g_referenceToggles.getPlatformKind()),
      m_nBoard(g_referenceToggles.getIDECircuitBoardType()),
      m_nToggles(g_referenceToggles.getToggles()),
      m_bNeverShowVexPortWarnings(g_referenceToggles.bNeverShowVexPortWarnings),
      m_pToggles(pToggles),
      m_pPlatformData(pPlatformData) {}

CHostSelectionScope::~CHostSelectionScope() {
  g_referenceToggles.select(m_nPlatformKind, m_nBoard);
  g_referenceToggles.setToggles(m_nToggles);
  g_referenceToggles.bNeverShowVexPortWarnings = m_bNeverShowVexPortWarnings;
  pToggles = m_pToggles;
  pPlatformData = m_pPlatformData;
}
