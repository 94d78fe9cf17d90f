// SPDX-License-Identifier: MIT
// The record of pressed buttons that a host receives: a copy of the engine's own.

#include <gtest/gtest.h>

#include <memory>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"

namespace qz {

namespace {

class ButtonStates : public testing::Test {
 protected:
  ~ButtonStates() override { engine->terminateParser(); }

  drivers::MemoryDriver driver;
  toolkit::Ref<toolkit::Window> window = driver.makeWindow({0, 0, 300, 200});
  toolkit::Ref<toolkit::View> check =
      driver.makeView(drivers::ViewKind::toggle, 12, {20, 20, 100, 30}, window->contentView());
  std::shared_ptr<QZ_Plist_State_Parser> engine =
      QZ_Plist_State_Parser::initWithWindow(driver.toolkit(), nullptr);
};

TEST_F(ButtonStates, ACopyStaysAsItWasWhenItWasAskedFor) {
  engine->getGuiAssetsFromWindow(window);
  const auto before = engine->buttonStates();
  driver.click(check);
  const auto once = engine->buttonStates();
  driver.click(check);
  EXPECT_EQ(before->count(), 0U);
  ASSERT_EQ(once->count(), 1U);
  EXPECT_TRUE(once->objectForKey("12")->boolValue());
  EXPECT_FALSE(engine->buttonStates()->objectForKey("12")->boolValue());
}

TEST_F(ButtonStates, EveryCopyIsAnother) {
  EXPECT_FALSE(engine->buttonStates() == engine->buttonStates());
}

TEST_F(ButtonStates, ACopyCannotBeChanged) {
  engine->getGuiAssetsFromWindow(window);
  driver.click(check);
  const auto states = engine->buttonStates();
  EXPECT_THROW(states->setObject(toolkit::Number::withBool(true), "13"), toolkit::Exception);
  EXPECT_THROW(states->removeAllObjects(), toolkit::Exception);
  EXPECT_EQ(states->count(), 1U);
}

TEST_F(ButtonStates, StatesAreBooleans) {
  engine->getGuiAssetsFromWindow(window);
  driver.click(check);
  const auto state = toolkit::asNumber(engine->buttonStates()->objectForKey("12"));
  EXPECT_EQ(state->type(), toolkit::Number::Type::boolean);
}

TEST_F(ButtonStates, AnEndedEngineHasNoRecordLeftInACopysWay) {
  engine->getGuiAssetsFromWindow(window);
  driver.click(check);
  const auto states = engine->buttonStates();
  engine->terminateParser();
  const std::weak_ptr<QZ_Plist_State_Parser> ended = engine;
  engine = QZ_Plist_State_Parser::init(driver.toolkit());
  EXPECT_TRUE(ended.expired());
  EXPECT_EQ(states->count(), 1U);
}

}  // namespace

}  // namespace qz
