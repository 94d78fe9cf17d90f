// SPDX-License-Identifier: MIT
// Pictures of storyboards that Qt draws: one for each look, the same on every machine, and taken
// apart so that nothing is in the page twice.
#include <gtest/gtest.h>

#include <QApplication>
#include <QFont>
#include <QImage>
#include <QPalette>
#include <algorithm>
#include <cmath>
#include <cstdio>
#include <set>
#include <tuple>

#include "tests/storyboard/pages.hpp"
#include "tests/tools/play_files.hpp"
#include "tools/drawing/look_stage.hpp"
#include "tools/steps/script_file.hpp"
#include "tools/storyboard/board.hpp"
#include "tools/storyboard/picture_store.hpp"
#include "tools/storyboard/storyboard.hpp"
#include "tools/support/drivers.hpp"

namespace qz::tools::storyboard {
namespace {

using drivers::Pixels;

constexpr const char* png = "url(data:image/png;base64,";

/// Returns the text behind `begin` up to `end`.
std::string between(const std::string& text, const std::string& begin, const std::string& end) {
  const std::size_t from = text.find(begin);
  if (from == std::string::npos) return "";
  const std::size_t start = from + begin.size();
  return text.substr(start, text.find(end, start) - start);
}

std::size_t count(const std::string& text, const std::string& part) {
  std::size_t found = 0;
  for (std::size_t at = text.find(part); at != std::string::npos; at = text.find(part, at + 1)) {
    ++found;
  }
  return found;
}

QImage imageOf(const std::string& base64) {
  return QImage::fromData(QByteArray::fromBase64(QByteArray::fromStdString(base64)), "PNG");
}

/// Returns the section of a step.
std::string sectionOf(const std::string& page, const std::string& id) {
  return between(page, "<section id=\"" + id + "\"", "</section>");
}

/// Pages of Qt, in an application whose windows nobody sees.
class StoryboardPictures : public testing::Test {
 protected:
  static void SetUpTestSuite() {
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
    requireDriver("qt");
  }

  static const std::string& backupPage() {
    static const std::string page = [] {
      const play::WorkingDirectory directory;
      return madeOn("qt", {backup}).html;
    }();
    return page;
  }
};

/// The lists 2 and 3 change nothing that is seen.
constexpr const char* quietScript = R"({
  1 = ((SET_TEXT_FOR_OBJECT_ID, Hello, 5), (HIDE_OBJECT_WITH_ID, 6));
  2 = ((SET_TAG_FOR_OBJECT_ID, 3, 2));
  3 = ((SET_TEXT_FOR_OBJECT_ID, Unseen, 6), (SET_TAG_FOR_OBJECT_ID, 4, 3));
  4 = ((SET_TEXT_FOR_OBJECT_ID, Bye, 5), (SET_TAG_FOR_OBJECT_ID, 8, 4));
  8 = (TERMINATE_PARSER);
})";
constexpr const char* quietHost = R"(
({ class = NSTextField; tag = 5; frame = (10, 90, 190, 30); },
 { class = NSTextField; tag = 6; frame = (10, 50, 190, 30); },
 { class = NSButton; tag = 2; frame = (10, 10, 90, 30); title = Next; }))";

TEST_F(StoryboardPictures, AreOneForEachLookAndNotForEachPlace) {
  const play::WorkingDirectory directory;
  directory.write("host.plist", quietHost);
  directory.write("quiet.plist", quietScript);
  const auto [page, said] = madeOn("qt", {"quiet.plist", "--window", "host.plist"});
  EXPECT_TRUE(said.starts_with("page.html: 5 steps, 2 pictures, ")) << said;
  for (const std::string id : {"list-1", "list-2", "list-3", "list-4"}) {
    const std::string section = sectionOf(page, id);
    EXPECT_EQ(count(section, "<div class=\"picture drawn\""), 1U) << id;
    EXPECT_EQ(count(section, "<span class=\"patch "), id == "list-4" ? 1U : 0U) << id;
  }
  EXPECT_EQ(count(page, png), 2U) << "the first picture, and where the last is different";
  EXPECT_EQ(count(sectionOf(page, "list-8"), "class=\"picture"), 0U) << "nothing is seen at an end";
}

