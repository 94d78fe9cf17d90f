// The tool's shell.
#include "tools/shell.hpp"

#include <CLI/CLI.hpp>

#include <algorithm>
#include <exception>
#include <iostream>
#include <new>

#include "tools/suggestions.hpp"
#include "tools/text_layout.hpp"

namespace tools {
namespace {

constexpr const char* toolName = "qz-walkthrough";

constexpr const char* exitStatuses =
    "Exit status:\n"
    "  0  all went well\n"
    "  1  a test failed, a walk-through could not start or go on as asked, or a file could not be\n"
    "     dumped or converted\n"
    "  2  bad usage, or a file that is not what it should be\n"
    "  3  a script's lists ran each other without end";

int report(ExitStatus status, const std::string& message) {
  std::cout.flush();
  std::cerr << toolName << ": " << oneLine(message) << std::endl;
  return static_cast<int>(status);
}

/// The command that was given, or the tool itself when there is none.
const CLI::App& chosen(const CLI::App& app) {
  const auto commands = app.get_subcommands();
  return commands.empty() ? app : *commands.front();
}

/// Why no command was recognised: which there are, and what stands where one should.
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

/// CLI11 says "--start: At Most 1 required but received 2" of an option that stands twice.
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

/// What is wrong with the command line, in one line.
std::string explain(const CLI::ParseError& error, const CLI::App& app) {
  const CLI::App& command = chosen(app);
  std::string words = error.what();
  if (&command == &app) {
    words = commandExpected(app);
  } else if (command.remaining_size(true) > 0) {
    // Whatever else is wrong, what is not understood comes first: it may be the reason.
    words = unexpectedArgument(command);
  } else if (dynamic_cast<const CLI::ArgumentMismatch*>(&error)) {
    words = givenTwice(flagWithValue(missingValue(std::move(words))));
  }
  const std::string help = &command == &app ? "" : command.get_name() + " ";
  return words + "; see " + toolName + " " + help + "--help";
}

int parse(CLI::App& app, std::vector<std::string> arguments, const int& status) {
  try {
    // CLI11 takes the arguments from the back.
    std::reverse(arguments.begin(), arguments.end());
    app.parse(std::move(arguments));
    return status;
  } catch (const CLI::Success& success) {
    return app.exit(success);  // prints the help or the version
  } catch (const CLI::ParseError& error) {
    return report(ExitStatus::badInput, explain(error, app));
  } catch (const Failure& failure) {
    return report(failure.status(), failure.what());
  } catch (const std::bad_alloc&) {
    return report(ExitStatus::failed, "there is not enough memory for this");
  } catch (const std::exception& error) {
    return report(ExitStatus::failed, error.what());
  }
}

}  // namespace

std::string whyNotPath(const std::string& argument) {
  return argument.empty() ? "expected a path, found an empty text" : "";
}

int runTool(const std::vector<std::string>& arguments, const std::vector<AddCommand>& commands) {
  CLI::App app("Plays and tests scripted walk-throughs over the controls of a window.", toolName);
  int status = static_cast<int>(ExitStatus::fine);
  app.set_version_flag("--version", std::string(toolName) + " " + QZ_VERSION);
  app.footer(exitStatuses);
  app.get_formatter()->label("SUBCOMMAND", "COMMAND");
  app.get_formatter()->label("Subcommands", "Commands");
  app.require_subcommand(1);
  app.option_defaults()
      ->disable_flag_override();  // else "--list=3" would do, whatever it is to mean
  for (const AddCommand add : commands) add(app, status);

  const int result = parse(app, arguments, status);
  if (!std::cout.flush()) {
    return report(ExitStatus::failed, "standard output cannot be written");
  }
  return result;
}

}  // namespace tools
