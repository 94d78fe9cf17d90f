// SPDX-License-Identifier: MIT
// The command line of the tool: what its commands take, and reading it. The library that does the
// reading is known to command_line.cpp only; its header takes seconds to compile.
#pragma once

#include <functional>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

namespace CLI {
class App;
class Option;
}  // namespace CLI

namespace tools {

/// Thrown for a value that an option cannot take. The message says what was expected.
class UsageError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

/// What one command takes. The values that are handed over by reference are set before the action
/// runs, and outlive the command line's reading; what the user leaves out stays as it is.
class Command {
 public:
  /// An option that was added, for what else is to be said about it.
  class Option {
   public:
    explicit Option(CLI::Option* option) : option_(option) {}
    /// How the help names the option's value.
    Option& valueName(const std::string& name);
    /// The help says what holds when the user leaves the option out: the value as it is now.
    Option& showDefault();
    /// An empty text is refused.
    Option& path();
    /// The user can give only one of the two.
    Option& excludes(Option& other);

   private:
    CLI::Option* option_;
  };

  explicit Command(CLI::App& app, int& status) : app_(app), status_(status) {}

  /// An argument without a name, which must be given.
  Option argument(const std::string& name, std::string& value, const std::string& help);
  /// One argument or more without a name.
  Option arguments(const std::string& name, std::vector<std::string>& values,
                   const std::string& help);
  Option option(const std::string& name, std::string& value, const std::string& help);
  Option option(const std::string& name, std::optional<std::string>& value,
                const std::string& help);
  Option flag(const std::string& name, bool& value, const std::string& help);

  /// What is done with a value or with several; may throw a UsageError.
  using Take = std::function<void(const std::string& value)>;
  /// An option whose value is handed to `take` once the whole line is read.
  Option taken(const std::string& name, Take take, const std::string& help);
  /// An option that can be given again and again. `take` is called while the line is read, so that
  /// calls come in the order of the line, across options.
  Option repeated(const std::string& name, Take take, const std::string& help);
  /// The same for an option that takes all values up to the next option.
  Option repeatedList(const std::string& name, Take take, const std::string& help);

  /// Runs once the line is read. Gives the tool's exit status, or throws a Failure.
  void action(std::function<int()> run);

 private:
  CLI::App& app_;
  int& status_;
};

/// A command as the tool lists it.
struct CommandEntry {
  const char* name;
  const char* summary;
  void (*describe)(Command& command);
};

/// The tool's own part of its help.
struct ToolHelp {
  std::string name;
  std::string summary;
  std::string version;
  std::string exitStatuses;
};

/// Reads the arguments behind the tool's name and runs the command that they name. Gives its exit
/// status; 0 where help or the version was asked for, which are printed. Throws a Failure where the
/// arguments make no sense, and hands on what the command throws.
int runCommandLine(const ToolHelp& help, const std::vector<CommandEntry>& commands,
                   std::vector<std::string> arguments);

}  // namespace tools
