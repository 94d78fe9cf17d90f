// SPDX-License-Identifier: MIT
// The order of a press's steps, and timers that are not the engine's.

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"

namespace qz {

namespace {

using Engine = QZ_Plist_State_Parser;
using toolkit::Array;
using toolkit::Number;
using toolkit::String;

class Presses : public testing::Test {
 protected:
  Presses() {
    engine->getGuiAssetsFromWindow(window);
    driver.setLogSink([this](std::string_view line) {
      log.emplace_back(line);
      if (onLog) onLog();
    });
  }
  ~Presses() override {
    driver.setLogSink(nullptr);
    engine->terminateParser();
  }

  /// Puts a list that does nothing into the script under `key`.
  void giveListTo(std::string_view key) {
    engine->plistDictionary()->setObject(Array::make({String::make("IDLE_LOOP")}), key);
  }
  Engine::Timer timer() {
    return driver.toolkit().runLoop().schedule(1000, false, [](const Engine::Timer&) {});
  }

  std::vector<std::string> log;
  std::function<void()> onLog;
  drivers::MemoryDriver driver;
  toolkit::Ref<toolkit::Window> window = driver.makeWindow({0, 0, 300, 200});
  toolkit::Ref<toolkit::View> button =
      driver.makeView(drivers::ViewKind::toggle, 7, {20, 20, 100, 30}, window->contentView());
  std::shared_ptr<Engine> engine = Engine::initWithWindow(driver.toolkit(), nullptr);
};

TEST_F(Presses, TimersAreCancelledBeforeTheLineAndTheStateIsRecordedBehindIt) {
  giveListTo("7");
  engine->startTimerWithValue(5, "9");
  onLog = [&] {
    EXPECT_EQ(engine->objectIdTimers()->count(), 0U);
    EXPECT_EQ(engine->buttonStates()->count(), 0U);
    EXPECT_FALSE(engine->lastTagId());
  };
  driver.click(button);
  EXPECT_EQ(log, std::vector<std::string>{"Button tag 7 pressed."});
  EXPECT_EQ(engine->buttonStates()->count(), 1U);
  EXPECT_EQ(engine->currentCommandState(), "7");
}

TEST_F(Presses, TheStateIsTheOneWhenItIsRecorded) {
  onLog = [&] { toolkit::asButton(button)->setState(toolkit::State::on); };
  engine->buttonPushed(button);
  EXPECT_TRUE(engine->buttonStates()->objectForKey("7")->boolValue());
}

TEST_F(Presses, ATimerThatTheTableDoesNotHoldDoesNothing) {
  giveListTo("9");
  engine->startTimerWithValue(5, "9");
  engine->pseudoButtonPush(timer());
  engine->pseudoButtonPush(nullptr);
  EXPECT_EQ(engine->objectIdTimers()->count(), 1U);
  EXPECT_FALSE(engine->lastTagId());
}

TEST_F(Presses, ATimerUnderTwoKeysRunsOneOfThemOnce) {
  giveListTo("8");
  giveListTo("9");
  const auto shared = timer();
  engine->objectIdTimers()->setObject(shared, "8");
  engine->objectIdTimers()->setObject(shared, "9");
  engine->pseudoButtonPush(shared);
  EXPECT_EQ(engine->objectIdTimers()->count(), 0U);
  EXPECT_TRUE(engine->currentCommandState() == "8" || engine->currentCommandState() == "9");
  const std::string state = engine->currentCommandState();
  engine->pseudoButtonPush(shared);
  EXPECT_EQ(engine->currentCommandState(), state);
}

TEST_F(Presses, AFiringCancelsTheOthersBeforeItPresses) {
  engine->startTimerWithValue(1, "7");
  engine->startTimerWithValue(5, "9");
  const auto other = engine->objectIdTimers()->objectForKey("9");
  onLog = [&] { EXPECT_FALSE(other->isValid()); };
  driver.advance(2);
  EXPECT_EQ(log, std::vector<std::string>{"Button tag 7 pressed."});
}

TEST_F(Presses, AFiringWhoseValueIsNoListRaisesOutOfTheRunLoop) {
  engine->plistDictionary()->setObject(String::make("no list"), "9");
  engine->startTimerWithValue(1, "9");
  EXPECT_THROW(driver.advance(2), toolkit::Exception);
  EXPECT_EQ(engine->currentCommandState(), "9");
  EXPECT_EQ(engine->objectIdTimers()->count(), 0U);
}

TEST_F(Presses, ARecordedStateIsABoolean) {
  driver.click(button);
  const auto state = toolkit::asNumber(engine->buttonStates()->objectForKey("7"));
  EXPECT_EQ(state->type(), Number::Type::boolean);
  EXPECT_TRUE(state->boolValue());
}

}  // namespace

}  // namespace qz