TEST_F(StoryboardPictures, HaveTwoPixelsAPoint) {
  const std::string& page = backupPage();
  int width = 0;
  int height = 0;
  const std::string size = between(page, "<div class=\"picture drawn\" style=\"", "\"");
  ASSERT_EQ(std::sscanf(size.c_str(), "--width:%d;--height:%d", &width, &height), 2) << size;
  const QImage ground = imageOf(between(page, png, ")"));
  EXPECT_EQ(ground.size(), QSize(2 * width, 2 * height));
}

TEST_F(StoryboardPictures, DependNeitherOnTheMachineNorOnTheApplication) {
  const play::WorkingDirectory directory;
  const std::string& page = backupPage();
  EXPECT_EQ(QApplication::font().family(), "Liberation Sans") << "which is shipped";
  QApplication::setFont(QFont("DejaVu Sans Mono", 30));
  QApplication::setStyle("Windows");
  QApplication::setPalette(QPalette(Qt::red));
  EXPECT_TRUE(madeOn("qt", {backup}).html == page) << "the same bytes";
}

TEST_F(StoryboardPictures, AreInTheStyleAndNotInTheProgram) {
  const std::string& page = backupPage();
  const std::size_t style = page.find("</style>");
  EXPECT_GE(count(page.substr(0, style), png), 2U);
  EXPECT_EQ(count(page.substr(style), "data:image"), 0U);
  EXPECT_EQ(count(page, "<script"), 1U);
  EXPECT_LT(page.size(), 2'000'000U);
  const play::WorkingDirectory directory;
  EXPECT_EQ(count(pageOf({backup}), "data:image"), 0U) << "without Qt there are texts";
}

/// A patch of a page: its place and its picture.
using PatchRule = std::tuple<std::string, std::string>;

std::vector<PatchRule> patchRules(const std::string& page) {
  std::vector<PatchRule> rules;
  while (true) {
    const std::string rule = between(page, "\n.p" + std::to_string(rules.size()) + " {", "}");
    if (rule.empty()) return rules;
    rules.emplace_back(between(rule, "left:", ";background"), between(rule, png, ")"));
  }
}

TEST_F(StoryboardPictures, ShareTheirParts) {
  const std::string& page = backupPage();
  const auto rules = patchRules(page);
  ASSERT_GE(rules.size(), 3U);
  EXPECT_EQ(std::set<PatchRule>(rules.begin(), rules.end()).size(), rules.size())
      << "none is there twice";
  const auto steps = page.substr(page.find("<main"));
  std::size_t shared = 0;
  for (std::size_t i = 0; i < rules.size(); ++i) {
    const std::size_t uses = count(steps, "\"patch p" + std::to_string(i) + "\"");
    EXPECT_GE(uses, 1U) << i;
    if (uses > 1) ++shared;
    EXPECT_FALSE(imageOf(std::get<1>(rules[i])).isNull()) << i;
  }
  EXPECT_GE(shared, 1U);
}

TEST_F(StoryboardPictures, AreInTheMapToo) {
  const std::string map = between(backupPage(), "<div class=\"map\"", "</details>");
  if (map.empty()) GTEST_SKIP() << "this build lays out no graphs";
  EXPECT_EQ(count(map, "<a class=\"node\""), 10U);
  EXPECT_EQ(count(map, "<span class=\"thumbnail drawn\">"), 9U) << "all but that of the end";
  EXPECT_GE(count(map, "<span class=\"patch p"), 8U);
  int height = 0;
  const std::string node = between(map, "px;width:150px;height:", "px");
  ASSERT_EQ(std::sscanf(node.c_str(), "%d", &height), 1) << node;
  EXPECT_GT(height, 40) << "room for more than the title";
}

/// Draws as another artist does, and keeps the pictures instead of writing files.
class Keeper : public drivers::Drawing {
 public:
  explicit Keeper(drivers::Drawing& artist) : artist_(artist) {}

  void drawAlike(std::span<const std::string_view> fonts) override { artist_.drawAlike(fonts); }
  Pixels draw(const toolkit::Ref<toolkit::Window>& window, double density) override {
    return last_ = artist_.draw(window, density);
  }
  std::string pngOf(const Pixels& pixels) override {
    kept_.push_back(pixels);
    return std::to_string(kept_.size() - 1);
  }

