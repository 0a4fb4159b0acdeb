#include "cli/ProjectFile.h"

#include <fnmatch.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <map>
#include <sstream>

// toml++ checks a few facts about its input with assertions that abort (in a
// build without NDEBUG) or that clang assumes true (with NDEBUG), although a
// malformed file breaks them, e.g. a table header "[&x]". Without the checks
// its parser reports those inputs as errors, as a gcc release build does.
#pragma push_macro("NDEBUG")
#undef NDEBUG
#define TOML_ASSERT(expr) static_assert(true)
#include <toml++/toml.h>
#pragma pop_macro("NDEBUG")

#include "robotconfig/host/Platform.h"

namespace fs = std::filesystem;

const char *const kProjectFileNames[2] = {"robotcfg.toml", ".robotcfg.toml"};

namespace {

// A project file is a few lines; a larger one is a mistake, not a project file.
constexpr std::uintmax_t kMaxProjectFileSize = 1 << 20;

// "FILE:LINE:COL: " of a place in a project file.
std::string placeOf(const std::string &sPath, const toml::source_region &region) {
  return sPath + ":" + std::to_string(region.begin.line) + ":" + std::to_string(region.begin.column) + ": ";
}

// Reads a list of strings; false when the value is anything else.
bool readStrings(const toml::node &value, std::vector<std::string> &out) {
  const toml::array *pArray = value.as_array();
  if (!pArray) return false;
  out.clear();
  for (const toml::node &item : *pArray) {
    const std::optional<std::string> sItem = item.value<std::string>();
    if (!sItem) return false;
    out.push_back(*sItem);
  }
  return true;
}

// A number or a name as text, for the platform and board lookups.
std::optional<std::string> numberOrName(const toml::node &value) {
  if (const std::optional<int64_t> nValue = value.value<int64_t>())
    return *nValue >= 0 ? std::optional<std::string>(std::to_string(*nValue)) : std::optional<std::string>("-1");
  if (value.is_string()) return value.value<std::string>();
  return std::nullopt;
}

// One key of the file: stores its value; false with a message for a bad one.
using TKeyReader = bool (*)(const toml::node &value, TProjectSettings &settings, std::string &sError);

struct TProjectKey {
  const char *pzName;
  TKeyReader read;
};

const TProjectKey kProjectKeys[] = {
    {"platform",
     [](const toml::node &value, TProjectSettings &settings, std::string &sError) {
       const std::optional<std::string> sText = numberOrName(value);
       settings.nPlatformKind = sText ? findPlatformKind(*sText) : -1;
       if (settings.nPlatformKind < 0) sError = unknownPlatformMessage(sText ? *sText : "");
       return settings.bHasPlatform = settings.nPlatformKind >= 0;
     }},
    {"board",
     [](const toml::node &value, TProjectSettings &settings, std::string &sError) {
       const std::optional<std::string> sText = numberOrName(value);
       settings.nBoard = sText ? findBoard(*sText) : -1;
       if (settings.nBoard < 0) sError = unknownBoardMessage(sText ? *sText : "");
       return settings.bHasBoard = settings.nBoard >= 0;
     }},
    {"external-controllers",
     [](const toml::node &value, TProjectSettings &settings, std::string &sError) {
       const std::optional<bool> bValue = value.value<bool>();
       if (!bValue) sError = "needs true or false";
       settings.bExternalControllers = bValue.value_or(false);
       return settings.bHasExternal = bValue.has_value();
     }},
    {"extensions",
     [](const toml::node &value, TProjectSettings &settings, std::string &sError) {
       if (!readStrings(value, settings.extensions)) sError = "needs a list of strings such as [\".c\"]";
       return sError.empty();
     }},
    {"exclude",
     [](const toml::node &value, TProjectSettings &settings, std::string &sError) {
       if (!readStrings(value, settings.exclude)) sError = "needs a list of glob patterns";
       return sError.empty();
     }},
};

// Makes the text pure ASCII for toml++ 3.3, which meets some other
// characters with undefined behaviour (its whitespace test reaches an
// unreachable branch, also while it reports an error): blanks out the
// non-ASCII bytes of comments, and returns the offset of the first one
// elsewhere (npos when none), which a "..." string can write as \uXXXX.
size_t makeAsciiForParser(std::string &sText) {
  enum { kCode, kComment, kBasic, kLiteral, kMultiBasic, kMultiLiteral } nState = kCode;
  for (size_t n = 0; n < sText.size(); ++n) {
    const char c = sText[n];
    if (static_cast<unsigned char>(c) >= 0x80) {
      if (nState != kComment) return n;
      sText[n] = ' ';
      continue;
    }
    const bool bTriple = sText.compare(n, 3, std::string(3, c)) == 0;
    switch (nState) {
      case kCode:
        if (c == '#') nState = kComment;
        else if (c == '"') nState = bTriple ? (n += 2, kMultiBasic) : kBasic;
        else if (c == '\'') nState = bTriple ? (n += 2, kMultiLiteral) : kLiteral;
        break;
      case kComment:
        if (c == '\n') nState = kCode;
        break;
      case kBasic:
      case kMultiBasic:
        if (c == '\\') ++n;  // an escape: the next character is the string's
        else if (c == '"' && (nState == kBasic || bTriple)) nState = nState == kBasic ? kCode : (n += 2, kCode);
        else if (c == '\n' && nState == kBasic) nState = kCode;  // an unclosed string: toml++ reports it
        break;
      case kLiteral:
      case kMultiLiteral:
        if (c == '\'' && (nState == kLiteral || bTriple)) nState = nState == kLiteral ? kCode : (n += 2, kCode);
        else if (c == '\n' && nState == kLiteral) nState = kCode;
        break;
    }
  }
  return std::string::npos;
}

// "LINE:COL" of a byte offset, columns counted in bytes.
std::string lineAndColumn(const std::string &sText, size_t nOffset) {
  const size_t nLineStart = sText.rfind('\n', nOffset == 0 ? 0 : nOffset - 1);
  const size_t nLine = size_t(std::count(sText.begin(), sText.begin() + long(nOffset), '\n')) + 1;
  const size_t nColumn = nLineStart == std::string::npos || nOffset == 0 ? nOffset + 1 : nOffset - nLineStart;
  return std::to_string(nLine) + ":" + std::to_string(nColumn);
}

std::string keyNames() {
  std::string sNames;
  for (const TProjectKey &key : kProjectKeys) sNames += (sNames.empty() ? "" : ", ") + std::string(key.pzName);
  return sNames;
}

// The project file in a folder; "" when none.
std::string projectFileIn(const fs::path &folder) {
  for (const char *pzName : kProjectFileNames) {
    std::error_code error;
    const fs::path candidate = folder / pzName;
    if (fs::is_regular_file(candidate, error)) return candidate.string();
  }
  return "";
}

// The nearest project file from `folder` upwards; "" when none. Folders
// already searched are remembered: a tree of programs searches each once.
std::string nearestProjectFile(fs::path folder) {
  static std::map<std::string, std::string> found;
  std::vector<std::string> searched;
  std::string sFile;
  for (;;) {
    const auto known = found.find(folder.string());
    if (known != found.end()) {
      sFile = known->second;
      break;
    }
    searched.push_back(folder.string());
    sFile = projectFileIn(folder);
    if (!sFile.empty() || folder == folder.parent_path() || folder.empty()) break;
    folder = folder.parent_path();
  }
  for (const std::string &sFolder : searched) found[sFolder] = sFile;
  return sFile;
}

}  // namespace

