// SPDX-License-Identifier: MIT
// The commands `build` and `texts`: what they write where, and what they say.
#include <gtest/gtest.h>

#include <csignal>
#include <filesystem>
#include <functional>
#include <sstream>

#include "tests/steps/source_folder.hpp"
#include "tool_run.hpp"
#include "tools/commands.hpp"
#include "tools/play/play.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools {
namespace {

namespace fs = std::filesystem;

constexpr const char* tour =
    "steps:\n  a: {text: Hello, next: {title: Go on, press: b}}\n"
    "  b: {text: Bye, next: {press: end}}\n";

class BuildCommand : public testing::Test {
 protected:
  void SetUp() override { folder_.writeSource(tour); }

  static Result build(std::vector<std::string> arguments) {
    arguments.insert(arguments.begin(), {"build", "tour.yaml"});
    return run(buildCommand, arguments);
  }
  static std::string contents(const std::string& path) {
    return wholeFile(path).value_or("absent");
  }

  steps::SourceFolder folder_;
};

TEST_F(BuildCommand, NamesTheScriptAfterTheSource) {
  EXPECT_EQ(build({}).status, 0);
  EXPECT_NE(contents("tour.plist").find("<string>Hello</string>"), std::string::npos);
  folder_.write("de.po", "msgid \"Hello\"\nmsgstr \"Hallo\"\n");
  EXPECT_EQ(build({"--language", "de"}).status, 0);
  EXPECT_NE(contents("tour_de.plist").find("<string>Hallo</string>"), std::string::npos);
  EXPECT_EQ(build({"-o", "out.bplist"}).status, 0);
  EXPECT_TRUE(contents("out.bplist").starts_with("bplist00"));
}

TEST_F(BuildCommand, SaysWhichTextsAreNotTranslated) {
  folder_.write("de.po",
                "#, fuzzy\nmsgid \"Hello\"\nmsgstr \"Hallihallo\"\n"
                "msgid \"Go on\"\nmsgstr \"Weiter\"\n");
  const Result result = build({"--language", "de"});
  EXPECT_EQ(result.status, 0);
  EXPECT_TRUE(result.err.starts_with(
      "tour.yaml:4:13: warning: “Hello” (a, text) has changed since it was translated in “de”; it "
      "stays as it is\n"
      "tour.yaml:5:13: warning: “Bye” (b, text) has no translation in “de”; it stays as it is\n"))
      << result.err;
  EXPECT_NE(contents("tour_de.plist").find("<string>Hello</string>"), std::string::npos);
}

TEST_F(BuildCommand, SaysWhatIsMissing) {
  EXPECT_EQ(build({"--language", "fr"}).err,
            "qz-walkthrough: fr.po: cannot be read; expected the translations to “fr” beside the "
            "source\n");
  EXPECT_EQ(run(buildCommand, {"build", "tour.plist"}).err,
            "qz-walkthrough: tour.plist: expected a walk-through in steps, a file whose name ends "
            "with .yaml or .yml\n");
  EXPECT_EQ(run(buildCommand, {"build", "other.yaml"}).err,
            "qz-walkthrough: other.yaml: cannot be read; expected a walk-through in steps\n");
}

TEST_F(BuildCommand, SaysAllMistakesAndWritesNothing) {
  folder_.writeSource("steps:\n  a: {nxt: 1}\n  b: {bck: 1}\n");
  const Result result = build({"--map", "map.json"});
  EXPECT_EQ(result.status, 2);
  EXPECT_EQ(result.err,
            "qz-walkthrough: tour.yaml:4:7: expected the name of a control or a word such as "
            "“show”, found “nxt”; did you mean \"next\"?\n"
            "qz-walkthrough: tour.yaml:5:7: expected the name of a control or a word such as "
            "“show”, found “bck”; did you mean \"back\"?\n");
  EXPECT_FALSE(fs::exists("tour.plist"));
  EXPECT_FALSE(fs::exists("map.json"));
}

/// Does one thing after the other, each when the next line is written to a stream.
class Reader : public std::stringbuf {
 public:
  Reader(std::ostream& stream, std::vector<std::function<void()>> acts)
      : stream_(stream), before_(stream.rdbuf(this)), acts_(std::move(acts)) {}
  ~Reader() override { stream_.rdbuf(before_); }
  Reader(const Reader&) = delete;
  Reader& operator=(const Reader&) = delete;

