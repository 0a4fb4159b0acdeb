#include "robotconfig/motors/MotorIOPins.h"

#include <array>
#include <cstddef>

const wchar_t *const pzMuxTypes[9] = {L"none",    L"HTMotor", L"HTServo",  L"MatrxRbtcs", L"HTTouch",
                                      L"MSServo", L"MSMotor", L"NXTSlave", nullptr};

const wchar_t *getMuxTypes(int nHubType) {
  // Only the controllers a Hubs line can name are spelled; the rest read "none".
  return (nHubType >= 0 && nHubType <= 5) ? pzMuxTypes[nHubType] : pzMuxTypes[0];
}

namespace {

//  hardware types, default motor name, primary pin / flag, secondary pin / flag
constexpr TMotorIOPinsDefinition kPinTable1[] = {
    {0x10180, L"servo_9", L"dgtl9", 1, nullptr, 1},     {0x10180, L"servo_10", L"dgtl10", 1, nullptr, 1},
    {0x13980, L"motor_5", L"dgtl5", 1, L"dgtl4", 0},    {0x13980, L"motor_6", L"dgtl6", 1, L"dgtl7", 0},
    {0x13980, L"motor_3", L"dgtl3", 1, L"dgtl2", 0},    {0x13980, L"motor_11", L"dgtl11", 1, L"dgtl12", 0},
    {0x10180, L"servo_A", L"dgtl0", 0, nullptr, 1},     {0x10180, L"servo_B", L"dgtl0", 0, nullptr, 1},
};

// Same rows as pin table 1, kept apart because its board is described apart.
constexpr TMotorIOPinsDefinition kPinTable1Board20[] = {
    {0x10180, L"servo_9", L"dgtl9", 1, nullptr, 1},     {0x10180, L"servo_10", L"dgtl10", 1, nullptr, 1},
    {0x13980, L"motor_5", L"dgtl5", 1, L"dgtl4", 0},    {0x13980, L"motor_6", L"dgtl6", 1, L"dgtl7", 0},
    {0x13980, L"motor_3", L"dgtl3", 1, L"dgtl2", 0},    {0x13980, L"motor_11", L"dgtl11", 1, L"dgtl12", 0},
    {0x10180, L"servo_A", L"dgtl0", 0, nullptr, 1},     {0x10180, L"servo_B", L"dgtl0", 0, nullptr, 1},
};

constexpr TMotorIOPinsDefinition kPinTable2[] = {
    {0x14180, L"servo_2", L"dgtl2", 1, nullptr, 1},     {0x14180, L"servo_3", L"dgtl3", 1, nullptr, 1},
    {0x14180, L"servo_5", L"dgtl5", 1, nullptr, 1},     {0x14180, L"servo_6", L"dgtl6", 1, nullptr, 1},
    {0x14180, L"servo_7", L"dgtl7", 1, nullptr, 1},     {0x14180, L"servo_8", L"dgtl8", 1, nullptr, 1},
    {0x14180, L"servo_11", L"dgtl11", 1, nullptr, 1},   {0x14180, L"servo_12", L"dgtl12", 1, nullptr, 1},
    {0x14180, L"servo_13", L"dgtl13", 1, nullptr, 1},   {0x13980, L"motor_4", L"dgtl4", 1, L"dgtl7", 0},
    {0x13980, L"motor_9", L"dgtl9", 1, L"dgtl2", 0},    {0x13980, L"motor_10", L"dgtl10", 1, L"dgtl12", 0},
};

constexpr TMotorIOPinsDefinition kPinTable3[] = {
    {0x200, L"motor_5", L"dgtl5", 1, L"dgtl4", 1},      {0x200, L"motor_6", L"dgtl6", 1, L"dgtl7", 1},
    {0x14180, L"servo_9", L"dgtl9", 1, nullptr, 1},     {0x14180, L"servo_10", L"dgtl10", 1, nullptr, 1},
    {0x13980, L"motor_3", L"dgtl3", 1, L"dgtl2", 0},    {0x13980, L"motor_11", L"dgtl11", 1, L"dgtl12", 0},
    {0x10180, L"servo_A", L"dgtl0", 0, nullptr, 1},     {0x10180, L"servo_B", L"dgtl0", 0, nullptr, 1},
};

// The current motor shield; same rows as the older shield's table.
constexpr TMotorIOPinsDefinition kPinTableDFRobotMotor[] = {
    {0x200, L"motor_5", L"dgtl5", 1, L"dgtl4", 1},      {0x200, L"motor_6", L"dgtl6", 1, L"dgtl7", 1},
    {0x14180, L"servo_9", L"dgtl9", 1, nullptr, 1},     {0x14180, L"servo_10", L"dgtl10", 1, nullptr, 1},
    {0x13980, L"motor_3", L"dgtl3", 1, L"dgtl2", 0},    {0x13980, L"motor_11", L"dgtl11", 1, L"dgtl12", 0},
    {0x10180, L"servo_A", L"dgtl0", 0, nullptr, 1},     {0x10180, L"servo_B", L"dgtl0", 0, nullptr, 1},
};

constexpr TMotorIOPinsDefinition kPinTable4[] = {
    {0x10180, L"servo_10", L"dgtl10", 1, nullptr, 1},   {0x10180, L"servo_11", L"dgtl11", 1, nullptr, 1},
    {0x13980, L"motor_5", L"dgtl5", 1, L"dgtl4", 0},    {0x13980, L"motor_6", L"dgtl6", 1, L"dgtl7", 0},
    {0x13980, L"motor_3", L"dgtl3", 1, L"dgtl2", 0},    {0x10180, L"servo_A", L"dgtl0", 0, nullptr, 1},
    {0x10180, L"servo_B", L"dgtl0", 0, nullptr, 1},     {0x4000, L"sound", L"dgtl9", 1, nullptr, 1},
};

constexpr TMotorIOPinsDefinition kPinTable5[] = {
    {0x400, L"motor_5", L"dgtl5", 1, L"dgtl6", 1},      {0x400, L"motor_3", L"dgtl3", 1, L"dgtl11", 1},
    {0x14180, L"servo_9", L"dgtl9", 1, nullptr, 1},     {0x14180, L"servo_10", L"dgtl10", 1, nullptr, 1},
    {0x10180, L"servo_A", L"dgtl0", 0, nullptr, 1},     {0x10180, L"servo_B", L"dgtl0", 0, nullptr, 1},
    {0x10180, L"servo_C", L"dgtl0", 0, nullptr, 1},     {0x10180, L"servo_C", L"dgtl0", 0, nullptr, 1},
};

template <std::size_t N>
constexpr TMotorIOPinTableRef tableRef(const TMotorIOPinsDefinition (&table)[N]) {
  return {table, static_cast<int32_t>(N)};
}

// A board that has no motor pins of its own.
constexpr TMotorIOPinsDefinition kEmptyPinTable[1] = {{0, nullptr, nullptr, 0, nullptr, 0}};

struct TBoardPinTableRow {
  TControllerBoardType nBoard;
  bool bChangesTable;
  TMotorIOPinTableRef table;
};

// Motor pins of each controller board; boards not listed get the empty table.
constexpr TBoardPinTableRow kBoardPinTables[] = {
    {1, false, {nullptr, 0}},     {2, false, {nullptr, 0}},    {5, false, {nullptr, 0}},
    {6, false, {nullptr, 0}},     {7, false, {nullptr, 0}},    {36, false, {nullptr, 0}},
    {8, true, tableRef(kPinTable1)},  {9, true, tableRef(kPinTable1)},  {10, true, tableRef(kPinTable1)},
    {11, true, tableRef(kPinTable1)}, {14, true, tableRef(kPinTable1)}, {15, true, tableRef(kPinTable1)},
    {16, true, tableRef(kPinTable1)}, {19, true, tableRef(kPinTable1)}, {21, true, tableRef(kPinTable1)},
    {22, true, tableRef(kPinTable1)}, {23, true, tableRef(kPinTable1)}, {12, true, tableRef(kPinTable2)},
    {13, true, tableRef(kPinTable2)}, {24, true, tableRef(kPinTable2)}, {17, true, tableRef(kPinTable3)},
    {18, true, tableRef(kPinTable3)}, {20, true, tableRef(kPinTable1Board20)},
    {27, true, tableRef(kPinTable4)}, {28, true, tableRef(kPinTable5)},
};

struct TPluginPinTableRow {
  int nPluginBoard;
  TMotorIOPinTableRef table;
};

// Motor pins that a plug-in board brings; the others set none.
constexpr TPluginPinTableRow kPluginPinTables[] = {
    {1, tableRef(kPinTableDFRobotMotor)},
    {2, tableRef(kPinTable3)},
    {4, tableRef(kPinTable4)},
};

}  // namespace

TMotorIOPinTableRef getControllerBoardMotorIOPins(TControllerBoardType nBoard, bool &bChangesTable) {
  for (const TBoardPinTableRow &row : kBoardPinTables)
    if (row.nBoard == nBoard) {
      bChangesTable = row.bChangesTable;
      return row.table;
    }
  bChangesTable = true;
  return {kEmptyPinTable, 0};
}

TMotorIOPinTableRef getPluginBoardMotorIOPins(int nPluginBoard) {
  for (const TPluginPinTableRow &row : kPluginPinTables)
    if (row.nPluginBoard == nPluginBoard) return row.table;
  return {nullptr, 0};
}
