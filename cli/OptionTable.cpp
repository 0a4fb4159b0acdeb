#include "cli/OptionTable.h"

#include <cstdlib>
#include <cstring>

namespace {

constexpr unsigned kCheck = commandBit(TCommand::kCheck);
constexpr unsigned kFormat = commandBit(TCommand::kFormat);
constexpr unsigned kGenerate = commandBit(TCommand::kGenerate);
constexpr unsigned kShow = commandBit(TCommand::kShow);
constexpr unsigned kDiff = commandBit(TCommand::kDiff);
constexpr unsigned kModels = commandBit(TCommand::kModels);
constexpr unsigned kSaveModel = commandBit(TCommand::kSaveModel);
constexpr unsigned kEdits = commandBit(TCommand::kSet) | commandBit(TCommand::kApply);
constexpr unsigned kServe = commandBit(TCommand::kServe);
/// Commands that read programs, and so a project file.
constexpr unsigned kReading = kCheck | kFormat | kGenerate | kShow | kDiff | kModels | kSaveModel | kEdits;

using TApply = bool (*)(TOptions &, const std::string &, std::string &);

bool setColor(TOptions &options, const std::string &sValue, std::string &sError) {
  if (sValue == "auto") options.nColor = TColorWhen::kAuto;
  else if (sValue == "always") options.nColor = TColorWhen::kAlways;
  else if (sValue == "never") options.nColor = TColorWhen::kNever;
  else {
    sError = "unknown --color value '" + sValue + "' (auto, always or never)";
    return false;
  }
  return true;
}

bool setReportFormat(TOptions &options, const std::string &sValue, std::string &sError) {
  if (sValue != "text" && sValue != "json" && sValue != "sarif") {
    sError = "unknown report format '" + sValue + "' (text, json or sarif)";
    return false;
  }
  options.sReportFormat = sValue;
  return true;
}

bool setServePort(TOptions &options, const std::string &sValue, std::string &sError) {
  const bool bDigits = !sValue.empty() && sValue.size() <= 5 && sValue.find_first_not_of("0123456789") == std::string::npos;
  options.nServePort = bDigits ? std::atoi(sValue.c_str()) : -1;
  if (options.nServePort < 0 || options.nServePort > 65535) sError = "--port takes a number 0..65535";
  return sError.empty();
}

bool setPlatform(TOptions &options, const std::string &sValue, std::string &sError) {
  options.nPlatformKind = findPlatformKind(sValue);
  if (options.nPlatformKind < 0) sError = unknownPlatformMessage(sValue);
  options.bPlatformGiven = true;
  return options.nPlatformKind >= 0;
}

bool setBoard(TOptions &options, const std::string &sValue, std::string &sError) {
  options.nBoard = findBoard(sValue);
  if (options.nBoard < 0) sError = unknownBoardMessage(sValue);
  options.bBoardGiven = true;
  return options.nBoard >= 0;
}

#define SWITCH(field) [](TOptions &o, const std::string &, std::string &) { return o.field = true; }
#define TEXT(field) [](TOptions &o, const std::string &s, std::string &) { return o.field = s, true; }

}  // namespace