  const Pixels& last() const { return last_; }
  const Pixels& kept(const std::string& file) const { return kept_[std::stoul(file)]; }

 private:
  drivers::Drawing& artist_;
  std::vector<Pixels> kept_;
  Pixels last_;
};

/// Puts a patch onto a picture.
void paste(const PagePatch& patch, const Pixels& pixels, Pixels& picture) {
  const auto x = static_cast<int>(std::lround(patch.area.x * picture.width));
  const auto y = static_cast<int>(std::lround(patch.area.y * picture.height));
  ASSERT_EQ(std::lround(patch.area.width * picture.width), pixels.width);
  ASSERT_EQ(std::lround(patch.area.height * picture.height), pixels.height);
  for (std::ptrdiff_t row = 0; row < pixels.height; ++row) {
    std::copy_n(pixels.argb.begin() + row * pixels.width, pixels.width,
                picture.argb.begin() + (y + row) * picture.width + x);
  }
}

/// The walk-through of the backup, explored.
struct ExploredBackup {
  steps::ScriptFile script = steps::openScript(backup);
  check::Script lists{script.file.dictionary()};
  std::string resources = repository + "/examples/first-steps";
  walkthrough::StagePlan plan =
      walkthrough::planStage(script.stage({}), lists.dictionary(), script.file.path());
  check::Setting setting = [this] {
    check::Setting whole = check::settingOf(lists, plan, resources);
    whole.wholeLooks = whole.exactStates = true;
    return whole;
  }();
  check::Exploration exploration{setting, check::startKeysOf(script.file, lists, {})};
};

TEST_F(StoryboardPictures, AreWholeAgainWhenTheirPartsArePutTogether) {
  ExploredBackup explored;
  explored.exploration.run({}, 1, {});
  const Board board(explored.exploration, 1);
  const auto driver = requireDriver("qt");
  driver->setResourcePath(explored.resources);
  Keeper artist(dynamic_cast<drivers::Drawing&>(*driver));
  Page page;
  PictureStore store(artist, page);
  std::size_t different = 0;
  for (const BoardStep& step : board.steps()) {
    if (step.isOver) continue;
    drawing::LookStage stage(*driver, explored.exploration, step.place, step.look);
    const auto patches = store.add(stage.window(), stage.picture());
    Pixels made = artist.kept(page.ground);
    for (const std::size_t patch : patches) {
      paste(page.patches[patch], artist.kept(page.patches[patch].png), made);
    }
    EXPECT_TRUE(made == artist.last()) << step.group;
    if (!patches.empty()) ++different;
  }
  EXPECT_GE(different, 6U);
}

TEST_F(StoryboardPictures, AreNotMadeOfAWindowThatIsNotShown) {
  const auto driver = requireDriver("qt");
  const auto window = driver->makeWindow({0, 0, 100, 50});
  window->orderOut();
  Page page;
  PictureStore store(dynamic_cast<drivers::Drawing&>(*driver), page);
  EXPECT_TRUE(store.add(window, {}).empty());
  EXPECT_EQ(page.ground, "");
}

TEST_F(StoryboardPictures, AreCountedWhileTheyAreDrawn) {
  const play::WorkingDirectory directory;
  directory.write("host.plist", quietHost);
  directory.write("quiet.plist", quietScript);
  const steps::ScriptFile script = steps::openScript("quiet.plist");
  StoryboardOptions options;
  options.check.stage.window = "host.plist";
  options.check.toolkit = testToolkit();
  options.toolkit = "qt";
  const std::string page = makeStoryboard(script.file, options, {}).html;
  std::vector<std::pair<std::size_t, std::size_t>> calls;
  options.drawing = [&](std::size_t done, std::size_t all) { calls.emplace_back(done, all); };
  EXPECT_TRUE(makeStoryboard(script.file, options, {}).html == page);
  ASSERT_EQ(calls.size(), 5U);
  for (std::size_t i = 0; i < calls.size(); ++i) EXPECT_EQ(calls[i], std::pair(i, calls.size()));
}

}  // namespace
}  // namespace qz::tools::storyboard
