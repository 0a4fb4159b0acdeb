// Engineering rules: the VEX PIC reads its analog channels from port 0 up to
// the highest analog sensor, so digital ports and quadrature encoders placed
// below that sensor waste channels. The rules count the channels and advise
// the user, once per warning, when the ports are out of order.
#include <algorithm>
#include <array>

#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/Platform.h"

namespace {

// Classes of sensor types the rules look at; a type may belong to several.
enum : unsigned {
  kClassAnalog = 1u << 0,
  kClassDigitalIn = 1u << 1,
  kClassDigitalOut = 1u << 2,
  kClassQuadEncoder = 1u << 3,
};

struct TSensorClassRow {
  TSensorTypes nType;
  unsigned nClasses;
};

// Every sensor type with a class; all other types are ignored by the rules.
constexpr std::array<TSensorClassRow, 20> kSensorClasses = {{
    {1, kClassDigitalIn},
    {3, kClassAnalog},
    {4, kClassDigitalIn},
    {45, kClassDigitalIn},
    {46, kClassAnalog},
    {47, kClassAnalog},
    {48, kClassAnalog},
    {49, kClassAnalog},
    {50, kClassAnalog},
    {51, kClassDigitalOut},
    {52, kClassDigitalOut},
    {53, kClassDigitalOut},
    {54, kClassDigitalOut},
    {55, kClassDigitalOut},
    {74, kClassDigitalOut},
    {76, kClassDigitalOut},
    {77, kClassDigitalOut},
    {78, kClassDigitalOut},
    {79, kClassDigitalOut},
    {80, kClassDigitalIn | kClassQuadEncoder},
}};

// Platform kinds without analog channels to count.
constexpr std::array<int, 3> kKindsWithoutAnalogChannels = {platformNone, platformKind5, platformKind6};

constexpr const wchar_t *kDigitalInWarning =
    L"VEX CPU is more efficient if digital input sensors are given higher port numbers than all analog sensors. "
    L"Firmware will still operate if this is not the case but in a less efficient fashion.\n \n"
    L"Analog port at '%s' is higher 'number' than digital port at '%s'.\n \n"
    L"Use \"Motor and Sensors Setup\" command (on the \"Robot\" menu) to modify configuration.";

constexpr const wchar_t *kDigitalOutWarning =
    L"VEX CPU hardware optimizes placement of digital output ports.\n \n"
    L"Analog sensor at port '%s' should be assigned to port lower in number than the digital output at port '%s'!\n \n"
    L"Use \"Motor and Sensors Setup\" command (on the \"Robot\" menu) to modify configuration.";

constexpr const wchar_t *kQuadEncoderWarning =
    L"VEX CPU hardware optimizes placement of quadrature motor encoders.\n \n"
    L"Analog sensor at port '%s' should be assigned to port lower in number than the quadrature motor encoder at "
    L"port '%s'!\n \n"
    L"Use \"Motor and Sensors Setup\" command (on the \"Robot\" menu) to modify configuration.";

// The rule classes of a sensor type (0 for a type the rules ignore).
unsigned sensorClassesOf(TSensorTypes nType) {
  for (const TSensorClassRow &row : kSensorClasses)
    if (row.nType == nType) return row.nClasses;
  return 0;
}

bool bIsVexPic() { return pToggles->getPlatformKind() == platformVexPic; }

}  // namespace

void CRobotConfigurationBasic::checkEngineeringRules(bool bResetWarnings) {
  if (bResetWarnings) {
    bDigitalPortWarningShown = false;
    bQuadPortErrorShown = false;
  }
  if (bIsVexPic()) nGetNumberOfAnalogVexChannelsAndReportErrors(true);
}

int CRobotConfigurationBasic::nGetNumberOfAnalogVexChannelsAndReportErrors(bool bReportErrors) {
  const int nKind = pToggles->getPlatformKind();
  if (std::find(kKindsWithoutAnalogChannels.begin(), kKindsWithoutAnalogChannels.end(), nKind) !=
      kKindsWithoutAnalogChannels.end())
    return 0;

  int nCount = 0;
  int nFirstDigitalIn = -1, nFirstDigitalOut = -1, nFirstQuad = -1;
  for (int port = 0; port < kMaxNumbOfSensorPorts; ++port) {
    const unsigned nClasses = sensorClassesOf(settings.nSensorTypes[size_t(port)]);
    if (nClasses & kClassAnalog) nCount = port + 1;
    if ((nClasses & kClassDigitalIn) && nFirstDigitalIn < 0) nFirstDigitalIn = port;
    if ((nClasses & kClassDigitalOut) && nFirstDigitalOut < 0) nFirstDigitalOut = port;
    if ((nClasses & kClassQuadEncoder) && nFirstQuad < 0) nFirstQuad = port;
  }
  if (nKind != platformVexPic || !bReportErrors) return nCount;

  // Ports below the highest analog sensor; -1 (none) never is.
  auto bBelowAnalog = [nCount](int nPort) { return nPort >= 0 && nPort < nCount; };
  const int nHighestAnalog = nCount - 1;
  if (bBelowAnalog(nFirstQuad)) {
    errorInvalidQuadSensorPort(nHighestAnalog, nFirstQuad);
  } else if (bBelowAnalog(nFirstDigitalOut)) {
    digitalOutPortAssignmentWarning(nHighestAnalog, nFirstDigitalOut);
  } else {
    bQuadPortErrorShown = false;
    if (bBelowAnalog(nFirstDigitalIn)) digitalInPortAssignmentWarningForVexPIC(nHighestAnalog, nFirstDigitalIn);
    else bDigitalPortWarningShown = false;
  }
  return nCount;
}

void CRobotConfigurationBasic::digitalInPortAssignmentWarningForVexPIC(int nAnalogPort, int nDigitalPort) {
  if (bDigitalPortWarningShown || pToggles->bNeverShowVexPortWarnings || !bIsVexPic()) return;
  CString sText;
  sText.Format(kDigitalInWarning, getSensorPortString(nAnalogPort), getSensorPortString(nDigitalPort));
  if (bNeverRepeatMessageBoxPrompt(sText)) pToggles->bNeverShowVexPortWarnings = true;
  bDigitalPortWarningShown = true;
}

void CRobotConfigurationBasic::digitalOutPortAssignmentWarning(int nAnalogPort, int nDigitalPort) {
  if (bDigitalPortWarningShown || pToggles->bNeverShowVexPortWarnings || !bIsVexPic()) return;
  CString sText;
  sText.Format(kDigitalOutWarning, getSensorPortString(nAnalogPort), getSensorPortString(nDigitalPort));
  myAppMessageBoxString(sText, kMessageStyleInformation);
  bDigitalPortWarningShown = true;
}

void CRobotConfigurationBasic::errorInvalidQuadSensorPort(int nAnalogPort, int nQuadPort) {
  if (bQuadPortErrorShown || !bIsVexPic()) return;
  CString sText;
  sText.Format(kQuadEncoderWarning, getSensorPortString(nAnalogPort), getSensorPortString(nQuadPort));
  myAppMessageBoxString(sText, kMessageStyleInformation);
  bQuadPortErrorShown = true;
}