const TCommandSpec kCommandSpecs[] = {
    {TCommand::kCheck, "check", "FILE|FOLDER...", 1, -1, "no input files",
     "report mistakes as FILE:LINE:COL: error: MESSAGE [CODE]",
     "Reads the configuration block of each program and reports every line that is\n"
     "refused or would be lost, with warnings for legal but doubtful settings\n"
     "(docs/DIAGNOSTICS.md lists the codes). A folder is searched for programs\n"
     "(see the project file); FILE '-' reads standard input.\n",
     "0 no errors, 1 errors found (or warnings with --Werror), 2 usage or I/O error.",
     "robotcfg check --platform vexpic robot.c\nrobotcfg check .    # with a robotcfg.toml"},
    {TCommand::kFormat, "format", "FILE|FOLDER...", 1, -1, "no input files",
     "print each program with its configuration block regenerated",
     "Regenerates the configuration block of each program in its settled form and\n"
     "prints the program, or rewrites it with -i. Nothing else in the file changes.\n"
     "A program with a refused line is left alone.\n",
     "0 done (with --check, --diff, -l: nothing would change), 1 refused lines or a block "
     "that would change, 2 usage or I/O error.",
     "robotcfg format -i robot.c\nrobotcfg format --diff src/"},
    {TCommand::kGenerate, "generate", "FILE", 1, 1, "generate takes exactly one file",
     "print only the regenerated configuration block",
     "Prints the configuration block that format would write, without the rest of\n"
     "the program.\n",
     "0 done, 1 refused lines, 2 usage or I/O error.", "robotcfg generate robot.c"},
    {TCommand::kShow, "show", "[FILE]", 0, 1, "show takes at most one file",
     "summarise the configured devices (of FILE, or the empty configuration)",
     "Prints the configured motors, sensors, servos, hubs, serial ports, board and\n"
     "drive train of a program's configuration (--all: every port), or with --json\n"
     "the configuration as a JSON document (docs/configuration.schema.json), or\n"
     "with --svg a picture of the wiring.\n",
     "0 done, 1 refused lines, 2 usage or I/O error.", "robotcfg show --platform nxt --external-controllers"},
    {TCommand::kDiff, "diff", "A B", 2, 2, "diff takes exactly two files",
     "compare the configurations of two programs (-v: which devices differ)",
     "Says whether two programs' configurations are the same, differ only in device\n"
     "names, only in model names, or in settings.\n",
     "0 same, 1 different, 2 usage or I/O error, or refused lines in either file.",
     "robotcfg diff -v old.c new.c"},
    {TCommand::kModels, "models", "", 0, 0, "models takes no file",
     "list the standard robot models of the platform",
     "Lists the standard robot models of the selected platform, which a\n"
     "StandardModel line can name.\n",
     "0 done, 2 usage error.", "robotcfg models --platform nxt"},
    {TCommand::kSaveModel, "save-model", "FILE -o OUT", 1, 1, "save-model takes one file and -o OUT",
     "save the configuration of FILE as a model file",
     "Writes the configuration of FILE, device by device, as a model file that a\n"
     "UserModel line can name.\n",
     "0 saved, 1 refused lines, 2 usage or I/O error.", "robotcfg save-model robot.c -o base.model"},
    {TCommand::kSet, "set", "FILE PATH=VALUE...", 2, -1, "set takes a file and at least one PATH=VALUE",
     "change the configuration through the record's setters and print the program",
     "Changes the configuration as the setup dialogs do (motor.port2.type=tmotorVex393_MC29,\n"
     "sensor.in1=sensorTouch, sensor.in1.name=bumper, board=typeCktBoardUno, ...) and\n"
     "prints the program with its new block, or rewrites it with -i. An edit the\n"
     "rules refuse is reported and nothing is written.\n",
     "0 done, 1 refused lines or edits, 2 usage or I/O error.",
     "robotcfg set -i robot.c motor.port2.type=tmotorVex393_MC29 motor.port2.name=left"},
    {TCommand::kApply, "apply", "FILE EDITS.json", 2, 2, "apply takes a file and a JSON file of edits",
     "the same as set, with a JSON list of edits",
     "Reads a JSON list of {\"op\": \"set\", \"path\": ..., \"value\": ...} and applies it\n"
     "as set does.\n",
     "0 done, 1 refused lines or edits, 2 usage or I/O error.", "robotcfg apply -i robot.c edits.json"},
    {TCommand::kServe, "serve", "FILE|FOLDER...", 1, -1, "serve takes the programs or folders to open",
     "the setup dialogs as a local web page",
     "Serves a page on 127.0.0.1 with a tab per setup dialog, the generated block,\n"
     "the findings and the wiring picture, and prints its URL with a secret token.\n"
     "Only the files named and the .c files under the folders named can be opened.\n"
     "Ctrl-C stops it.\n",
     "0 stopped, 2 usage error or the port cannot be opened.", "robotcfg serve --platform vexi2c robot.c"},
        {TCommand::kInit, "init", "", 0, 0, "init takes no file",
     "write a commented robotcfg.toml in the current folder",
     "Writes robotcfg.toml, with the platform, board and controller toggle given\n"
     "(or the defaults) and every other key commented out. An existing file is\n"
     "kept.\n",
     "0 written, 2 the file exists or cannot be written.", "robotcfg init --platform vexi2c"},
    {TCommand::kCompletion, "completion", "bash|zsh|fish", 1, 1, "completion takes one shell: bash, zsh or fish",
     "print a shell completion script",
     "Prints a completion script for the shell: commands, options, platform names\n"
     "and board keywords.\n",
     "0 done, 2 unknown shell.",
     "robotcfg completion bash > ~/.local/share/bash-completion/completions/robotcfg"},
};
const size_t kNumbOfCommandSpecs = sizeof(kCommandSpecs) / sizeof(kCommandSpecs[0]);

