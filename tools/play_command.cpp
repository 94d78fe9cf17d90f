// The command `play`: its options.
#include "tools/play_command.hpp"

#include <CLI/CLI.hpp>
#include <sys/ioctl.h>
#include <unistd.h>

#include <algorithm>
#include <iostream>
#include <memory>

#include "tools/drivers.hpp"
#include "tools/play/play.hpp"
#include "tools/play/prompt.hpp"
#include "tools/terminal.hpp"
#include "tools/text_layout.hpp"

namespace tools {
namespace {

constexpr std::size_t narrowest = 72;  // columns; a picture needs them
constexpr std::size_t widest = 140;    // lines any longer are hard to read

/// How to write to standard output: in colour to a terminal whose user has nothing against it.
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

void addPresses(play::PlayOptions& options, const std::vector<std::string>& tags) {
  for (const std::string& text : tags) {
    const auto tag = play::parseTag(text);
    if (!tag) {
      throw CLI::ValidationError("--press: expected a tag (a whole number), found " + quote(text));
    }
    options.steps.emplace_back(play::Press{*tag});
  }
}

void addAdvance(play::PlayOptions& options, const std::string& text) {
  const auto seconds = play::parseSeconds(text);
  if (!seconds) {
    throw CLI::ValidationError("--advance: expected seconds from 0 to 86400, found " + quote(text));
  }
  options.steps.emplace_back(play::Advance{*seconds});
}

void addWindowOptions(CLI::App& command, play::PlayOptions& options) {
  auto* window = command.add_option("--window", options.window,
                                    "The host's window, a property list of its controls");
  auto* assets = command.add_option("--assets", options.assets,
                                    "A description of which the engine builds the window");
  window->type_name("HOST.plist")->excludes(assets);
  assets->type_name("DESCRIPTION.plist")->excludes(window);
  command
      .add_option("--resources", options.resources,
                  "The directory of the images; the script's own without it")
      ->type_name("DIR");
  command.add_flag("--sheet", options.sheet, "Show it as a sheet over another window of the host");
  options.toolkit = playerToolkit();
  command.add_option("--toolkit", options.toolkit, "The toolkit to play it on")
      ->type_name("NAME")
      ->capture_default_str();
  command
      .add_option("--screenshots", options.screenshots,
                  "Write a picture after every step there, and the transcript")
      ->type_name("DIR");
}

/// Steps are collected while the command line is read, for their order across both options counts.
void addStepOptions(CLI::App& command, play::PlayOptions& options) {
  command.add_option("--start", options.startKey, "The list to start with; else the smallest tag")
      ->type_name("KEY");
  command
      .add_option_function<std::vector<std::string>>(
          "--press",
          [&options](const std::vector<std::string>& tags) { addPresses(options, tags); },
          "Press the buttons with these tags, in turn")
      ->type_name("TAG")
      ->trigger_on_parse();
  command
      .add_option_function<std::string>(
          "--advance", [&options](const std::string& text) { addAdvance(options, text); },
          "Let time pass; in turn with --press, as they stand on the command line")
      ->type_name("SECONDS")
      ->trigger_on_parse();
}

}  // namespace

void addPlayCommand(CLI::App& app, int& status) {
  CLI::App* command =
      app.add_subcommand("play", "Play a script and show, step by step, what its user would see");
  const auto options = std::make_shared<play::PlayOptions>();
  command->add_option("SCRIPT", options->script, "The script, a property list")
      ->required()
      ->type_name("");
  addWindowOptions(*command, *options);
  addStepOptions(*command, *options);
  command->callback([options, &status] {
    const bool interactive = ::isatty(STDIN_FILENO) != 0;
    const play::Terminal terminal{std::cin, std::cout, std::cerr, interactive, outputStyle()};
    status = static_cast<int>(play::play(*options, terminal));
  });
}

}  // namespace tools
