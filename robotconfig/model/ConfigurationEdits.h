// Edits of a configuration, made through the record's public setters as the
// setup dialogs make them: "motor.port2.type=tmotorVex393_MC29",
// "sensor.in1=sensorTouch", "board=typeCktBoardUno". An edit the rules refuse
// leaves the configuration as it was.
#pragma once

#include <string>
#include <vector>

#include "robotconfig/program/HostConfiguration.h"

namespace robotconfig::model {

/// One edit: a path into the configuration and the word (or name, number,
/// true/false) to put there. An empty value, "none" or "None" removes a device.
struct TEdit {
  std::string sPath;
  std::string sValue;
};

/// Splits "PATH=VALUE"; false with a message when there is no '=' or no path.
bool parseEditAssignment(const std::string &sText, TEdit &edit, std::string &sError);

/// Reads a JSON list of operations, each {"op": "set", "path": P, "value": V}
/// (V a string, a bool, an integer or null). False with a message, and no
/// edits, when the text is not such a list.
bool parseEditList(const std::string &sJson, std::vector<TEdit> &edits, std::string &sError);

/// The paths an edit may name, one pattern a line, for help texts.
const char *editPathHelp();

/// Applies the edits in order to a copy of `config`; when every edit is
/// accepted, and the block the copy writes reads back as the copy, the copy
/// replaces `config` and the result is empty. Otherwise `config` is
/// unchanged and the result holds one message per refused edit ("PATH:
/// reason"). Uses the current host selection.
std::vector<std::string> applyEdits(CHostRobotConfiguration &config, const std::vector<TEdit> &edits);

/// The message of a configuration whose block would not read back as the
/// record (an edit the writer cannot carry); "" when it reads back the same.
std::string checkBlockReadsBack(const CHostRobotConfiguration &config);

}  // namespace robotconfig::model
