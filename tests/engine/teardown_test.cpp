// SPDX-License-Identifier: MIT
// The order in which a termination tears things down, seen from the calls it makes.

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"
#include "tests/engine/fakes.hpp"

namespace qz {

namespace {

using Engine = QZ_Plist_State_Parser;

class Teardown : public testing::Test {
 protected:
  Teardown() {
    engine->getGuiAssetsFromWindow(toolkit::Ref<toolkit::Window>(window));
    engine->plistDictionary()->setObject(toolkit::Array::make(), "1");
    engine->setCommandArray(toolkit::Array::make());
    engine->startTimerWithValue(5, "1");
    engine->addedObjectToTutorial()->addObject(button);
  }
  ~Teardown() override { engine->terminateParser(); }

  bool everythingIsThere() const {
    return !engine->terminating() && !engine->hasTerminated() && engine->flashingTimer() &&
           engine->flashingTimer()->isValid() && engine->objectIdTimers()->count() == 1 &&
           engine->addedObjectToTutorial()->count() == 1 && engine->guiAssets()->count() == 1 &&
           engine->plistDictionary()->count() == 1 && engine->commandArray();
  }
  bool everythingIsGone() const {
    return engine->terminating() && !engine->flashingTimer() && !engine->objectIdTimers() &&
           !engine->addedObjectToTutorial() && !engine->guiAssets() && !engine->plistDictionary() &&
           !engine->commandArray();
  }

  drivers::MemoryDriver driver;
  toolkit::Ref<toolkit::Button> button = driver.toolkit().application().makeButton({0, 0, 9, 9});
  std::shared_ptr<fakes::FakeWindow> window = fakes::windowWith(button.pointer());
  std::shared_ptr<Engine> engine = Engine::initWithWindow(driver.toolkit(), nullptr);
};

TEST_F(Teardown, TagsArePutBackBeforeAnythingGoes) {
  button->setTag(40);
  int lines = 0;
  driver.setLogSink([&](std::string_view) {
    ++lines;
    EXPECT_TRUE(everythingIsThere());
    EXPECT_EQ(window->closes, 0);
  });
  engine->terminateParser();
  EXPECT_EQ(lines, 1);
  EXPECT_EQ(button->tag(), 0);
}

TEST_F(Teardown, TheWindowIsClosedWhenEverythingIsGone) {
  window->onClose = [&] {
    EXPECT_TRUE(everythingIsGone());
    EXPECT_TRUE(engine->hasTerminated());
  };
  engine->terminateParser();
  EXPECT_EQ(window->closes, 1);
}

TEST_F(Teardown, AWindowThatTerminatesWhileItClosesIsClosedOnce) {
  window->onClose = [&] { engine->terminateParser(); };
  engine->terminateParser();
  EXPECT_EQ(window->closes, 1);
}

TEST_F(Teardown, ASecondTerminationPutsBackTagsOfNewRecords) {
  engine->terminateParser();
  engine->setGuiAssets(toolkit::Table<AssetRecord>::make());
  engine->getGuiAssetsFromWindow(toolkit::Ref<toolkit::Window>(window));
  button->setTag(40);
  engine->terminateParser();
  EXPECT_EQ(button->tag(), 0);
  EXPECT_EQ(window->closes, 1);
}

TEST_F(Teardown, AFlasherThatTheHostStoppedIsDroppedAllTheSame) {
  engine->flashingTimer()->invalidate();
  engine->terminateParser();
  EXPECT_FALSE(engine->flashingTimer());
}

TEST_F(Teardown, TimersThatAreStoppedAlreadyGoWithTheirTable) {
  const auto timers = engine->objectIdTimers();
  timers->objectForKey("1")->invalidate();
  engine->terminateParser();
  EXPECT_EQ(timers->count(), 0U);
  EXPECT_FALSE(engine->objectIdTimers());
}

class EndWatcher final : public toolkit::SheetDelegate {
 public:
  explicit EndWatcher(std::function<void()> onEnd) : onEnd_(std::move(onEnd)) {}
  void sheetDidEnd(const toolkit::Ref<toolkit::Window>& sheet, long returnCode,
                   void* contextInfo) override {
    EXPECT_EQ(returnCode, 0);
    EXPECT_EQ(contextInfo, nullptr);
    ended = sheet;
    onEnd_();
  }

  toolkit::Ref<toolkit::Window> ended;

 private:
  std::function<void()> onEnd_;
};

TEST_F(Teardown, ASheetEndsWhenEverythingIsGone) {
  const auto panel = driver.makeWindow({0, 0, 100, 100});
  const auto watcher = std::make_shared<EndWatcher>([&] { EXPECT_TRUE(everythingIsGone()); });
  engine->setTutorialWindow(panel);
  EXPECT_TRUE(engine->loadPlist("no such script", std::nullopt, watcher, true));
  engine->terminateParser();
  EXPECT_TRUE(watcher->ended == panel);
  EXPECT_TRUE(driver.look(panel).visible);  // ordering it out is the delegate's job
}

// The delegate belongs to the host: the engine does not keep it.
TEST_F(Teardown, ASheetMayEndWithoutADelegate) {
  const auto panel = driver.makeWindow({0, 0, 100, 100});
  engine->setTutorialWindow(panel);
  {
    const auto watcher = std::make_shared<EndWatcher>([] { FAIL() << "told after its end"; });
    EXPECT_TRUE(engine->loadPlist("no such script", std::nullopt, watcher, true));
    EXPECT_EQ(watcher.use_count(), 1);
  }
  engine->terminateParser();
  EXPECT_EQ(driver.look(panel).sheetEnds, std::vector<long>{0});
  EXPECT_TRUE(engine->loadPlist("no such script", std::nullopt, nullptr, true));
}

}  // namespace

}  // namespace qz
