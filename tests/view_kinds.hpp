// SPDX-License-Identifier: MIT
// What the table of kinds of view promises of each driver's views.
#pragma once

#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "qz/drivers/driver.hpp"
#include "tests/enumerators.hpp"

namespace qz {

/// Expects that the driver makes every kind of view as its row says, and recognises it.
inline void expectEveryKindOfView(drivers::Driver& driver) {
  using drivers::Caption;
  const auto window = driver.makeWindow({0, 0, 400, 400});
  for (const drivers::ViewKind kind : enumerators<drivers::ViewKind>()) {
    ASSERT_LT(static_cast<std::size_t>(kind), std::size(drivers::viewKinds)) << "no row";
    const drivers::ViewKindRow& row = rowOf(kind);
    const auto view = driver.makeView(kind, 7, {10, 20, 90, 40}, window->contentView());
    EXPECT_EQ(driver.look(view).kind, kind) << row.name;
    EXPECT_EQ(view->className(), driver.className(kind)) << row.name;
    const auto control = std::dynamic_pointer_cast<toolkit::Control>(view.pointer());
    EXPECT_EQ(control != nullptr, row.isControl) << row.name;
    EXPECT_EQ(view->asButton() != nullptr, row.isButton) << row.name;
    EXPECT_EQ(row.caption == Caption::title, row.isButton) << row.name;
    EXPECT_EQ(view->asTextField() != nullptr, row.caption == Caption::text) << row.name;
    EXPECT_EQ(view->asImageView() != nullptr, row.caption == Caption::imageName) << row.name;
    if (!row.isButton) continue;
    toolkit::asButton(view)->setState(toolkit::State::mixed);
    EXPECT_EQ(view->state() == toolkit::State::mixed, row.hasMixedState) << row.name;
  }
}

}  // namespace qz
