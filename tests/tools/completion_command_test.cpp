// SPDX-License-Identifier: MIT
// The completion scripts, run by the shells themselves. zsh and fish are tested where they are
// installed.
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <set>
#include <sstream>
#include <string>
#include <vector>

#include "qz/property_list/formats.hpp"
#include "tool_run.hpp"
#include "tools/commands.hpp"
#include "tools/completion_scripts.hpp"
#include "tools/support/drivers.hpp"

namespace qz::tools {
namespace {

using Words = std::set<std::string>;

/// Runs a command of the system's shell and returns its output.
std::string outputOf(const std::string& command) {
  std::string output;
  FILE* const pipe = ::popen(command.c_str(), "r");
  for (int c = 0; (c = std::fgetc(pipe)) != EOF;) output += static_cast<char>(c);
  ::pclose(pipe);
  return output;
}

bool isInstalled(const std::string& shell) { return !outputOf("command -v " + shell).empty(); }

Words linesOf(const std::string& text) {
  Words lines;
  std::istringstream stream(text);
  for (std::string line; std::getline(stream, line);) {
    if (!line.empty()) lines.insert(line.substr(0, line.find('\t')));  // fish appends the help
  }
  return lines;
}

/// A directory with a file, a directory with a script, and the completion script of a shell, which
/// finds the tool.
class CompletionPlace {
 public:
  explicit CompletionPlace(const std::string& shell) {
    std::string name = std::filesystem::temp_directory_path() / "qz-completion-XXXXXX";
    path_ = ::mkdtemp(name.data());
    std::filesystem::create_directory(path_ / "dir");
    std::ofstream(path_ / "data.plist") << "{}";
    std::ofstream(path_ / "dir" / "in tro.plist")
        << "{ 12 = (); 9 = (); 100 = (); \"$(id)\" = (); }";
    std::ofstream(path_ / "script") << run(completionCommand, {"completion", shell}).out;
  }
  ~CompletionPlace() { std::filesystem::remove_all(path_); }
  CompletionPlace(const CompletionPlace&) = delete;
  CompletionPlace& operator=(const CompletionPlace&) = delete;

  /// Returns the output of the program, which the named shell runs in the directory.
  std::string outputOf(const std::string& shell, const std::string& program) const {
    std::ofstream(path_ / "program") << program;
    return tools::outputOf("cd '" + path_.string() +
                           "' && PATH='" QZ_TOOL_DIRECTORY "':$PATH timeout 60 " + shell +
                           " program 2>&1");
  }

