// SPDX-License-Identifier: MIT
// What an observer learns about lists, commands, looked-up controls and timers.
#include "qz/observer.hpp"

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"
#include "qz/property_list/reader.hpp"

namespace qz {

namespace {

/// Records every event as a line.
struct Notes final : qz::Observer {
  void listWillRun(const Value&, const ObjectId& id) override {
    lines.push_back("list for " + (id ? id->description() : "nothing"));
  }
  void listDidRun(const Value&, const ObjectId&) override { lines.emplace_back("list ends"); }
  void commandWillRun(const Value&, std::size_t index) override { add("command ", index); }
  void commandDidRun(const Value&, std::size_t index, bool result) override {
    add(result ? "YES from " : "NO from ", index);
  }
  void commandRaised(const Value&, std::size_t index, const toolkit::Exception& raised) override {
    add(raised.name() + " from ", index);
  }
  void controlSought(toolkit::Tag tag, const toolkit::Ref<toolkit::View>& control) override {
    lines.push_back((control ? "found " : "no control ") + std::to_string(tag));
  }
  void controlPressed(const toolkit::Ref<toolkit::View>& control) override {
    add("pressed ", static_cast<std::size_t>(control->tag()));
  }
  void timerSet(std::string_view key, double seconds) override {
    add("timer " + std::string(key) + " of seconds: ", static_cast<std::size_t>(seconds));
  }
  void timerFired(std::string_view key) override { lines.push_back("fired " + std::string(key)); }
  void timerCancelled(std::string_view key) override {
    lines.push_back("cancelled " + std::string(key));
  }

  void add(const std::string& what, std::size_t number) {
    lines.push_back(what + std::to_string(number));
  }

  std::vector<std::string> lines;
};

using Lines = std::vector<std::string>;

class ObserverTest : public testing::Test {
 protected:
  ObserverTest() {
    driver.setLogSink([](std::string_view) {});
    button = driver.makeView(drivers::ViewKind::button, 1, {0, 0, 80, 20}, window->contentView());
    engine->getGuiAssetsFromWindow(window);
    engine->setObserver(notes);
  }
  ~ObserverTest() override { engine->terminateParser(); }

  void use(std::string_view script) {
    engine->setPlistDictionary(toolkit::dictionaryFromPropertyList(script));
  }
  /// Returns the lines recorded since the last call.
  Lines noted() { return std::exchange(notes->lines, {}); }

  drivers::MemoryDriver driver;
  toolkit::Ref<toolkit::Window> window = driver.makeWindow({0, 0, 200, 100});
  toolkit::Ref<toolkit::View> button;
  std::shared_ptr<QZ_Plist_State_Parser> engine =
      QZ_Plist_State_Parser::initWithWindow(driver.toolkit(), window);
  std::shared_ptr<Notes> notes = std::make_shared<Notes>();
};

TEST_F(ObserverTest, IsToldOfListsAndTheirCommandsInOrder) {
  use("{ 1 = ((SHOW_OBJECT_WITH_ID, 1), (PROCESS_COMMANDS_FOR_ID, 2), (FLASH_ID), NOTHING);"
      "  2 = (IDLE_LOOP); }");
  driver.click(button);
  EXPECT_EQ(noted(),
            (Lines{"pressed 1", "list for 1", "command 0", "found 1", "found 1", "YES from 0",
                   "command 1", "list for 2", "command 0", "no control 2", "YES from 0",
                   "list ends", "YES from 1", "command 2", "NSRangeException from 2", "command 3",
                   "found 1", "NO from 3", "list ends"}));
}

TEST_F(ObserverTest, IsToldOfControlsThatAreNotThere) {
  use("{ 1 = ((SET_TITLE_FOR_OBJECT_ID, Go, 9)); }");
  driver.click(button);
  EXPECT_EQ(noted(), (Lines{"pressed 1", "list for 1", "command 0", "no control 9", "NO from 0",
                            "list ends"}));
}

TEST_F(ObserverTest, IsToldOfTimersThatFire) {
  use("{ 1 = ((SET_TIMER_FOR_ID, 3, 5)); 5 = (IDLE_LOOP); }");
  driver.click(button);
  EXPECT_EQ(noted(), (Lines{"pressed 1", "list for 1", "command 0", "no control 5",
                            "timer 5 of seconds: 3", "NO from 0", "list ends"}));
  driver.advance(3);
  EXPECT_EQ(noted(), (Lines{"fired 5", "no control 5", "list for 5", "command 0", "no control 5",
                            "YES from 0", "list ends"}));
}

TEST_F(ObserverTest, IsToldOfTimersThatAreCancelled) {
  engine->startTimerWithValue(3, "5");
  engine->startTimerWithValue(4, "1");
  engine->QZ_Plist_State_Processor_SET_TIMER(0, toolkit::Number::withLong(1));
  engine->killAllTimers();
  EXPECT_EQ(noted(), (Lines{"timer 5 of seconds: 3", "timer 1 of seconds: 4", "found 1",
                            "cancelled 1", "cancelled 5"}));
  engine->QZ_Plist_State_Processor_SET_TIMER(0, toolkit::Number::withLong(1));
  EXPECT_EQ(noted(), Lines{"found 1"}) << "nothing was pending";
}

TEST_F(ObserverTest, NeedNotListenToEverything) {
  engine->setObserver(std::make_shared<qz::Observer>());
  use("{ 1 = ((SET_TIMER_FOR_ID, 1, 2), (FLASH_ID)); 2 = (IDLE_LOOP); }");
  driver.click(button);
  driver.advance(1);
  EXPECT_EQ(engine->currentCommandState(), "2");
}

/// Removes itself from the engine at the first event.
struct Leaving final : qz::Observer {
  explicit Leaving(QZ_Plist_State_Parser& engine) : engine_(engine) {}
  void listWillRun(const Value&, const ObjectId&) override {
    engine_.setObserver(nullptr);
    ++told;
  }
  void listDidRun(const Value&, const ObjectId&) override { ++told; }
  QZ_Plist_State_Parser& engine_;
  int told = 0;
};

TEST_F(ObserverTest, MayBeReplacedWhileItIsTold) {
  auto leaving = std::make_shared<Leaving>(*engine);
  const std::weak_ptr<Leaving> watched = leaving;
  engine->setObserver(leaving);
  use("{ 1 = (IDLE_LOOP); }");
  driver.click(button);
  EXPECT_EQ(leaving->told, 1);
  EXPECT_EQ(engine->observer(), nullptr);
  leaving = nullptr;
  EXPECT_TRUE(watched.expired());
}

}  // namespace

}  // namespace qz
