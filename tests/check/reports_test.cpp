// SPDX-License-Identifier: MIT
// The formats of the reports: what the libraries that read them get out.

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>
#include <pugixml.hpp>

#include <algorithm>
#include <optional>
#include <sstream>

#include "tests/check/checking.hpp"
#include "tests/tools/play_files.hpp"
#include "tools/check/report.hpp"

namespace qz::tools::check {
namespace {

using Json = nlohmann::ordered_json;

// One finding of each severity, in the order of the lines: left-behind, dead-end, never-runs.
constexpr const char* smallWindow = R"((
  { class = NSTextField; tag = 5; frame = (10, 50, 190, 30); title = ""; },
  { class = NSButton; tag = 2; frame = (10, 10, 90, 30); title = "Close"; },
  { class = NSButton; tag = 3; frame = (110, 10, 90, 30); title = "Next"; }
))";
constexpr const char* smallScript = R"({
  1 = ((SET_TEXT_FOR_OBJECT_ID, Welcome, 5));
  2 = (TERMINATE_PARSER);
  3 = (HIDE_OBJECT_WITH_ID, (HIDE_OBJECT_WITH_ID, 2));
  7 = (IDLE_LOOP);
}
)";

/// Reports on a script.
class Reports : public testing::Test {
 protected:
  /// Checks the script of this file.
  void checkSmallScript() {
    directory_.write("window.plist", smallWindow);
    directory_.write("script.plist", smallScript);
    file_.emplace("script.plist", "a script");
    CheckOptions options;
    options.toolkit = testToolkit();
    options.stage.window = "window.plist";
    verdict_ = check::checkScript(*file_, options, {});
    ASSERT_EQ(verdict_.findings.size(), 3U) << messagesOf(verdict_);
  }
  /// Makes a verdict on a file of this name, without findings.
  void makeVerdict(const std::string& name) {
    directory_.write(name, "{\n  1 = (IDLE_LOOP);\n}\n");
    file_.emplace(name, "a script");
    verdict_ = {.path = name};
    verdict_.explored = {.places = 1, .complete = true};
  }
  /// Adds a finding at the first command.
  void addFinding(const std::string& message) {
    Finding finding = findingOf("never-runs", message);
    finding.list = "1";
    finding.where = toolkit::asArray(file_->dictionary()->objectForKey("1"))->objectAtIndex(0);
    verdict_.findings.push_back(std::move(finding));
  }

  template <class Write>
  std::string written(Write write, bool color = false) {
    std::ostringstream out;
    write({.scripts = {{verdict_, *file_, " --window window.plist", failOn_}},
           .unchecked = unchecked_},
          color, out);
    return out.str();
  }

  const std::string& message(std::size_t finding) { return verdict_.findings[finding].message; }

  play::WorkingDirectory directory_;
  std::optional<InputFile> file_;
  Verdict verdict_{};
  Severity failOn_ = Severity::warning;
  std::vector<Unchecked> unchecked_;
};

Json pathOf(int press) { return Json::array({{{"start", "1"}}, {{"press", press}}}); }

TEST_F(Reports, JsonHasEveryField) {
  checkSmallScript();
  const Json expected = {
      {"version", 1},
      {"scripts", Json::array({{{"script", "script.plist"},
                                {"explored",
                                 {{"places", 3}, {"presses", 2}, {"waits", 0}, {"complete", true}}},
                                {"findings", Json::array({{{"code", "left-behind"},
                                                           {"severity", "note"},
                                                           {"message", message(0)},
                                                           {"list", "2"},
                                                           {"line", 3},
                                                           {"column", 3},
                                                           {"tag", 5},
                                                           {"path", pathOf(2)},
                                                           {"places", 1}},
                                                          {{"code", "dead-end"},
                                                           {"severity", "error"},
                                                           {"message", message(1)},
                                                           {"list", "3"},
                                                           {"line", 4},
                                                           {"column", 3},
                                                           {"path", pathOf(3)},
                                                           {"places", 1}},
                                                          {{"code", "never-runs"},
                                                           {"severity", "warning"},
                                                           {"message", message(2)},
                                                           {"list", "7"},
                                                           {"line", 5},
                                                           {"column", 3}}})}}})},
      {"unchecked", Json::array()}};
  EXPECT_EQ(Json::parse(written(writeJson)), expected);
}

