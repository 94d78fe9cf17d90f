// SPDX-License-Identifier: MIT
// Views that cannot be put into another view.

#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "drivers/qt/qt_driver.hpp"
#include "qz/toolkit/exception.hpp"

namespace qz {

namespace {

using namespace toolkit;

/// Returns the reason for which `parent` refuses `view`, or "accepted".
std::string reasonToRefuse(const Ref<View>& parent, const Ref<View>& view) {
  try {
    parent->addSubview(view);
  } catch (const InvalidArgumentException& exception) {
    return exception.reason();
  }
  return "accepted";
}

TEST(RefusedSubviews, LeaveTheViewsAsTheyWere) {
  drivers::QtDriver driver;
  const auto window = driver.makeWindow({0, 0, 200, 100});
  const auto content = window->contentView();
  const auto outer = driver.makeView(drivers::ViewKind::box, 1, {0, 0, 90, 90}, content);
  const auto inner = driver.makeView(drivers::ViewKind::box, 2, {0, 0, 50, 50}, outer);
  const Ref<View> foreign = std::shared_ptr<View>(std::shared_ptr<void>(), &View::nothing());
  const std::string start = "-[" + std::string(outer->className()) + " addSubview:]: the view";
  const struct {
    const Ref<View>& parent;
    Ref<View> view;
    std::string reason;
  } cases[] = {
      {outer, nullptr, " is absent"},
      {outer, outer, " is the superview itself, or contains it"},
      {inner, outer, " is the superview itself, or contains it"},
      {inner, content, " is the content view of a window"},
      {outer, foreign, ", of class , belongs to another toolkit"},
  };
  for (const auto& test : cases) {
    EXPECT_EQ(reasonToRefuse(test.parent, test.view), start + test.reason);
  }
  ASSERT_EQ(content->subviews().size(), 1U);
  EXPECT_EQ(content->subviews().front(), outer);
  ASSERT_EQ(outer->subviews().size(), 1U);
  EXPECT_EQ(outer->subviews().front(), inner);
  EXPECT_TRUE(inner->subviews().empty());
}

}  // namespace

}  // namespace qz
