// SPDX-License-Identifier: MIT
// A class of another language that derives from the engine.

#include "qz/subclass.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <set>
#include <string>
#include <vector>

#include "qz/engine.hpp"
#include "qz/toolkit/memory/memory_toolkit.hpp"

namespace qz {
namespace {

using namespace toolkit;
using Engine = QZ_Plist_State_Parser;

/// Overrides all operations, or those that a test names.
class Recorder final : public Subclass {
 public:
  bool overrides(std::string_view operation) override {
    asked.emplace_back(operation);
    return overridden.empty() || overridden.contains(std::string(operation));
  }
  Result perform(std::string_view operation, std::span<const Argument> arguments) override {
    performed.emplace_back(operation);
    given.assign(arguments.begin(), arguments.end());
    if (during) during();
    return result;
  }
  std::shared_ptr<void> object() override { return held; }

  std::set<std::string> overridden;  // empty for all
  std::vector<std::string> asked;
  std::vector<std::string> performed;
  std::vector<Argument> given;
  Result result;
  std::function<void()> during;
  std::shared_ptr<int> held = std::make_shared<int>(0);
};

class Subclasses : public testing::Test {
 protected:
  ValueRef<Number> number(long value) { return Number::withLong(value); }

  memory::MemoryToolkit toolkit;
  std::shared_ptr<Recorder> recorder = std::make_shared<Recorder>();
  std::shared_ptr<Engine> engine = Engine::initWithWindow(toolkit, nullptr, recorder);
};

// Every call of a table of operations must reach the subclass under the operation's selector.
struct Operation {
  std::string selector;
  std::function<bool(Engine&)> call;  // NO also for operations without a result
};

std::vector<Operation> everyOperation() {
  const auto id = Number::withLong(1);
  const auto none = Array::make();
  const std::string processor = "QZ_Plist_State_Processor_";
  const auto silent = [](auto call) {
    return [call](Engine& engine) {
      call(engine);
      return false;
    };
  };
  return {
      {"getGuiAssetsFromWindow:", [](Engine& e) { return e.getGuiAssetsFromWindow(nullptr); }},
      {"buttonPushed:", silent([](Engine& e) { e.buttonPushed(nullptr); })},
      {"terminateParser", silent([](Engine& e) { e.terminateParser(); })},
      {"processCommandArray:ForObject:",
       [=](Engine& e) { return e.processCommandArray(none, id); }},
      {"doSimpleCommand:withParams:usingObject:",
       [=](Engine& e) { return e.doSimpleCommand("A", none, id); }},
      {"doCompoundCommand:withParameters:usingObject:",
       [=](Engine& e) { return e.doCompoundCommand("A", none, id); }},
      {"findObjectWithTag:", [](Engine& e) { return static_cast<bool>(e.findObjectWithTag(1)); }},
      {"restoreOriginalTagValues", silent([](Engine& e) { e.restoreOriginalTagValues(); })},
      {"startTimerWithValue:forKey:", silent([](Engine& e) { e.startTimerWithValue(1, "1"); })},
      {"killAllTimers", silent([](Engine& e) { e.killAllTimers(); })},
      {"pseudoButtonPush:", silent([](Engine& e) { e.pseudoButtonPush(nullptr); })},
      {"flasherFired:", silent([](Engine& e) { e.flasherFired(nullptr); })},
      {processor + "SET_TEXT:forId:",
       [=](Engine& e) { return e.QZ_Plist_State_Processor_SET_TEXT(nullptr, id); }},
      {processor + "SET_ATTRIBUTED_STRING_AS_HTML:WITH_FONT_NAME:WITH_SIZE:FOR_OBJECT_ID:",
       [=](Engine& e) {
         return e.QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML(nullptr, nullptr, nullptr,
                                                                         id);
       }},
      {processor +
           "SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER:WITH_FONT_NAME:WITH_SIZE:FOR_OBJECT_ID:",
       [=](Engine& e) {
         return e.QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER(nullptr, nullptr,
                                                                                   nullptr, id);
       }},
      {processor + "SET_ATTRIBUTED_STRING_AS_IS:WITH_HTML:WITH_FONT_NAME:WITH_SIZE:FOR_OBJECT_ID:",
       [=](Engine& e) {
         return e.QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_IS(true, nullptr, nullptr,
                                                                       nullptr, id);
       }},
      {processor + "SET_BACKGROUND_COLOR:forId:",
       [=](Engine& e) { return e.QZ_Plist_State_Processor_SET_BACKGROUND_COLOR(1, id); }},
      {processor + "SET_FOREGROUND_COLOR:FOR_OBJECT_ID:",
       [=](Engine& e) { return e.QZ_Plist_State_Processor_SET_FOREGROUND_COLOR(nullptr, id); }},
      {processor + "SET_TITLE:forId:",
       [=](Engine& e) { return e.QZ_Plist_State_Processor_SET_TITLE(nullptr, id); }},
      {processor + "SET_STATE_ON:",
       [=](Engine& e) { return e.QZ_Plist_State_Processor_SET_STATE_ON(id); }},
      {processor + "SET_STATE_OFF:",
       [=](Engine& e) { return e.QZ_Plist_State_Processor_SET_STATE_OFF(id); }},
      {processor + "SET_TOOL_TIP:forObject:",
       [=](Engine& e) { return e.QZ_Plist_State_Processor_SET_TOOL_TIP(none, id); }},
      {processor + "LOAD_GRAPHIC_OBJECT_WITH_PATH:forObject:",
       [=](Engine& e) {
         return e.QZ_Plist_State_Processor_LOAD_GRAPHIC_OBJECT_WITH_PATH(none, id);
       }},
      {processor + "PROCESS_COMMANDS_FOR_ID:",
       [=](Engine& e) { return e.QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID(id); }},
      {processor + "TERMINATE_PARSER",
       silent([](Engine& e) { e.QZ_Plist_State_Processor_TERMINATE_PARSER(); })},
      {processor + "SET_TIMER:forId:",
       [=](Engine& e) { return e.QZ_Plist_State_Processor_SET_TIMER(1, id); }},
      {processor + "SET_TAG:forId:",
       [=](Engine& e) { return e.QZ_Plist_State_Processor_SET_TAG(id, id); }},
      {processor + "SET_TAG:forId:withTimerValue:",
       [=](Engine& e) { return e.QZ_Plist_State_Processor_SET_TAG(id, id, nullptr); }},
      {processor + "ALLOW_FLASHING:",
       [](Engine& e) { return e.QZ_Plist_State_Processor_ALLOW_FLASHING(true); }},
      {processor + "FLASH_ID:flashOn:",
       [=](Engine& e) { return e.QZ_Plist_State_Processor_FLASH_ID(id, true); }},
  };
}

TEST_F(Subclasses, PerformEveryOperationThatTheyOverride) {
  recorder->result = {.yes = true, .control = toolkit.application().makeButton({})};
  for (const auto& [selector, call] : everyOperation()) {
    recorder->performed.clear();
    const bool answer = call(*engine);
    EXPECT_EQ(recorder->performed, std::vector<std::string>{selector});
    EXPECT_EQ(recorder->given.size(),
              static_cast<std::size_t>(std::count(selector.begin(), selector.end(), ':')))
        << selector;
    static const std::set<std::string> withoutResult = {
        "buttonPushed:",
        "terminateParser",
        "restoreOriginalTagValues",
        "startTimerWithValue:forKey:",
        "killAllTimers",
        "pseudoButtonPush:",
        "flasherFired:",
        "QZ_Plist_State_Processor_TERMINATE_PARSER"};
    EXPECT_EQ(answer, !withoutResult.contains(selector)) << selector;
  }
  EXPECT_FALSE(engine->terminating());
  recorder->overridden = {"none"};
  engine->terminateParser();
}

TEST_F(Subclasses, LeaveTheOtherOperationsToTheEngine) {
  recorder->overridden = {"none"};
  EXPECT_TRUE(engine->doSimpleCommand("IDLE_LOOP", nullptr, nullptr));
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_ALLOW_FLASHING(true));
  EXPECT_TRUE(engine->flashing());
  EXPECT_TRUE(recorder->performed.empty());
  EXPECT_EQ(engine->subclass(), recorder);
  engine->terminateParser();
  EXPECT_TRUE(engine->terminating());
}

TEST_F(Subclasses, GetTextNumbersAndListsAsArguments) {
  engine->startTimerWithValue(7, "12");
  ASSERT_EQ(recorder->given.size(), 2U);
  EXPECT_EQ(std::get<std::uint64_t>(recorder->given[0]), 7U);
  EXPECT_EQ(std::get<ValueRef<>>(recorder->given[1])->description(), "12");
  engine->startTimerWithValue(7, std::nullopt);
  EXPECT_FALSE(std::get<ValueRef<>>(recorder->given[1]));
  engine->findObjectWithTag(-3);
  EXPECT_EQ(std::get<Tag>(recorder->given[0]), -3);
  recorder->overridden = {"none"};
  engine->terminateParser();
}

TEST_F(Subclasses, SeeEachStepOfARun) {
  recorder->overridden = {"none"};
  const auto compound = [](std::string name) {
    return Array::make({String::make(std::move(name)), String::make("a"), Number::withLong(2)});
  };
  const auto list = Array::make({compound("set_tool_tip_for_id"),
                                 compound("load_graphic_object_with_path_and_id"),
                                 String::make("TERMINATE_PARSER")});
  recorder->asked.clear();
  engine->processCommandArray(list, number(1));
  EXPECT_EQ(recorder->asked,
            (std::vector<std::string>{
                "processCommandArray:ForObject:", "doCompoundCommand:withParameters:usingObject:",
                "QZ_Plist_State_Processor_SET_TOOL_TIP:forObject:", "findObjectWithTag:",
                "doCompoundCommand:withParameters:usingObject:",
                "QZ_Plist_State_Processor_LOAD_GRAPHIC_OBJECT_WITH_PATH:forObject:",
                "findObjectWithTag:", "doSimpleCommand:withParams:usingObject:",
                "findObjectWithTag:", "QZ_Plist_State_Processor_TERMINATE_PARSER",
                "terminateParser", "restoreOriginalTagValues"}));
}

TEST_F(Subclasses, PerformWhatTimersCall) {
  recorder->overridden = {"flasherFired:", "pseudoButtonPush:"};
  engine->startTimerWithValue(1, "8");
  toolkit.advance(1.2);
  EXPECT_EQ(recorder->performed,
            (std::vector<std::string>{"flasherFired:", "flasherFired:", "pseudoButtonPush:"}));
  EXPECT_EQ(engine->objectIdTimers()->count(), 1U);  // the override did not remove it
  engine->terminateParser();
}

TEST_F(Subclasses, LiveAsLongAsATimerIsValid) {
  recorder->overridden = {"none"};
  const std::weak_ptr<int> object = recorder->held;
  recorder->held = nullptr;
  EXPECT_FALSE(object.expired());
  engine->terminateParser();
  EXPECT_TRUE(object.expired());
}

TEST_F(Subclasses, MayReleaseTheEngineWhileTheyPerform) {
  const std::weak_ptr<Engine> alive = engine;
  recorder->overridden = {"buttonPushed:"};
  engine->terminateParser();
  recorder->result = {.yes = true, .control = {}};
  recorder->during = [&] { engine.reset(); };
  Engine* const called = engine.get();
  recorder = nullptr;  // the engine is the last to hold it
  called->buttonPushed(nullptr);
  EXPECT_TRUE(alive.expired());
}

}  // namespace
}  // namespace qz