bool loadProjectFile(const std::string &sPath, TProjectSettings &settings, std::string &sError) {
  settings = TProjectSettings();
  settings.sPath = sPath;
  std::error_code error;
  settings.sFolder = fs::absolute(fs::path(sPath), error).parent_path().string();
  std::ifstream in(sPath, std::ios::binary);
  if (!in || fs::is_directory(sPath, error)) {
    sError = sPath + ": cannot read the project file";
    return false;
  }
  if (fs::file_size(sPath, error) > kMaxProjectFileSize) {
    sError = sPath + ": the project file is larger than 1 MiB";
    return false;
  }
  std::ostringstream bytes;
  bytes << in.rdbuf();
  return parseProjectText(bytes.str(), sPath, settings, sError);
}

bool parseProjectText(const std::string &sText, const std::string &sPath, TProjectSettings &settings,
                      std::string &sError) {
  std::string sAscii = sText;
  const size_t nStray = makeAsciiForParser(sAscii);
  if (nStray != std::string::npos) {
    sError = sPath + ":" + lineAndColumn(sText, nStray) +
             ": a character other than ASCII outside a comment (in a \"...\" string write it as \\uXXXX)";
    return false;
  }
  toml::table table;
  try {
    table = toml::parse(std::string_view(sAscii), std::string_view(sPath));
  } catch (const toml::parse_error &failure) {
    sError = placeOf(sPath, failure.source()) + std::string(failure.description());
    return false;
  }
  for (auto &&[key, value] : table) {
    const TProjectKey *pKey = nullptr;
    for (const TProjectKey &candidate : kProjectKeys)
      if (key.str() == candidate.pzName) pKey = &candidate;
    if (!pKey) {
      sError = placeOf(sPath, key.source()) + "unknown key '" + std::string(key.str()) + "' (" + keyNames() + ")";
      return false;
    }
    std::string sMessage;
    if (!pKey->read(value, settings, sMessage)) {
      sError = placeOf(sPath, value.source()) + "'" + pKey->pzName + "': " + sMessage;
      return false;
    }
  }
  return true;
}

