// SPDX-License-Identifier: MIT
// Pages of scripts that are unusual: lists without commands, presses that lead nowhere, buttons
// without titles.
#include <gtest/gtest.h>

#include "tests/storyboard/pages.hpp"
#include "tests/tools/play_files.hpp"
#include "tools/steps/script_file.hpp"
#include "tools/storyboard/storyboard.hpp"
#include "tools/support/drivers.hpp"

namespace qz::tools::storyboard {
namespace {

constexpr const char* smallHost = R"(
({ class = NSTextField; tag = 5; frame = (10, 50, 190, 30); },
 { class = NSButton; tag = 2; frame = (10, 10, 90, 30); title = ""; }))";

constexpr const char* boxes = R"(
({ class = NSTextField; tag = 5; frame = (10, 50, 190, 30); },
 { class = "NSButton:toggle"; tag = 2; frame = (10, 10, 90, 30); title = Expert; }))";

class UnusualPages : public testing::Test {
 protected:
  UnusualPages() { directory_.write("host.plist", smallHost); }

  std::string pageOfScript(std::string_view script, std::vector<std::string> arguments = {}) const {
    directory_.write("script.plist", script);
    arguments.insert(arguments.begin(), {"script.plist", "--window", "host.plist"});
    return pageOf(arguments);
  }

  static std::multiset<std::string> titles(const std::string& page) {
    return all(page, "<h2 [^>]*>([^<]*)</h2>");
  }

  play::WorkingDirectory directory_;
};

TEST_F(UnusualPages, CallAStartWithoutCommandsByItsList) {
  const std::string page =
      pageOfScript("{ 1 = ((SET_TEXT_FOR_OBJECT_ID, Hello, 5)); 7 = (); 2 = (TERMINATE_PARSER); }",
                   {"--start", "1", "--start", "7"});
  EXPECT_EQ(titles(page), (std::multiset<std::string>{"List 1", "List 7", "List 2"}));
}

TEST_F(UnusualPages, CallAStepWithoutCommandsByItsStart) {
  directory_.write("boxes.plist", boxes);
  directory_.write("script.plist", "{ 1 = ((SET_TEXT_FOR_OBJECT_ID, Hello, 5)); 7 = (); 2 = (); }");
  const std::string page =
      pageOf({"script.plist", "--window", "boxes.plist", "--start", "1", "--start", "7"});
  const auto found = titles(page);
  EXPECT_EQ(found, (std::multiset<std::string>{"List 1", "List 1: expert on", "List 7",
                                               "List 7: expert on"}));
}

TEST_F(UnusualPages, CallAButtonWithoutATitleByItsTagOrName) {
  const std::string script = pageOfScript("{ 1 = (IDLE_LOOP); 2 = (TERMINATE_PARSER); }");
  EXPECT_NE(script.find("data-move=\"--press 2\" aria-label=\"button 2\""), std::string::npos);
  directory_.write("tour.yaml",
                   "window: host.plist\ncontrols: {text: 5, \"go <on>\": 2}\nsteps:\n"
                   "  hello: {text: Hello, \"go <on>\": {press: end}}\n");
  const std::string source = pageOf({"tour.yaml"});
  EXPECT_NE(source.find(" aria-label=\"button go &lt;on&gt;\""), std::string::npos);
}

TEST_F(UnusualPages, LeaveAPressThatLeadsNowhereAtItsStep) {
  directory_.write("boxes.plist", boxes);
  directory_.write("tour.yaml",
                   "window: boxes.plist\ncontrols: {text: 5, expert: 2}\nsteps:\n"
                   "  hello: {text: Hello, expert: {title: Expert, state: off}, after 5 s: bye}\n"
                   "  bye: {text: Bye, hide: expert, after 1 s: end}\n");
  EXPECT_EQ(titles(pageOf({"tour.yaml"})),
            (std::multiset<std::string>{"hello", "hello: expert on", "bye", "the end"}));
}

TEST_F(UnusualPages, SayThatTheWindowWasMadeFromTheScript) {
  const std::string remark = "The window was made from the script; name the real one";
  const std::string script =
      "{ 1 = ((SET_TEXT_FOR_OBJECT_ID, Hello, 5)); 2 = (TERMINATE_PARSER); }";
  EXPECT_EQ(pageOfScript(script).find(remark), std::string::npos);
  EXPECT_NE(pageOf({"script.plist"}).find(remark), std::string::npos);
}

TEST_F(UnusualPages, SayThatNotEverythingWasExplored) {
  const steps::ScriptFile script = steps::openScript(backup);
  StoryboardOptions options;
  options.check.stage = script.stage({});
  options.check.toolkit = options.toolkit = testToolkit();
  options.check.limits.places = 3;
  const Storyboard made = makeStoryboard(script.file, options, {});
  EXPECT_FALSE(made.isComplete);
  EXPECT_NE(made.html.find("Not everything was explored, so there may be more steps."),
            std::string::npos);
  EXPECT_NE(made.html.find("or were not explored"), std::string::npos);
  options.check.limits = {};
  EXPECT_EQ(makeStoryboard(script.file, options, {}).html.find("may be more steps"),
            std::string::npos);
}

}  // namespace
}  // namespace qz::tools::storyboard
