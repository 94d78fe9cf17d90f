// SPDX-License-Identifier: MIT
// The command processors, called directly by a host with arguments that no script can give them.

#include <gtest/gtest.h>

#include <cstdint>
#include <limits>
#include <memory>
#include <string>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"

namespace qz {

namespace {

using toolkit::Number;

class Processors : public testing::Test {
 protected:
  Processors() {
    driver.setLogSink([this](std::string_view line) { log.emplace_back(line); });
    engine->getGuiAssetsFromWindow(window);
    log.clear();
  }
  ~Processors() override { engine->terminateParser(); }

  std::vector<std::string> log;
  drivers::MemoryDriver driver;
  toolkit::Ref<toolkit::Window> window = driver.makeWindow({0, 0, 300, 200});
  toolkit::Ref<toolkit::View> button =
      driver.makeView(drivers::ViewKind::button, 7, {20, 20, 100, 30}, window->contentView());
  std::shared_ptr<QZ_Plist_State_Parser> engine =
      QZ_Plist_State_Parser::initWithWindow(driver.toolkit(), nullptr);
};

TEST_F(Processors, TerminatingEndsTheWalkThrough) {
  engine->QZ_Plist_State_Processor_TERMINATE_PARSER();
  EXPECT_TRUE(engine->terminating());
  EXPECT_TRUE(engine->hasTerminated());
  EXPECT_FALSE(engine->flashingTimer());
  EXPECT_EQ(driver.look(window).closes, 1);
  engine->QZ_Plist_State_Processor_TERMINATE_PARSER();
  EXPECT_EQ(driver.look(window).closes, 1);
}

TEST_F(Processors, IdlingDoesNothing) {
  engine->QZ_Plist_State_Processor_RETURN_TO_IDLE_LOOP();
  EXPECT_FALSE(engine->terminating());
  EXPECT_EQ(engine->currentCommandState(), "0");
  EXPECT_TRUE(driver.look(window).visible);
  EXPECT_TRUE(log.empty());
}

// A colour number that no script parameter converts to.
TEST_F(Processors, TheLargestColourIsRedToo) {
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_SET_BACKGROUND_COLOR(
      std::numeric_limits<std::uint64_t>::max(), Number::withLong(7)));
  EXPECT_EQ(driver.look(button).background, toolkit::colors::red);
}

TEST_F(Processors, AbsentParametersAreNone) {
  EXPECT_FALSE(engine->QZ_Plist_State_Processor_SET_TOOL_TIP(nullptr, Number::withLong(7)));
  EXPECT_FALSE(
      engine->QZ_Plist_State_Processor_LOAD_GRAPHIC_OBJECT_WITH_PATH(nullptr, Number::withLong(7)));
  EXPECT_TRUE(log.empty());
  EXPECT_EQ(driver.look(button).toolTip, "");
}

// The dispatcher passes 32 bits of a tag; the processors read 64.
TEST_F(Processors, TagsBeyond32BitsAreFoundAndGiven) {
  constexpr toolkit::Tag large = 5'000'000'000;
  EXPECT_TRUE(
      engine->QZ_Plist_State_Processor_SET_TAG(Number::withLong(large), Number::withLong(7)));
  EXPECT_EQ(button->tag(), large);
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_SET_TITLE(toolkit::String::make("far"),
                                                         Number::withLong(large)));
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_SET_STATE_ON(Number::withLong(large)));
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_FLASH_ID(Number::withLong(large), true));
  EXPECT_EQ(driver.look(button).title.string(), "far");
  EXPECT_EQ(driver.look(button).state, toolkit::State::on);
  EXPECT_TRUE(engine->flashingTagIds()->objectForKey("5000000000")->boolValue());
}

// Both use 32 bits: a tick converts the key's text, which is clamped, and a timer converts the id,
// whose low bits are kept.
TEST_F(Processors, TicksAndTimersLookFor32Bits) {
  constexpr toolkit::Tag large = 4'294'967'303;  // 7 in its low 32 bits
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_FLASH_ID(Number::withLong(large), true));
  engine->QZ_Plist_State_Processor_ALLOW_FLASHING(true);
  driver.advance(0.75);
  EXPECT_FALSE(driver.look(button).highlighted);  // the key reads as 2147483647
  EXPECT_FALSE(engine->QZ_Plist_State_Processor_SET_TIMER(3, Number::withLong(large)));
  EXPECT_TRUE(engine->objectIdTimers()->contains("4294967303"));
}

TEST_F(Processors, AListIsChainedByAllTheBitsOfItsTag) {
  const auto script = toolkit::Dictionary::make();
  script->setObject(toolkit::Array::make({toolkit::String::make("IDLE_LOOP")}), "4294967303");
  engine->setPlistDictionary(script);
  EXPECT_TRUE(
      engine->QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID(Number::withLong(4'294'967'303)));
  EXPECT_EQ(engine->currentCommandState(), "4294967303");
}

TEST_F(Processors, ATimerThatZeroSecondsCancelIsNoLongerValid) {
  engine->QZ_Plist_State_Processor_SET_TIMER(3, Number::withLong(7));
  const toolkit::Ref<toolkit::Timer> timer = engine->objectIdTimers()->objectForKey("7");
  ASSERT_TRUE(timer->isValid());
  engine->QZ_Plist_State_Processor_SET_TIMER(0, Number::withLong(7));
  EXPECT_FALSE(timer->isValid());
}

TEST_F(Processors, ATimerValueHas64Bits) {
  engine->QZ_Plist_State_Processor_SET_TIMER(8'589'934'592, Number::withLong(7));
  EXPECT_EQ(engine->objectIdTimers()->objectForKey("7")->interval(), 8'589'934'592.0);
}

TEST_F(Processors, NothingEqualsAnAbsentText) {
  EXPECT_FALSE(engine->QZ_Plist_State_Processor_SET_TEXT(nullptr, Number::withLong(7)));
  EXPECT_EQ(driver.look(button).text.string(), "");
}

}  // namespace

}  // namespace qz
