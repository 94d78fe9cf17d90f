// SPDX-License-Identifier: MIT
// The flasher's tick: the order in which it looks at controls, seen from the toolkit's side.

#include <gtest/gtest.h>

#include <functional>
#include <memory>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"
#include "tests/engine/fakes.hpp"

namespace qz {

namespace {

using toolkit::Number;

/// A view that is not a button, and counts how often it is asked.
class AskedView final : public fakes::FakeRole<toolkit::View> {
 public:
  using FakeRole::FakeRole;
  toolkit::Button* asButton() override {
    ++asked;
    if (onAsked) onAsked();
    return nullptr;
  }

  int asked = 0;
  std::function<void()> onAsked;
};

TEST(Flasher, WalksTheTagsThatWereMarkedWhenItsTickBegan) {
  drivers::MemoryDriver driver;
  const auto engine = QZ_Plist_State_Parser::init(driver.toolkit());
  const auto content = std::make_shared<fakes::FakeRole<toolkit::View>>();
  const auto first = std::make_shared<AskedView>(1);
  const auto second = std::make_shared<AskedView>(2);
  for (const auto& view : {first, second}) content->views.emplace_back(view);
  engine->setTutorialWindow(std::make_shared<fakes::FakeWindow>(content));
  engine->setFlashingTagIds(toolkit::Dictionary::make());
  engine->setFlashing(true);
  engine->QZ_Plist_State_Processor_FLASH_ID(Number::withLong(1), true);
  first->onAsked = [&] { engine->QZ_Plist_State_Processor_FLASH_ID(Number::withLong(2), true); };
  engine->flasherFired(nullptr);
  EXPECT_EQ(first->asked, 1);
  EXPECT_EQ(second->asked, 0);
  engine->flasherFired(nullptr);
  EXPECT_EQ(second->asked, 1);
}

}  // namespace

}  // namespace qz
