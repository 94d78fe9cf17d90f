// SPDX-License-Identifier: MIT
// Ids and numbers that need 64 bits: where the engine uses all bits, and where only 32.

#include <gtest/gtest.h>

#include <limits>
#include <memory>
#include <string>
#include <type_traits>
#include <utility>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"
#include "text/number_conversion.hpp"

namespace qz {

namespace {

using drivers::ViewKind;
using toolkit::Array;
using toolkit::Number;
using toolkit::String;

// Whatever the width of `long`, a tag has 64 bits with a sign all the way from the number or key
// that names a control to the control itself.
static_assert(std::numeric_limits<toolkit::Tag>::is_signed);
static_assert(std::numeric_limits<toolkit::Tag>::digits == 63);
using View = toolkit::View;
using Engine = QZ_Plist_State_Parser;
static_assert(std::is_same_v<decltype(&View::tag), toolkit::Tag (View::*)() const>);
static_assert(std::is_same_v<decltype(&View::setTag), void (View::*)(toolkit::Tag)>);
static_assert(std::is_same_v<decltype(&Engine::findObjectWithTag),
                             Engine::Control (Engine::*)(toolkit::Tag) const>);
static_assert(std::is_same_v<decltype(std::declval<Number>().longValue()), toolkit::Tag>);
static_assert(std::is_same_v<decltype(std::declval<Number>().integerValue()), toolkit::Tag>);
static_assert(std::is_same_v<decltype(text::integerValueOf("")), toolkit::Tag>);

constexpr toolkit::Tag beyond = toolkit::Tag{1} << 32;
constexpr toolkit::Tag near = 7;
constexpr toolkit::Tag far = near + beyond;  // equals `near` in 32 bits

class WideIds : public testing::Test {
 protected:
  WideIds() { engine->getGuiAssetsFromWindow(window); }
  ~WideIds() override { engine->terminateParser(); }

  toolkit::Ref<toolkit::View> view(drivers::ViewKind kind, toolkit::Tag tag) {
    return driver.makeView(kind, tag, {20, 20, 100, 30}, window->contentView());
  }
  bool showHtml(const toolkit::ValueRef<>& size) {
    return engine->QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML(
        String::make("html"), String::make("Times"), size, Number::withLong(far));
  }

  drivers::MemoryDriver driver;
  toolkit::Ref<toolkit::Window> window = driver.makeWindow({0, 0, 300, 200});
  std::shared_ptr<QZ_Plist_State_Parser> engine =
      QZ_Plist_State_Parser::initWithWindow(driver.toolkit(), window);
};

TEST_F(WideIds, ReachTheControlWithAllOfThem) {
  const auto nearField = view(drivers::ViewKind::textField, near);
  const auto field = view(drivers::ViewKind::textField, far);
  const auto id = Number::withLong(far);
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_SET_TEXT(String::make("text"), id));
  EXPECT_EQ(driver.look(field).text.string(), "text");
  EXPECT_TRUE(
      engine->QZ_Plist_State_Processor_SET_TOOL_TIP(Array::make({String::make("tip")}), id));
  EXPECT_EQ(driver.look(field).toolTip, "tip");
  EXPECT_TRUE(showHtml(Number::withLong(12)));
  EXPECT_EQ(driver.look(field).text.string(), "html");
  EXPECT_EQ(driver.look(nearField).text.string(), "");
  EXPECT_EQ(driver.look(nearField).toolTip, "");
}

TEST_F(WideIds, ReachTheButtonWhoseBackgroundIsSet) {
  const auto nearButton = view(drivers::ViewKind::button, near);
  const auto button = view(drivers::ViewKind::button, far);
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_SET_BACKGROUND_COLOR(0, Number::withLong(far)));
  EXPECT_EQ(driver.look(button).background, toolkit::colors::red);
  EXPECT_FALSE(driver.look(nearButton).background);
}

TEST_F(WideIds, OfAToolTipsTargetCountInTheir32LowBits) {
  const auto nearField = view(drivers::ViewKind::textField, near);
  const auto field = view(drivers::ViewKind::textField, far);
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_SET_TOOL_TIP(
      Array::make({String::make("tip"), Number::withLong(far)}), Number::withLong(far)));
  EXPECT_EQ(driver.look(nearField).toolTip, "tip");
  EXPECT_EQ(driver.look(field).toolTip, "");
}

