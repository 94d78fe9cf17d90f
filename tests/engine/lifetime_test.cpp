// SPDX-License-Identifier: MIT
// The end of an engine that was not terminated: what it stops and empties, and what kept it alive.

#include <gtest/gtest.h>

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"

namespace qz {

namespace {

using Engine = QZ_Plist_State_Parser;
using toolkit::Number;

class Lifetime : public testing::Test {
 protected:
  Engine::Timer timer(bool repeats = false) {
    return driver->toolkit().runLoop().schedule(1000, repeats, [](const Engine::Timer&) {});
  }

  std::optional<drivers::MemoryDriver> driver{std::in_place};
  std::shared_ptr<Engine> engine = Engine::init(driver->toolkit());
};

TEST_F(Lifetime, AnEndingEngineStopsItsFlasher) {
  const auto flasher = timer(true);
  engine->setFlashingTimer(flasher);
  engine.reset();
  EXPECT_FALSE(flasher->isValid());
}

TEST_F(Lifetime, AnEndingEngineStopsItsTimersAndEmptiesTheirTable) {
  const auto pending = timer();
  const auto stopped = timer();
  stopped->invalidate();
  const auto timers = toolkit::Table<Engine::Timer>::make();
  timers->setObject(pending, "1");
  timers->setObject(stopped, "2");
  engine->setObjectIdTimers(timers);
  engine.reset();
  EXPECT_FALSE(pending->isValid());
  EXPECT_EQ(timers->count(), 0U);
}

TEST_F(Lifetime, AnEndingEngineLeavesTheOtherTablesAsTheyAre) {
  const auto script = toolkit::Dictionary::make();
  const auto tags = toolkit::Dictionary::make();
  const auto flashing = toolkit::Dictionary::make();
  const auto list = toolkit::Array::make({Number::withLong(1)});
  const auto assets = toolkit::Table<AssetRecord>::make();
  for (const auto& table : {script, tags, flashing}) table->setObject(Number::withLong(1), "1");
  assets->setObject({}, "1");
  engine->setPlistDictionary(script);
  engine->setOriginalTagValues(tags);
  engine->setFlashingTagIds(flashing);
  engine->setCommandArray(list);
  engine->setGuiAssets(assets);
  engine.reset();
  for (const auto& table : {script, tags, flashing}) EXPECT_EQ(table->count(), 1U);
  EXPECT_EQ(list->count(), 1U);
  EXPECT_EQ(assets->count(), 1U);
}

// Unlike termination, which treats an absent window as a different one.
TEST_F(Lifetime, AddedControlsAreLetGoOfOnlyBetweenTwoWindows) {
  const struct {
    const char* name;
    bool tutorial;
    bool host;
    bool same;
    bool emptied;
  } cases[] = {
      {"two windows", true, true, false, true},
      {"one window that is both", true, true, true, false},
      {"no host window", true, false, false, false},
      {"no walk-through window", false, true, false, false},
      {"no window", false, false, false, false},
  };
  for (const auto& wanted : cases) {
    SCOPED_TRACE(wanted.name);
    const auto first = driver->makeWindow({0, 0, 100, 100});
    const auto second = driver->makeWindow({0, 0, 100, 100});
    const auto added = toolkit::List<Engine::Control>::make();
    added->addObject(first->contentView());
    engine = Engine::init(driver->toolkit());
    if (wanted.tutorial) engine->setTutorialWindow(first);
    if (wanted.host) engine->setWindow(wanted.same ? first : second);
    engine->setAddedObjectToTutorial(added);
    engine.reset();
    EXPECT_EQ(added->count(), wanted.emptied ? 0U : 1U);
  }
}

TEST_F(Lifetime, AnEndingEngineClosesNoWindow) {
  const auto window = driver->makeWindow({0, 0, 100, 100});
  engine->getGuiAssetsFromWindow(window);
  engine.reset();
  EXPECT_EQ(driver->look(window).closes, 0);
  EXPECT_TRUE(driver->look(window).visible);
}

TEST_F(Lifetime, TheRunningFlasherAloneKeepsAnEngine) {
  engine = Engine::initWithWindow(driver->toolkit(), nullptr);
  const std::weak_ptr<Engine> watched = engine;
  const auto flasher = engine->flashingTimer();
  engine.reset();
  driver->advance(10);
  EXPECT_FALSE(watched.expired());
  flasher->invalidate();
  EXPECT_TRUE(watched.expired());
}

TEST_F(Lifetime, APendingObjectTimerKeepsAnEngineUntilItFires) {
  engine->setObjectIdTimers(toolkit::Table<Engine::Timer>::make());
  engine->startTimerWithValue(2, "5");
  const std::weak_ptr<Engine> watched = engine;
  engine.reset();
  driver->advance(1);
  EXPECT_FALSE(watched.expired());
  driver->advance(2);
  EXPECT_TRUE(watched.expired());
}

TEST_F(Lifetime, AnEngineKeepsTheWindowItBuiltAndNoOther) {
  auto adopted = driver->makeWindow({0, 0, 100, 100});
  auto host = driver->makeWindow({0, 0, 100, 100});
  engine = Engine::initWithWindow(driver->toolkit(), host);
  engine->getGuiAssetsFromWindow(adopted);
  adopted = nullptr;
  host = nullptr;
  EXPECT_FALSE(engine->tutorialWindow());
  EXPECT_FALSE(engine->window());
  const auto frame =
      toolkit::Array::make({toolkit::String::make("NSButton"), Number::withLong(0),
                            Number::withLong(0), Number::withLong(9), Number::withLong(9)});
  const auto description = toolkit::Dictionary::make();
  description->setObject(frame, "1");
  EXPECT_TRUE(engine->loadGuiAssets(description, nullptr));
  engine->tutorialWindow()->orderOut();
  EXPECT_TRUE(engine->tutorialWindow());
  engine->terminateParser();
}

TEST_F(Lifetime, AWindowGivenThroughAPropertyIsKept) {
  engine->setWindow(driver->makeWindow({0, 0, 100, 100}));
  engine->setTutorialWindow(driver->makeWindow({0, 0, 100, 100}));
  EXPECT_TRUE(engine->window());
  EXPECT_TRUE(engine->tutorialWindow());
}

// The run loop holds the last reference to an engine that its host forgot to terminate.
TEST_F(Lifetime, AnEngineEndsWithItsToolkit) {
  engine = Engine::initWithWindow(driver->toolkit(), nullptr);
  engine->startTimerWithValue(2, "5");
  const std::weak_ptr<Engine> watched = engine;
  engine.reset();
  driver.reset();
  EXPECT_TRUE(watched.expired());
}

TEST_F(Lifetime, AnEngineMayEndAfterItsToolkit) {
  const auto window = driver->makeWindow({0, 0, 100, 100});
  engine = Engine::initWithWindow(driver->toolkit(), window);
  engine->startTimerWithValue(2, "5");
  const auto timers = engine->objectIdTimers();
  driver.reset();
  engine.reset();
  EXPECT_EQ(timers->count(), 0U);
}

/// A host that releases its engine during a call, at the first line that is logged.
class LetGo : public Lifetime {
 protected:
  LetGo() {
    engine = Engine::initWithWindow(driver->toolkit(), nullptr);
    engine->getGuiAssetsFromWindow(window);
    const Engine::Value raises = toolkit::Array::make();
    const auto text = [](std::string_view name) { return toolkit::String::make(name); };
    const auto speak =
        toolkit::Array::make({text("SET_TITLE_FOR_OBJECT_ID"), text("done"), Number::withLong(7)});
    engine->plistDictionary()->setObject(toolkit::Array::make({raises, speak}), "7");
    engine->plistDictionary()->setObject(toolkit::Array::make({raises, speak}), "8");
    driver->setLogSink([this](std::string_view) { engine.reset(); });
  }

