// SPDX-License-Identifier: MIT
// The command `storyboard`.
#include <algorithm>
#include <filesystem>
#include <iostream>
#include <memory>
#include <string>
#include <thread>

#include "tools/check_progress.hpp"
#include "tools/commands.hpp"
#include "tools/stage_arguments.hpp"
#include "tools/steps/script_file.hpp"
#include "tools/storyboard/storyboard.hpp"
#include "tools/support/drivers.hpp"
#include "tools/support/replace_file.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/walkthrough/parse_number.hpp"

namespace qz::tools {
namespace {

namespace fs = std::filesystem;

struct StoryboardCommandOptions {
  std::string script;
  std::string output;
  storyboard::StoryboardOptions board;
};

std::size_t limitFrom(const std::string& text) {
  const auto number = walkthrough::parseNumber<std::size_t>(text);
  if (number && *number > 0) return *number;
  throw UsageError("--limit: expected a whole number above 0, found " + quote(text));
}

/// Fails before the work if the page could not be written after it.
void requirePlaceFor(const std::string& output) {
  const auto folder = fs::absolute(output).parent_path();
  if (fs::is_directory(folder) && !fs::is_directory(output)) return;
  throw Failure(ExitStatus::badInput,
                output + ": cannot be written; expected a path in a directory that is there");
}

storyboard::Storyboard storyboardOf(const StoryboardCommandOptions& options) {
  const Interruption interruption;
  ProgressLine line;
  check::ExplorationHooks hooks;
  hooks.report = [&](const check::Progress& progress) { line.show(options.script, progress); };
  hooks.isCancelled = Interruption::isWanted;
  auto own = options.board;
  own.drawing = [&](std::size_t done, std::size_t all) {
    line.show("drawing", done, all, "pictures");
  };
  const steps::ScriptFile script = steps::openScript(options.script, own.check.startKeys);
  own.stageArguments = playStageArguments(own.check.stage, own.check.resources);
  own.check.stage = script.stage(own.check.stage);
  own.check.standIn = !own.check.stage.window && !own.check.stage.assets;
  if (script.from) {
    auto keys = script.from->built.startKeys;
    keys.resize(std::max<std::size_t>(own.check.startKeys.size(), 1));
    own.check.startKeys = keys;
  }
  return makeStoryboard(script.file, own, hooks);
}

int runStoryboard(const StoryboardCommandOptions& options) {
  if (options.output.empty()) {
    throw Failure(ExitStatus::badInput,
                  "-o FILE is required; see qz-walkthrough storyboard --help");
  }
  requirePlaceFor(options.output);
  const auto made = storyboardOf(options);
  replaceFile(options.output, made.html);
  std::cout << options.output << ": " << made.steps << " steps, " << made.pictures << " pictures, "
            << made.findings << " findings";
  if (made.leftOut > 0) std::cout << "; " << made.leftOut << " steps are left out (--limit)";
  std::cout << (made.isComplete ? "" : "; not everything was explored") << '\n';
  return static_cast<int>(ExitStatus::fine);
}

void describeStoryboard(Command& command) {
  const auto options = std::make_shared<StoryboardCommandOptions>();
  auto& check = options->board.check;
  command
      .argument("SCRIPT", options->script,
                "The script, a property list; or its source, a YAML file")
      .file();
  command.option("-o,--output", options->output, "The page, an HTML file").valueName("FILE").file();
  addStageOptions(command, check.stage, check.resources);
  command
      .repeated(
          "--start", [&check](const std::string& key) { check.startKeys.push_back(key); },
          "A list, or a step of a source, with which the walk-through may start (default: the "
          "smallest tag, or the first step)")
      .valueName("KEY")
      .scriptKey();
  options->board.toolkit = playerToolkit();
  addToolkitOption(command, options->board.toolkit, "The toolkit that draws the pictures");
  command
      .taken(
          "--limit", [options](const std::string& text) { options->board.limit = limitFrom(text); },
          "The most steps of the page (default: 500)")
      .valueName("STEPS");
  check.toolkit = testToolkit();
  check.threads = std::max(1U, std::thread::hardware_concurrency());
  command.action([options] { return runStoryboard(*options); });
}

}  // namespace

constexpr CommandEntry storyboardCommand{
    "storyboard", "Make a page that shows every step of a script, to click through",
    describeStoryboard};

}  // namespace qz::tools