bool projectSettingsFor(const std::string &sPath, bool bIsFolder, const TOptions &options,
                        TProjectSettings &settings, std::string &sError) {
  settings = TProjectSettings();
  if (options.bNoConfig) return true;
  std::string sFile = options.sConfigPath;
  if (sFile.empty()) {
    std::error_code error;
    const fs::path path = fs::absolute(sPath.empty() ? fs::path(".") : fs::path(sPath), error);
    sFile = nearestProjectFile(bIsFolder ? path.lexically_normal() : path.lexically_normal().parent_path());
  }
  if (sFile.empty()) return true;
  // A file is read once however many programs it covers.
  static std::map<std::string, std::pair<TProjectSettings, std::string>> loaded;
  auto known = loaded.find(sFile);
  if (known == loaded.end()) {
    TProjectSettings read;
    std::string sMessage;
    if (!loadProjectFile(sFile, read, sMessage)) read.sPath.clear();
    known = loaded.emplace(sFile, std::make_pair(read, sMessage)).first;
  }
  settings = known->second.first;
  sError = known->second.second;
  return sError.empty();
}

void selectPlatformFor(const TProjectSettings &settings, const TOptions &options) {
  const int nKind = !options.bPlatformGiven && settings.bHasPlatform ? settings.nPlatformKind : options.nPlatformKind;
  TControllerBoardType nBoard = options.nBoard;
  if (!options.bBoardGiven) nBoard = settings.bHasBoard ? settings.nBoard : -1;
  const bool bExternal = options.bExternalGiven || (settings.bHasExternal && settings.bExternalControllers);
  selectHostPlatform(nKind, nBoard, bExternal);
}

bool bExcluded(const TProjectSettings &settings, const std::string &sPath) {
  if (settings.exclude.empty()) return false;
  std::error_code error;
  const std::string sRelative =
      fs::absolute(fs::path(sPath), error).lexically_normal().lexically_relative(settings.sFolder).generic_string();
  if (sRelative.empty() || sRelative.rfind("..", 0) == 0) return false;
  // "*" also matches "/", so "build/*" takes the whole folder, as "build/**" does.
  for (const std::string &sPattern : settings.exclude)
    if (::fnmatch(sPattern.c_str(), sRelative.c_str(), 0) == 0) return true;
  return false;
}
