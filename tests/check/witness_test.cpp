// SPDX-License-Identifier: MIT
// The scenarios that a check writes for its findings: they pass on every toolkit of the build.

#include "tools/check/witness.hpp"

#include <cstdlib>

#include "tests/check/documented_examples.hpp"
#include "tools/scenario/scenario_files.hpp"

namespace qz::tools::check {
namespace {

/// Runs the scenarios of a directory, and returns how many pass. A failure is a failure of the
/// test.
std::size_t countPassing(const std::string& directory, const std::string& toolkit) {
  const scenario::Runner runner{
      [&] { return makeDriver(toolkit); }, toolkit,
      [](const std::string&, const scenario::Statement&, const std::string&) {}};
  const auto read = scenario::readScenarios({directory});
  for (const std::string& problem : read.problems) ADD_FAILURE() << problem;
  std::size_t passing = 0;
  for (const scenario::LoadedFile& file : read.files) {
    for (const scenario::Scenario& each : file.contents.scenarios) {
      const scenario::Report report = runner.run(file, each);
      if (report.verdict == scenario::Verdict::passed) ++passing;
      EXPECT_EQ(report.verdict, scenario::Verdict::passed)
          << toolkit << ": " << report.file << ":" << report.failedLine << ": " << report.problem
          << "\n"
          << report.statement << "\n"
          << *wholeFile(report.file);
    }
  }
  return passing;
}

/// Runs them on every toolkit. Those that show windows need no screen.
void expectThatAllPass(const std::string& directory, std::size_t count) {
  ::setenv("QT_QPA_PLATFORM", "offscreen", 0);
  for (const std::string_view toolkit : driverNames()) {
    // AppKit needs a display; the test appkit:witnesses has one.
    if (toolkit == "appkit" && !std::getenv("DISPLAY")) continue;
    EXPECT_EQ(countPassing(directory, std::string(toolkit)), count) << toolkit;
  }
}

std::size_t countPaths(const Verdict& verdict) {
  return static_cast<std::size_t>(
      std::count_if(verdict.findings.begin(), verdict.findings.end(),
                    [](const Finding& finding) { return !finding.path.empty(); }));
}

Verdict writeWitnesses(const CheckOptions& options) {
  const InputFile file("script.plist", "a script");
  Verdict verdict = checkScript(file, options, {});
  WitnessWriter writer("found");
  writer.write(verdict, file, options);
  EXPECT_EQ(writer.count(), countPaths(verdict));
  return verdict;
}

CheckOptions optionsFor(const std::string& window) {
  CheckOptions options;
  options.toolkit = testToolkit();
  options.stage.window = window;
  return options;
}

class WitnessOfExample : public testing::TestWithParam<Example> {};

TEST_P(WitnessOfExample, Passes) {
  const play::WorkingDirectory directory;
  writeExample(directory, GetParam(), GetParam().script);
  const Verdict verdict = writeWitnesses(optionsFor("window.plist"));
  expectThatAllPass("found", countPaths(verdict));
}

/// The mistakes that show only when the script is played over a window.
std::vector<Example> playedExamples() {
  auto all = documentedExamples();
  std::erase_if(all, [](const Example& example) {
    return example.window.empty() || example.code == "no-end" || example.code == "never-runs" ||
           example.code == "unneeded-allowance";
  });
  return all;
}

INSTANTIATE_TEST_SUITE_P(All, WitnessOfExample, testing::ValuesIn(playedExamples()), testNameOf);

// The window has every kind of control, and captions that a scenario must quote.
constexpr const char* manyControls = R"((
  { class = NSWindow; frame = (50, 60, 400, 300); title = "Hôst"; },
  { class = NSTextField; tag = 5; frame = (10, 50, 190, 30); title = "a \"b\" \\ # c\n\U00e9"; },
  { class = NSBox; tag = 6; frame = (10, 90, 190, 30); },
  { class = NSView; tag = 7; frame = (10, 130, 190, 30); hidden = YES; },
  { class = NSImageView; tag = 8; frame = (10, 170, 190, 30); image = "pic"; enabled = NO; },
  { class = "NSButton:toggle"; tag = 9; frame = (10.5, 210, 90, 30); title = ""; state = on; },
  { class = "NSButton:mixed"; tag = 10; frame = (110, 210, 90, 30); state = mixed; },
  { class = NSButton; tag = 3; frame = (10, 10, 90, 30); title = "Trap"; toolTip = "# \"t\""; },
  { class = NSButton; tag = 2; frame = (110, 10, 90, 30); title = "Close"; }
))";

constexpr const char* manyMistakes = R"({
  1 = ((SET_TEXT_FOR_OBJECT_ID, "Your files are safe", 5), (SET_TIMER_FOR_ID, 1, 20),
       (SET_TITLE_FOR_OBJECT_ID, x, 5), (SHOW_OBJECT_WITH_ID, 22), (DISABLE_OBJECT_WITH_ID, 6),
       (LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID, pic, 8));
  2 = (TERMINATE_PARSER);
  3 = (HIDE_OBJECT_WITH_ID, (HIDE_OBJECT_WITH_ID, 2), (HIDE_OBJECT_WITH_ID, 9));
  20 = ((SET_TEXT_FOR_OBJECT_ID, "", 5), (SET_TAG_FOR_OBJECT_ID, 61, 6));
})";