TEST_F(Reports, JsonSaysWhichOfTheControlsWithOneTagIsPressed) {
  makeVerdict("script.plist");
  addFinding("one");
  verdict_.findings[0].path = {StartMove{"1"}, PressMove{2, 4, true}, WaitMove{0.5}};
  verdict_.findings[0].otherPath = {StartMove{"7"}, PressMove{2, 1, false}};
  const Json json = Json::parse(written(writeJson));
  const Json& finding = json["scripts"][0]["findings"][0];
  EXPECT_EQ(finding["path"],
            Json::array({{{"start", "1"}}, {{"press", 2}, {"index", 4}}, {{"wait", 0.5}}}));
  EXPECT_EQ(finding["otherPath"], Json::array({{{"start", "7"}}, {{"press", 2}}}));
}

TEST_F(Reports, JsonNamesTheFileOfAnExpectation) {
  makeVerdict("script.plist");
  verdict_.findings.push_back(findingOf("expectation", "one"));
  verdict_.findings[0].elsewhere = FileLine{"check.expect", 4};
  const Json json = Json::parse(written(writeJson));
  EXPECT_EQ(json["scripts"][0]["findings"][0]["file"], "check.expect");
  EXPECT_EQ(json["scripts"][0]["findings"][0]["line"], 4);
  EXPECT_FALSE(json["scripts"][0]["findings"][0].contains("column"));
}

TEST_F(Reports, JsonSaysWhatIsMissing) {
  makeVerdict("script.plist");
  verdict_.explored = {.places = 5, .complete = false, .stop = Stop::time, .frontier = 2};
  EXPECT_EQ(Json::parse(written(writeJson))["scripts"][0]["explored"]["complete"], false);
}

Json locationIn(const char* uri, int line) {
  return {{"physicalLocation",
           {{"artifactLocation", {{"uri", uri}}},
            {"region", {{"startLine", line}, {"startColumn", 3}}}}}};
}

TEST_F(Reports, SarifHasAResultForEachFinding) {
  checkSmallScript();
  const Json sarif = Json::parse(written(writeSarif));
  EXPECT_EQ(sarif["version"], "2.1.0");
  ASSERT_EQ(sarif["runs"].size(), 1U);
  const struct {
    const char* rule;
    const char* level;
    int line;
  } results[] = {
      {"left-behind", "note", 3}, {"dead-end", "error", 4}, {"never-runs", "warning", 5}};
  ASSERT_EQ(sarif["runs"][0]["results"].size(), std::size(results));
  for (std::size_t i = 0; i < std::size(results); ++i) {
    const Json& result = sarif["runs"][0]["results"][i];
    EXPECT_EQ(result["ruleId"], results[i].rule);
    EXPECT_EQ(result["level"], results[i].level);
    EXPECT_EQ(result["message"]["text"], message(i));
    EXPECT_EQ(result["locations"], Json::array({locationIn("script.plist", results[i].line)}));
  }
}

TEST_F(Reports, SarifHasThePathAsACodeFlow) {
  checkSmallScript();
  const Json results = Json::parse(written(writeSarif))["runs"][0]["results"];
  const Json& flows = results[1]["codeFlows"];
  ASSERT_EQ(flows.size(), 1U);
  ASSERT_EQ(flows[0]["threadFlows"].size(), 1U);
  const Json& steps = flows[0]["threadFlows"][0]["locations"];
  ASSERT_EQ(steps.size(), 2U);
  EXPECT_EQ(steps[0]["location"]["message"]["text"], "--start 1");
  EXPECT_EQ(steps[1]["location"]["message"]["text"], "--press 3");
  EXPECT_FALSE(results[2].contains("codeFlows")) << "a list that never runs has no path";
}

TEST_F(Reports, SarifHasARuleForEachCode) {
  makeVerdict("script.plist");
  const Json sarif = Json::parse(written(writeSarif));
  const Json& rules = sarif["runs"][0]["tool"]["driver"]["rules"];
  ASSERT_EQ(rules.size(), codes().size());
  for (std::size_t i = 0; i < rules.size(); ++i) {
    EXPECT_EQ(rules[i]["id"], codes()[i].name);
    EXPECT_EQ(rules[i]["defaultConfiguration"]["level"], nameOf(codes()[i].severity));
    EXPECT_EQ(rules[i]["shortDescription"]["text"], codes()[i].summary);
  }
}

constexpr std::size_t mostResults = 5000;
constexpr std::size_t mostSteps = 1000;

