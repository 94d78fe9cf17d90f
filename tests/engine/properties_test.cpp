// SPDX-License-Identifier: MIT
// The engine's properties: what a getter returns, and that any thread may use them.

#include <gtest/gtest.h>

#include <atomic>
#include <functional>
#include <memory>
#include <string>
#include <thread>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"

namespace qz {

namespace {

using Engine = QZ_Plist_State_Parser;
using toolkit::Array;
using toolkit::Dictionary;
using toolkit::Number;
using toolkit::String;

class Properties : public testing::Test {
 protected:
  ~Properties() override { engine->terminateParser(); }

  drivers::MemoryDriver driver;
  std::shared_ptr<Engine> engine = Engine::initWithWindow(driver.toolkit(), nullptr);
};

TEST_F(Properties, GettersHandOutTheEnginesOwnTables) {
  EXPECT_TRUE(engine->plistDictionary() == engine->plistDictionary());
  EXPECT_TRUE(engine->flashingTagIds() == engine->flashingTagIds());
  EXPECT_TRUE(engine->originalTagValues() == engine->originalTagValues());
  EXPECT_TRUE(engine->objectIdTimers() == engine->objectIdTimers());
  EXPECT_TRUE(engine->guiAssets() == engine->guiAssets());
  EXPECT_TRUE(engine->addedObjectToTutorial() == engine->addedObjectToTutorial());
  EXPECT_TRUE(engine->flashingTimer() == engine->flashingTimer());
}

TEST_F(Properties, WhatTheHostPutsIntoATableTheEngineFindsThere) {
  engine->plistDictionary()->setObject(Array::make({String::make("IDLE_LOOP")}), "5");
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID(Number::withLong(5)));
  engine->flashingTagIds()->setObject(Number::withBool(true), "6");
  EXPECT_FALSE(engine->QZ_Plist_State_Processor_FLASH_ID(Number::withLong(6), false));
}

TEST_F(Properties, SettersKeepTheVeryObject) {
  const auto script = Dictionary::make();
  const auto id = Number::withLong(5);
  const Engine::Value list = Array::make();
  engine->setPlistDictionary(script);
  engine->setObjectId(id);
  engine->setLastTagId(id);
  engine->setCommandArray(list);
  EXPECT_TRUE(engine->plistDictionary() == script);
  EXPECT_TRUE(engine->objectId() == id);
  EXPECT_TRUE(engine->lastTagId() == id);
  EXPECT_TRUE(engine->commandArray() == list);
}

TEST_F(Properties, ATableThatWasKeptOutlivesItsEngine) {
  const auto other = Engine::initWithWindow(driver.toolkit(), nullptr);
  const auto flashing = other->flashingTagIds();
  other->QZ_Plist_State_Processor_FLASH_ID(Number::withLong(6), true);
  other->terminateParser();
  EXPECT_EQ(flashing->count(), 1U);
}

/// Runs each task on its own thread, again and again until `work` is done.
template <class Work>
void meanwhile(const std::vector<std::function<void()>>& tasks, Work work) {
  std::atomic<bool> done = false;
  std::atomic<std::size_t> started = 0;
  std::vector<std::thread> threads;
  threads.reserve(tasks.size());
  for (const auto& task : tasks) {
    threads.emplace_back([&] {
      ++started;
      while (!done) task();
    });
  }
  while (started < tasks.size()) std::this_thread::yield();
  work();
  done = true;
  for (auto& thread : threads) thread.join();
}

/// Returns a script whose list 1 runs list 2, which does nothing.
Engine::Dictionary script() {
  auto script = Dictionary::make();
  script->setObject(
      Array::make({Array::make({String::make("PROCESS_COMMANDS_FOR_ID"), Number::withLong(2)})}),
      "1");
  script->setObject(Array::make({String::make("IDLE_LOOP")}), "2");
  return script;
}

TEST_F(Properties, AGetterNeverMissesWhatASetterReplaces) {
  std::atomic<bool> damaged = false;
  const auto set = [&] { engine->setPlistDictionary(script()); };
  const auto get = [&] {
    if (engine->plistDictionary()->count() != 2) damaged = true;
  };
  set();
  meanwhile({set, get, get}, [&] {
    for (int i = 0; i < 3000; ++i) set();
  });
  EXPECT_FALSE(damaged);
}

TEST_F(Properties, AnyThreadMayAskWhileTheEngineRuns) {
  engine->setPlistDictionary(script());
  std::atomic<bool> damaged = false;
  const auto askForId = [&] {
    const auto id = engine->lastTagId();
    if (id && id->longValue() != 1 && id->longValue() != 2) damaged = true;
  };
  const auto askForScript = [&] {
    if (engine->plistDictionary()->count() != 2) damaged = true;
  };
  meanwhile({askForId, askForScript}, [&] {
    for (int i = 0; i < 3000; ++i) {
      EXPECT_TRUE(engine->QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID(Number::withLong(1)));
    }
  });
  EXPECT_FALSE(damaged);
}

TEST_F(Properties, AnyThreadMayReplaceWhileTheEngineRuns) {
  engine->setPlistDictionary(script());
  const auto replace = [&] {
    engine->setPlistDictionary(script());
    engine->setLastTagId(Number::withLong(3));
    engine->setCommandArray(Array::make());
    engine->setObjectId(Number::withLong(4));
    engine->setFlashingTagIds(Dictionary::make());
    engine->setObjectIdTimers(toolkit::Table<Engine::Timer>::make());
  };
  meanwhile({replace, replace}, [&] {
    for (int i = 0; i < 3000; ++i) {
      EXPECT_TRUE(engine->QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID(Number::withLong(1)));
      engine->QZ_Plist_State_Processor_FLASH_ID(Number::withLong(i), true);
      engine->killAllTimers();
      engine->currentCommandState();
    }
  });
}

TEST_F(Properties, AnyThreadMayReplaceTheWindows) {
  const auto first = driver.makeWindow({0, 0, 100, 100});
  const auto second = driver.makeWindow({0, 0, 100, 100});
  std::atomic<bool> damaged = false;
  const auto replace = [&] {
    engine->setWindow(first);
    engine->setTutorialWindow(second);
    engine->setTutorialWindow(first);
  };
  const auto ask = [&] {
    const auto window = engine->tutorialWindow();
    if (window && !(window == first) && !(window == second)) damaged = true;
  };
  meanwhile({replace, ask}, [&] {
    for (int i = 0; i < 3000; ++i) EXPECT_FALSE(engine->findObjectWithTag(1));
  });
  EXPECT_FALSE(damaged);
}

}  // namespace

}  // namespace qz
