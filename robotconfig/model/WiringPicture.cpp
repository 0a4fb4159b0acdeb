#include "robotconfig/model/WiringPicture.h"

#include <algorithm>
#include <vector>

namespace robotconfig::model {

using json = nlohmann::ordered_json;

namespace {

/// Layout of the picture, in SVG user units.
constexpr int kMargin = 20;
constexpr int kTitleHeight = 40;
constexpr int kRowHeight = 46;
constexpr int kControllerX = kMargin;
constexpr int kControllerWidth = 230;
constexpr int kDeviceX = 330;
constexpr int kDeviceWidth = 420;
constexpr int kChainIndent = 40;
constexpr int kPictureWidth = kDeviceX + kDeviceWidth + kChainIndent + kMargin;

/// Fill colours of the device kinds: light enough to print, distinct on screen.
struct TDeviceStyle {
  const char *pzKind;
  const char *pzFill;
  const char *pzStroke;
};
constexpr TDeviceStyle kStyles[] = {
    {"motor", "#dbeafe", "#1d4ed8"},  {"sensor", "#dcfce7", "#15803d"}, {"servo", "#fef3c7", "#b45309"},
    {"hub", "#ede9fe", "#6d28d9"},    {"serial", "#fce7f3", "#be185d"},
};

const TDeviceStyle &styleOf(const std::string &sKind) {
  for (const TDeviceStyle &style : kStyles)
    if (sKind == style.pzKind) return style;
  return kStyles[0];
}

/// A string value, or "" for anything else.
std::string text(const json &value) { return value.is_string() ? value.get<std::string>() : std::string(); }

/// One row of the picture: a device (or hub, or serial link) at a port.
struct TRow {
  std::string sKind;
  std::string sPort;      ///< label at the controller's edge ("" for a device on a hub)
  std::string sTitle;     ///< first line: the device's name
  std::string sDetail;    ///< second line: type and what matters
  bool bOnChain = false;  ///< drawn indented, wired to the hub above it
  std::string sId;        ///< element id, so that a page can jump to the device
};

/// Hub chain of a hub device's port word ("mtr_S1_C2_1" -> "S1_C2"); "" when none.
std::string chainOf(const std::string &sPort) {
  const size_t nAt = sPort.find("_S");
  if (nAt == std::string::npos || sPort.size() < nAt + 6 || sPort[nAt + 3] != '_' || sPort[nAt + 4] != 'C') return "";
  return sPort.substr(nAt + 1, 5);
}

std::string motorDetail(const json &motor) {
  std::string sDetail = text(motor["type"]);
  if (motor["reversed"].get<bool>()) sDetail += ", reversed";
  if (motor["encoder"].get<bool>())
    sDetail += motor["encoderPort"].is_string() ? ", encoder on " + text(motor["encoderPort"]) : ", encoder";
  if (motor.contains("ioPins") && (motor["ioPins"][0].is_string() || motor["ioPins"][1].is_string())) {
    sDetail += ", pins " + (motor["ioPins"][0].is_string() ? text(motor["ioPins"][0]) : "None");
    if (motor["ioPins"][1].is_string()) sDetail += " + " + text(motor["ioPins"][1]);
  }
  const std::string sSide = text(motor["driveSide"]);
  if (sSide == "Left" || sSide == "Right") sDetail += " \u2014 drive " + sSide;
  return sDetail;
}

/// The rows: directly wired devices first, then each hub chain with its devices, then serial links.
std::vector<TRow> pictureRows(const json &doc) {
  std::vector<TRow> rows, chained;
  auto add = [&](const std::string &sKind, const json &device, const std::string &sDetail) {
    const std::string sPort = text(device["port"]);
    TRow row{sKind, sPort, text(device["name"]), sDetail, false, sKind + "-" + sPort};
    if (row.sTitle.empty()) row.sTitle = sPort;
    if (!chainOf(sPort).empty()) {
      row.bOnChain = true;
      chained.push_back(row);
    } else {
      rows.push_back(row);
    }
  };
  for (const json &motor : doc["motors"])
    if (!motor["type"].is_null()) add("motor", motor, motorDetail(motor));
  // A hub chain's port is drawn as the chain itself.
  for (const json &sensor : doc["sensors"])
    if (!sensor["type"].is_null() && !(text(sensor["type"]) == "sensorI2CMuxController" && !doc["hubs"].empty()))
      add("sensor", sensor, text(sensor["type"]) + (sensor["mode"].is_string() ? ", " + text(sensor["mode"]) : ""));
  for (const json &servo : doc["servos"])
    if (!servo["type"].is_null()) add("servo", servo, text(servo["type"]));
  for (const json &hub : doc["hubs"]) {
    const std::string sPort = text(hub["port"]);
    int nPosition = 0;
    for (const json &link : hub["chain"]) {
      ++nPosition;
      if (text(link) == "none") continue;
      const std::string sChain = sPort + "_C" + std::to_string(nPosition);
      rows.push_back({"hub", nPosition == 1 ? sPort : "", text(link) + " controller " + std::to_string(nPosition),
                      "daisy chain on " + sPort, false, "hub-" + sChain});
      for (const TRow &device : chained)
        if (chainOf(device.sPort) == sChain) {
          TRow row = device;
          row.sDetail = device.sPort + ": " + device.sDetail;
          row.sPort.clear();
          rows.push_back(row);
        }
    }
  }
  for (const json &uart : doc["uarts"])
    if (uart["use"].is_string() && text(uart["use"]) != "uartNotUsed")
      rows.push_back({"serial", text(uart["port"]), text(uart["use"]),
                      text(uart["baud"]) + (uart["pins"][0].is_string() ? ", pins " + text(uart["pins"][0]) : ""), false,
                      "uart-" + text(uart["port"])});
  for (const json &i2c : doc["i2c"])
    if (i2c["use"].is_string() && text(i2c["use"]) != "i2cNotUsed")
      rows.push_back({"serial", text(i2c["port"]), text(i2c["use"]), "I2C bus", false, "i2c-" + text(i2c["port"])});
  return rows;
}

}  // namespace

std::string xmlEscaped(const std::string &sText) {
  std::string sOut;
  for (char c : sText) {
    switch (c) {
      case '&': sOut += "&amp;"; break;
      case '<': sOut += "&lt;"; break;
      case '>': sOut += "&gt;"; break;
      case '"': sOut += "&quot;"; break;
      case '\'': sOut += "&apos;"; break;
      default: sOut += c;
    }
  }
  return sOut;
}

std::string wiringPicture(const json &doc) {
  const std::vector<TRow> rows = pictureRows(doc);
  std::string sDrive;
  if (doc.contains("driveTrain") && !doc["driveTrain"]["motors"].empty()) {
    std::string sMotors;
    for (const json &motor : doc["driveTrain"]["motors"])
      sMotors += (sMotors.empty() ? "" : ", ") + (motor.is_string() ? text(motor) : std::string("none"));
    sDrive = "Drive train: " + text(doc["driveTrain"]["type"]) + (sMotors.empty() ? "" : " (" + sMotors + ")");
  }
  const int nRows = std::max<int>(1, static_cast<int>(rows.size()));
  const int nTop = kMargin + kTitleHeight;
  const int nHeight = nTop + nRows * kRowHeight + (sDrive.empty() ? 0 : 30) + kMargin;
  const std::string sBoard = text(doc["board"]["name"]).empty() ? text(doc["platform"]["name"]) : text(doc["board"]["name"]);

  std::string s;
  s += "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n";
  s += "<svg xmlns=\"http://www.w3.org/2000/svg\" width=\"" + std::to_string(kPictureWidth) + "\" height=\"" +
       std::to_string(nHeight) + "\" viewBox=\"0 0 " + std::to_string(kPictureWidth) + " " + std::to_string(nHeight) +
       "\" font-family=\"sans-serif\" font-size=\"13\" role=\"img\" aria-labelledby=\"wiring-title\">\n";
  s += "<title id=\"wiring-title\">Wiring of the " + xmlEscaped(sBoard) + "</title>\n";
  s += "<rect width=\"100%\" height=\"100%\" fill=\"#ffffff\"/>\n";
  s += "<text x=\"" + std::to_string(kMargin) + "\" y=\"" + std::to_string(kMargin + 16) +
       "\" font-size=\"18\" font-weight=\"bold\" fill=\"#111827\">" + xmlEscaped(text(doc["platform"]["name"])) +
       " \u2014 " + xmlEscaped(sBoard) + "</text>\n";
  // The controller, with a port label for each wired row.
  s += "<rect class=\"controller\" x=\"" + std::to_string(kControllerX) + "\" y=\"" + std::to_string(nTop) +
       "\" width=\"" + std::to_string(kControllerWidth) + "\" height=\"" + std::to_string(nRows * kRowHeight - 6) +
       "\" rx=\"10\" fill=\"#f3f4f6\" stroke=\"#374151\" stroke-width=\"2\"/>\n";
  s += "<text x=\"" + std::to_string(kControllerX + 14) + "\" y=\"" + std::to_string(nTop + 22) +
       "\" font-weight=\"bold\" fill=\"#374151\">" + xmlEscaped(sBoard) + "</text>\n";
  if (rows.empty())
    s += "<text x=\"" + std::to_string(kDeviceX) + "\" y=\"" + std::to_string(nTop + 24) +
         "\" fill=\"#6b7280\">No devices configured</text>\n";
  int nPreviousHubY = -1;
  for (size_t n = 0; n < rows.size(); ++n) {
    const TRow &row = rows[n];
    const TDeviceStyle &style = styleOf(row.sKind);
    const int nY = nTop + static_cast<int>(n) * kRowHeight;
    const int nMid = nY + 20;
    const int nX = kDeviceX + (row.bOnChain ? kChainIndent : 0);
    s += "<g class=\"device " + row.sKind + "\" id=\"" + xmlEscaped(row.sId) + "\">\n";
    if (!row.sPort.empty()) {
      s += "  <text x=\"" + std::to_string(kControllerX + kControllerWidth - 12) + "\" y=\"" + std::to_string(nMid + 5) +
           "\" text-anchor=\"end\" font-family=\"monospace\" fill=\"#111827\">" + xmlEscaped(row.sPort) + "</text>\n";
      s += "  <circle cx=\"" + std::to_string(kControllerX + kControllerWidth) + "\" cy=\"" + std::to_string(nMid) +
           "\" r=\"4\" fill=\"#374151\"/>\n";
      s += "  <line x1=\"" + std::to_string(kControllerX + kControllerWidth) + "\" y1=\"" + std::to_string(nMid) +
           "\" x2=\"" + std::to_string(nX) + "\" y2=\"" + std::to_string(nMid) + "\" stroke=\"" + style.pzStroke +
           "\" stroke-width=\"2\"/>\n";
    } else if (nPreviousHubY >= 0 && row.sKind == "hub") {
      // The next controller of a daisy chain hangs from the one before it.
      s += "  <line x1=\"" + std::to_string(kDeviceX + 8) + "\" y1=\"" + std::to_string(nPreviousHubY + 40) + "\" x2=\"" +
           std::to_string(kDeviceX + 8) + "\" y2=\"" + std::to_string(nY) + "\" stroke=\"" + styleOf("hub").pzStroke +
           "\" stroke-width=\"3\" stroke-dasharray=\"6 4\"/>\n";
    } else if (nPreviousHubY >= 0) {
      // A device on a hub: wired to its controller above.
      s += "  <path d=\"M" + std::to_string(kDeviceX + 20) + " " + std::to_string(nPreviousHubY + 40) + " V" +
           std::to_string(nMid) + " H" + std::to_string(nX) + "\" fill=\"none\" stroke=\"" + styleOf("hub").pzStroke +
           "\" stroke-width=\"2\"/>\n";
    }
    s += "  <rect x=\"" + std::to_string(nX) + "\" y=\"" + std::to_string(nY) + "\" width=\"" +
         std::to_string(kDeviceWidth) + "\" height=\"40\" rx=\"6\" fill=\"" + style.pzFill + "\" stroke=\"" +
         style.pzStroke + "\" stroke-width=\"1.5\"/>\n";
    s += "  <text x=\"" + std::to_string(nX + 10) + "\" y=\"" + std::to_string(nY + 16) +
         "\" font-weight=\"bold\" fill=\"#111827\">" + xmlEscaped(row.sTitle) + "</text>\n";
    s += "  <text x=\"" + std::to_string(nX + 10) + "\" y=\"" + std::to_string(nY + 33) + "\" fill=\"#374151\">" +
         xmlEscaped(row.sDetail) + "</text>\n";
    s += "</g>\n";
    if (row.sKind == "hub") nPreviousHubY = nY;
  }
  if (!sDrive.empty())
    s += "<text class=\"drive-train\" x=\"" + std::to_string(kMargin) + "\" y=\"" +
         std::to_string(nTop + nRows * kRowHeight + 18) + "\" font-weight=\"bold\" fill=\"#1d4ed8\">" +
         xmlEscaped(sDrive) + "</text>\n";
  s += "</svg>\n";
  return s;
}

}  // namespace robotconfig::model
