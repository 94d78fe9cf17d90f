// SPDX-License-Identifier: MIT
// Reads the command line with CLI11 and reports its errors in the tool's own words.
#include "tools/command_line.hpp"

#include <CLI/CLI.hpp>

#include <algorithm>
#include <utility>

#include "tools/support/failure.hpp"
#include "tools/support/suggestions.hpp"

namespace qz::tools {
namespace {

/// Returns the command that was given, or the tool itself if there is none.
const CLI::App& chosen(const CLI::App& app) {
  const auto commands = app.get_subcommands();
  return commands.empty() ? app : *commands.front();
}

/// Says that a command was expected: which there are, and what was found instead.
std::string commandExpected(const CLI::App& app) {
  std::vector<std::string_view> names;
  for (const CLI::App* command : app.get_subcommands({})) names.push_back(command->get_name());
  const std::string list = enumerate({names.begin(), names.end()});
  const auto rest = app.remaining();
  if (rest.empty()) return "expected a command: " + list;
  const bool isOption = rest.front().starts_with("-");
  return (isOption ? "unknown option " : "unknown command ") + rest.front() + "; expected " + list +
         didYouMean(rest.front(), names);
}

std::string unexpectedArgument(const CLI::App& command) {
  const std::string argument = command.remaining(true).front();
  if (!argument.starts_with("-")) return "unexpected argument " + argument;
  const std::string name = argument.substr(0, argument.find('='));
  std::vector<std::string> options;
  for (const CLI::Option* option : command.get_options()) {
    options.push_back(option->get_name(false, true));
  }
  return "unknown option " + name + didYouMean(name, {options.begin(), options.end()});
}

/// CLI11 says "--start: At Most 1 required but received 2" of an option that is given twice.
std::string givenTwice(std::string words) {
  constexpr std::string_view most = ": At Most 1 required but received ";
  const std::size_t at = words.find(most);
  if (at == std::string::npos) return words;
  return words.replace(at, most.size(), ": expected once, found ") + " times";
}

/// CLI11 says "list was given a disallowed flag override" of "--list=3".
std::string flagWithValue(std::string words) {
  constexpr std::string_view given = " was given a disallowed flag override";
  if (!words.ends_with(given)) return words;
  words.resize(words.size() - given.size());
  return "--" + words + ": expected no value";
}

/// CLI11 says "--press: 1 required TAG missing" of an option whose value is missing.
std::string missingValue(std::string words) {
  constexpr std::string_view required = ": 1 required ";
  constexpr std::string_view missing = " missing";
  const std::size_t at = words.find(required);
  if (at == std::string::npos || !words.ends_with(missing)) return words;
  words.erase(words.size() - missing.size());
  return words.replace(at, required.size(), ": expected ");
}

/// Says what is wrong with the arguments of a command.
std::string wrongArguments(const CLI::ParseError& error, const CLI::App& command) {
  // An argument that is not understood comes first: it may cause the other errors.
  if (command.remaining_size(true) > 0) return unexpectedArgument(command);
  if (!dynamic_cast<const CLI::ArgumentMismatch*>(&error)) return error.what();
  return givenTwice(flagWithValue(missingValue(error.what())));
}

/// Says what is wrong with the command line, in one line.
std::string explain(const CLI::ParseError& error, const CLI::App& app) {
  const CLI::App& command = chosen(app);
  const bool isCommand = &command != &app;
  const std::string words = isCommand ? wrongArguments(error, command) : commandExpected(app);
  const std::string help = isCommand ? command.get_name() + " " : "";
  return words + "; see " + app.get_name() + " " + help + "--help";
}

std::string whyNotPath(const std::string& argument) {
  return argument.empty() ? "expected a path, found an empty text" : "";
}

/// Calls a function and translates its error: CLI11 handles only its own.
template <class Function, class... Arguments>
auto translating(const Function& function, const Arguments&... arguments) {
  try {
    return function(arguments...);
  } catch (const UsageError& error) {
    throw CLI::ValidationError(error.what());
  }
}

void hand(const Command::Take& take, const std::string& value) { translating(take, value); }

}  // namespace

Command::Option& Command::Option::valueName(const std::string& name) {
  option_->type_name(name);
  return *this;
}

Command::Option& Command::Option::showDefault() {
  option_->capture_default_str();
  return *this;
}

Command::Option& Command::Option::notRequired() {
  option_->required(false);
  return *this;
}

Command::Option& Command::Option::path() {
  option_->check(whyNotPath);
  return *this;
}

Command::Option& Command::Option::excludes(Option& other) {
  option_->excludes(other.option_);
  other.option_->excludes(option_);
  return *this;
}

Command::Option& Command::Option::choices(const std::vector<std::string_view>& names) {
  hints_[option_].choices.assign(names.begin(), names.end());
  return *this;
}

Command::Option& Command::Option::file() {
  hints_[option_].isFile = true;
  return *this;
}

Command::Option& Command::Option::directory() {
  hints_[option_].isDirectory = true;
  return *this;
}

Command::Option& Command::Option::scriptKey() {
  hints_[option_].isScriptKey = true;
  return *this;
}

// Options pass their words on unconverted: CLI11's conversions are templates, which take longer to
// compile than the rest of this file.
namespace {

CLI::callback_t storeIn(std::string& value) {
  return [&value](const CLI::results_t& words) {
    value = words.front();
    return true;
  };
}

CLI::callback_t eachTo(Command::Take take) {
  return [take = std::move(take)](const CLI::results_t& words) {
    for (const std::string& word : words) hand(take, word);
    return true;
  };
}

constexpr int anyNumber = CLI::detail::expected_max_vector_size;

}  // namespace

Command::Option Command::argument(const std::string& name, std::string& value,
                                  const std::string& help) {
  return {app_.add_option(name, storeIn(value), help)->required()->type_name(""), hints_};
}

Command::Option Command::arguments(const std::string& name, std::vector<std::string>& values,
                                   const std::string& help) {
  const auto store = [&values](const CLI::results_t& words) {
    values = words;
    return true;
  };
  return {app_.add_option(name, store, help)->required()->expected(anyNumber)->type_name("TEXT"),
          hints_};
}

Command::Option Command::option(const std::string& name, std::string& value,
                                const std::string& help) {
  return {app_.add_option(name, storeIn(value), help, false, [&value] { return value; })
              ->type_name("TEXT"),
          hints_};
}

Command::Option Command::option(const std::string& name, std::optional<std::string>& value,
                                const std::string& help) {
  return taken(
      name, [&value](const std::string& word) { value = word; }, help);
}

Command::Option Command::flag(const std::string& name, bool& value, const std::string& help) {
  const auto set = [&value] { value = true; };
  return {app_.add_flag_callback(name, set, help), hints_};
}

Command::Option Command::taken(const std::string& name, Take take, const std::string& help) {
  return {app_.add_option(name, eachTo(std::move(take)), help)->type_name("TEXT"), hints_};
}

Command::Option Command::repeated(const std::string& name, Take take, const std::string& help) {
  return {
      app_.add_option(name, eachTo(std::move(take)), help)->type_name("TEXT")->trigger_on_parse(),
      hints_};
}

Command::Option Command::repeatedList(const std::string& name, Take take, const std::string& help) {
  return {app_.add_option(name, eachTo(std::move(take)), help)
              ->type_name("TEXT")
              ->expected(anyNumber)
              ->trigger_on_parse(),
          hints_};
}

void Command::action(std::function<int()> run) {
  app_.callback([run = std::move(run), &status = status_] { status = translating(run); });
}

void Command::task(std::function<void()> run) {
  action([run = std::move(run)] {
    run();
    return static_cast<int>(ExitStatus::fine);
  });
}

namespace {

/// Returns the help up to its first detail.
std::string firstWords(const std::string& help) {
  const std::string words = help.substr(0, help.find_first_of(":;("));
  return words.substr(0, words.find_last_not_of(' ') + 1);
}

CommandOutline outlineOf(const CLI::App& app, ValueHints& hints) {
  CommandOutline outline{app.get_name(), app.get_description(), {}, {}};
  for (const CLI::Option* option : app.get_options()) {
    if (!option->get_positional()) {
      outline.options.push_back(
          {option->get_name(false, false), firstWords(option->get_description()),
           option->get_items_expected_max() > 0, option->get_trigger_on_parse(), hints[option]});
    } else {
      outline.arguments = hints[option];
    }
  }
  return outline;
}

}  // namespace

std::vector<CommandOutline> outlineOf(const std::vector<CommandEntry>& commands) {
  std::vector<CommandOutline> outlines;
  for (const CommandEntry& entry : commands) {
    CLI::App app(entry.summary, entry.name);
    int status = 0;
    ValueHints hints;
    Command command(app, status, hints);
    entry.describe(command);
    outlines.push_back(outlineOf(app, hints));
  }
  return outlines;
}

int runCommandLine(const ToolHelp& help, const std::vector<CommandEntry>& commands,
                   std::vector<std::string> arguments) {
  CLI::App app(help.summary, help.name);
  int status = static_cast<int>(ExitStatus::fine);
  app.set_version_flag("--version", help.name + " " + help.version);
  app.footer(help.exitStatuses);
  app.get_formatter()->label("SUBCOMMAND", "COMMAND");
  app.get_formatter()->label("Subcommands", "Commands");
  app.require_subcommand(1);
  app.option_defaults()
      ->disable_flag_override();  // otherwise "--list=3" would be accepted without an error
  ValueHints hints;
  for (const CommandEntry& entry : commands) {
    Command command(*app.add_subcommand(entry.name, entry.summary), status, hints);
    entry.describe(command);
  }
  try {
    // CLI11 expects the arguments in reverse order.
    std::reverse(arguments.begin(), arguments.end());
    app.parse(std::move(arguments));
    return status;
  } catch (const CLI::Success& success) {
    return app.exit(success);  // prints the help or the version
  } catch (const CLI::ParseError& error) {
    throw Failure(ExitStatus::badInput, explain(error, app));
  }
}

}  // namespace qz::tools