TEST_F(Reports, SarifIsCutAfterWhatItsReadersShow) {
  makeVerdict("script.plist");
  for (std::size_t i = 0; i <= mostResults; ++i) addFinding("one");
  const Json run = Json::parse(written(writeSarif))["runs"][0];
  EXPECT_EQ(run["results"].size(), mostResults);
  const Json& notes = run["invocations"][0]["toolExecutionNotifications"];
  ASSERT_EQ(notes.size(), 1U);
  EXPECT_EQ(notes[0]["level"], "warning");
  EXPECT_EQ(notes[0]["message"]["text"].get<std::string>().find("5001 findings"), 0U) << notes;
}

TEST_F(Reports, SarifSaysNothingOfCutsIfThereIsNone) {
  checkSmallScript();
  const Json run = Json::parse(written(writeSarif))["runs"][0];
  EXPECT_EQ(run["invocations"], Json::array({{{"executionSuccessful", true}}}));
}

TEST_F(Reports, SarifSaysWhatIsCutAndWhatCouldNotBeChecked) {
  makeVerdict("script.plist");
  for (std::size_t i = 0; i <= mostResults; ++i) addFinding("one");
  unchecked_ = {{.script = "none.plist", .message = "none.plist: no such file"}};
  const Json invocation = Json::parse(written(writeSarif))["runs"][0]["invocations"][0];
  ASSERT_EQ(invocation["toolExecutionNotifications"].size(), 2U) << invocation;
  EXPECT_EQ(invocation["toolExecutionNotifications"][0]["level"], "error");
  EXPECT_EQ(invocation["toolExecutionNotifications"][1]["level"], "warning");
}

TEST_F(Reports, SarifCutsLongPathsAndSaysSo) {
  makeVerdict("script.plist");
  const auto resultFor = [&](std::size_t steps) {
    verdict_.findings.clear();
    addFinding("far away");
    verdict_.findings[0].path.assign(steps, WaitMove{1});
    return Json::parse(written(writeSarif))["runs"][0]["results"][0];
  };
  const Json longest = resultFor(mostSteps);
  EXPECT_EQ(longest["message"]["text"], "far away");
  EXPECT_EQ(longest["codeFlows"][0]["threadFlows"][0]["locations"].size(), mostSteps);
  const Json cut = resultFor(mostSteps + 1);
  EXPECT_EQ(cut["codeFlows"][0]["threadFlows"][0]["locations"].size(), mostSteps);
  EXPECT_NE(cut["message"]["text"].get<std::string>().find("1001 steps"), std::string::npos) << cut;
}

pugi::xml_document xmlOf(const std::string& text) {
  pugi::xml_document document;
  const auto result = document.load_buffer(text.data(), text.size());
  EXPECT_TRUE(result) << result.description() << "\n" << text;
  return document;
}

TEST_F(Reports, JunitHasACaseForEachFinding) {
  checkSmallScript();
  const auto document = xmlOf(written(writeJunit));
  const auto suite = document.child("testsuites").child("testsuite");
  EXPECT_STREQ(suite.attribute("name").value(), "script.plist");
  EXPECT_EQ(suite.attribute("tests").as_int(), 3);
  EXPECT_EQ(suite.attribute("failures").as_int(), 2) << "a note does not fail";
  EXPECT_EQ(suite.attribute("errors").as_int(), 0);
  const struct {
    const char* code;
    const char* type;
    const char* details;
  } cases[] = {{"left-behind", "", ""},
               {"dead-end", "error",
                "script.plist:4:3: qz-walkthrough play script.plist --window window.plist --start "
                "1 --press 3"},
               {"never-runs", "warning", "script.plist:5:3"}};
  auto one = suite.child("testcase");
  for (std::size_t i = 0; i < std::size(cases); ++i, one = one.next_sibling("testcase")) {
    EXPECT_STREQ(one.attribute("classname").value(), "script.plist");
    EXPECT_EQ(one.attribute("name").value(), std::string(cases[i].code) + ": " + message(i));
    EXPECT_STREQ(one.child("failure").attribute("type").value(), cases[i].type);
    EXPECT_EQ(one.child("failure").attribute("message").value(), i == 0 ? "" : message(i));
    EXPECT_STREQ(one.child("failure").text().get(), cases[i].details);
  }
  EXPECT_FALSE(one) << "there are more";
}