  /// Calls the engine, which only the host keeps. True if the host released the engine and it then
  /// ended.
  template <class Call>
  bool endsOnlyAfter(Call call) {
    engine->flashingTimer()->invalidate();
    const std::weak_ptr<Engine> watched = engine;
    call(*engine);
    return !engine && watched.expired();
  }
  std::string title() { return driver->look(button).title.string(); }

  toolkit::Ref<toolkit::Window> window = driver->makeWindow({0, 0, 300, 200});
  toolkit::Ref<toolkit::View> button =
      driver->makeView(drivers::ViewKind::button, 7, {20, 20, 100, 30}, window->contentView());
};

TEST_F(LetGo, InARunTheRunIsDone) {
  EXPECT_TRUE(endsOnlyAfter([](Engine& called) {
    called.processCommandArray(called.plistDictionary()->objectForKey("7"), Number::withLong(7));
  }));
  EXPECT_EQ(title(), "done");
}

TEST_F(LetGo, InAPressItsListIsDone) {
  EXPECT_TRUE(endsOnlyAfter([this](Engine& called) { called.buttonPushed(button); }));
  EXPECT_EQ(title(), "done");
}

TEST_F(LetGo, InALoadItsListIsDone) {
  EXPECT_TRUE(endsOnlyAfter(
      [](Engine& called) { EXPECT_TRUE(called.loadPlist("none.plist", "7", nullptr, false)); }));
  EXPECT_EQ(title(), "done");
}

TEST_F(LetGo, InATimersPressItsListIsDone) {
  const auto fired = timer();
  engine->objectIdTimers()->setObject(fired, "7");
  EXPECT_TRUE(endsOnlyAfter([&](Engine& called) { called.pseudoButtonPush(fired); }));
  EXPECT_EQ(title(), "done");
}

TEST_F(LetGo, InATimersOwnListTheListIsDone) {
  const auto fired = timer();
  engine->objectIdTimers()->setObject(fired, "8");
  EXPECT_TRUE(endsOnlyAfter([&](Engine& called) { called.pseudoButtonPush(fired); }));
  EXPECT_EQ(title(), "done");
}

TEST_F(LetGo, InATerminationTheWindowIsClosed) {
  EXPECT_TRUE(endsOnlyAfter([](Engine& called) { called.terminateParser(); }));
  EXPECT_EQ(driver->look(window).closes, 1);
}

/// Records the calls it receives.
class AskedTimer final : public toolkit::Timer {
 public:
  explicit AskedTimer(bool valid) : valid_(valid) {}
  bool isValid() const override {
    calls.emplace_back("isValid");
    return valid_;
  }
  void invalidate() override {
    calls.emplace_back("invalidate");
    valid_ = false;
  }
  double interval() const override { return 1; }
  double timeLeft() const override { return 0; }

  mutable std::vector<std::string> calls;

 private:
  bool valid_;
};

TEST_F(Lifetime, OnlyAnEndingEnginesObjectTimersAreStoppedUnasked) {
  using Calls = std::vector<std::string>;
  for (const bool valid : {true, false}) {
    for (const bool terminated : {true, false}) {
      const auto flasher = std::make_shared<AskedTimer>(valid);
      const auto pending = std::make_shared<AskedTimer>(valid);
      const auto timers = toolkit::Table<Engine::Timer>::make();
      timers->setObject(Engine::Timer(pending), "1");
      engine = Engine::init(driver->toolkit());
      engine->setFlashingTimer(Engine::Timer(flasher));
      engine->setObjectIdTimers(timers);
      if (terminated) engine->terminateParser();
      engine.reset();
      const Calls asked = valid ? Calls{"isValid", "invalidate"} : Calls{"isValid"};
      EXPECT_EQ(flasher->calls, asked);
      EXPECT_EQ(pending->calls, terminated ? asked : Calls{"invalidate"});
    }
  }
}

}  // namespace

}  // namespace qz
