// SPDX-License-Identifier: MIT
// The command line of the tool: declares what its commands take, and reads it. Only
// command_line.cpp includes CLI11, the library that reads it: its header takes seconds to compile.
#pragma once

#include <functional>
#include <map>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

namespace CLI {
class App;
class Option;
}  // namespace CLI

namespace qz::tools {

/// Thrown for a value that an option does not accept. The message says what was expected.
class UsageError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

/// What a shell can offer where the user types a value.
struct ValueHint {
  std::vector<std::string> choices;  ///< every value that is accepted; empty if they are not known
  bool isFile = false;               ///< the path of a file
  bool isDirectory = false;          ///< the path of a directory
  bool isScriptKey = false;          ///< a key of the script that is on the line
};

/// The hints of the options that have one.
using ValueHints = std::map<const CLI::Option*, ValueHint>;

/// Declares the arguments and options of one command. The variables passed by reference must
/// outlive the reading of the command line. They are set before the action runs; a variable whose
/// option the user leaves out keeps its value.
class Command {
 public:
  /// An option that was added; its functions refine it.
  class Option {
   public:
    Option(CLI::Option* option, ValueHints& hints) : option_(option), hints_(hints) {}
    /// Sets how the help names the option's value.
    Option& valueName(const std::string& name);
    /// Shows the variable's present value in the help, as the default.
    Option& showDefault();
    /// Lets the user leave a positional argument out.
    Option& notRequired();
    /// Refuses an empty text.
    Option& path();
    /// Lets the user give only one of the two.
    Option& excludes(Option& other);
    /// Names every value that is accepted, for shells that complete it. Checks nothing.
    Option& choices(const std::vector<std::string_view>& names);
    /// Lets shells complete the value as the path of a file.
    Option& file();
    /// Lets shells complete the value as the path of a directory.
    Option& directory();
    /// Lets shells complete the value as a key of the script that is on the line.
    Option& scriptKey();

   private:
    CLI::Option* option_;
    ValueHints& hints_;
  };

  Command(CLI::App& app, int& status, ValueHints& hints)
      : app_(app), status_(status), hints_(hints) {}

  /// Adds a required positional argument.
  Option argument(const std::string& name, std::string& value, const std::string& help);
  /// Adds a positional argument that takes one or more values.
  Option arguments(const std::string& name, std::vector<std::string>& values,
                   const std::string& help);
  Option option(const std::string& name, std::string& value, const std::string& help);
  Option option(const std::string& name, std::optional<std::string>& value,
                const std::string& help);
  Option flag(const std::string& name, bool& value, const std::string& help);

  /// Called with each value; may throw a UsageError.
  using Take = std::function<void(const std::string& value)>;
  /// Adds an option whose value is passed to `take` once the whole line is read.
  Option taken(const std::string& name, Take take, const std::string& help);
  /// Adds an option that can be given any number of times. `take` is called while the line is read,
  /// so that the calls of all such options come in the order of the line.
  Option repeated(const std::string& name, Take take, const std::string& help);
  /// The same for an option that takes all values up to the next option.
  Option repeatedList(const std::string& name, Take take, const std::string& help);

  /// Sets what runs once the line is read; `run` returns the exit status, or throws a Failure or a
  /// UsageError.
  void action(std::function<int()> run);
  /// The same for a command whose exit status is always 0: it does its work or throws.
  void task(std::function<void()> run);

 private:
  CLI::App& app_;
  int& status_;
  ValueHints& hints_;
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

/// Reads the arguments that follow the tool's name and runs the command that they name. Returns the
/// command's exit status, or 0 after printing the help or the version. Throws a Failure if the
/// arguments make no sense, and passes on what the command throws.
int runCommandLine(const ToolHelp& help, const std::vector<CommandEntry>& commands,
                   std::vector<std::string> arguments);

/// An option as shells complete it.
struct OptionOutline {
  std::string name;  ///< such as "--toolkit"
  std::string help;  ///< the first words of its help
  bool takesValue = false;
  bool isRepeated = false;  ///< can be given any number of times
  ValueHint value;
};

/// A command as shells complete it.
struct CommandOutline {
  std::string name;
  std::string summary;
  std::vector<OptionOutline> options;
  ValueHint arguments;  ///< of its positional arguments
};

/// Returns what the commands accept.
std::vector<CommandOutline> outlineOf(const std::vector<CommandEntry>& commands);

}  // namespace qz::tools
