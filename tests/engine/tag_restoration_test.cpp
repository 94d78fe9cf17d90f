// SPDX-License-Identifier: MIT
// Restoring tags: which controls have their tag set.

#include <gtest/gtest.h>

#include <memory>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"
#include "tests/engine/fakes.hpp"

namespace qz {

namespace {

class Retagged final : public fakes::FakeRole<toolkit::View> {
 public:
  explicit Retagged(toolkit::Tag tag) : FakeRole(tag) {}
  void setTag(toolkit::Tag tag) override {
    ++settings;
    FakeRole::setTag(tag);
  }

  int settings = 0;
};

TEST(TagRestoration, LeavesAControlThatHasItsTag) {
  drivers::MemoryDriver driver;
  const auto engine = QZ_Plist_State_Parser::init(driver.toolkit());
  const auto view = std::make_shared<Retagged>(7);
  const auto assets = toolkit::Table<AssetRecord>::make();
  assets->setObject(
      {{"Fake"}, {}, toolkit::StoredRef<toolkit::View>::refer(toolkit::Ref<toolkit::View>(view))},
      "7");
  const auto tags = toolkit::Dictionary::make();
  tags->setObject(toolkit::Number::withLong(7), "7");
  engine->setGuiAssets(assets);
  engine->setOriginalTagValues(tags);
  engine->restoreOriginalTagValues();
  EXPECT_EQ(view->settings, 0);
  view->setTag(40);
  engine->restoreOriginalTagValues();
  EXPECT_EQ(view->settings, 2);
  EXPECT_EQ(view->tag(), 7);
}

}  // namespace

}  // namespace qz
