#include "cli/ShowSummary.h"

#include <algorithm>
#include <vector>

namespace {

using json = nlohmann::ordered_json;

/// A string value, or "-" for null and empty.
std::string word(const json &value) {
  if (value.is_string() && !value.get<std::string>().empty()) return value.get<std::string>();
  if (value.is_number()) return value.dump();
  return "-";
}

/// The words of a list joined with ", ", nulls as "none".
std::string joined(const json &list) {
  std::string sText;
  for (const json &item : list) sText += (sText.empty() ? "" : ", ") + (item.is_null() ? std::string("none") : word(item));
  return sText;
}

/// Rows as aligned columns, each row indented by two spaces.
std::string table(const std::vector<std::vector<std::string>> &rows) {
  std::vector<size_t> widths;
  for (const auto &row : rows)
    for (size_t n = 0; n < row.size(); ++n) {
      if (widths.size() <= n) widths.push_back(0);
      widths[n] = std::max(widths[n], row[n].size());
    }
  std::string sOut;
  for (const auto &row : rows) {
    std::string sLine;
    for (size_t n = 0; n < row.size(); ++n) {
      sLine += "  " + row[n];
      if (n + 1 < row.size()) sLine += std::string(widths[n] - row[n].size(), ' ');
    }
    while (!sLine.empty() && sLine.back() == ' ') sLine.pop_back();
    sOut += sLine + "\n";
  }
  return sOut;
}

/// What matters about a motor besides port, name and type.
std::string motorDetails(const json &motor) {
  std::vector<std::string> details;
  details.push_back(motor["pidControl"].get<bool>() ? "PIDControl" : "openLoop");
  if (motor["reversed"].get<bool>()) details.push_back("reversed");
  const std::string sSide = word(motor["driveSide"]);
  if (sSide == "Left" || sSide == "Right") details.push_back("drive " + sSide);
  if (motor["encoder"].get<bool>())
    details.push_back(motor["encoderPort"].is_string() ? "encoder on " + word(motor["encoderPort"]) : "encoder");
  if (motor.contains("ioPins") && (!motor["ioPins"][0].is_null() || !motor["ioPins"][1].is_null()))
    details.push_back("pins " + word(motor["ioPins"][0]) + ", " + word(motor["ioPins"][1]));
  if (motor.contains("pidSettings")) details.push_back("own PID settings");
  std::string sText;
  for (const std::string &sDetail : details) sText += (sText.empty() ? "" : ", ") + sDetail;
  return sText;
}

void devices(std::string &sOut, const char *pzTitle, const json &list, bool bMotors, bool bAll) {
  std::vector<std::vector<std::string>> rows;
  for (const json &device : list) {
    // Hub servos are written whether or not they are used; an unused one says nothing.
    if (!bAll && device["type"].is_null() && !bMotors) continue;
    std::vector<std::string> row = {word(device["port"]), word(device["name"]), word(device["type"])};
    if (bMotors && !device["type"].is_null()) row.push_back(motorDetails(device));
    if (!bMotors && device.contains("mode") && !device["mode"].is_null()) row.push_back(word(device["mode"]));
    rows.push_back(row);
  }
  if (rows.empty()) return;
  sOut += std::string(pzTitle) + ":\n" + table(rows);
}

}  // namespace

std::string summaryText(const json &doc, bool bAll) {
  std::string sOut = "Platform: " + word(doc["platform"]["name"]) + "\n";
  const json &board = doc["board"];
  sOut += "Board: " + word(board["name"]);
  if (board["word"].is_string()) sOut += " (" + word(board["word"]) + ")";
  if (board["cpu"].is_string()) sOut += ", CPU " + word(board["cpu"]) + " at " + word(board["clockSpeed"]) + " Hz";
  sOut += "\n";
  sOut += std::string("External Motor/Servo Controllers: ") + (doc["externalControllers"].get<bool>() ? "on" : "off") + "\n";
  if (!doc["standardModel"].is_null()) sOut += "Standard model: " + word(doc["standardModel"]) + "\n";
  if (!doc["userModel"].is_null()) sOut += "User model: " + word(doc["userModel"]) + "\n";
  json plugins = json::array();
  for (const json &plugin : board["plugins"])
    if (!plugin.is_null()) plugins.push_back(plugin);
  if (!plugins.empty()) sOut += "Plug-in boards: " + joined(plugins) + "\n";

  std::vector<std::vector<std::string>> hubs;
  for (const json &hub : doc["hubs"]) hubs.push_back({word(hub["port"]), joined(hub["chain"])});
  if (!hubs.empty()) sOut += "Motor/servo controllers:\n" + table(hubs);
  devices(sOut, "Motors", doc["motors"], true, bAll);
  devices(sOut, "Sensors", doc["sensors"], false, bAll);
  devices(sOut, "Servos", doc["servos"], false, bAll);

  std::vector<std::vector<std::string>> serial;
  for (const json &uart : doc["uarts"])
    serial.push_back({word(uart["port"]), word(uart["use"]), word(uart["baud"])});
  for (const json &i2c : doc["i2c"])
    serial.push_back({word(i2c["port"]), word(i2c["use"])});
  if (!serial.empty()) sOut += "Serial ports:\n" + table(serial);

  if (doc.contains("driveTrain")) {
    const json &train = doc["driveTrain"];
    sOut += "Drive train: " + word(train["type"]);
    if (!train["motors"].empty()) sOut += ", motors " + joined(train["motors"]);
    sOut += "; wheels " + joined(train["wheels"]) + "\n";
  }
  if (doc.contains("gripperArm")) {
    sOut += "Gripper arm: " + word(doc["gripperArm"]["type"]);
    if (!doc["gripperArm"]["motors"].empty()) sOut += ", motors " + joined(doc["gripperArm"]["motors"]);
    sOut += "\n";
  }
  if (doc.contains("joystickDrive"))
    sOut += "Joystick drive: " + word(doc["joystickDrive"]["type"]) + ", " + word(doc["joystickDrive"]["scaling"]) + "\n";
  if (bAll || !doc["programType"].is_null()) sOut += "Program type: " + word(doc["programType"]) + "\n";
  if (bAll || !doc["firmware"].empty())
    sOut += "Firmware features: " + (doc["firmware"].empty() ? std::string("none") : joined(doc["firmware"])) + "\n";
  const json &sizes = doc["memory"]["sizes"];
  if (bAll || sizes[0] != "auto" || sizes[1] != "auto" || sizes[2] != "auto")
    sOut += "Memory: datalog stream " + word(sizes[0]) + ", debug stream " + word(sizes[1]) + ", task stack " +
            word(sizes[2]) + "\n";
  if (!doc["network"].is_null()) {
    const json &network = doc["network"];
    sOut += "Network: " + word(network["name"]) + " (" + word(network["type"]) + "), number " + word(network["number"]) +
            ", channel " + word(network["channel"]) + "\n";
    for (const json &node : network["nodes"]) sOut += "  node " + word(node["name"]) + " " + word(node["address"]) + "\n";
  }
  for (const json &series : doc["datalogSeries"]) sOut += "Datalog series: " + joined(series) + "\n";
  return sOut;
}