TEST_F(Reports, JunitFailsOnWhatTheCommandFailsOn) {
  checkSmallScript();
  const std::pair<Severity, int> cases[] = {
      {Severity::note, 3}, {Severity::warning, 2}, {Severity::error, 1}};
  for (const auto& [severity, failures] : cases) {
    failOn_ = severity;
    const auto document = xmlOf(written(writeJunit));
    const auto suite = document.child("testsuites").child("testsuite");
    EXPECT_EQ(suite.attribute("failures").as_int(), failures);
    EXPECT_EQ(document.select_nodes("//failure").size(), static_cast<std::size_t>(failures));
  }
}

TEST_F(Reports, TextShowsTheMovesOfAPathOnce) {
  makeVerdict("script.plist");
  for (const char* const words : {"one", "two"}) {
    addFinding(words);
    verdict_.findings.back().path = {StartMove{"1"}};
    verdict_.findings.back().played = {{"start 1", {}, false, false}};
  }
  const std::string text = written(writeText);
  const auto moves = text.find("    start 1: nothing changes\n");
  EXPECT_NE(moves, std::string::npos) << text;
  EXPECT_EQ(text.find("    start 1:", moves + 1), std::string::npos) << text;
}

TEST_F(Reports, JunitHasAPassingCaseForAScriptWithoutFindings) {
  makeVerdict("script.plist");
  const auto document = xmlOf(written(writeJunit));
  const auto suite = document.child("testsuites").child("testsuite");
  EXPECT_EQ(suite.attribute("tests").as_int(), 1);
  EXPECT_EQ(suite.attribute("failures").as_int(), 0);
  EXPECT_TRUE(suite.child("testcase"));
  EXPECT_FALSE(suite.child("testcase").child("failure"));
}

TEST_F(Reports, GithubHasALineForEachFinding) {
  checkSmallScript();
  const std::string play =
      "%0Aqz-walkthrough play script.plist --window window.plist --start 1 --press ";
  EXPECT_EQ(written(writeGithub),
            "::notice file=script.plist,line=3,col=3,title=left-behind::" + message(0) + play +
                "2\n"
                "::error file=script.plist,line=4,col=3,title=dead-end::" +
                message(1) + play +
                "3\n"
                "::warning file=script.plist,line=5,col=3,title=never-runs::" +
                message(2) + "\n");
}

TEST_F(Reports, GithubNamesTheLineOfAnExpectation) {
  makeVerdict("script.plist");
  verdict_.findings.push_back(findingOf("expectation", "one"));
  verdict_.findings[0].elsewhere = FileLine{"a,b/check.expect", 4};
  EXPECT_EQ(written(writeGithub),
            "::error file=a%2Cb/check.expect,line=4,title=expectation::one\n");
}

TEST_F(Reports, TextHasTheSourceAndThePath) {
  checkSmallScript();
  const std::string text = written(writeText);
  EXPECT_NE(text.find("script.plist:4:3: error: " + message(1) +
                      " [dead-end]\n"
                      "  |   3 = (HIDE_OBJECT_WITH_ID, (HIDE_OBJECT_WITH_ID, 2));\n"
                      "  |   ^\n"
                      "  see it: qz-walkthrough play script.plist --window window.plist --start 1 "
                      "--press 3\n"
                      "    start 1: tag 5: text “Welcome”\n"
                      "    press 3: tag 2: hidden; tag 3: hidden\n"
                      "  help: " +
                      verdict_.findings[1].help + "\n"),
            std::string::npos)
      << text;
}

TEST_F(Reports, TextEndsWithASummary) {
  checkSmallScript();
  const std::string text = written(writeText);
  EXPECT_TRUE(
      text.ends_with("\nscript.plist: explored 3 places, 2 presses and 0 waits, which are "
                     "all; 1 error, 1 warning, 1 note\n"))
      << text;
}

TEST_F(Reports, TextSaysWhyTheRestIsMissing) {
  makeVerdict("script.plist");
  const struct {
    Stop stop;
    const char* words;
  } cases[] = {{Stop::places, "--limit"},
               {Stop::memory, "--memory"},
               {Stop::time, "--seconds"},
               {Stop::cancelled, "you stopped it"}};
  for (const auto& test : cases) {
    verdict_.explored = {.places = 5, .complete = false, .stop = test.stop, .frontier = 2};
    const std::string text = written(writeText);
    EXPECT_NE(text.find("not everything: " + std::string(test.words)), std::string::npos) << text;
    EXPECT_NE(text.find("2 known places"), std::string::npos) << text;
  }
}

