// SPDX-License-Identifier: MIT
// The command line of `qz-walkthrough check`: what it refuses, its exit statuses, and its files.
#include <gtest/gtest.h>
#include <signal.h>  // NOLINT(modernize-deprecated-headers): the standard one has no kill
#include <sys/inotify.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

#include <filesystem>
#include <string>
#include <thread>
#include <vector>

#include "play_files.hpp"
#include "tool_run.hpp"
#include "tools/check/finding.hpp"
#include "tools/commands.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools {
namespace {

constexpr const char* closeWindow =
    "( { class = NSTextField; tag = 5; frame = (10, 50, 190, 30); title = \"\"; },"
    "  { class = NSButton; tag = 2; frame = (10, 10, 90, 30); title = Close; } )";
constexpr const char* cleanScript = "{ 1 = (IDLE_LOOP); 2 = (TERMINATE_PARSER); }";
constexpr const char* noteScript =  // left-behind
    "{ 1 = ((SET_TEXT_FOR_OBJECT_ID, Welcome, 5)); 2 = (TERMINATE_PARSER); }";
constexpr const char* warningScript =  // never-runs
    "{ 1 = (IDLE_LOOP); 2 = (TERMINATE_PARSER); 7 = (IDLE_LOOP); }";
constexpr const char* errorScript =  // unknown-command
    "{ 1 = (IDLE_LOP); 2 = (TERMINATE_PARSER); }";

class CheckCommand : public testing::Test {
 protected:
  void SetUp() override {
    directory_.write("window.plist", closeWindow);
    directory_.write("clean.plist", cleanScript);
    directory_.write("note.plist", noteScript);
    directory_.write("warning.plist", warningScript);
    directory_.write("error.plist", errorScript);
  }

  static Result check(std::vector<std::string> arguments) {
    arguments.insert(arguments.begin(), "check");
    return run(checkCommand, arguments);
  }
  /// Checks in the window.
  static Result checkInWindow(std::vector<std::string> arguments) {
    arguments.insert(arguments.end(), {"--window", "window.plist"});
    return check(std::move(arguments));
  }
  static bool contains(const std::string& text, const std::string& part) {
    return text.find(part) != std::string::npos;
  }

