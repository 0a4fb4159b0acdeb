// Internal to the checker: the state one check carries from line to line, and
// the rule families that use it.
#pragma once

#include <map>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "robotconfig/checker/Finding.h"
#include "robotconfig/checker/LineScanner.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/program/ProgramText.h"

struct TDeviceTypeMenuItem;

/// One configuration line as the check saw it.
struct TCheckedLine {
  int nLine = 0;
  TTokenizedConfigParms parms;
  TScannedLine scanned;
  TConfigTypes nType = configTypeNotFound;
  bool bAccepted = false;
  bool bFlagged = false;  ///< a finding of warning or error weight stands on it
  std::set<int> reportedParms;  ///< parameters a finding (of any weight) is about
  std::vector<std::wstring> keywordSuggestions;  ///< for a refused line with an unknown keyword
  CString sLineText;
};

/// Who holds a sensor port that is not a sensor of its own.
struct TPortClaim {
  int nLine = 0;
  std::string sOwner;  ///< "motor 'leftMotor' (IO pins)"
};

/// A name a line gave a device.
struct TNamedDevice {
  int nLine = 0;
  int nColumn = 0;
  std::string sDevice;  ///< "Motor port2"
};

class CCheckContext {
 public:
  CCheckContext(CHostRobotConfiguration &configToRead, const CProgramText &programToRead)
      : config(configToRead), program(programToRead) {}

  /// Adds a finding of rule `pzCode` (its severity is the rule's unless given)
  /// at parameter `nParm` of `line` (-1: the line's start).
  TFinding &report(TCheckedLine &line, const char *pzCode, int nParm, const std::string &sMessage);
  /// Column of parameter `nParm` of a line; 1 when the line has no such token.
  static int columnOf(const TCheckedLine &line, int nParm);

  CHostRobotConfiguration &config;
  const CProgramText &program;
  std::vector<TFinding> findings;
  std::vector<TCheckedLine> lines;
  /// Device key ("Sensor#3") -> index in `lines` of the line that defined it.
  std::map<std::string, size_t> definitions;
  /// Sensor port -> line that put a sensor of its own there.
  std::map<int, size_t> sensorLines;
  /// Sensor port -> what claims it (pins, second ports, shared ports).
  std::map<int, TPortClaim> claims;
  /// Device name -> where it was first given.
  std::map<std::wstring, TNamedDevice> names;
  /// Sensor types of every port just before the current line.
  std::vector<TSensorTypes> sensorTypesBefore;
  /// Reading left the IDE's board as it found it, so the block reads back from the same start.
  bool bBoardKept = false;
  /// Primary and secondary IO pin of every motor just before the current line
  /// (a motor lets a pin go when a later line takes it).
  std::vector<std::pair<int, int>> motorPinsBefore;
};

/// UTF-8 of a wide text.
std::string utf8(const CString &s);
std::string utf8(const std::wstring &s);
std::string utf8(const wchar_t *pz);
std::string quoted(const CString &s);

// Rule families, each run after the reader accepted a line.
/// Syntax the tokenizer forgives (RC010..RC013).
void checkLineSyntax(CCheckContext &context, TCheckedLine &line);
/// Words of catalog positions (RC101..RC106).
void checkLineWords(CCheckContext &context, TCheckedLine &line);
/// Repeated devices, claimed ports, drive slots and names (RC201, RC301, RC302, RC40x).
void checkLineDevices(CCheckContext &context, TCheckedLine &line);
/// After the last line: devices on controllers the chain lacks (RC303).
void checkDevicesOnHubs(CCheckContext &context);
/// After reading: definitions the regenerated block no longer carries (RC901, RC902).
void checkRegeneratedBlock(CCheckContext &context);
/// Platforms that read the file without errors (RC501).
void suggestOtherPlatforms(CCheckContext &context, const CProgramText &program);

/// Keywords of a table on the current platform, for suggestions.
std::vector<std::wstring> tableWords(const TDeviceTypeMenuItem *pTable);
/// "NXT, VEX PIC" for the platforms (other than the current one) whose rows
/// of `pTable` hold `sWord`; "" when none.
std::string otherPlatformsOfWord(const TDeviceTypeMenuItem *pTable, const CString &sWord);
