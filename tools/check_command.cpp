// SPDX-License-Identifier: MIT
// The command `check`: its options.
#include <algorithm>
#include <charconv>
#include <iostream>
#include <list>
#include <memory>
#include <thread>

#include "tools/check/check.hpp"
#include "tools/check/report.hpp"
#include "tools/commands.hpp"
#include "tools/support/drivers.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/terminal.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/walkthrough/parse_number.hpp"

namespace qz::tools {
namespace {

using check::CheckOptions;
using check::Severity;

// Nothing was found, but not everything was looked at.
constexpr int notComplete = 3;

struct CommandOptions {
  std::vector<std::string> scripts;
  CheckOptions check;
  std::string format = "text";
  Severity failOn = Severity::warning;
};

std::size_t positive(const std::string& option, const std::string& text) {
  const auto number = walkthrough::parseNumber<std::size_t>(text);
  if (!number || *number == 0) {
    throw UsageError(option + ": expected a whole number above 0, found " + quote(text));
  }
  return *number;
}

double positiveReal(const std::string& option, const std::string& text) {
  const auto number = walkthrough::parseNumber<double>(text);
  if (!number || !(*number > 0)) {
    throw UsageError(option + ": expected a number above 0, found " + quote(text));
  }
  return *number;
}

std::string formatNames() {
  std::vector<std::string> names;
  for (const auto& format : check::reportFormats()) names.emplace_back(format.name);
  return enumerate(names);
}

const check::ReportFormat& formatNamed(const std::string& name) {
  static const auto formats = check::reportFormats();
  const auto found = std::find_if(formats.begin(), formats.end(),
                                  [&](const auto& format) { return format.name == name; });
  if (found != formats.end()) return *found;
  throw Failure(ExitStatus::badInput,
                "--format: expected " + formatNames() + ", found " + quote(name));
}

std::string stageArguments(const CheckOptions& options) {
  std::string arguments;
  if (options.stage.window) arguments += " --window " + *options.stage.window;
  if (options.stage.assets) arguments += " --assets " + *options.stage.assets;
  if (options.resources) arguments += " --resources " + *options.resources;
  if (options.stage.sheet) arguments += " --sheet";
  return arguments;
}

int statusOf(const std::vector<check::Verdict>& verdicts, Severity failOn) {
  bool complete = true;
  for (const auto& verdict : verdicts) {
    complete &= verdict.explored.complete;
    for (const auto& finding : verdict.findings) {
      if (finding.severity >= failOn) return static_cast<int>(ExitStatus::failed);
    }
  }
  return complete ? static_cast<int>(ExitStatus::fine) : notComplete;
}

int runCheck(const CommandOptions& options) {
  const auto& format = formatNamed(options.format);
  std::list<InputFile> files;
  std::vector<check::Verdict> verdicts;
  for (const std::string& path : options.scripts) {
    files.emplace_back(path, "a script");
    verdicts.push_back(check::checkScript(files.back(), options.check, {}));
  }
  std::vector<check::Report> reports;
  auto file = files.begin();
  for (const auto& verdict : verdicts) {
    reports.push_back({verdict, *file++, stageArguments(options.check)});
  }
  format.write(reports, outputShowsColor(), std::cout);
  return statusOf(verdicts, options.failOn);
}

void addWindowOptions(Command& command, CheckOptions& options) {
  auto window = command.option("--window", options.stage.window,
                               "The host's window, a property list of its controls");
  auto assets = command.option("--assets", options.stage.assets,
                               "A description from which the engine builds the window");
  window.valueName("HOST.plist").excludes(assets);
  assets.valueName("DESCRIPTION.plist");
  auto standIn = command.flag("--stand-in", options.standIn,
                              "Check without a window: make one from the script, and say nothing "
                              "about the tags and kinds of controls");
  standIn.excludes(window).excludes(assets);
  command
      .option("--resources", options.resources,
              "The directory of the images (default: the script's)")
      .valueName("DIR");
  command.flag("--sheet", options.stage.sheet,
               "Show the window as a sheet over another window of the host");
  options.toolkit = testToolkit();
  command
      .option("--toolkit", options.toolkit,
              "The toolkit whose fonts and images the script may use: " + toolkitHelp())
      .valueName("NAME")
      .showDefault();
}

void addExploringOptions(Command& command, CheckOptions& options) {
  command
      .repeated(
          "--start", [&](const std::string& key) { options.startKeys.push_back(key); },
          "A list with which the walk-through may start (default: the smallest tag)")
      .valueName("KEY");
  command
      .taken(
          "--limit", [&](const std::string& n) { options.limits.places = positive("--limit", n); },
          "Stop after this many places (default: 1000000)")
      .valueName("PLACES");
  command
      .taken(
          "--seconds",
          [&](const std::string& s) { options.limits.seconds = positiveReal("--seconds", s); },
          "Stop after this time (default: never)")
      .valueName("SECONDS");
  command
      .taken(
          "--words-per-minute",
          [&](const std::string& n) {
            options.wordsPerMinute = positiveReal("--words-per-minute", n);
          },
          "How fast users read (default: 200)")
      .valueName("WORDS");
  options.threads = std::max(1U, std::thread::hardware_concurrency());
  command
      .taken(
          "--threads",
          [&](const std::string& n) {
            options.threads = static_cast<unsigned>(positive("--threads", n));
          },
          "How many threads explore (default: one a processor); the result is the same")
      .valueName("COUNT");
}

void setFailOn(CommandOptions& options, const std::string& name) {
  const auto severity = check::severityNamed(name);
  if (!severity) {
    throw UsageError("--fail-on: expected error, warning or note, found " + quote(name));
  }
  options.failOn = *severity;
}

void describeCheck(Command& command) {
  const auto options = std::make_shared<CommandOptions>();
  command.arguments("SCRIPT", options->scripts, "The scripts, property lists");
  addWindowOptions(command, options->check);
  addExploringOptions(command, options->check);
  command.option("--format", options->format, "The format of the report: " + formatNames())
      .valueName("FORMAT")
      .showDefault();
  command
      .taken(
          "--fail-on", [options](const std::string& name) { setFailOn(*options, name); },
          "The least severity that fails: error, warning or note (default: warning)")
      .valueName("SEVERITY");
  command
      .repeated(
          "--allow",
          [options](const std::string& text) {
            options->check.allowances.push_back(check::parseAllowance(text, "--allow"));
            options->check.allowances.back().place.clear();
          },
          "Take back the findings of a code, or those of one list")
      .valueName("CODE[=KEY]");
  command.action([options] {
    auto& check = options->check;
    if (!check.stage.window && !check.stage.assets) check.standIn = true;
    return runCheck(*options);
  });
}

}  // namespace

constexpr CommandEntry checkCommand{
    "check", "Say what is wrong with scripts: explore everything that a user can do",
    describeCheck};

}  // namespace qz::tools
