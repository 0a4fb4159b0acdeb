#include "robotconfig/checker/RuleTable.h"

#include <cstring>

namespace {

constexpr TSeverity kError = TSeverity::kError;
constexpr TSeverity kWarning = TSeverity::kWarning;
constexpr TSeverity kNote = TSeverity::kNote;

// Codes group by concern: 0xx line syntax, 1xx words, 2xx repeated devices,
// 3xx resources, 4xx names, 5xx platform, 9xx the regenerated block.
constexpr TCheckRule kRules[] = {
    {"RC001", "line-refused", kError, "The configuration reader refused the line.",
     "The line is not read at all; the reader's own message says why. Regenerating the block would drop it."},
    {"RC010", "missing-parenthesis", kWarning, "A configuration line has no closing ')'.",
     "The line is read as if the parenthesis were there; close it so that compilers read it the same way."},
    {"RC011", "text-after-parenthesis", kError, "Text follows the closing ')' of a configuration line.",
     "Everything after ')' is ignored and disappears when the block is regenerated; move it to a comment "
     "line of its own or into the parameters."},
    {"RC012", "missing-comma", kError, "A parameter holds two words: a comma is missing.",
     "Reading stops at the second word, so it and every parameter after it are lost; put a comma between "
     "the words."},
    {"RC013", "ignored-parameter", kWarning, "The keyword ignores a parameter.",
     "The parameter has no effect and is not written back; remove it."},
    {"RC014", "missing-motor", kError, "A drive train or gripper arm names fewer motors than it drives.",
     "The regenerated line would name 'None' for the missing motors, which does not read back; name a motor "
     "for every slot."},
    {"RC101", "unknown-word", kError, "A word is none of the words its position accepts.",
     "The record replaces an unknown word by its 'none' value, so the device or setting is lost; use one "
     "of the suggested words."},
    {"RC102", "word-of-other-platform", kError, "A word exists only on other platforms.",
     "The current platform has no such device; select the platform the program is for (--platform) or "
     "use a word of this one."},
    {"RC103", "motor-type-replaced", kWarning, "A motor type is replaced by another type on this platform.",
     "The platform lacks the type the line names; the block is written with the replacement."},
    {"RC104", "motor-type-dropped", kError, "A motor type gives no motor on this port.",
     "The port's hardware cannot drive the type, so the motor is lost; use a type the port accepts."},
    {"RC105", "mode-of-other-type", kError, "A sensor mode does not belong to the sensor's type.",
     "The mode is dropped; use a mode of the sensor's type or none."},
    {"RC106", "legacy-word", kNote, "An older word is written in its current form.",
     "Nothing is lost; the regenerated block uses the current word."},
    {"RC201", "defined-twice", kError, "A device or setting is defined twice.",
     "Only the later line counts; the earlier definition is lost. Remove one of the lines."},
    {"RC301", "pin-conflict", kError, "Two devices claim the same pin or port.",
     "The record keeps only one of them; move one device to a free pin."},
    {"RC302", "motor-in-two-slots", kError, "One motor fills two drive-train or gripper slots.",
     "A motor can drive one wheel or arm joint; give each slot its own motor."},
    {"RC303", "missing-hub", kError, "A device sits on a controller or port the configuration does not provide.",
     "Declare the controller with a Hubs line (and enable external controllers) or use a port that exists."},
    {"RC401", "duplicate-name", kError, "Two devices have the same name.",
     "The names become variables of the robot program, which will not compile; rename one device."},
    {"RC402", "invalid-name", kError, "A device name is no valid identifier.",
     "Names become variables of the robot program: letters, digits and '_', not starting with a digit."},
    {"RC403", "reserved-name", kError, "A device name is a keyword of the robot language.",
     "The robot program will not compile; choose another name."},
    {"RC501", "other-platform", kNote, "The file reads cleanly on other platforms.",
     "Many lines fail on this platform; the note lists the platforms (and boards) that read the file "
     "without errors."},
    {"RC502", "board-changed", kNote, "The program's board replaces the board the command line assumed.",
     "The file names its own controller board; the rest of it is read for that board."},
    {"RC503", "port-rule", kWarning, "A port-assignment rule of the controller is broken.",
     "The controller expects sensors of a kind on certain ports; the message says which."},
    {"RC901", "lost-on-regeneration", kError, "A definition is lost when the block is regenerated.",
     "The regenerated block does not carry what the line says; the line holds a combination the record "
     "cannot keep."},
    {"RC902", "block-not-writable", kError, "The regenerated block cannot be written.",
     "The configuration as read has no block that reads back the same; the message names the line to change."},
};

}  // namespace

const TCheckRule *checkRules(size_t &nCount) {
  nCount = sizeof(kRules) / sizeof(kRules[0]);
  return kRules;
}

const TCheckRule *findCheckRule(const char *pzCode) {
  for (const TCheckRule &rule : kRules)
    if (std::strcmp(rule.pzCode, pzCode) == 0) return &rule;
  return nullptr;
}
