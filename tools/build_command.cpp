// SPDX-License-Identifier: MIT
// The command `build`.
#include <chrono>
#include <filesystem>
#include <iostream>
#include <memory>
#include <optional>
#include <set>
#include <string>
#include <thread>
#include <vector>

#include "qz/property_list/formats.hpp"
#include "tools/check_progress.hpp"
#include "tools/commands.hpp"
#include "tools/output_format.hpp"
#include "tools/steps/room.hpp"
#include "tools/steps/script_file.hpp"
#include "tools/steps/source_map.hpp"
#include "tools/steps/translation.hpp"
#include "tools/support/folder_watch.hpp"
#include "tools/support/replace_file.hpp"

namespace qz::tools {
namespace {

struct BuildOptions {
  std::string source;
  std::optional<std::string> output;
  std::optional<std::string> language;
  std::optional<std::string> map;
  bool watch = false;
};

std::string outputOf(const BuildOptions& options) {
  const std::string ending = options.language ? "_" + *options.language + ".plist" : ".plist";
  auto standard = std::filesystem::path(options.source).replace_extension().concat(ending);
  return options.output.value_or(standard.string());
}

steps::Translate translateOf(const BuildOptions& options) {
  return options.language ? steps::translationTo(*options.language, options.source)
                          : steps::Translate();
}

void say(const std::vector<std::string>& messages) {
  for (const std::string& message : messages) std::cerr << message << '\n';
}

/// Says which texts are not in the language, and which have no room in it.
void judgeTexts(const steps::Source& source, const std::string& language) {
  say(steps::untranslated(source, language));
  const auto without = steps::textsWithoutRoom(source);
  say(
      without.value_or(std::vector<std::string>{
          source.path + ": note: nobody knows whether the texts fit, because this build has no "
                        "toolkit that measures them, such as Qt"}));
}

void requireSource(const std::string& path) {
  if (steps::isSourcePath(path)) return;
  throw Failure(ExitStatus::badInput,
                path +
                    ": expected a walk-through in steps, a file whose name ends with .yaml or "
                    ".yml");
}

/// Builds the script of the options, writes it, and returns it.
steps::ScriptFile buildSource(const BuildOptions& options) {
  requireSource(options.source);
  steps::ScriptFile script = steps::openScript(options.source, {}, translateOf(options));
  const std::string output = outputOf(options);
  const auto& format = toolkit::formatRow(formatBySuffix(output));
  replaceFile(output, format.write(script.file.dictionary()));
  if (options.map) replaceFile(*options.map, steps::sourceMap(script));
  if (options.language) judgeTexts(script.from->source, *options.language);
  return script;
}

std::string folderOf(const std::string& path) {
  return std::filesystem::absolute(path).parent_path().string();
}

/// Returns the folders of the files of which a script was built.
std::set<std::string> foldersOf(const steps::Source& source) {
  std::set<std::string> folders;
  for (const std::string& path : source.files.paths()) folders.insert(folderOf(path));
  folders.insert(folderOf(source.stage.window ? *source.stage.window : *source.stage.assets));
  return folders;
}

/// Sleeps for a fifth of a second. Returns NO if the user has interrupted.
bool restUntilInterrupted() {
  std::this_thread::sleep_for(std::chrono::milliseconds(200));
  return !Interruption::isWanted();
}

/// Builds again whenever a file has changed beside the source or another file that it is built of,
/// until the user interrupts. Mistakes are said, and mended ones are built.
void watch(const BuildOptions& options) {
  const Interruption interruption;
  std::set<std::string> folders = {folderOf(options.source)};
  const std::set<std::string> outputs = {outputOf(options),
                                         options.map.value_or(outputOf(options))};
  const auto buildAgain = [&] {
    try {
      folders.merge(foldersOf(buildSource(options).from->source));
      std::cout << outputOf(options) << ": written" << std::endl;
    } catch (const steps::SourceRefused& refused) {
      say(refused.messages());
      for (const std::string& path : refused.paths()) folders.insert(folderOf(path));
    } catch (const Failure& failure) {
      std::cerr << failure.what() << '\n';
    }
    return folders;
  };
  watchFolders(folders, outputs, buildAgain, restUntilInterrupted);
}

void describeBuild(Command& command) {
  const auto options = std::make_shared<BuildOptions>();
  command.argument("SOURCE", options->source, "The walk-through in steps, a YAML file").file();
  command
      .option("-o,--output", options->output,
              "The script to write (default: the source's name with .plist)")
      .valueName("SCRIPT.plist")
      .path()
      .file();
  command
      .option("--language", options->language,
              "Write the script of a language, with the translations of LANG.po beside the source; "
              "x-long makes all texts longer")
      .valueName("LANG");
  command
      .option("--map", options->map,
              "Also write where in the source each list and command comes from, as JSON")
      .valueName("MAP.json")
      .path()
      .file();
  command.flag("--watch", options->watch,
               "Build again whenever a file that the script depends on has changed, until "
               "interrupted");
  command.task([options] {
    if (options->watch) {
      watch(*options);
    } else {
      buildSource(*options);
    }
  });
}

}  // namespace

constexpr CommandEntry buildCommand{"build", "Make a script of a walk-through in steps",
                                    describeBuild};

}  // namespace qz::tools