 private:
  std::filesystem::path path_;
};

/// Completes the last word of the line, whose words bash would divide in this way.
Words bashCompletes(const CompletionPlace& place, const std::vector<std::string>& words) {
  std::string program = "source ./script\nCOMP_WORDS=(qz-walkthrough";
  for (const std::string& word : words) program += " '" + word + "'";
  program += ")\nCOMP_CWORD=" + std::to_string(words.size()) +
             "\n_qz_walkthrough\nprintf '%s\\n' \"${COMPREPLY[@]}\"\n";
  return linesOf(place.outputOf("bash", program));
}

Words setOf(const std::vector<std::string_view>& words) { return {words.begin(), words.end()}; }

Words writableFormatNames() {
  Words names;
  for (const toolkit::FormatRow& row : toolkit::formats()) {
    if (row.write) names.emplace(row.name);
  }
  return names;
}

Words commandsWith(std::string_view beginning) {
  Words names;
  for (const CommandEntry& command : allCommands()) {
    if (std::string_view(command.name).starts_with(beginning)) names.emplace(command.name);
  }
  return names;
}

TEST(Completion, BashCompletesCommandsOptionsAndValues) {
  const CompletionPlace place("bash");
  const Words files = {"data.plist", "dir"};
  const struct {
    std::vector<std::string> words;
    Words expected;
  } cases[] = {
      {{"pl"}, {"play"}},
      {{"co"}, commandsWith("co")},
      {{"--v"}, {"--version"}},
      {{"play", "--s"}, {"--sheet", "--screenshots", "--start"}},
      {{"play", "--toolkit", ""}, setOf(driverNames())},
      {{"test", "--toolkit", "mem"}, {"memory"}},
      {{"test", "--toolkit", "="}, setOf(driverNames())},
      {{"test", "--toolkit", "=", "mem"}, {"memory"}},
      {{"convert", "a", "b", "--format", ""}, writableFormatNames()},
      {{"completion", ""}, {"bash", "zsh", "fish"}},
      {{"play", "d"}, files},
      {{"play", "--window", "d"}, files},
      {{"play", "--resources", "d"}, {"dir"}},
      {{"play", "--press", ""}, {}},
      {{"play", "dir/in\\ tro.plist", "--press", ""}, {"9", "12", "100", "$(id)"}},
      {{"play", "--window", "data.plist", "dir/in\\ tro.plist", "--start", "1"}, {"12", "100"}},
      {{"check", "dir/in\\ tro.plist", "--start", "=", "9"}, {"9"}},
      {{"dump", "--canonical", "da"}, {"data.plist"}},
      {{"unknown", ""}, {}},
  };
  for (const auto& test : cases) {
    EXPECT_EQ(bashCompletes(place, test.words), test.expected)
        << test.words.front() << " … " << test.words.back();
  }
}

TEST(Completion, BashKnowsEveryCommandAndEveryOption) {
  const CompletionPlace place("bash");
  Words names = {"--help", "--version"};
  for (const CommandOutline& command : outlineOf(allCommands())) {
    names.insert(command.name);
    Words options;
    for (const OptionOutline& option : command.options) options.insert(option.name);
    EXPECT_EQ(bashCompletes(place, {command.name, "--"}), options) << command.name;
    EXPECT_TRUE(options.contains("--help")) << command.name;
  }
  EXPECT_EQ(bashCompletes(place, {""}), names);
}

/// Expects the script to name every command, and behind its name every option of it.
void expectAllNames(const std::string& script, const std::string& before, const std::string& behind,
                    const std::string& dash) {
  for (const CommandOutline& command : outlineOf(allCommands())) {
    const std::size_t name = script.find(before + command.name + behind);
    ASSERT_NE(name, std::string::npos) << command.name;
    for (const OptionOutline& option : command.options) {
      EXPECT_NE(script.find(dash + option.name.substr(2), name), std::string::npos)
          << command.name << " " << option.name;
    }
  }
}

// What these shells do with the scripts is tested below, where the shells are installed.
TEST(Completion, FishAndZshAreToldEveryCommandAndEveryOption) {
  const std::string fish = run(completionCommand, {"completion", "fish"}).out;
  expectAllNames(fish, "'__fish_seen_subcommand_from ", "'", "' -l ");
  for (const char* const part :
       {"completion' -a 'bash zsh fish'", "-l resources -x -a '(__fish_complete_directories)'",
        "-l window -r -F", "-l press -x -a '(__qz_walkthrough_keys)' -d"}) {
    EXPECT_NE(fish.find(part), std::string::npos) << part;
  }
  const std::string zsh = run(completionCommand, {"completion", "zsh"}).out;
  expectAllNames(zsh, "    ", ") _arguments", "--");
  for (const char* const part :
       {"completion) _arguments '--help[Print this help message and exit]' "
        "'*:argument:(bash zsh fish)' ;;",
        "'--resources=[The directory of the images]:value:_files -/'",
        "'--window=[The host'\\''s window, a property list of its controls or a "
        "form]:value:_files'"}) {
    EXPECT_NE(zsh.find(part), std::string::npos) << part;
  }
}

TEST(Completion, FishCompletesCommandsOptionsAndValues) {
  if (!isInstalled("fish")) GTEST_SKIP() << "fish is not installed";
  const CompletionPlace place("fish");
  const struct {
    std::string line;
    Words expected;
  } cases[] = {
      {"pl", {"play"}},
      {"co", commandsWith("co")},
      {"play --s", {"--sheet", "--screenshots", "--start"}},
      {"test --toolkit ", setOf(driverNames())},
      {"convert a b --format ", writableFormatNames()},
      {"completion ", {"bash", "zsh", "fish"}},
      {"play d", {"data.plist", "dir/"}},
      {"play --resources d", {"dir/"}},
      {"play --press ", {}},
      {"play --window data.plist dir/in\\ tro.plist --press 1", {"12", "100"}},
  };
  for (const auto& test : cases) {
    const std::string program = "source ./script\ncomplete -C 'qz-walkthrough " + test.line + "'\n";
    EXPECT_EQ(linesOf(place.outputOf("fish", program)), test.expected) << test.line;
  }
}

/// Types the line and the tabulator key in an interactive zsh, and returns what the line becomes.
std::string zshCompletes(const CompletionPlace& place, const std::string& line) {
  const std::string program = R"(zmodload zsh/zpty
zpty shell 'PS1= zsh -f -i 2>/dev/null'
zpty -w shell 'autoload -U compinit; compinit -u -D; source ./script; stty -echo'
zpty -w shell 'show() { print -r -- "[[$BUFFER]]"; BUFFER=; zle accept-line }; zle -N show'
zpty -w shell 'bindkey "^X" show; print -r -- re""ady'
zpty -r -m shell out '*ready*'
zpty -w -n shell "qz-walkthrough )" +
                              line + R"("$'\t\x18'
zpty -r -m shell out '*\]\]*'
print -r -- "$out"
)";
  const std::string output = place.outputOf("zsh", program);
  const std::size_t from = output.rfind("[[qz-walkthrough ");
  return from == std::string::npos ? output
                                   : output.substr(from + 17, output.find("]]") - from - 17);
}

TEST(Completion, ZshCompletesCommandsOptionsAndValues) {
  if (!isInstalled("zsh")) GTEST_SKIP() << "zsh is not installed";
  const CompletionPlace place("zsh");
  const struct {
    std::string line;
    std::string completed;
  } cases[] = {
      {"pl", "play "},
      {"play --she", "play --sheet "},
      {"test --toolkit mem", "test --toolkit memory "},
      {"convert --format x", "convert --format xml "},
      {"completion f", "completion fish "},
      {"dump da", "dump data.plist "},
      {"play --resources d", "play --resources dir/"},
      {"play --window data.plist dir/in\\ tro.plist --start 10",
       "play --window data.plist dir/in\\ tro.plist --start 100 "},
  };
  for (const auto& test : cases) {
    EXPECT_EQ(zshCompletes(place, test.line), test.completed) << test.line;
  }
}

TEST(Completion, RefusesAnUnknownShell) {
  const Result result = run(completionCommand, {"completion", "bsh"});
  EXPECT_EQ(result.status, 2);
  EXPECT_EQ(result.out, "");
  EXPECT_EQ(result.err,
            "qz-walkthrough: expected a shell, bash, zsh or fish, found “bsh”; did you mean "
            "\"bash\"?\n");
}

}  // namespace
}  // namespace qz::tools
