#include <algorithm>
#include <filesystem>

#include "apps/axvelto/Command.h"
#include "apps/axvelto/Output.h"
#include "apps/axvelto/Progress.h"
#include "apps/shared/Complaint.h"
#include "apps/shared/Input.h"
#include "apps/shared/Workouts.h"

namespace ax::app {

namespace {

namespace fs = std::filesystem;

void declare(CLI::App& app, Arguments& arguments) {
  app.add_option("FILE", arguments.files,
                 "workout files in FIT, TCX or GPX, archives or folders of them; - is standard input")
      ->required();
  declareLocale(app, arguments);
  declareWorkouts(app, arguments);
}

bool isFolder(const std::string& path) {
  std::error_code error;
  return fs::is_directory(path, error);
}

bool isHidden(const fs::path& path) {
  return path.filename().string().starts_with('.');
}

reader::Fault unreadable(const std::string& folder) {
  return {folder, "", "the folder may not be read", "permission to read it"};
}

bool mayBeListed(const fs::path& folder) {
  std::error_code error;
  const fs::directory_iterator first(folder, error);
  return !error;
}

// Every file below a folder that is not hidden, in the order of their names, and the folders that may not be
// read.
std::vector<std::string> filesBelow(const std::string& folder) {
  if (!mayBeListed(folder)) return {folder};
  std::vector<std::string> files;
  std::error_code error;
  fs::recursive_directory_iterator at(folder, fs::directory_options::skip_permission_denied, error);
  for (; !error && at != fs::recursive_directory_iterator(); at.increment(error)) {
    const bool isBelow = at->is_directory(error);
    if (isHidden(at->path())) {
      if (isBelow) at.disable_recursion_pending();
    } else if (!isBelow || !mayBeListed(at->path())) {
      files.push_back(at->path().string());
    }
  }
  if (error) throw unreadable(folder);
  std::ranges::sort(files);
  return files;
}

// Answers whether all could be read. What cannot be is told, and the others go on.
bool addAll(const std::vector<std::string>& files, const Arguments& arguments, Workouts& workouts) {
  bool isWhole = true;
  const Progress progress("Reading");
  for (std::size_t i = 0; i < files.size(); ++i) {
    if (files.size() > 1) progress.show(i, files.size());
    try {
      if (isFolder(files[i])) throw unreadable(files[i]);
      const auto add = [&](const std::string& name, std::string_view bytes) { workouts.add(name, bytes); };
      isWhole = forEachUnpacked(files[i], arguments, add) && isWhole;
    } catch (const reader::Fault& fault) {
      isWhole = false;
      progress.clear();
      if (files.size() == 1) throw;
      complain(fault);
    }
  }
  return isWhole;
}

ExitCode run(const Arguments& arguments) {
  checkLocale(arguments.locale);
  checkTimeZone(arguments.timeZone);
  std::vector<std::string> files;
  for (const std::string& path : arguments.files) {
    const std::vector<std::string> named = isFolder(path) ? filesBelow(path) : std::vector{path};
    files.insert(files.end(), named.begin(), named.end());
  }
  Workouts workouts(arguments);
  const bool isWhole = addAll(files, arguments, workouts);
  if (workouts.isEmpty()) {
    throw reader::Fault{arguments.files.front(), "", "no workout", "at least one in FIT, TCX or GPX"};
  }
  print(workouts.scene());
  return isWhole ? exitDone : exitFallsShort;
}

}  // namespace

const Command importCommand = {"import", "A workout file, or several as a list, as a scene", declare, run};

}  // namespace ax::app
