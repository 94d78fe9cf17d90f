// SPDX-License-Identifier: MIT
// The table of object timers while the engine works on it: cancelling or releasing a timer can run
// code that changes the table.

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <utility>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"

namespace qz {

namespace {

using Engine = QZ_Plist_State_Parser;

/// A timer that calls the test when it is cancelled and when it is destroyed.
struct NotifyingTimer final : toolkit::Timer {
  ~NotifyingTimer() override {
    if (onEnd) onEnd();
  }
  bool isValid() const override { return valid; }
  void invalidate() override {
    valid = false;
    if (onCancel) onCancel();
  }
  double interval() const override { return 1; }
  double timeLeft() const override { return 1; }

  bool valid = true;
  std::function<void()> onCancel;
  std::function<void()> onEnd;
};

class ChangingTables : public testing::Test {
 protected:
  ChangingTables() {
    first->onCancel = [this] {
      timers->removeAllObjects();
      timers->setObject(std::make_shared<NotifyingTimer>(), "3");
    };
    timers->setObject(first, "1");
    timers->setObject(second, "2");
    engine->setObjectIdTimers(timers);
  }

  drivers::MemoryDriver driver;
  std::shared_ptr<NotifyingTimer> first = std::make_shared<NotifyingTimer>();
  std::shared_ptr<NotifyingTimer> second = std::make_shared<NotifyingTimer>();
  Engine::Timers timers = toolkit::Table<Engine::Timer>::make();
  std::shared_ptr<Engine> engine = Engine::init(driver.toolkit());
};

TEST_F(ChangingTables, EveryTimerThatWasThereIsCancelled) {
  engine->killAllTimers();
  EXPECT_FALSE(first->valid);
  EXPECT_FALSE(second->valid);
  EXPECT_EQ(timers->count(), 0U);
}

TEST_F(ChangingTables, AnEngineThatEndsCancelsEveryTimerThatWasThere) {
  engine.reset();
  EXPECT_FALSE(first->valid);
  EXPECT_FALSE(second->valid);
  EXPECT_EQ(timers->count(), 0U);
}

TEST_F(ChangingTables, ATimerThatIsTakenOutMayEmptyTheTable) {
  second->onEnd = [this] { timers->removeAllObjects(); };
  second.reset();
  timers->removeObjectForKey("2");
  EXPECT_EQ(timers->count(), 0U);
}

TEST_F(ChangingTables, ATimerThatIsReplacedMayEmptyTheTable) {
  std::size_t entriesAtItsEnd = 0;
  second->onEnd = [&] {
    entriesAtItsEnd = timers->count();
    timers->removeAllObjects();
  };
  second.reset();
  timers->setObject(std::make_shared<NotifyingTimer>(), "2");
  EXPECT_EQ(entriesAtItsEnd, 2U);
  EXPECT_EQ(timers->count(), 0U);
}

}  // namespace

}  // namespace qz
