// SPDX-License-Identifier: MIT
// The command `cover`.
#include <algorithm>
#include <filesystem>
#include <iostream>
#include <memory>
#include <string>
#include <thread>

#include "tools/check_progress.hpp"
#include "tools/commands.hpp"
#include "tools/cover/cover.hpp"
#include "tools/cover/scenario_text.hpp"
#include "tools/stage_arguments.hpp"
#include "tools/steps/script_file.hpp"
#include "tools/support/drivers.hpp"
#include "tools/support/replace_file.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools {
namespace {

namespace fs = std::filesystem;

struct CoverOptions {
  std::string script;
  std::string directory;
  check::CheckOptions check;
  bool update = false;
};

/// Returns the scenarios that an earlier run has written to the directory, by the names of their
/// files.
std::map<std::string, std::string> writtenIn(const std::string& directory) {
  std::map<std::string, std::string> written;
  std::error_code error;
  for (const auto& file : fs::directory_iterator(directory, error)) {
    const auto text =
        file.path().extension() == ".walk" ? wholeFile(file.path().string()) : std::nullopt;
    if (text && text->starts_with(cover::signature))
      written[file.path().filename().string()] = *text;
  }
  return written;
}

/// Says what is different in the directory, and returns whether anything is.
bool sayDifferences(const std::map<std::string, std::string>& before,
                    const std::map<std::string, std::string>& after) {
  bool isDifferent = false;
  const auto say = [&](const char* what, const std::string& name) {
    std::cout << what << ' ' << name << '\n';
    isDifferent = true;
  };
  for (const auto& [name, text] : after) {
    const auto old = before.find(name);
    if (old == before.end()) say("new:    ", name);
    if (old != before.end() && old->second != text) say("changed:", name);
  }
  for (const auto& [name, text] : before) {
    if (!after.contains(name)) say("gone:   ", name);
  }
  return isDifferent;
}

void write(const std::string& directory, const std::map<std::string, std::string>& before,
           const std::map<std::string, std::string>& after) {
  for (const auto& [name, text] : after) {
    const auto old = before.find(name);
    if (old == before.end() || old->second != text) {
      replaceFile((fs::path(directory) / name).string(), text);
    }
  }
  for (const auto& [name, text] : before) {
    if (!after.contains(name)) fs::remove(fs::path(directory) / name);
  }
}

void makeDirectory(const std::string& directory) {
  std::error_code error;
  fs::create_directories(directory, error);
  if (!fs::is_directory(directory)) {
    throw Failure(ExitStatus::badInput, directory + ": expected a directory, which can be made");
  }
}

cover::Coverage coverageOf(const CoverOptions& options) {
  const Interruption interruption;
  ProgressLine line;
  check::ExplorationHooks hooks;
  hooks.report = [&](const check::Progress& progress) { line.show(options.script, progress); };
  hooks.isCancelled = Interruption::isWanted;
  const steps::ScriptFile script = steps::openScript(options.script);
  check::CheckOptions own = options.check;
  own.stage = script.stage(own.stage);
  return cover::coverScript(script.file, own, options.directory, hooks);
}

void sayCounts(const cover::Coverage& coverage) {
  std::cout << coverage.files.size() << " scenarios: " << coverage.steps << " steps, "
            << coverage.moves << " moves between them"
            << (coverage.isComplete ? "" : "; not everything was explored") << '\n';
}

int runCover(const CoverOptions& options) {
  makeDirectory(options.directory);
  const auto coverage = coverageOf(options);
  const auto before = writtenIn(options.directory);
  const bool isDifferent = sayDifferences(before, coverage.files);
  const bool isStale = isDifferent && !before.empty() && !options.update;
  if (!isStale) write(options.directory, before, coverage.files);
  sayCounts(coverage);
  if (!isStale) return static_cast<int>(ExitStatus::fine);
  std::cerr << "qz-walkthrough: the scenarios in " << options.directory
            << " do not fit the script; --update rewrites them\n";
  return static_cast<int>(ExitStatus::failed);
}

void describeCover(Command& command) {
  const auto options = std::make_shared<CoverOptions>();
  command
      .argument("SCRIPT", options->script,
                "The script, a property list; or its source, a YAML file")
      .file();
  command.option("-o,--output", options->directory, "The directory of the scenarios")
      .valueName("DIR")
      .directory();
  addStageOptions(command, options->check.stage, options->check.resources);
  command
      .repeated(
          "--start", [options](const std::string& key) { options->check.startKeys.push_back(key); },
          "A list with which the walk-through may start (default: the smallest tag)")
      .valueName("KEY")
      .scriptKey();
  command.flag("--update", options->update,
               "Rewrite scenarios of an earlier run after an intended change of the script");
  options->check.threads = std::max(1U, std::thread::hardware_concurrency());
  command.action([options] {
    if (options->directory.empty()) {
      throw Failure(ExitStatus::badInput, "-o DIR is required; see qz-walkthrough cover --help");
    }
    return runCover(*options);
  });
}

}  // namespace

constexpr CommandEntry coverCommand{
    "cover", "Write scenarios that do everything that a user can do with a script", describeCover};

}  // namespace qz::tools
