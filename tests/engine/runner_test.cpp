// SPDX-License-Identifier: MIT
// The runner: which exceptions it catches, and lists that no scenario can write.

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <new>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"
#include "qz/property_list/reader.hpp"
#include "tests/engine/fakes.hpp"

namespace qz {

namespace {

using toolkit::Array;
using toolkit::Number;
using toolkit::String;
using toolkit::ValueRef;

ValueRef<> text(std::string_view text) { return String::make(text); }

class Runner : public testing::Test {
 protected:
  Runner() {
    driver.setLogSink([this](std::string_view line) { log.emplace_back(line); });
    engine->setTutorialWindow(fakes::windowWith(view));
  }

  bool run(std::vector<ValueRef<>> elements) {
    return engine->processCommandArray(Array::make(std::move(elements)), Number::withLong(tag));
  }

  static constexpr toolkit::Tag tag = 7;
  std::vector<std::string> log;
  drivers::MemoryDriver driver;
  std::shared_ptr<fakes::FakeView> view = std::make_shared<fakes::FakeView>(tag);
  std::shared_ptr<QZ_Plist_State_Parser> engine = QZ_Plist_State_Parser::init(driver.toolkit());
};

TEST_F(Runner, CatchesEveryKindOfToolkitExceptionAndLogsItsReason) {
  const std::function<void()> raises[] = {
      [] { throw toolkit::Exception("NSGenericException", "out of order"); },
      [] { throw toolkit::RangeException("out of order"); },
      [] { throw toolkit::InvalidArgumentException("out of order"); },
  };
  for (const auto& raise : raises) {
    view->onCall = [&](const std::string&) { raise(); };
    EXPECT_TRUE(run({text("IDLE_LOOP"), text("HIDE_OBJECT_WITH_ID")}));
  }
  EXPECT_EQ(log, std::vector<std::string>(3, "Exception in processCommandArray: out of order"));
}

TEST_F(Runner, LetsEverythingElseThrough) {
  view->onCall = [](const std::string&) { throw std::bad_alloc(); };
  EXPECT_THROW(run({text("HIDE_OBJECT_WITH_ID")}), std::bad_alloc);
  EXPECT_THROW(run({Array::make({text("HIDE_OBJECT_WITH_ID")})}), std::bad_alloc);
  view->onCall = [](const std::string&) { throw std::runtime_error("not the toolkit's"); };
  EXPECT_THROW(run({text("HIDE_OBJECT_WITH_ID")}), std::runtime_error);
  view->onCall = [](const std::string&) { throw 5; };
  EXPECT_THROW(run({text("HIDE_OBJECT_WITH_ID")}), int);
  EXPECT_TRUE(log.empty());
}

TEST_F(Runner, LetsThemThroughNestedRunsToo) {
  engine->setPlistDictionary(toolkit::Dictionary::make());
  engine->plistDictionary()->setObject(Array::make({text("HIDE_OBJECT_WITH_ID")}), "7");
  view->onCall = [](const std::string&) { throw std::bad_alloc(); };
  EXPECT_THROW(run({Array::make({text("PROCESS_COMMANDS_FOR_ID"), text("7")})}), std::bad_alloc);
  EXPECT_TRUE(log.empty());
}

TEST_F(Runner, WorksOnAfterAnExceptionWentThrough) {
  view->onCall = [](const std::string&) { throw std::bad_alloc(); };
  EXPECT_THROW(run({text("HIDE_OBJECT_WITH_ID")}), std::bad_alloc);
  EXPECT_EQ(engine->currentCommandState(), "7");
  view->onCall = nullptr;
  EXPECT_TRUE(run({text("HIDE_OBJECT_WITH_ID"), text("IDLE_LOOP")}));
  EXPECT_EQ(view->calls, std::vector<std::string>{"hide"});
}

TEST_F(Runner, ARaisingViewIsAnElementThatRaised) {
  view->onCall = [](const std::string&) { throw toolkit::RangeException("no"); };
  EXPECT_TRUE(run({text("IDLE_LOOP"), Array::make({text("DISABLE_OBJECT_WITH_ID")})}));
  EXPECT_EQ(log.size(), 1U);
}

TEST_F(Runner, RunsAMillionElements) {
  std::vector<ValueRef<>> elements(1'000'000, text("SHOW_OBJECT_WITH_ID"));
  elements.back() = text("IDLE_LOOP");
  EXPECT_TRUE(run(std::move(elements)));
  EXPECT_EQ(view->calls.size(), 999'999U);
}

TEST_F(Runner, RunsAHundredThousandCompoundElements) {
  const ValueRef<> hide = Array::make({text("hide_object_with_id"), Number::withLong(tag)});
  EXPECT_TRUE(run(std::vector<ValueRef<>>(100'000, hide)));
  EXPECT_EQ(view->calls.size(), 200'000U);  // for each: hide, and ask whether a redraw is needed
}

// The address sanitizer makes a frame several times as large, but not the stack.
#ifdef __SANITIZE_ADDRESS__
constexpr toolkit::Tag deepest = 501;
#else
constexpr toolkit::Tag deepest = 1001;
#endif

TEST_F(Runner, ListsMayCallOneAnotherAThousandDeep) {
  const auto script = toolkit::Dictionary::make();
  for (toolkit::Tag key = 1; key < deepest; ++key) {
    const ValueRef<> call =
        Array::make({text("PROCESS_COMMANDS_FOR_ID"), Number::withLong(key + 1)});
    script->setObject(Array::make({call}), std::to_string(key));
  }
  script->setObject(Array::make({text("IDLE_LOOP")}), std::to_string(deepest));
  engine->setPlistDictionary(script);
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID(Number::withLong(1)));
  EXPECT_EQ(engine->currentCommandState(), std::to_string(deepest));
}

TEST_F(Runner, TakesTheElementsThatThereWereAtTheStart) {
  const auto list = Array::make({text("HIDE_OBJECT_WITH_ID"), text("IDLE_LOOP")});
  view->onCall = [&](const std::string&) { list->addObject(text("NO_SUCH_COMMAND")); };
  EXPECT_TRUE(engine->processCommandArray(list, Number::withLong(tag)));
  EXPECT_EQ(list->count(), 3U);
}

TEST_F(Runner, ElementsThatVanishMeanwhileRaiseOneByOne) {
  const auto list =
      Array::make({text("HIDE_OBJECT_WITH_ID"), text("IDLE_LOOP"), text("IDLE_LOOP")});
  view->onCall = [&](const std::string&) { list->removeAllObjects(); };
  EXPECT_FALSE(engine->processCommandArray(list, Number::withLong(tag)));
  EXPECT_EQ(log.size(), 2U);
}

TEST_F(Runner, ACommandsParametersAreItsOwnList) {
  const auto command = Array::make({text("set_tool_tip_for_id"), text("tip")});
  EXPECT_TRUE(run({command, command}));
  EXPECT_EQ(command->count(), 2U);
}

TEST_F(Runner, ACommandThatLosesItsElementsMeanwhileHasItsParameters) {
  const auto command = Array::make({text("SET_TOOL_TIP_FOR_ID"), text("the first tooltip")});
  std::vector<ValueRef<>> others;
  view->onCall = [&](const std::string&) {
    command->removeAllObjects();
    // These would reuse memory that was released.
    for (int i = 0; i < 8; ++i) others.emplace_back(text("another tooltip!!"));
  };
  EXPECT_TRUE(run({command}));
  EXPECT_EQ(view->toolTip, "the first tooltip");
}

TEST_F(Runner, AListOutOfAFileIsThereAsLongAsItRuns) {
  auto list =
      toolkit::readPropertyList("((SET_TOOL_TIP_FOR_ID, \"the first tooltip\"), IDLE_LOOP)").value;
  view->onCall = [&](const std::string&) { list = nullptr; };
  EXPECT_TRUE(engine->processCommandArray(list, Number::withLong(tag)));
  EXPECT_FALSE(list);
  EXPECT_EQ(view->toolTip, "the first tooltip");
  EXPECT_TRUE(log.empty());
}

TEST_F(Runner, TheIdIsHandedOnAsItIs) {
  const auto id = Number::withDouble(7.9);
  EXPECT_FALSE(engine->processCommandArray(Array::make({text("HIDE_OBJECT_WITH_ID")}), id));
  EXPECT_TRUE(engine->lastTagId() == id);
  EXPECT_EQ(engine->currentCommandState(), "7");
  EXPECT_EQ(view->calls, std::vector<std::string>{"hide"});
}

TEST_F(Runner, WithoutAnIdARunIsForTheTag0) {
  view->setTag(0);
  EXPECT_FALSE(engine->processCommandArray(Array::make({text("HIDE_OBJECT_WITH_ID")}), nullptr));
  EXPECT_FALSE(engine->lastTagId());
  EXPECT_EQ(engine->currentCommandState(), "0");
  EXPECT_EQ(view->calls, std::vector<std::string>{"hide"});
}

// The dispatcher expects upper case; only the runner converts names.
TEST_F(Runner, TheDispatcherTakesNamesToTheLetter) {
  const auto id = Number::withLong(tag);
  EXPECT_FALSE(engine->doCompoundCommand("hide_object_with_id", Array::make(), id));
  EXPECT_TRUE(engine->doCompoundCommand("HIDE_OBJECT_WITH_ID", Array::make(), id));
  EXPECT_THROW(engine->doCompoundCommand("FLASH_ID", Array::make(), id), toolkit::RangeException);
}

/// A list that reports any count of elements; each element is the command that does nothing.
class ClaimingList final : public toolkit::Value {
 public:
  explicit ClaimingList(std::size_t count) : Value(Kind::array), count_(count) {}
  std::size_t count() const override { return count_; }
  const ValueRef<>& objectAtIndex(std::size_t) const override {
    ++asked;
    return idle_;
  }

  mutable std::size_t asked = 0;

 private:
  std::size_t count_;
  ValueRef<> idle_ = text("IDLE_LOOP");
};

TEST_F(Runner, TakesAListsCountIn32BitsWithASign) {
  const struct {
    std::size_t count;
    std::size_t asked;
  } cases[] = {{std::size_t{1} << 31, 0},
               {static_cast<std::size_t>((std::uint64_t{1} << 32) + 2), 2}};
  for (const auto& c : cases) {
    ClaimingList list(c.count);
    const ValueRef<> shared(toolkit::Counted<toolkit::Value>::share(&list));
    EXPECT_EQ(engine->processCommandArray(shared, Number::withLong(tag)), c.asked > 0) << c.count;
    EXPECT_EQ(list.asked, c.asked) << c.count;
  }
}

}  // namespace

}  // namespace qz