TEST_F(Reports, TextHasColoursOnlyIfAsked) {
  checkSmallScript();
  EXPECT_EQ(written(writeText).find('\x1b'), std::string::npos);
  const std::string text = written(writeText, true);
  EXPECT_NE(text.find("\x1b[1;31merror:\x1b[0m"), std::string::npos) << text;
}

TEST_F(Reports, EachScriptHasItsPart) {
  makeVerdict("a.plist");
  const Verdict first = verdict_;
  makeVerdict("b.plist");
  const InputFile a("a.plist", "a script");
  const InputFile b("b.plist", "a script");
  std::ostringstream json;
  const RunReport run{.scripts = {{first, a, "", failOn_}, {verdict_, b, "", failOn_}},
                      .unchecked = {}};
  writeJson(run, false, json);
  EXPECT_EQ(Json::parse(json.str())["scripts"][0]["script"], "a.plist");
  EXPECT_EQ(Json::parse(json.str())["scripts"][1]["script"], "b.plist");
  std::ostringstream junit;
  writeJunit(run, false, junit);
  const auto document = xmlOf(junit.str());
  EXPECT_STREQ(document.child("testsuites").last_child().attribute("name").value(), "b.plist");
}

// Everything that some format gives a meaning, in a name and in a text.
const std::string oddName = "e\x1b[2J%,:<&\"' \n\xC3\xA9.plist";
const std::string oddText = "50% of “a”, b: <c> & \"d\" 'e' é 😀\n::error::f\r\t\x1b[2J";

class OddCharacters : public Reports {
 protected:
  void SetUp() override {
    makeVerdict(oddName);
    addFinding(oddText);
  }
};

TEST_F(OddCharacters, AreTheSameInJson) {
  const Json json = Json::parse(written(writeJson))["scripts"][0];
  EXPECT_EQ(json["script"], oddName);
  EXPECT_EQ(json["findings"][0]["message"], oddText);
}

TEST_F(OddCharacters, AreTheSameInTheMessageOfSarif) {
  const Json sarif = Json::parse(written(writeSarif));
  EXPECT_EQ(sarif["runs"][0]["results"][0]["message"]["text"], oddText);
}

TEST_F(OddCharacters, AreVisibleInJunit) {
  const auto document = xmlOf(written(writeJunit));
  const auto suite = document.child("testsuites").child("testsuite");
  EXPECT_STREQ(suite.attribute("name").value(), "e\\u{1b}[2J%,:<&\"' \\né.plist");
  EXPECT_STREQ(suite.child("testcase").child("failure").attribute("message").value(),
               "50% of “a”, b: <c> & \"d\" 'e' é 😀\\n::error::f\\u{d} \\u{1b}[2J");
}

// Readers of XML refuse a file with these, although they are UTF-8.
TEST_F(OddCharacters, ThatXmlForbidsAreReplacedInJunit) {
  makeVerdict("a\uFFFEb.plist");
  addFinding("c\uFFFFd \uFFFD\uE000\U0001FFFE");
  verdict_.findings[0].path = {StartMove{"e\uFFFEf"}};
  const std::string text = written(writeJunit);
  for (const char* const forbidden : {"\uFFFE", "\uFFFF"}) {
    EXPECT_EQ(text.find(forbidden), std::string::npos) << text;
  }
  const auto document = xmlOf(text);
  const auto suite = document.child("testsuites").child("testsuite");
  EXPECT_STREQ(suite.attribute("name").value(), "a\uFFFDb.plist");
  const auto failure = suite.child("testcase").child("failure");
  EXPECT_STREQ(failure.attribute("message").value(), "c\uFFFDd \uFFFD\uE000\U0001FFFE");
  EXPECT_NE(std::string(failure.text().get()).find("--start 'e\uFFFDf'"), std::string::npos)
      << text;
}

/// Undoes the escapes of a workflow command.
std::string unescaped(std::string text) {
  const std::pair<const char*, const char*> escapes[] = {
      {"%0D", "\r"}, {"%0A", "\n"}, {"%3A", ":"}, {"%2C", ","}, {"%25", "%"}};
  for (const auto& [escape, meaning] : escapes) {
    for (auto at = text.find(escape); at != std::string::npos; at = text.find(escape, at + 1)) {
      text.replace(at, 3, meaning);
    }
  }
  return text;
}