  play::WorkingDirectory directory_;
};

TEST_F(CheckCommand, RefusesWhatItDoesNotUnderstand) {
  const struct {
    std::vector<std::string> arguments;
    const char* words;
  } cases[] = {
      {{}, "SCRIPT"},
      {{"clean.plist", "--windw", "window.plist"}, "unknown option --windw; did you mean"},
      {{"clean.plist", "--fail-on", "fatal"}, "--fail-on: expected error, warning or note, found"},
      {{"clean.plist", "--format", "html"},
       "--format: expected text, json, sarif, junit or github"},
      {{"clean.plist", "--limit", "0"}, "--limit: expected a whole number above 0, found “0”"},
      {{"clean.plist", "--limit", "-1"}, "--limit: expected a whole number above 0, found “-1”"},
      {{"clean.plist", "--limit", "many"}, "--limit: expected a whole number above 0"},
      {{"clean.plist", "--memory", "0"}, "--memory: expected a whole number above 0"},
      {{"clean.plist", "--threads", "0"}, "--threads: expected a whole number above 0"},
      {{"clean.plist", "--seconds", "0"}, "--seconds: expected a number above 0, found “0”"},
      {{"clean.plist", "--seconds", "nan"}, "--seconds: expected a number above 0"},
      {{"clean.plist", "--words-per-minute", "-5"}, "--words-per-minute: expected a number above"},
      {{"clean.plist", "--limit", "5", "--limit", "6"}, "--limit: expected once, found 2 times"},
      {{"clean.plist", "--format", "json", "--format", "json"}, "--format: expected once"},
      {{"clean.plist", "--toolkit", "tcl"}, "tcl"},
      {{"clean.plist", "--baseline"}, "--baseline: expected FILE"},
      {{"clean.plist", "--update-baseline"}, "--update-baseline requires --baseline FILE"},
      {{"clean.plist", "--window", "window.plist", "--assets", "assets.plist"}, "--assets"},
      {{"clean.plist", "--window", "window.plist", "--stand-in"}, "--stand-in"},
      {{"clean.plist", "--assets", "assets.plist", "--stand-in"}, "--stand-in"},
      {{"clean.plist", "--allow", "never-run"}, "did you mean \"never-runs\"?"},
      {{"clean.plist", "--start", "9"}, "no list under the start key “9”"},
  };
  for (const auto& test : cases) {
    const Result result = check(test.arguments);
    EXPECT_EQ(result.status, 2) << test.words;
    EXPECT_TRUE(contains(result.err, test.words)) << result.err;
    EXPECT_TRUE(result.err.starts_with("qz-walkthrough: ")) << result.err;
    EXPECT_EQ(result.err.find('\n'), result.err.size() - 1) << "one line: " << result.err;
    EXPECT_EQ(result.out, "") << test.words;
  }
}

TEST_F(CheckCommand, RefusesFilesThatAreNotWhatTheyShouldBe) {
  directory_.write("broken.plist", "{ 1 = (");
  directory_.write("list.plist", "(1, 2)");
  std::filesystem::create_directory("folder");
  const struct {
    std::vector<std::string> arguments;
    const char* words;
  } cases[] = {
      {{"none.plist"}, "none.plist: no such file; expected a script"},
      {{"folder"}, "folder: a directory; expected a script"},
      {{"broken.plist"}, "broken.plist:1:"},
      {{"list.plist"}, "list.plist:1:1: expected a script"},
      {{"clean.plist", "--window", "none.plist"}, "none.plist: no such file"},
      {{"clean.plist", "--window", "clean.plist"},
       "clean.plist:1:1: expected an array of controls"},
      {{"clean.plist", "--assets", "none.plist"}, "none.plist: no such file"},
      {{"clean.plist", "--expect", "none"}, "none: cannot be read"},
      {{"clean.plist", "--baseline", "none"}, "none: cannot be read"},
      {{"clean.plist", "--witness", "clean.plist"}, "clean.plist: expected a directory"},
  };
  for (const auto& test : cases) {
    const Result result = check(test.arguments);
    EXPECT_EQ(result.status, 2) << test.words;
    EXPECT_TRUE(contains(result.err, test.words)) << test.words << "\n" << result.err;
  }
}

TEST_F(CheckCommand, RefusesAFileThatNobodyCanRead) {
  const int made = ::socket(AF_UNIX, SOCK_STREAM, 0);
  sockaddr_un address{};
  address.sun_family = AF_UNIX;
  std::string("socket.plist").copy(address.sun_path, sizeof address.sun_path - 1);
  ASSERT_EQ(::bind(made, reinterpret_cast<const sockaddr*>(&address), sizeof address), 0);
  ::close(made);
  const Result result = check({"socket.plist"});
  EXPECT_EQ(result.status, 2);
  EXPECT_TRUE(contains(result.err, "socket.plist: cannot be read")) << result.err;
}

TEST_F(CheckCommand, EndsWithTheStatusOfTheWorstFinding) {
  const struct {
    const char* script;
    const char* failOn;
    int status;
  } cases[] = {
      {"clean.plist", "note", 0},   {"note.plist", "note", 1},       {"note.plist", "warning", 0},
      {"warning.plist", "note", 1}, {"warning.plist", "warning", 1}, {"warning.plist", "error", 0},
      {"error.plist", "error", 1},  {"error.plist", "warning", 1},
  };
  for (const auto& test : cases) {
    const Result result = checkInWindow({test.script, "--fail-on", test.failOn});
    EXPECT_EQ(result.status, test.status) << test.script << " " << test.failOn << "\n"
                                          << result.out << result.err;
  }
}

TEST_F(CheckCommand, FailsOnWarningsIfNotTold) {
  EXPECT_EQ(checkInWindow({"note.plist"}).status, 0);
  EXPECT_EQ(checkInWindow({"warning.plist"}).status, 1);
}

TEST_F(CheckCommand, EndsWithAStatusOfItsOwnIfNotEverythingIsExplored) {
  EXPECT_EQ(checkInWindow({"clean.plist", "--limit", "1"}).status, 3);
  EXPECT_EQ(checkInWindow({"error.plist", "--limit", "1"}).status, 1) << "a finding comes first";
}

TEST_F(CheckCommand, ReportsTheOtherScriptsIfOneCannotBeRead) {
  const Result result = checkInWindow({"none.plist", "warning.plist"});
  EXPECT_EQ(result.status, 2);
  EXPECT_TRUE(contains(result.out, "warning.plist: explored ")) << result.out;
  EXPECT_EQ(result.err, "qz-walkthrough: none.plist: no such file; expected a script\n");
}

TEST_F(CheckCommand, NamesInEveryReportTheScriptsThatItCouldNotCheck) {
  const std::pair<const char*, const char*> formats[] = {
      {"text", "\n1 of 2 scripts could not be checked: none.plist\n"},
      {"json", "\"script\": \"none.plist\""},
      {"sarif", "\"uri\": \"none.plist\""},
      {"junit", "<testsuite name=\"none.plist\" tests=\"1\" failures=\"0\" errors=\"1\">"},
      {"github", "::error file=none.plist,title=not checked::none.plist: no such file"}};
  for (const auto& [format, words] : formats) {
    const Result result = checkInWindow({"none.plist", "note.plist", "--format", format});
    EXPECT_EQ(result.status, 2) << format;
    EXPECT_TRUE(contains(result.out, words)) << result.out;
    EXPECT_EQ(result.err, "qz-walkthrough: none.plist: no such file; expected a script\n");
  }
}

TEST_F(CheckCommand, SaysInAReportForProgramsThatTheOnlyScriptCouldNotBeChecked) {
  for (const char* const format : {"json", "sarif", "junit", "github"}) {
    const Result result = check({"none.plist", "--format", format});
    EXPECT_TRUE(contains(result.out, "none.plist: no such file; expected a script")) << result.out;
  }
}

TEST_F(CheckCommand, DoesNotDisturbTheTerminalWithThePathOfAScript) {
  const Result result = check({"\x1b[2J.plist", "clean.plist"});
  EXPECT_EQ(result.err, "qz-walkthrough: \\u{1b}[2J.plist: no such file; expected a script\n");
  EXPECT_EQ(result.out.find('\x1b'), std::string::npos) << result.out;
}

TEST_F(CheckCommand, RefusesAStartInAScriptWithoutLists) {
  directory_.write("empty.plist", "{}");
  const Result result = check({"empty.plist", "--start", "1"});
  EXPECT_EQ(result.status, 2);
  EXPECT_EQ(result.err,
            "qz-walkthrough: empty.plist:1:1: no list under the start key “1”; the script has no "
            "lists\n");
}

TEST_F(CheckCommand, GivesTheSameBytesWithAnyNumberOfThreads) {
  const std::vector<std::string> scripts{"warning.plist", "clean.plist", "error.plist",
                                         "note.plist"};
  const auto with = [&](const char* threads) {
    auto arguments = scripts;
    arguments.insert(arguments.end(), {"--threads", threads});
    return checkInWindow(arguments).out;
  };
  const std::string one = with("1");
  EXPECT_EQ(with("4"), one);
  EXPECT_EQ(with("3"), one);
  std::size_t at = 0;
  for (const std::string& script : scripts) {
    const std::size_t found = one.find("\n" + script + ": explored ", at);
    EXPECT_NE(found, std::string::npos) << script << " comes in the order of the command line\n"
                                        << one;
    at = found;
  }
}

TEST_F(CheckCommand, TakesEveryNumberOfThreadsAndMegabytes) {
  for (const char* const number : {"4294967296", "4294967297", "17592186044416"}) {
    EXPECT_EQ(checkInWindow({"clean.plist", "--threads", number}).status, 0) << number;
    EXPECT_EQ(checkInWindow({"clean.plist", "--memory", number}).status, 0) << number;
  }
}

TEST_F(CheckCommand, ChecksAScriptTwiceThatIsGivenTwice) {
  const Result result = checkInWindow({"clean.plist", "clean.plist"});
  EXPECT_EQ(result.status, 0);
  const std::string half = result.out.substr(0, result.out.size() / 2);
  EXPECT_EQ(result.out, half + half);
  EXPECT_TRUE(half.starts_with("clean.plist: explored ")) << half;
}

TEST_F(CheckCommand, SaysNothingAboutControlsWithoutAWindow) {
  directory_.write("stray.plist", "{ 1 = ((SHOW_OBJECT_WITH_ID, 22)); 2 = (TERMINATE_PARSER); }");
  EXPECT_TRUE(contains(checkInWindow({"stray.plist"}).out, "[no-target]"));
  for (const auto& arguments :
       {std::vector<std::string>{"stray.plist"}, {"stray.plist", "--stand-in"}}) {
    const Result result = check(arguments);
    EXPECT_EQ(result.status, 0) << result.out;
    EXPECT_TRUE(contains(result.out, "--window")) << "the summary says so: " << result.out;
  }
}

TEST_F(CheckCommand, StartsWithEachListThatIsNamed) {
  const Result one = checkInWindow({"warning.plist", "--start", "7"});
  EXPECT_TRUE(contains(one.out, "[never-runs]")) << "list 1: " << one.out;
  const Result both = checkInWindow({"warning.plist", "--start", "7", "--start", "1"});
  EXPECT_EQ(both.status, 0) << both.out;
}

TEST_F(CheckCommand, TakesBackWhatIsAllowed) {
  EXPECT_EQ(checkInWindow({"warning.plist", "--allow", "never-runs"}).status, 0);
  EXPECT_EQ(checkInWindow({"warning.plist", "--allow", "never-runs=7"}).status, 0);
  EXPECT_EQ(checkInWindow({"warning.plist", "--allow", "never-runs=8"}).status, 1);
  EXPECT_EQ(checkInWindow({"warning.plist", "--allow", "trap", "--allow", "never-runs"}).status, 0);
}

TEST_F(CheckCommand, SharesAllowancesInADirectory) {
  directory_.write("check.allow", "never-runs\ntrap\n");
  const Result result = checkInWindow({"clean.plist", "warning.plist"});
  EXPECT_EQ(result.status, 1);
  const std::string code = "[unneeded-allowance]";
  const auto first = result.out.find(code);
  ASSERT_NE(first, std::string::npos) << "none of the scripts needs trap: " << result.out;
  EXPECT_EQ(result.out.find(code, first + 1), std::string::npos)
      << "one of them needs never-runs, and trap is reported once: " << result.out;
  EXPECT_TRUE(contains(result.out, "check.allow:2: warning: ")) << result.out;
}

TEST_F(CheckCommand, SharesAllowancesHoweverTheDirectoryIsNamed) {
  directory_.write("check.allow", "never-runs\n");
  const Result result = checkInWindow({"clean.plist", "./warning.plist"});
  EXPECT_EQ(result.status, 0) << result.out;
}

TEST_F(CheckCommand, FailsOnlyOnWhatTheBaselineDoesNotHave) {
  const Result first = checkInWindow({"warning.plist", "--baseline", "known", "--update-baseline"});
  EXPECT_EQ(first.status, 0) << first.out << first.err;
  const Result again = checkInWindow({"warning.plist", "--baseline", "known"});
  EXPECT_EQ(again.status, 0);
  EXPECT_TRUE(contains(again.out, "taken back 1 finding")) << again.out;
  directory_.write("warning.plist",
                   "{ 1 = (IDLE_LOOP); 2 = (TERMINATE_PARSER);\n 7 = (IDLE_LOOP); 8 = (); }");
  const Result later = checkInWindow({"warning.plist", "--baseline", "known"});
  EXPECT_EQ(later.status, 1);
  EXPECT_TRUE(contains(later.out, "list “8”")) << later.out;
  EXPECT_FALSE(contains(later.out, "list “7”")) << later.out;
}

TEST_F(CheckCommand, ForgetsInTheBaselineWhatIsMended) {
  checkInWindow({"warning.plist", "--baseline", "known", "--update-baseline"});
  directory_.write("warning.plist", cleanScript);
  EXPECT_EQ(checkInWindow({"warning.plist", "--baseline", "known", "--update-baseline"}).status, 0);
  EXPECT_FALSE(contains(*wholeFile("known"), "never-runs"));
}

TEST_F(CheckCommand, KeepsABaselineThatItCannotRead) {
  directory_.write("known", "something else");
  const Result result =
      checkInWindow({"warning.plist", "--baseline", "known", "--update-baseline"});
  EXPECT_EQ(result.status, 2);
  EXPECT_TRUE(contains(result.err, "known: expected a baseline")) << result.err;
  EXPECT_EQ(*wholeFile("known"), "something else");
}

/// Notes whether anybody opens a file.
class OpenWatch {
 public:
  explicit OpenWatch(const char* path) : descriptor_(::inotify_init1(IN_NONBLOCK | IN_CLOEXEC)) {
    EXPECT_GE(::inotify_add_watch(descriptor_, path, IN_OPEN), 0) << path;
  }
  ~OpenWatch() { ::close(descriptor_); }
  OpenWatch(const OpenWatch&) = delete;
  OpenWatch& operator=(const OpenWatch&) = delete;