 protected:
  int sync() override {
    if (str().ends_with('\n') && next_ < acts_.size()) acts_[next_++]();
    return 0;
  }

 private:
  std::ostream& stream_;
  std::streambuf* before_;
  std::vector<std::function<void()>> acts_;
  std::size_t next_ = 0;
};

TEST_F(BuildCommand, BuildsAgainAfterEachChangeUntilInterrupted) {
  const auto misspell = [&] { folder_.writeSource("steps:\n  a: {nxt: 1}\n"); };
  const auto remove = [] { fs::remove("tour.yaml"); };
  const auto mend = [&] {
    EXPECT_NE(contents("tour.plist").find("<string>Hello</string>"), std::string::npos);
    folder_.writeSource("steps:\n  a: {text: Mended, next: {press: end}}\n");
  };
  const auto interrupt = [] { std::raise(SIGINT); };
  Reader out(std::cout, {misspell, interrupt});
  Reader err(std::cerr, {remove, mend});
  EXPECT_EQ(runTool({"build", "tour.yaml", "--watch"}, {buildCommand}), 0);
  EXPECT_EQ(out.str(), "tour.plist: written\ntour.plist: written\n");
  EXPECT_EQ(err.str(),
            "tour.yaml:4:7: expected the name of a control or a word such as “show”, found “nxt”; "
            "did you mean \"next\"?\n"
            "tour.yaml: cannot be read; expected a walk-through in steps\n");
  EXPECT_NE(contents("tour.plist").find("<string>Mended</string>"), std::string::npos);
}

TEST_F(BuildCommand, WritesAMap) {
  EXPECT_EQ(build({"--map", "map.json"}).status, 0);
  EXPECT_NE(contents("map.json").find("\"source\": \"tour.yaml\""), std::string::npos);
}

TEST_F(BuildCommand, TextsAreExtracted) {
  const Result result = run(textsCommand, {"texts", "extract", "tour.yaml"});
  EXPECT_EQ(result.status, 0) << result.err;
  const std::string text = contents("tour.pot");
  EXPECT_NE(text.find("\n#. step a: title of next\n#: tour.yaml:4\nmsgid \"Go on\"\nmsgstr \"\"\n"),
            std::string::npos)
      << text;
  EXPECT_EQ(run(textsCommand, {"texts", "extract", "tour.yaml", "-o", "a.pot"}).status, 0);
  EXPECT_EQ(contents("a.pot"), text);
  EXPECT_EQ(run(textsCommand, {"texts", "merge", "tour.yaml"}).status, 2);
}

TEST_F(BuildCommand, OtherCommandsTakeASourceAsAScript) {
  ASSERT_EQ(build({}).status, 0);
  EXPECT_EQ(run(keysCommand, {"keys", "tour.yaml"}).out, "a\nb\n");
  const Result dumped = run(dumpCommand, {"dump", "--canonical", "tour.yaml"});
  EXPECT_EQ(dumped.status, 0);
  EXPECT_EQ(dumped.out, run(dumpCommand, {"dump", "--canonical", "tour.plist"}).out);
  EXPECT_EQ(run(convertCommand, {"convert", "tour.yaml", "copy.plist"}).status, 0);
  EXPECT_EQ(contents("copy.plist"), contents("tour.plist"));
}

TEST_F(BuildCommand, ScenariosPlayASource) {
  folder_.write("tour.walk",
                "copy script.plist tour.yaml\nhost h host.plist\nengine h\nadopt h => YES\n"
                "ignore log\nload script.plist from \"\" => YES\n\nscenario the first step\n"
                "expect #1.text \"Hello\"\n");
  const Result result = run(testCommand, {"test", "tour.walk"});
  EXPECT_EQ(result.out, "1 passed, 0 failed\n") << result.err;
}

TEST_F(BuildCommand, TranscriptsSpeakOfStepsAndControls) {
  const Result played =
      run(playCommand, {"play", "tour.yaml", "--toolkit", "memory", "--press", "next", "next"});
  EXPECT_EQ(played.status, 0) << played.out << played.err;
  for (const char* const part :
       {"── 2. press next (Go on) ──", "↳ step: “a” → “b”", "The walk-through ended."}) {
    EXPECT_NE(played.out.find(part), std::string::npos) << part << "\n" << played.out;
  }
  const Result wrong =
      run(playCommand, {"play", "tour.yaml", "--toolkit", "memory", "--press", "nxt"});
  EXPECT_EQ(wrong.status, 1);
  EXPECT_NE(wrong.err.find("nxt"), std::string::npos) << wrong.err;
}

TEST_F(BuildCommand, ThePromptTakesControlsByName) {
  play::PlayOptions options;
  options.script = "tour.yaml";
  const steps::ScriptFile script = steps::openScript(options.script);
  options.stage = script.stage({});
  options.toolkit = "memory";
  std::istringstream typed("nxt\nnext\nnext\n");
  std::ostringstream out;
  std::ostringstream log;
  EXPECT_EQ(play::play(options, {typed, out, log, true, {}}), ExitStatus::fine) << log.str();
  EXPECT_NE(out.str().find("  no control is called “nxt”; did you mean \"next\"?\n"),
            std::string::npos)
      << out.str();
  EXPECT_NE(out.str().find("The walk-through ended."), std::string::npos) << out.str();
}

TEST_F(BuildCommand, FindingsSpeakOfStepsAndControls) {
  folder_.writeSource(
      "steps:\n  a: {text: Hello, next: {press: b}}\n  b: {next: {press: nothing}}\n");
  const Result checked = run(checkCommand, {"check", "tour.yaml", "--witness", "found"});
  EXPECT_EQ(checked.status, 1);
  for (const char* const part : {"tour.yaml: warning: nothing that the user does",
                                 "help: let a press or a wait lead to the “end”\n"}) {
    EXPECT_NE(checked.out.find(part), std::string::npos) << part << "\n" << checked.out;
  }
  EXPECT_EQ(checked.out.find("TERMINATE_PARSER"), std::string::npos) << checked.out;
}

TEST_F(BuildCommand, ExpectationsNameStepsAndControls) {
  folder_.write("check.expect",
                "can reach step b\nalways can reach the end\nwhenever step b, text text Bye\n"
                "never hidden next\nnever step a\n");
  const Result checked = run(checkCommand, {"check", "tour.yaml"});
  EXPECT_NE(checked.out.find("check.expect:5: error: “never step a” does not hold after this path"),
            std::string::npos)
      << checked.out;
  EXPECT_NE(checked.out.find("expectations: 4 hold, 1 fail"), std::string::npos) << checked.out;
  folder_.write("check.expect", "can reach step c\n");
  EXPECT_EQ(
      run(checkCommand, {"check", "tour.yaml"}).err,
      "qz-walkthrough: check.expect:1:16: expected the name of a step of a source, found “c”\n");
  folder_.write("check.expect", "never hidden nxt\n");
  EXPECT_EQ(
      run(checkCommand, {"check", "tour.yaml"}).err,
      "qz-walkthrough: check.expect:1:14: expected the name of a control, found “nxt”; did you "
      "mean \"next\"?\n");
}

TEST_F(BuildCommand, ChecksStartAtStepsByName) {
  const Result checked = run(checkCommand, {"check", "tour.yaml", "--start", "b"});
  EXPECT_EQ(checked.status, 0) << checked.out << checked.err;
  EXPECT_NE(checked.out.find("explored 2 places, 2 presses and"), std::string::npos) << checked.out;
  EXPECT_EQ(run(checkCommand, {"check", "tour.yaml", "--start", "bb"}).err,
            "qz-walkthrough: tour.yaml: no step is called “bb”; did you mean \"b\"?\n");
}

TEST_F(BuildCommand, AWitnessOfASourceReplays) {
  const Result checked =
      run(checkCommand, {"check", "tour.yaml", "--fail-on", "note", "--witness", "found"});
  EXPECT_EQ(checked.status, 1);
  EXPECT_NE(checked.out.find("see it: qz-walkthrough play tour.yaml --start a --press next next\n"),
            std::string::npos)
      << checked.out;
  EXPECT_NE(checked.out.find("    press “next”: "), std::string::npos) << checked.out;
  const Result replayed = run(testCommand, {"test", "found"});
  EXPECT_EQ(replayed.status, 0) << replayed.out << replayed.err;
  EXPECT_FALSE(fs::is_empty("found"));
}

}  // namespace
}  // namespace qz::tools