TEST_F(OddCharacters, AreTheSameInAnAnnotation) {
  const std::string text = written(writeGithub);
  EXPECT_EQ(std::count(text.begin(), text.end(), '\n'), 1) << text;
  const std::size_t name = text.find("file=") + 5;
  const std::string file = text.substr(name, text.find(",line=") - name);
  EXPECT_EQ(file.find_first_of(":,"), std::string::npos) << "they end a property";
  EXPECT_EQ(unescaped(file), oddName);
  const std::size_t message = text.find("::", 2) + 2;
  EXPECT_EQ(unescaped(text.substr(message, text.size() - message - 1)), oddText);
}

TEST_F(OddCharacters, DoNotReachTheTerminal) {
  const std::string text = written(writeText);
  EXPECT_EQ(text.find_first_of("\x1b\r\t"), std::string::npos) << text;
  EXPECT_NE(text.find("50% of “a”, b: <c> & \"d\" 'e' é 😀\\n::error::f\\u{d} \\u{1b}[2J"),
            std::string::npos)
      << text;
}

TEST_F(OddCharacters, ThatAreNotUnicodeAreReplacedInJson) {
  verdict_.findings[0].message =
      "a\xFF"
      "b";
  const std::string replaced = "a\uFFFDb";
  EXPECT_EQ(Json::parse(written(writeJson))["scripts"][0]["findings"][0]["message"], replaced);
  EXPECT_EQ(Json::parse(written(writeSarif))["runs"][0]["results"][0]["message"]["text"], replaced);
}

TEST_F(OddCharacters, AreEscapedInTheUriOfSarif) {
  const Json sarif = Json::parse(written(writeSarif));
  EXPECT_EQ(
      sarif["runs"][0]["results"][0]["locations"][0]["physicalLocation"]["artifactLocation"]["uri"],
      "e%1B%5B2J%25%2C%3A%3C%26%22%27%20%0A%C3%A9.plist");
}

TEST_F(OddCharacters, DoNotReachTheTerminalFromAPath) {
  verdict_.findings[0].path = {StartMove{"\x1b[2J"}};
  verdict_.findings[0].played = {{"start \x1b[2J", {"tag 5: image \x1b[2J"}, false, false}};
  const std::string text = written(writeText);
  EXPECT_EQ(text.find('\x1b'), std::string::npos) << text;
}

TEST_F(Reports, QuoteThePathOfTheScriptForAShell) {
  makeVerdict("my script.plist");
  addFinding("one");
  verdict_.findings[0].path = {StartMove{"1"}};
  const std::string play =
      "qz-walkthrough play 'my script.plist' --window window.plist --start 1\n";
  EXPECT_NE(written(writeText).find(play), std::string::npos) << written(writeText);
  EXPECT_NE(written(writeGithub).find(play), std::string::npos) << written(writeGithub);
}

TEST_F(Reports, PutTheCaretBelowWideCharacters) {
  directory_.write("wide.plist", "{ 1 = (\"日本\", IDLE_LOP); }\n");
  file_.emplace("wide.plist", "a script");
  verdict_ = {.path = "wide.plist"};
  Finding finding = findingOf("unknown-command", "one");
  finding.where = toolkit::asArray(file_->dictionary()->objectForKey("1"))->objectAtIndex(1);
  verdict_.findings.push_back(finding);
  EXPECT_NE(written(writeText).find("  | { 1 = (\"日本\", IDLE_LOP); }\n"
                                    "  |                ^\n"),
            std::string::npos)
      << written(writeText);
}

TEST(PlayArguments, WalkAPath) {
  const struct {
    Path path;
    const char* words;
  } cases[] = {
      {{}, ""},
      {{StartMove{"1"}}, "--start 1"},
      {{StartMove{"it's; 1"}}, "--start 'it'\\''s; 1'"},
      {{StartMove{""}}, "--start ''"},
      {{StartMove{"1"}, PressMove{2, 0, false}, PressMove{-3, 1, true}}, "--start 1 --press 2 -3"},
      {{StartMove{"1"}, PressMove{2, 0, false}, WaitMove{0.25}, PressMove{3, 0, false}},
       "--start 1 --press 2 --advance 0.25 --press 3"},
  };
  for (const auto& test : cases) EXPECT_EQ(playArguments(test.path), test.words);
}

}  // namespace
}  // namespace qz::tools::check
