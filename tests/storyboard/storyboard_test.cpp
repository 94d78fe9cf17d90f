// SPDX-License-Identifier: MIT
// Storyboards show what a user would see, and lead where the user would come.
#include "tools/storyboard/storyboard.hpp"

#include <gtest/gtest.h>

#include <filesystem>

#include "drivers/memory/memory_driver.hpp"
#include "tests/storyboard/pages.hpp"
#include "tests/tools/play_files.hpp"
#include "tools/check/replay.hpp"
#include "tools/drawing/look_stage.hpp"
#include "tools/play/words.hpp"
#include "tools/steps/script_file.hpp"
#include "tools/storyboard/board.hpp"

namespace qz::tools::storyboard {
namespace {

namespace fs = std::filesystem;

/// A script of the repository and its window.
struct Shown {
  std::string name;
  std::string script;
  std::string window{};
  std::string assets{};

  walkthrough::StageOptions stage() const {
    walkthrough::StageOptions options;
    if (!window.empty()) options.window = window;
    if (!assets.empty()) options.assets = assets;
    return options;
  }
};

std::vector<Shown> shownScripts() {
  const std::string examples = repository + "/examples/";
  std::vector<Shown> all = {
      {"backup", examples + "first-steps/backup.yaml"},
      {"import", examples + "photo-import/import.yaml"},
      {"tour", examples + "qt-host/tour.plist", examples + "qt-host/tour-host.plist"},
      {"built", examples + "built-window/script.plist", "",
       examples + "built-window/assets.plist"}};
  for (const auto& folder : fs::directory_iterator(repository + "/tests/check/corpus")) {
    const auto window = folder.path() / "window.plist";
    if (!fs::exists(window)) continue;
    all.push_back({folder.path().filename().string(), (folder.path() / "script.plist").string(),
                   window.string()});
  }
  return all;
}

/// Returns what `play` says of a picture.
std::string wordsOf(const walkthrough::StepPicture& picture) {
  std::string words = picture.ended ? "the end" : "";
  if (picture.ended) return words;
  for (const auto& control : picture.controls) {
    words += std::to_string(control.view.tag) + ' ' + control.name + ' ' +
             play::contentOf(control) + (control.hasList ? " (" : " [");
    for (const std::string& remark : play::remarksOn(control)) words += remark + ", ";
    words += ")\n";
  }
  for (const auto& timer : picture.timers) {
    words += timer.key + ' ' + timer.step + ' ' + play::whenWords(timer.timeLeft) + '\n';
  }
  return words;
}

class StoryboardOf : public testing::TestWithParam<Shown> {};

TEST_P(StoryboardOf, ShowsWhatAUserSees) {
  const steps::ScriptFile script = steps::openScript(GetParam().script);
  const auto options = script.stage(GetParam().stage());
  const check::Script lists(script.file.dictionary());
  const auto plan = walkthrough::planStage(options, lists.dictionary(), script.file.path());
  const auto resources = fs::path(GetParam().script).parent_path().string();
  check::Setting setting = check::settingOf(lists, plan, resources);
  setting.wholeLooks = setting.exactStates = true;
  check::Exploration exploration(setting, check::startKeysOf(script.file, lists, {}));
  exploration.run({}, 1, {});
  const Board board(exploration, 1);
  ASSERT_GE(board.steps().size(), 2U);
  drivers::MemoryDriver driver;
  driver.setResourcePath(resources);
  for (const BoardStep& step : board.steps()) {
    const auto path = exploration.path(step.visit);
    drawing::LookStage stage(driver, exploration, step.place, step.look);
    EXPECT_EQ(wordsOf(stage.picture()), wordsOf(check::pictureAfter(setting, path)))
        << testing::PrintToString(path.size()) << " moves";
    EXPECT_EQ(&board.steps()[board.endOf(path).value_or(0)], &step);
  }
}

INSTANTIATE_TEST_SUITE_P(All, StoryboardOf, testing::ValuesIn(shownScripts()),
                         [](const testing::TestParamInfo<Shown>& each) {
                           std::string name = each.param.name;
                           std::replace(name.begin(), name.end(), '-', '_');
                           return name;
                         });

TEST(Storyboards, LinkToTheirOwnStepsAndToNothingElse) {
  const play::WorkingDirectory directory;
  const std::string page = pageOf({backup});
  EXPECT_EQ(page, pageOf({backup})) << "made again";
  const auto ids = all(page, "<section id=\"([^\"]*)\"");
  EXPECT_EQ(ids, (std::multiset<std::string>{"welcome", "encryption", "encryption-encrypt-off",
                                             "ready", "copying", "copied-one", "done", "stopped",
                                             "stopped-after-one", "the-end"}));
  for (const std::string& link : all(page, "href=\"#([^\"]*)\"")) {
    EXPECT_EQ(ids.count(link), 1U) << link;
  }
  for (const std::string& id : ids) {
    EXPECT_EQ(all(page, " id=\"(" + id + ")\"").size(), 1U) << "no other element has the name";
  }
  EXPECT_EQ(all(page, "(?:href|src)=\"([^#d][^\"]*)\"").size(), 0U);
}

TEST(Storyboards, KeepTheNamesOfStepsThatASmallChangeLeavesAlone) {
  const play::WorkingDirectory directory;
  const auto before = all(pageOf({backup}), "<section id=\"([^\"]*)\"");
  fs::copy(repository + "/examples/first-steps", directory.path(), fs::copy_options::recursive);
  std::string source = *wholeFile(backup);
  source.replace(source.find("heading: Ready"), 14, "heading: Plug in");
  source.replace(source.find("  ready:"), 8, "  connect:");
  source.replace(source.find("press: ready"), 12, "press: connect");
  directory.write("changed.yaml", source);
  auto after = all(pageOf({"changed.yaml"}), "<section id=\"([^\"]*)\"");
  EXPECT_EQ(after.count("connect"), 1U);
  after.erase("connect");
  after.insert("ready");
  EXPECT_EQ(after, before);
}

TEST(Storyboards, SayWhatTheyLeaveOut) {
  const play::WorkingDirectory directory;
  const std::string page = pageOf({backup, "--limit", "3"});
  EXPECT_EQ(all(page, "<section id=\"([^\"]*)\"").size(), 3U);
  EXPECT_NE(page.find("3 of 10 steps"), std::string::npos);
  EXPECT_NE(page.find("Leads to a step that this page leaves out"), std::string::npos);
}

constexpr const char* hostileHost = R"(
({ class = NSTextField; tag = 5; frame = (10, 50, 190, 30); },
 { class = NSButton; tag = 2; frame = (10, 10, 90, 30); title = "</script><script>alert(1)//"; }))";

TEST(Storyboards, LetNoTextRun) {
  const play::WorkingDirectory directory;
  directory.write("host.plist", hostileHost);
  directory.write(
      "a\"><script>.plist",
      "{ 1 = ((SET_TEXT_FOR_OBJECT_ID, \"<img src=x onerror=alert(1)>\\U0007\\U202e\", 5));"
      "  2 = ((SET_TITLE_FOR_OBJECT_ID, \"" +
          std::string(1'000'000, 'x') + "\", 2), TERMINATE_PARSER); }");
  const std::string page = pageOf({"a\"><script>.plist", "--window", "host.plist"});
  EXPECT_EQ(all(page, "(<script)").size(), 1U);
  EXPECT_EQ(all(page, "(<img)").size(), 0U);
  EXPECT_EQ(page.find('\a'), std::string::npos);
  EXPECT_EQ(page.find("\xE2\x80\xAE"), std::string::npos);
  EXPECT_LT(page.size(), 300'000U) << "very long texts are shortened";
}

TEST(Storyboards, HaveTheFindingsAtTheirSteps) {
  const play::WorkingDirectory directory;
  directory.write("host.plist", hostileHost);
  directory.write("stuck.plist", "{ 1 = (IDLE_LOOP);\n 2 = (HIDE_OBJECT_WITH_ID); }");
  const std::string page = pageOf({"stuck.plist", "--window", "host.plist"});
  const auto step = page.substr(page.find("<section id=\"list-2\""));
  EXPECT_NE(step.find("leaves the user stuck"), std::string::npos);
  EXPECT_NE(page.find("See it: <a href=\"#list-1\">start 1</a> <a href=\"#list-2\">press 2</a>"),
            std::string::npos);
  EXPECT_NE(step.find("<span class=\"marked\"><i>2</i>"), std::string::npos) << "the source";
}

TEST(StoryboardCommand, SaysWhatIsMissing) {
  const play::WorkingDirectory directory;
  const struct {
    std::vector<std::string> arguments;
    std::string error;
  } cases[] = {
      {{"storyboard", backup},
       "qz-walkthrough: -o FILE is required; see qz-walkthrough storyboard --help\n"},
      {{"storyboard", backup, "-o", "none/page.html"},
       "qz-walkthrough: none/page.html: cannot be written; expected a path in a directory that is "
       "there\n"},
      {{"storyboard", backup, "-o", "page.html", "--limit", "0"},
       "qz-walkthrough: --limit: expected a whole number above 0, found “0”; see "
       "qz-walkthrough storyboard --help\n"}};
  for (const auto& each : cases) {
    const Result result = run(storyboardCommand, each.arguments);
    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.err, each.error);
    EXPECT_FALSE(fs::exists("page.html"));
  }
}

}  // namespace
}  // namespace qz::tools::storyboard