  /// Whether the file was opened since the last call.
  bool hasSeenAny() const {
    alignas(inotify_event) char events[4096];
    return ::read(descriptor_, events, sizeof events) > 0;
  }

 private:
  int descriptor_;
};

TEST_F(CheckCommand, DoesNotBeginIfItCouldNotTakeBackOrWriteTheFindings) {
  directory_.write("broken", "{\"version\": 1, \"scripts\": {");
  const struct {
    std::vector<std::string> options;
    const char* words;
  } cases[] = {
      {{"--baseline", "none"}, "none: cannot be read; --update-baseline writes a baseline"},
      {{"--baseline", "broken"}, "broken: expected a baseline, as --update-baseline writes it"},
      {{"--baseline", "broken", "--update-baseline"}, "broken: expected a baseline"},
      {{"--baseline", "no/such", "--update-baseline"},
       "no/such: cannot be written; expected a path in a directory that is there"},
      {{"--witness", "broken"}, "broken: expected a directory"},
  };
  const OpenWatch script("warning.plist");
  for (const auto& test : cases) {
    auto arguments = test.options;
    arguments.insert(arguments.begin(), "warning.plist");
    const Result result = checkInWindow(arguments);
    EXPECT_EQ(result.status, 2) << test.words;
    EXPECT_TRUE(result.err.starts_with("qz-walkthrough: " + std::string(test.words))) << result.err;
    EXPECT_EQ(result.out, "") << test.words;
    EXPECT_FALSE(script.hasSeenAny()) << test.words;
  }
  checkInWindow({"warning.plist"});
  EXPECT_TRUE(script.hasSeenAny()) << "otherwise the watch sees nothing";
}

TEST_F(CheckCommand, WritesScenariosThatPass) {
  EXPECT_EQ(checkInWindow({"note.plist", "--witness", "found"}).status, 0);
  const Result result = run(testCommand, {"test", "found", "--toolkit", "memory"});
  EXPECT_EQ(result.out, "1 passed, 0 failed\n") << result.err;
}

TEST_F(CheckCommand, ExplainsACode) {
  const Result result = check({"--explain", "never-runs"});
  EXPECT_EQ(result.status, 0);
  EXPECT_TRUE(result.out.starts_with("never-runs\n\nSeverity: warning.\n")) << result.out;
}

TEST_F(CheckCommand, NamesTheCodesThatItCanExplain) {
  std::vector<std::string> names;
  for (const check::Code& code : check::codes()) names.emplace_back(code.name);
  const std::string known = enumerate(names) + "\n";
  const Result near = check({"--explain", "never-run"});
  EXPECT_EQ(near.status, 2);
  EXPECT_EQ(near.err,
            "qz-walkthrough: --explain: no finding has the code “never-run”; did you mean "
            "\"never-runs\"? Expected " +
                known);
  const Result far = check({"--explain", "xyz"});
  EXPECT_EQ(far.status, 2);
  EXPECT_EQ(far.err, "qz-walkthrough: --explain: no finding has the code “xyz”; expected " + known);
}

TEST_F(CheckCommand, WritesEveryFormat) {
  const std::pair<const char*, const char*> formats[] = {
      {"text", "warning.plist:1:"},
      {"json", "{\n  \"version\": 1,"},
      {"sarif", "{\n  \"$schema\": "},
      {"junit", "<?xml version=\"1.0\""},
      {"github", "::warning file=warning.plist,"}};
  for (const auto& [format, begin] : formats) {
    const Result result = checkInWindow({"warning.plist", "--format", format});
    EXPECT_EQ(result.status, 1) << format;
    EXPECT_TRUE(result.out.starts_with(begin)) << result.out;
    EXPECT_EQ(result.err, "") << format;
  }
}

/// Writes a script with far more places than a test could wait for: 40 switches.
void writeSwitches(const play::WorkingDirectory& directory) {
  std::string script = "{ 1 = (IDLE_LOP);\n";
  std::string window = "( ";
  for (int i = 0; i < 40; ++i) {
    const std::string off = std::to_string(1000 + i);
    const std::string on = std::to_string(2000 + i);
    script += off + " = ((SET_TAG_FOR_OBJECT_ID, " + on + ", " + off + ")); " + on +
              " = ((SET_TAG_FOR_OBJECT_ID, " + off + ", " + on + "));\n";
    window += std::string(i == 0 ? "" : ",") + "{ class = NSButton; tag = " + off +
              "; frame = (0, 0, 9, 9); }\n";
  }
  directory.write("switches.plist", script + "}");
  directory.write("window.plist", window + ")");
}

bool handlesInterruptions() {
  struct sigaction action = {};
  ::sigaction(SIGINT, nullptr, &action);
  return action.sa_handler != SIG_DFL;
}

TEST_F(CheckCommand, PrintsWhatIsKnownWhenTheUserInterruptsIt) {
  writeSwitches(directory_);
  const std::jthread user([] {
    while (!handlesInterruptions()) std::this_thread::yield();
    ::kill(::getpid(), SIGINT);
  });
  const Result result = checkInWindow({"switches.plist", "--threads", "2"});
  EXPECT_EQ(result.status, 1) << result.err;
  EXPECT_TRUE(contains(result.out, "[unknown-command]")) << result.out;
  EXPECT_TRUE(contains(result.out, "not everything: you stopped it")) << result.out;
  EXPECT_FALSE(handlesInterruptions()) << "a later Ctrl-C ends the program as usual";
}

TEST_F(CheckCommand, TakesNumbersThatAreNotWhole) {
  const Result result =
      checkInWindow({"clean.plist", "--seconds", "59.5", "--words-per-minute", "180.5"});
  EXPECT_EQ(result.status, 0) << result.err;
  EXPECT_TRUE(contains(result.out, "which are all")) << result.out;
}

TEST_F(CheckCommand, CountsExpectationsInEveryReport) {
  directory_.write("check.expect", "always can reach the end\nnever shown 5\n");
  const struct {
    const char* format;
    std::vector<const char*> parts;
  } cases[] = {
      {"text", {"  expectations: 1 hold, 1 fail\n", "check.expect:2"}},
      {"json", {"\"expectations\"", "\"hold\": 1", "\"fail\": 1", "\"open\": 0"}},
      {"sarif", {"\"uri\": \"check.expect\"", "\"startLine\": 2"}},
      {"github", {"::error file=check.expect,line=2,title=expectation::"}},
      {"junit", {"check.expect:2"}},
  };
  for (const auto& test : cases) {
    const Result result =
        checkInWindow({"clean.plist", "--expect", "check.expect", "--format", test.format});
    EXPECT_EQ(result.status, 1) << result.err;
    for (const char* const part : test.parts) {
      EXPECT_TRUE(contains(result.out, part)) << test.format << ": " << part << "\n" << result.out;
    }
  }
  const Result cut = checkInWindow(
      {"clean.plist", "--expect", "check.expect", "--limit", "1", "--format", "text"});
  EXPECT_TRUE(contains(cut.out, "not known, because not everything was explored")) << cut.out;
}

}  // namespace
}  // namespace qz::tools
