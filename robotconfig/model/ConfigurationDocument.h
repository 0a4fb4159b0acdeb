// The configuration as a JSON document: every configured device with the
// words its configuration line uses, so that a reader never needs the
// record's numbering, and optionally the choices each slot may take.
#pragma once

#include <set>

#include <nlohmann/json.hpp>

#include "robotconfig/program/HostConfiguration.h"

namespace robotconfig::model {

/// Version of the document's layout; it grows when a key changes meaning.
constexpr int kDocumentVersion = 1;

struct TDocumentOptions {
  bool bAll = false;      ///< every port of the platform, not only the configured ones
  bool bChoices = false;  ///< the words each slot may take on this platform and board
};

/// The devices the configuration block writes a line for.
struct TWrittenDevices {
  std::set<int> motors;
  std::set<int> sensors;
  std::set<int> servos;
  std::set<int> uarts;
  std::set<int> i2cPorts;
  std::set<TConfigTypes> keywords;  ///< every keyword the block writes
};

/// The devices that `config`'s generated block names in Motor, Sensor and Servo lines.
TWrittenDevices findWrittenDevices(const CRobotConfigurationBasic &config, const CString &sBlock);

/// The document of a configuration as its block will carry it (the record is
/// normalised on a copy first, as writing does). Uses the current host selection.
nlohmann::ordered_json configurationDocument(const CHostRobotConfiguration &config, const TDocumentOptions &options);

}  // namespace robotconfig::model
