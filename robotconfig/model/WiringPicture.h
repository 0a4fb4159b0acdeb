// The wiring picture of a configuration: an SVG of the controller with its
// ports labelled as the platform names them, each configured device drawn at
// its port, hub chains as daisy chains, serial links and the drive train.
#pragma once

#include <string>

#include <nlohmann/json.hpp>

namespace robotconfig::model {

/// A self-contained SVG (no external fonts, images or scripts) of a
/// configuration document as configurationDocument makes it.
std::string wiringPicture(const nlohmann::ordered_json &document);

/// The text with the five XML special characters escaped.
std::string xmlEscaped(const std::string &sText);

}  // namespace robotconfig::model