constexpr const char* endlessTimer = R"({
  1 = ((SET_TIMER_FOR_ID, 1, 20), (SET_TAG_FOR_OBJECT_ID, 61, 6));
  2 = (TERMINATE_PARSER);
  20 = ((SET_TIMER_FOR_ID, 2, 21));
  21 = ((PROCESS_COMMANDS_FOR_ID, 22));
  22 = ((PROCESS_COMMANDS_FOR_ID, 21));
})";

class Witness : public testing::Test {
 protected:
  void SetUp() override {
    directory_.write("window.plist", manyControls);
    directory_.write("pic.png",
                     *wholeFile(std::string(QZ_SOURCE_DIR) + "/examples/first-steps/disk.png"));
  }

  play::WorkingDirectory directory_;
};

TEST_F(Witness, KeepsTheWholeWindow) {
  directory_.write("script.plist", manyMistakes);
  const Verdict verdict = writeWitnesses(optionsFor("window.plist"));
  const auto found = codesOf(verdict);
  for (const char* const code :
       {"dead-end", "wrong-target", "no-target", "no-list", "timer-lost", "left-behind"}) {
    EXPECT_TRUE(found.contains(code)) << code << "\n" << messagesOf(verdict);
  }
  expectThatAllPass("found", countPaths(verdict));
}

TEST_F(Witness, StopsBeforeAnEndlessChain) {
  directory_.write("script.plist", endlessTimer);
  const Verdict verdict = writeWitnesses(optionsFor("window.plist"));
  const auto text = wholeFile("found/endless-chain-1.walk");
  ASSERT_TRUE(text);
  const auto wait = text->find("\nadvance 1.0\n");
  ASSERT_NE(wait, std::string::npos) << *text;
  EXPECT_NE(text->find("# The next move runs lists without end: wait 2 s", wait), std::string::npos)
      << *text;
  expectThatAllPass("found", countPaths(verdict));
}

TEST_F(Witness, MayLogBeforeAnEndlessChain) {
  directory_.write("script.plist",
                   "{ 1 = ((DISABLE_OBJECT_WITH_ID, 6)); 2 = (PROCESS_COMMANDS_FOR_ID); }");
  const Verdict verdict = writeWitnesses(optionsFor("window.plist"));
  EXPECT_TRUE(codesOf(verdict).contains("endless-chain")) << messagesOf(verdict);
  expectThatAllPass("found", countPaths(verdict));
}

TEST_F(Witness, PlaysInASheet) {
  directory_.write("script.plist", manyMistakes);
  CheckOptions options = optionsFor("window.plist");
  options.stage.sheet = true;
  expectThatAllPass("found", countPaths(writeWitnesses(options)));
}

TEST_F(Witness, PlaysInAWindowThatTheEngineBuilds) {
  directory_.write("script.plist",
                   "{ 1 = ((SHOW_OBJECT_WITH_ID, 22)); 2 = (TERMINATE_PARSER); 3 = (); }");
  directory_.write("assets.plist",
                   *wholeFile(std::string(QZ_SOURCE_DIR) + "/examples/built-window/assets.plist"));
  CheckOptions options;
  options.toolkit = testToolkit();
  options.stage.assets = "assets.plist";
  const Verdict verdict = writeWitnesses(options);
  EXPECT_TRUE(codesOf(verdict).contains("no-target")) << messagesOf(verdict);
  expectThatAllPass("found", countPaths(verdict));
}

TEST_F(Witness, NamesTheScriptFromTheDirectoryOfTheScenario) {
  directory_.write("script.plist", "{ 1 = ((SHOW_OBJECT_WITH_ID, 22)); 2 = (TERMINATE_PARSER); }");
  const auto options = optionsFor("window.plist");
  const InputFile file(directory_.path() + "/script.plist", "a script");
  WitnessWriter("deep/er").write(checkScript(file, options, {}), file, options);
  const auto text = wholeFile("deep/er/no-target-1.walk");
  ASSERT_TRUE(text);
  EXPECT_NE(text->find("copy \"script.plist\" \"../../script.plist\"\n"), std::string::npos)
      << *text;
}

TEST_F(Witness, NumbersTheFindingsOfEachCode) {
  directory_.write("script.plist",
                   "{ 1 = ((SHOW_OBJECT_WITH_ID, 22), (SHOW_OBJECT_WITH_ID, 23)); 3 = (); }");
  writeWitnesses(optionsFor("window.plist"));
  for (const char* const name : {"no-target-1", "no-target-2", "no-list-1"}) {
    EXPECT_TRUE(std::filesystem::exists(std::string("found/") + name + ".walk")) << name;
  }
  EXPECT_FALSE(std::filesystem::exists("found/no-target-3.walk"));
}

TEST_F(Witness, NeedsADirectory) {
  directory_.write("found", "a file");
  try {
    const WitnessWriter writer("found");
    FAIL() << "accepted";
  } catch (const Failure& failure) {
    EXPECT_EQ(failure.status(), ExitStatus::badInput);
    EXPECT_EQ(std::string(failure.what()).find("found: expected a directory"), 0U)
        << failure.what();
  }
}

}  // namespace
}  // namespace qz::tools::check
