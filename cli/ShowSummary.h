// The text of `robotcfg show`: a readable summary of a configuration document.
#pragma once

#include <string>

#include <nlohmann/json.hpp>

/// The configured devices with what matters about each (the type the block
/// carries, an encoder's port, the pins); with `bAll` every port, empty ones as "-".
std::string summaryText(const nlohmann::ordered_json &document, bool bAll);
