#include "cli/InputFiles.h"

#include <algorithm>
#include <filesystem>
#include <vector>

#include "cli/ProjectFile.h"
#include "cli/ReadProgram.h"

namespace fs = std::filesystem;

namespace {

// The place a program counts as being: "-" is its --stdin-filename, else the current folder.
std::string placeOf(const std::string &sPath) { return programPath(sPath); }

bool bHasListedExtension(const TProjectSettings &settings, const fs::path &path) {
  const std::string sName = path.filename().string();
  for (const std::string &sExtension : settings.extensions)
    if (sName.size() > sExtension.size() && sName.compare(sName.size() - sExtension.size(), sExtension.size(), sExtension) == 0)
      return true;
  return false;
}

// Appends the programs under `folder`, in sorted order.
bool walkFolder(const fs::path &folder, const TOptions &options, std::vector<std::string> &found, std::string &sError) {
  std::error_code error;
  std::vector<fs::directory_entry> entries;
  for (fs::directory_iterator it(folder, error), end; !error && it != end; it.increment(error)) entries.push_back(*it);
  if (error) {
    sError = "cannot read '" + folder.string() + "': " + error.message();
    return false;
  }
  std::sort(entries.begin(), entries.end(),
            [](const fs::directory_entry &a, const fs::directory_entry &b) { return a.path().filename() < b.path().filename(); });
  for (const fs::directory_entry &entry : entries) {
    // The files of "." are named as "name", not "./name".
    const fs::path path = folder == "." ? entry.path().filename() : entry.path();
    const std::string sPath = path.string();
    // Linked folders are not followed: a link to a parent would never end.
    const bool bFolder = entry.is_directory(error) && !entry.is_symlink(error);
    if (!bFolder && !entry.is_regular_file(error)) continue;
    TProjectSettings settings;
    if (!projectSettingsFor(sPath, bFolder, options, settings, sError)) return false;
    if (bExcluded(settings, sPath)) continue;
    if (bFolder) {
      if (entry.path().filename().string()[0] == '.') continue;
      if (!walkFolder(path, options, found, sError)) return false;
    } else if (bHasListedExtension(settings, entry.path())) {
      found.push_back(sPath);
    }
  }
  return true;
}

}  // namespace

bool expandInputFiles(TOptions &options, std::string &sError) {
  const bool bWalks = options.nCommand == TCommand::kCheck || options.nCommand == TCommand::kFormat;
  std::vector<std::string> files;
  for (const std::string &sArg : options.files) {
    std::error_code error;
    const bool bFolder = sArg != "-" && fs::is_directory(sArg, error);
    TProjectSettings settings;
    if (!projectSettingsFor(placeOf(sArg), bFolder, options, settings, sError)) return false;
    if (bWalks && bFolder) {
      if (!walkFolder(sArg, options, files, sError)) return false;
    } else {
      files.push_back(sArg);
    }
  }
  options.files = std::move(files);
  // show and models read the project file of the current folder.
  if (options.files.empty()) {
    TProjectSettings settings;
    if (!projectSettingsFor("", true, options, settings, sError)) return false;
  }
  return true;
}

void selectPlatformForProgram(const std::string &sPath, const TOptions &options) {
  TProjectSettings settings;
  std::string sError;
  std::error_code error;
  const bool bFolder = sPath.empty() || (sPath != "-" && fs::is_directory(sPath, error));
  projectSettingsFor(placeOf(sPath), bFolder, options, settings, sError);
  selectPlatformFor(settings, options);
}

bool bPlatformUnchosen(const std::string &sPath, const TOptions &options) {
  if (options.bPlatformGiven || options.bPlatformFromEnvironment) return false;
  TProjectSettings settings;
  std::string sError;
  projectSettingsFor(placeOf(sPath), false, options, settings, sError);
  return !settings.bHasPlatform;
}
