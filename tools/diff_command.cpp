// SPDX-License-Identifier: MIT
// The command `diff`.
#include <algorithm>
#include <filesystem>
#include <iostream>
#include <memory>
#include <optional>
#include <string>
#include <thread>
#include <vector>

#include "tools/check/report.hpp"
#include "tools/check_progress.hpp"
#include "tools/commands.hpp"
#include "tools/diff/report.hpp"
#include "tools/stage_arguments.hpp"
#include "tools/support/drivers.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/terminal.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/walkthrough/parse_number.hpp"

namespace qz::tools {
namespace {

using diff::Both;
using diff::bothSides;
using diff::Side;

// No change was found, but not everything was compared.
constexpr int notAllCompared = 3;

struct DiffOptions {
  std::vector<std::string> files;
  check::CheckOptions both;
  walkthrough::StageOptions oldStage;
  std::optional<std::string> oldResources;
  std::vector<std::string> oldStartKeys;
  std::string format = "text";
};

/// The two files, and what people call them.
struct Files {
  Both<diff::NamedFile> files{};
  Both<std::string> names{};
  Both<std::string> onDisk{};  ///< as words of a shell; empty: it has no file that stays
};

Files twoFiles(const std::vector<std::string>& paths) {
  const Both<std::string> both{paths[0], paths[1]};
  return {.files = {{both.before, both.before}, {both.after, both.after}},
          .names = both,
          .onDisk = {check::shellWord(both.before), check::shellWord(both.after)}};
}

/// Names a version of a file. That of the working tree has no blob.
void nameVersion(Side side, const std::string& path, const std::string& blob, Files& files) {
  const bool isInWorkingTree = blob.find_first_not_of('0') == std::string::npos;
  constexpr std::size_t shortBlob = 7;
  files.names[side] = isInWorkingTree ? path : path + "@" + blob.substr(0, shortBlob);
  if (isInWorkingTree) files.onDisk[side] = check::shellWord(path);
}

/// Takes PATH OLD-FILE OLD-HEX OLD-MODE NEW-FILE NEW-HEX NEW-MODE [NEW-PATH CHANGE].
Files filesOfGit(const std::vector<std::string>& words) {
  const std::string& newPath = words.size() > 7 ? words[7] : words[0];
  Files files{.files = {{words[0], words[1]}, {newPath, words[4]}}, .names = {}, .onDisk = {}};
  nameVersion(Side::before, words[0], words[2], files);
  nameVersion(Side::after, newPath, words[5], files);
  return files;
}

check::CheckOptions optionsOf(Side side, const DiffOptions& options) {
  check::CheckOptions own = options.both;
  if (side == Side::after) return own;
  if (options.oldStage.window || options.oldStage.assets) {
    own.stage.window = options.oldStage.window;
    own.stage.assets = options.oldStage.assets;
  }
  if (options.oldResources) own.resources = options.oldResources;
  if (!options.oldStartKeys.empty()) own.startKeys = options.oldStartKeys;
  return own;
}

const diff::ReportFormat& formatOf(const DiffOptions& options) {
  static const auto formats = diff::reportFormats();
  std::vector<std::string> names;
  for (const auto& format : formats) {
    if (format.name == options.format) return format;
    names.emplace_back(format.name);
  }
  throw Failure(ExitStatus::badInput,
                "--format: expected " + enumerate(names) + ", found " + quote(options.format));
}

int compareFiles(const Files& files, const DiffOptions& options) {
  const auto& format = formatOf(options);
  const Both<check::CheckOptions> own{optionsOf(Side::before, options),
                                      optionsOf(Side::after, options)};
  const Both<diff::Subject> subjects{openSubject(files.files.before, own.before),
                                     openSubject(files.files.after, own.after)};
  const Interruption interruption;
  ProgressLine line;
  check::ExplorationHooks hooks;
  hooks.report = [&](const check::Progress& progress) { line.show(files.names.after, progress); };
  hooks.isCancelled = Interruption::isWanted;
  const auto found = diff::compareSubjects(subjects, hooks);
  diff::Report report{.subjects = subjects, .diff = *found, .play = {}, .name = files.names};
  for (const Side side : bothSides) {
    if (files.onDisk[side].empty()) continue;
    report.play[side] =
        "qz-walkthrough play " + files.onDisk[side] + check::stageArguments(own[side]);
  }
  format.write(report, outputShowsColor(), std::cout);
  if (!found->changes.empty()) return static_cast<int>(ExitStatus::failed);
  return found->isComplete ? static_cast<int>(ExitStatus::fine) : notAllCompared;
}

/// Git stops at the first status that is not 0, so a file that is no walk-through gets a line.
int compareForGit(const std::vector<std::string>& words, const DiffOptions& options) {
  const Files files = filesOfGit(words);
  constexpr const char* noFile = "/dev/null";
  try {
    if (files.files.before.readFrom == noFile) {
      std::cout << oneLine(files.files.after.path) << ": is new\n";
    } else if (files.files.after.readFrom == noFile) {
      std::cout << oneLine(files.files.before.path) << ": is gone\n";
    } else {
      compareFiles(files, options);
    }
  } catch (const Failure& failure) {
    std::cout << oneLine(files.files.after.path)
              << ": cannot be compared: " << oneLine(failure.what()) << '\n';
  }
  return static_cast<int>(ExitStatus::fine);
}

int runDiff(const DiffOptions& options) {
  const auto& files = options.files;
  if (files.size() == 2) return compareFiles(twoFiles(files), options);
  if (files.size() == 7 || files.size() == 9) return compareForGit(files, options);
  if (files.size() == 1) {  // so git names a file that is not merged yet
    throw Failure(ExitStatus::badInput, "expected OLD and NEW, found only " + quote(files[0]));
  }
  throw Failure(ExitStatus::badInput,
                "expected OLD and NEW, or the seven or nine words of git, found " +
                    std::to_string(files.size()));
}

void addOldOptions(Command& command, DiffOptions& options) {
  auto window = command.option("--old-window", options.oldStage.window,
                               "The host's window of the old script, if it had another one");
  auto assets = command.option("--old-assets", options.oldStage.assets,
                               "The description of the old script's window, if it had another one");
  window.valueName("HOST.plist").file().excludes(assets);
  assets.valueName("DESCRIPTION.plist").file();
  command
      .option("--old-resources", options.oldResources,
              "The directory of the old script's images, if they were others")
      .valueName("DIR")
      .directory();
  command
      .repeated(
          "--old-start", [&](const std::string& key) { options.oldStartKeys.push_back(key); },
          "The list, or the step, with which the old walk-through starts, if that was another one")
      .valueName("KEY")
      .scriptKey();
}

void describeDiff(Command& command) {
  const auto options = std::make_shared<DiffOptions>();
  command
      .arguments("OLD NEW", options->files,
                 "Two scripts, sources, host windows or descriptions; or what git passes to an "
                 "external diff driver")
      .file();
  addStageOptions(command, options->both.stage, options->both.resources);
  command
      .repeated(
          "--start", [options](const std::string& key) { options->both.startKeys.push_back(key); },
          "A list, or a step of a source, with which the walk-throughs may start (default: the "
          "smallest tag, or the first step)")
      .valueName("KEY")
      .scriptKey();
  addOldOptions(command, *options);
  command
      .taken(
          "--limit",
          [options](const std::string& text) {
            const auto number = walkthrough::parseNumber<std::size_t>(text);
            if (!number || *number == 0) {
              throw UsageError("--limit: expected a whole number above 0, found " + quote(text));
            }
            options->both.limits.places = *number;
          },
          "Stop after this many places (default: 1000000)")
      .valueName("PLACES");
  std::vector<std::string_view> formats;
  for (const auto& format : diff::reportFormats()) formats.push_back(format.name);
  command.option("--format", options->format, "The format of the report: text or json")
      .valueName("FORMAT")
      .choices(formats)
      .showDefault();
  options->both.toolkit = testToolkit();
  options->both.threads = std::max(1U, std::thread::hardware_concurrency());
  command.action([options] { return runDiff(*options); });
}

}  // namespace

constexpr CommandEntry diffCommand{
    "diff", "Say what a change of a walk-through changes for its users", describeDiff};

}  // namespace qz::tools
