// SPDX-License-Identifier: MIT
// A form from Qt Designer, whose file sets the tags and the image view as dynamic properties.

#include "tests/qt/support.hpp"
#include "ui_designer_form.h"

namespace qz {

namespace {

using DesignerForms = hosts::Host;

TEST_F(DesignerForms, CarryTheirTags) {
  Ui::DesignerForm form;
  form.setupUi(panel.get());
  const auto views = window->contentView()->subviews();
  ASSERT_EQ(views.size(), 3U);
  EXPECT_EQ(views[0]->tag(), 3);
  EXPECT_TRUE(views[0]->asButton());
  EXPECT_EQ(views[1]->tag(), 4);
  EXPECT_TRUE(views[1]->asImageView());
  EXPECT_EQ(views[2]->tag(), 0);
  EXPECT_TRUE(views[2]->asTextField());
}

}  // namespace

}  // namespace qz