const TOptionSpec kOptionSpecs[] = {
    {nullptr, "--platform", "KIND", kEveryCommand,
     "platform kind: a number 0..14 or a name such as nxt, vexpic, vexi2c, arduino "
     "(default: the project file's, else $ROBOTCFG_PLATFORM, else nxt)",
     "@platforms", setPlatform},
    {nullptr, "--board", "BOARD", kEveryCommand,
     "controller board chosen in the IDE: a number or a board keyword (default: the platform's own board)",
     "@boards", setBoard},
    {nullptr, "--external-controllers", nullptr, kEveryCommand, "enable \"External Motor/Servo Controllers\"", nullptr,
     [](TOptions &o, const std::string &, std::string &) { return o.bExternalControllers = o.bExternalGiven = true; }},
    {nullptr, "--config", "FILE", kReading, "use this project file for every program instead of searching for one",
     "@files", TEXT(sConfigPath)},
    {nullptr, "--no-config", nullptr, kReading, "use no project file", nullptr, SWITCH(bNoConfig)},
    {nullptr, "--stdin-filename", "NAME", kReading,
     "the name of the program read from '-' in messages; its folder is where its project file and user models are found", "@files",
     TEXT(sStdinFilename)},
    {"-i", "--in-place", nullptr, kFormat | kEdits, "rewrite the files instead of printing them", nullptr, SWITCH(bInPlace)},
    {nullptr, "--json", nullptr, kShow, "the configuration as a JSON document", nullptr, SWITCH(bJson)},
    {nullptr, "--choices", nullptr, kShow, "with --json: the words each device may take", nullptr, SWITCH(bChoices)},
    {nullptr, "--all", nullptr, kShow, "every port, not only the configured devices", nullptr, SWITCH(bAll)},
    {nullptr, "--svg", nullptr, kShow, "an SVG picture of the wiring", nullptr, SWITCH(bSvg)},
    {nullptr, "--port", "N", kServe, "the port to listen on (default: a free one)", nullptr, setServePort},
    {nullptr, "--host", "H", kServe, "listen on H instead of 127.0.0.1 (with a warning)", nullptr, TEXT(sServeHost)},
    {nullptr, "--check", nullptr, kFormat, "change nothing; exit 1 when a block is not in generated form", nullptr,
     SWITCH(bCheckOnly)},
    {nullptr, "--diff", nullptr, kFormat, "print a unified diff of each file that would change; exit 1 when any would",
     nullptr, SWITCH(bDiff)},
    {"-l", "--list", nullptr, kFormat,
     "print the names of the files that would change (exit 1 when any would), or with -i of those rewritten",
     nullptr, SWITCH(bList)},
    {"-v", "--verbose", nullptr, kDiff | kFormat,
     "diff: list the devices that differ; format -i: say which files were rewritten", nullptr, SWITCH(bVerbose)},
    {nullptr, "--format", "text|json|sarif", kCheck, "how findings are reported (json and sarif on standard output)",
     "text json sarif", setReportFormat},
    {nullptr, "--Werror", nullptr, kCheck | kFormat, "treat warnings as errors", nullptr, SWITCH(bWarningsAreErrors)},
    {"-q", "--quiet", nullptr, kCheck | kFormat, "report errors only", nullptr, SWITCH(bQuiet)},
    {nullptr, "--show-source", nullptr, kCheck | kFormat,
     "show the offending line under each finding (default on a terminal)", nullptr, SWITCH(bShowSource)},
    {"-o", "--output", "OUT", kSaveModel, "the model file to write", "@files", TEXT(sOutputPath)},
        {nullptr, "--color", "WHEN", kEveryCommand,
     "colour the output: auto (on a terminal, unless NO_COLOR is set), always or never", "auto always never",
     setColor},
    {"-h", "--help", nullptr, kEveryCommand, "show this help (after a command: the command's)", nullptr, SWITCH(bHelp)},
    {nullptr, "--version", nullptr, kEveryCommand, "show the version", nullptr, SWITCH(bVersion)},
    {nullptr, "--man", nullptr, kEveryCommand, "print the manual page (roff)", nullptr, SWITCH(bManPage)},
};
const size_t kNumbOfOptionSpecs = sizeof(kOptionSpecs) / sizeof(kOptionSpecs[0]);

const TCommandSpec *findCommandSpec(const std::string &sName) {
  for (const TCommandSpec &command : kCommandSpecs)
    if (sName == command.pzName) return &command;
  return nullptr;
}

const TCommandSpec *commandSpecOf(TCommand nCommand) {
  for (const TCommandSpec &command : kCommandSpecs)
    if (command.nCommand == nCommand) return &command;
  return nullptr;
}

std::string optionLabel(const TOptionSpec &option) {
  std::string sLabel = option.pzShort ? std::string(option.pzShort) + ", " : std::string();
  sLabel += option.pzLong;
  if (option.pzValue) sLabel += std::string(" ") + option.pzValue;
  return sLabel;
}
