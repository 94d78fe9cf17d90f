// SPDX-License-Identifier: MIT
// The command `play`: its options.
#include <sys/ioctl.h>
#include <unistd.h>

#include <algorithm>
#include <iostream>
#include <memory>

#include "tools/commands.hpp"
#include "tools/play/play.hpp"
#include "tools/play/prompt.hpp"
#include "tools/reading_errors.hpp"
#include "tools/stage_arguments.hpp"
#include "tools/steps/source.hpp"
#include "tools/support/drivers.hpp"
#include "tools/support/terminal.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools {
namespace {

constexpr std::size_t narrowest = 72;  // columns; a picture needs this many
constexpr std::size_t widest = 140;    // longer lines are hard to read

/// The style for standard output: the width of its terminal, and colour if that shows it.
play::Style outputStyle() {
  play::Style style;
  if (::isatty(STDOUT_FILENO) == 0) return style;
  style.color = outputShowsColor();
  winsize size{};
  if (::ioctl(STDOUT_FILENO, TIOCGWINSZ, &size) == 0 && size.ws_col > 0) {
    style.width = std::clamp<std::size_t>(size.ws_col, narrowest, widest);
  }
  return style;
}

void addPress(play::PlayOptions& options, const std::string& text) {
  const auto tag = play::parseTag(text);
  options.steps.emplace_back(tag ? play::Press{*tag, {}} : play::Press{0, text});
}

/// Throws a UsageError for a press by name, in a script without names.
void requireTags(const play::PlayOptions& options) {
  if (steps::isSourcePath(options.script)) return;
  for (const play::Step& step : options.steps) {
    const auto* const press = std::get_if<play::Press>(&step);
    if (!press || press->name.empty()) continue;
    throw UsageError("--press: expected a tag (a whole number), found " + quote(press->name));
  }
}

void addAdvance(play::PlayOptions& options, const std::string& text) {
  const auto seconds = play::parseSeconds(text);
  if (!seconds) {
    throw UsageError("--advance: expected seconds from 0 to 86400, found " + quote(text));
  }
  options.steps.emplace_back(play::Advance{*seconds});
}

void addWindowOptions(Command& command, play::PlayOptions& options) {
  addStageOptions(command, options.stage, options.resources);
  options.toolkit = playerToolkit();
  addToolkitOption(command, options.toolkit, "The toolkit to play the script on");
  command
      .option("--screenshots", options.screenshots,
              "Write the transcript and a picture after every step to this directory")
      .valueName("DIR")
      .directory();
}

void addStepOptions(Command& command, play::PlayOptions& options) {
  command
      .option("--start", options.startKey,
              "The list, or the step of a source, to start with (default: the smallest tag, or the "
              "first "
              "step)")
      .valueName("KEY")
      .scriptKey();
  command
      .repeatedList(
          "--press", [&options](const std::string& tag) { addPress(options, tag); },
          "Press the buttons with these tags, or of a source with these names, in turn")
      .valueName("TAG")
      .scriptKey();
  command
      .repeated(
          "--advance", [&options](const std::string& text) { addAdvance(options, text); },
          "Let time pass; --advance and --press run in the order given")
      .valueName("SECONDS");
}

void describePlay(Command& command) {
  const auto options = std::make_shared<play::PlayOptions>();
  command
      .argument("SCRIPT", options->script,
                "The script, a property list; or its source, a YAML file")
      .file();
  addWindowOptions(command, *options);
  addStepOptions(command, *options);
  const auto noCheck = std::make_shared<bool>(false);
  command.flag("--no-check", *noCheck, "Do not say what can be read to be wrong in the script");
  command.action([options, noCheck] {
    requireTags(*options);
    if (!*noCheck) {
      options->scriptLoaded = [](const InputFile& script, toolkit::Toolkit& toolkit,
                                 std::ostream& out) { writeReadingErrors(script, toolkit, out); };
    }
    const bool interactive = ::isatty(STDIN_FILENO) != 0;
    const play::Terminal terminal{std::cin, std::cout, std::cerr, interactive, outputStyle()};
    return static_cast<int>(play::play(*options, terminal));
  });
}

}  // namespace

constexpr CommandEntry playCommand{
    "play", "Play a script and show, step by step, what its user would see", describePlay};

}  // namespace qz::tools
