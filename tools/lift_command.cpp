// SPDX-License-Identifier: MIT
// The command `lift`.
#include <algorithm>
#include <filesystem>
#include <iostream>
#include <memory>
#include <optional>
#include <string>
#include <thread>

#include "engine/tag_key.hpp"
#include "tools/check_progress.hpp"
#include "tools/commands.hpp"
#include "tools/lift/lift.hpp"
#include "tools/lift/yaml_text.hpp"
#include "tools/steps/source.hpp"
#include "tools/support/replace_file.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/walkthrough/parse_number.hpp"

namespace qz::tools {
namespace {

namespace fs = std::filesystem;

struct LiftCommandOptions {
  std::string script;
  walkthrough::StageOptions stage;
  std::optional<std::string> output;
  std::optional<std::string> start;
  lift::LiftOptions lift;
};

/// Returns the path of the source. One that is there already is somebody's work.
std::string sourcePath(const LiftCommandOptions& options) {
  if (options.output) return *options.output;
  std::string path = fs::path(options.script).replace_extension(".yaml").string();
  if (!fs::exists(path)) return path;
  throw Failure(ExitStatus::badInput,
                path + ": is there already; expected -o with the file to write");
}

/// Returns the line of the source that names the window, from the directory of the source.
std::string windowLine(const LiftCommandOptions& options, const std::string& source) {
  const auto& [word, path] = options.stage.window ? std::pair("window: ", *options.stage.window)
                                                  : std::pair("assets: ", *options.stage.assets);
  const auto folder = fs::absolute(source).parent_path();
  return word + lift::scalar(fs::absolute(path).lexically_relative(folder).generic_string());
}

std::string startKeyOf(const LiftCommandOptions& options, const InputFile& file) {
  const auto script = file.dictionary();
  const auto key = options.start ? options.start : smallestTagKey(*script);
  if (!key) throw Failure(ExitStatus::badInput, file.path() + ": no list has a tag for a key");
  if (script->objectForKey(*key)) return *key;
  throw Failure(ExitStatus::badInput, file.path() + ": no list has the key " + quote(*key));
}

void liftToFile(LiftCommandOptions& options) {
  if (!options.stage.window && !options.stage.assets) {
    throw Failure(ExitStatus::badInput,
                  "expected --window with the host's window, or --assets; a source names it");
  }
  if (steps::isSourcePath(options.script)) {
    throw Failure(ExitStatus::badInput, options.script + ": is a walk-through in steps already");
  }
  const std::string source = sourcePath(options);
  const InputFile file(options.script, "a script");
  const comparison::Played played{.script = file.dictionary(),
                                  .plan = planStage(options.stage, file.dictionary(), file.path()),
                                  .resources = fs::absolute(file.path()).parent_path().string(),
                                  .startKeys = {startKeyOf(options, file)}};
  const Interruption interruption;
  ProgressLine line;
  options.lift.window = windowLine(options, source);
  options.lift.hooks.report = [&](const check::Progress& progress) {
    line.show(options.script, progress);
  };
  options.lift.hooks.isCancelled = Interruption::isWanted;
  const lift::Lifted lifted = liftScript(file, played, options.lift);
  replaceFile(source, lifted.source);
  std::cout << source << ": " << lifted.steps << (lifted.steps == 1 ? " step" : " steps")
            << "; built again, it is no different for users\n";
}

void describeLift(Command& command) {
  const auto options = std::make_shared<LiftCommandOptions>();
  command.argument("SCRIPT", options->script, "The script, a property list").file();
  auto window =
      command.option("--window", options->stage.window,
                     "The host's window, a property list of its controls or a form (.ui)");
  auto assets = command.option("--assets", options->stage.assets,
                               "A description from which the engine builds the window");
  window.valueName("HOST.plist").file().excludes(assets);
  assets.valueName("DESCRIPTION.plist").file();
  command
      .option("-o,--output", options->output,
              "The source to write (default: the script's name with .yaml, if there is none)")
      .valueName("SOURCE.yaml")
      .path()
      .file();
  command
      .option("--start", options->start,
              "The list with which the walk-through starts (default: the smallest tag)")
      .valueName("KEY")
      .scriptKey();
  command
      .taken(
          "--limit",
          [options](const std::string& text) {
            const auto number = walkthrough::parseNumber<std::size_t>(text);
            if (!number || *number == 0) {
              throw UsageError("--limit: expected a whole number above 0, found " + quote(text));
            }
            options->lift.limits.places = *number;
          },
          "Give up a script of more places (default: 1000000)")
      .valueName("PLACES");
  options->lift.threads = std::max(1U, std::thread::hardware_concurrency());
  command.task([options] { liftToFile(*options); });
}

}  // namespace

constexpr CommandEntry liftCommand{"lift", "Make a walk-through in steps of a script",
                                   describeLift};

}  // namespace qz::tools
