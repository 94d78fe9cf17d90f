// SPDX-License-Identifier: MIT
// Plays a script, from reading it to the end of the transcript.
#include "tools/play/play.hpp"

#include <algorithm>
#include <filesystem>
#include <istream>
#include <memory>
#include <optional>
#include <ostream>

#include "engine/tag_key.hpp"
#include "qz/property_list/collections.hpp"
#include "text/number_conversion.hpp"
#include "tools/play/pressing.hpp"
#include "tools/play/prompt.hpp"
#include "tools/play/raised_places.hpp"
#include "tools/play/screenshots.hpp"
#include "tools/play/session.hpp"
#include "tools/steps/script_file.hpp"
#include "tools/support/drivers.hpp"
#include "tools/support/input_file.hpp"
#include "tools/support/stack_guard.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/walkthrough/stage.hpp"

namespace qz::tools::play {
namespace {

namespace fs = std::filesystem;

using Script = toolkit::ValueRef<toolkit::Dictionary>;

/// Returns the script's keys in the order of their tags.
std::vector<std::string> sortedKeys(const Script& script) {
  std::vector<std::string> keys = script->allKeys();
  std::stable_sort(keys.begin(), keys.end(), [](const std::string& a, const std::string& b) {
    return text::integerValueOf(a) < text::integerValueOf(b);
  });
  return keys;
}

std::string listOfKeys(const Script& script) {
  std::string list;
  for (const std::string& key : sortedKeys(script)) {
    list.append(list.empty() ? "" : ", ").append(printable(key));
  }
  return list;
}

/// Throws a Failure unless the script has a list to start with.
void checkStart(const InputFile& file, std::string key) {
  const Script script = file.dictionary();
  if (script->allKeys().empty()) {
    file.fail(script, "expected at least one list, found an empty script");
  }
  if (key.empty()) key = *smallestTagKey(*script);
  const auto list = script->objectForKey(key);
  if (!list) {
    throw Failure(ExitStatus::failed, file.path() + ": no list under the start key " + quote(key) +
                                          "; expected one of " + listOfKeys(script));
  }
  if (!toolkit::asArray(list)) {
    file.fail(list, "start key " + quote(key) + ": expected a list of commands, found " +
                        foundWords(list));
  }
}

void checkDirectory(const std::string& path) {
  std::error_code error;
  if (fs::is_directory(path, error)) return;
  const std::string what = fs::exists(path, error) ? ": no directory" : ": no such directory";
  throw Failure(ExitStatus::badInput, path + what + "; expected one with images");
}

void pressIfPossible(Session& session, const Press& press, std::ostream& out) {
  const auto tag = tagOf(session.picture(), press);
  if (!tag) {
    out << "  " << noSuchName(session.picture(), press.name) << '\n';
  } else if (const auto reason = whyNotPress(session.picture(), *tag)) {
    out << "  " << *reason << '\n';
  } else {
    session.perform(press);
  }
}

/// Asks for one step after the other until the walk-through ends or the user quits.
void playInteractively(Session& session, const Terminal& terminal) {
  std::string line;
  while (!session.picture().ended) {
    terminal.out << '\n' << promptText << std::flush;
    if (!std::getline(terminal.in, line)) {
      terminal.out << '\n';
      return;
    }
    const Request request = parseRequest(line, session.hasNames());
    if (std::holds_alternative<Quit>(request)) return;
    if (const auto* pressed = std::get_if<Press>(&request)) {
      pressIfPossible(session, *pressed, terminal.out);
    } else if (const auto* passed = std::get_if<Advance>(&request)) {
      session.perform(*passed);
    } else if (const auto* unclear = std::get_if<Unclear>(&request)) {
      terminal.out << "  " << unclear->hint << '\n';
    } else {
      terminal.out << promptHelp;
    }
  }
}

/// Lets a person who sees the window play in it, else the user of an interactive terminal.
void leaveToTheUser(const drivers::Driver& driver, Session& session, const Terminal& terminal) {
  if (driver.hasPerson()) {
    terminal.out << "\nPress what the window offers; close it to stop.\n" << std::flush;
    session.handOver();
  } else if (terminal.interactive) {
    playInteractively(session, terminal);
  }
}

/// Passes the engine's log lines on, each below what the transcript already shows.
void connectLog(drivers::Driver& driver, const Terminal& terminal) {
  driver.setLogSink([&terminal](std::string_view line) {
    terminal.out << std::flush;
    terminal.log << oneLine(line) << std::endl;
  });
}

std::vector<std::string> startsOf(const PlayOptions& options) {
  if (options.startKey.empty()) return {};
  return {options.startKey};
}

}  // namespace

ExitStatus play(const PlayOptions& options, const Terminal& terminal) {
  const steps::ScriptFile script = steps::openScript(options.script, startsOf(options));
  const InputFile& file = script.file;
  const std::string startKey =
      script.from ? script.from->built.startKeys.front() : options.startKey;
  checkStart(file, startKey);
  const fs::path path = fs::absolute(options.script);
  if (options.resources) checkDirectory(*options.resources);

  const auto driver = requireDriver(options.toolkit);
  driver->setResourcePath(options.resources ? *options.resources : path.parent_path().string());
  connectLog(*driver, terminal);
  if (options.scriptLoaded) options.scriptLoaded(file, driver->toolkit(), terminal.log);
  std::optional<Screenshots> screenshots;
  if (options.screenshots) {
    screenshots.emplace(*driver, *options.screenshots);
  } else if (driver->hasPerson()) {
    driver->useRealTime();
  }
  Stage stage(*driver, planStage(script.stage(options.stage), file.dictionary(), options.script));
  const ScriptGuard guard(stage.engine(), options.script, file.dictionary());
  stage.engine().setObserver(std::make_shared<RaisedPlaces>(file, stage.engine(), terminal.log));
  Transcript transcript(terminal.out, terminal.style);
  Session session(*driver, stage, transcript, screenshots ? &*screenshots : nullptr,
                  script.names());

  if (script.from) {
    session.start(file.dictionary(), startKey);
  } else {
    session.start(path.string(), startKey);
  }
  for (const Step& step : options.steps) session.perform(step);
  if (options.steps.empty()) leaveToTheUser(*driver, session, terminal);
  session.conclude();
  for (const std::string& problem : session.problems()) {
    terminal.log << "qz-walkthrough: " << file.path() << ": " << oneLine(problem) << '\n';
  }
  return session.problems().empty() ? ExitStatus::fine : ExitStatus::failed;
}

}  // namespace qz::tools::play