TEST_F(WideIds, AreTagsFromTheControlToTheKeyAndBack) {
  constexpr std::pair<toolkit::Tag, const char*> rows[] = {
      {toolkit::Tag{1} << 40, "1099511627776"},
      {std::numeric_limits<toolkit::Tag>::max(), "9223372036854775807"},
      {std::numeric_limits<toolkit::Tag>::min(), "-9223372036854775808"},
  };
  for (const auto& [tag, key] : rows) {
    const auto button = view(drivers::ViewKind::toggle, tag);
    button->setAction("buttonPushed:");
    EXPECT_EQ(button->tag(), tag);
    EXPECT_EQ(engine->findObjectWithTag(tag), button);
    EXPECT_FALSE(engine->findObjectWithTag(static_cast<std::int32_t>(tag)));
    engine->plistDictionary()->setObject(
        Array::make({Array::make({String::make("DISABLE_OBJECT_WITH_ID")})}), key);
    driver.click(button);
    EXPECT_EQ(engine->lastTagId()->longValue(), tag);
    EXPECT_EQ(engine->currentCommandState(), key);
    EXPECT_FALSE(driver.look(button).enabled);
    EXPECT_TRUE(engine->buttonStates()->objectForKey(key));
    const auto states = toolkit::Dictionary::make();
    states->setObject(Number::withBool(true), key);
    EXPECT_TRUE(engine->setButtonSates(states));
    EXPECT_EQ(driver.look(button).state, toolkit::State::on);
  }
}

TEST_F(WideIds, AfterTheLargestTagOverflowKeysGoOn) {
  constexpr toolkit::Tag largest = std::numeric_limits<toolkit::Tag>::max();
  for (int i = 0; i < 3; ++i) view(drivers::ViewKind::button, largest);
  EXPECT_TRUE(engine->getGuiAssetsFromWindow(window));
  for (const char* key : {"9223372036854775807", "9223372036854775808", "9223372036854775809"}) {
    EXPECT_TRUE(engine->guiAssets()->contains(key));
    EXPECT_EQ(engine->originalTagValues()->objectForKey(key)->longValue(), largest);
  }
}

TEST_F(WideIds, StopTheFlashingOfTheirOwnButton) {
  view(drivers::ViewKind::button, near)->highlight(true);
  const auto button = view(drivers::ViewKind::button, far);
  button->highlight(true);
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_FLASH_ID(Number::withLong(far), false));
  EXPECT_FALSE(driver.look(button).highlighted);
}

TEST_F(WideIds, OfAFontSizeCountInTheir32LowBits) {
  const auto field = view(drivers::ViewKind::textField, far);
  EXPECT_TRUE(showHtml(Number::withLong(18 + beyond)));
  const auto text = driver.look(field).text;
  ASSERT_EQ(text.runs().size(), 1U);
  EXPECT_EQ(text.runs()[0].attributes.font->size, 18);
}

TEST_F(WideIds, OfAnImageViewCountInTheir32LowBits) {
  view(drivers::ViewKind::imageView, near);
  const auto parameters = Array::make({String::make("none"), Number::withLong(far)});
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_LOAD_GRAPHIC_OBJECT_WITH_PATH(parameters,
                                                                             Number::withLong(1)));
}

TEST_F(WideIds, AFlashingEntryIsSoughtBy32BitsAndRewrittenUnderAll) {
  view(drivers::ViewKind::button, near);
  view(drivers::ViewKind::button, far);
  engine->QZ_Plist_State_Processor_FLASH_ID(Number::withLong(near), true);
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_SET_TAG(Number::withLong(9), Number::withLong(far)));
  const auto flashing = engine->flashingTagIds();
  EXPECT_TRUE(flashing->objectForKey("7")->boolValue());
  ASSERT_TRUE(flashing->objectForKey("4294967303"));
  EXPECT_FALSE(flashing->objectForKey("4294967303")->boolValue());
}

// A key's text beyond 32 bits is clamped to the nearest 32-bit number.
TEST_F(WideIds, AFlashingKeyBeyond32BitsIsTheGreatestOfThem) {
  view(drivers::ViewKind::button, 2147483647);
  engine->QZ_Plist_State_Processor_FLASH_ID(Number::withLong(99999999999), true);
  EXPECT_TRUE(
      engine->QZ_Plist_State_Processor_SET_TAG(Number::withLong(9), Number::withLong(2147483647)));
  EXPECT_TRUE(engine->flashingTagIds()->objectForKey("2147483647"));
}

TEST_F(WideIds, OfANewTagAllNameItsTimer) {
  view(drivers::ViewKind::button, near);
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_SET_TAG(
      Number::withLong(far), Number::withLong(near), Number::withLong(3)));
  EXPECT_TRUE(engine->objectIdTimers()->contains(std::to_string(far)));
}

}  // namespace

}  // namespace qz
