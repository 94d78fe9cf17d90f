// SPDX-License-Identifier: MIT
// Re-tagging with a timer: the timer's seconds are the parameter's address, not its number.

#include <gtest/gtest.h>

#include <cstdint>
#include <memory>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"

namespace qz {

namespace {

using toolkit::Number;

class Retagging : public testing::Test {
 protected:
  Retagging() { engine->getGuiAssetsFromWindow(window); }
  ~Retagging() override { engine->terminateParser(); }

  bool retag(toolkit::Tag newTag, toolkit::Tag tag,
             const QZ_Plist_State_Parser::Value& timerValue) {
    return engine->QZ_Plist_State_Processor_SET_TAG(Number::withLong(newTag), Number::withLong(tag),
                                                    timerValue);
  }
  double secondsUnder(std::string_view key) const {
    return engine->objectIdTimers()->objectForKey(key)->interval();
  }

  drivers::MemoryDriver driver;
  toolkit::Ref<toolkit::Window> window = driver.makeWindow({0, 0, 300, 200});
  toolkit::Ref<toolkit::View> button =
      driver.makeView(drivers::ViewKind::button, 7, {20, 20, 100, 30}, window->contentView());
  std::shared_ptr<QZ_Plist_State_Parser> engine =
      QZ_Plist_State_Parser::initWithWindow(driver.toolkit(), nullptr);
};

TEST_F(Retagging, SecondsAreTheParametersAddressInSinglePrecision) {
  const QZ_Plist_State_Parser::Value seconds = Number::withLong(10);
  ASSERT_TRUE(retag(40, 7, seconds));
  const auto address = reinterpret_cast<std::uintptr_t>(seconds.pointer().get());
  EXPECT_EQ(secondsUnder("40"), static_cast<double>(static_cast<float>(address)));
  EXPECT_NE(secondsUnder("40"), 10);
}

TEST_F(Retagging, OneParameterGivesTheSameSecondsEveryTime) {
  const QZ_Plist_State_Parser::Value seconds = Number::withLong(10);
  ASSERT_TRUE(retag(40, 7, seconds));
  ASSERT_TRUE(retag(41, 40, seconds));
  EXPECT_EQ(engine->objectIdTimers()->count(), 2U);
  EXPECT_EQ(secondsUnder("40"), secondsUnder("41"));
}

TEST_F(Retagging, WithoutAParameterNoTimerIsArmed) {
  EXPECT_TRUE(retag(40, 7, nullptr));
  EXPECT_EQ(button->tag(), 40);
  EXPECT_EQ(engine->objectIdTimers()->count(), 0U);
}

}  // namespace

}  // namespace qz
