// SPDX-License-Identifier: MIT
// The example host: walk-throughs begin and end, and the host keeps working.
#include <gtest/gtest.h>

#include <QLabel>
#include <QMenu>
#include <QStatusBar>
#include <QTest>

#include "examples/qt-host/guided_form.hpp"
#include "support.hpp"
#include "toolkit/qt/button_look.hpp"

namespace qz {

namespace {

struct HostExample : testing::Test {
  std::unique_ptr<GuidedForm> form =
      std::make_unique<GuidedForm>(QZ_SOURCE_DIR "/examples/qt-host");

  HostExample() {
    form->show();
    form->activateWindow();
  }

  void choose(int item) {
    form->menuBar()->actions()[0]->menu()->actions()[item]->trigger();
    hosts::settle();
  }

  static void click(QWidget& widget) {
    QTest::mouseClick(&widget, Qt::LeftButton);
    hosts::settle();
  }

  /// Expects the form's own buttons to work as before any walk-through, once per press.
  void expectHostWorks() {
    form->name.setText("Ada");
    click(form->order);
    EXPECT_EQ(form->statusBar()->currentMessage(), "Ordered for Ada: 6 €");
    click(form->clear);
    EXPECT_EQ(form->name.text(), "");
  }
};

TEST_F(HostExample, WorksBeforeAnyWalkThrough) { expectHostWorks(); }

TEST_F(HostExample, IsGuidedOverItsOwnWindowAndGoesOnAfterwards) {
  for (int round = 0; round < 2; ++round) {
    choose(0);
    EXPECT_TRUE(form->guide.isVisible());
    EXPECT_TRUE(form->guide.text().contains("Welcome"));
    EXPECT_FALSE(form->order.isEnabled());

    click(form->next);
    EXPECT_EQ(form->express.toolTip(), "Two days instead of five");
    EXPECT_TRUE(QTest::qWaitFor([&] { return toolkit::qt::isHighlighted(form->express); }));
    click(form->next);
    EXPECT_TRUE(form->order.isEnabled());
    EXPECT_FALSE(form->clear.isEnabled());
    EXPECT_EQ(form->next.text(), "Done");
    click(form->order);
    EXPECT_TRUE(form->guide.text().contains("after the tour"));
    click(form->next);
    EXPECT_TRUE(form->isVisible());
    EXPECT_FALSE(form->guide.isVisible());
    EXPECT_FALSE(toolkit::qt::isHighlighted(form->express));
    EXPECT_EQ(form->express.toolTip(), "");
    EXPECT_EQ(form->next.property("qzTag"), 20);
    expectHostWorks();
  }
}

TEST_F(HostExample, ClosesInTheMiddleOfAWalkThroughWhenTheUserWantsIt) {
  choose(0);
  EXPECT_TRUE(form->close());
  EXPECT_FALSE(form->isVisible());
}

TEST_F(HostExample, ShowsTipsInASheet) {
  choose(1);
  EXPECT_TRUE(form->tips.isVisible());
  EXPECT_TRUE(form->tips.isModal());
  click(form->tips.next);
  EXPECT_EQ(form->tips.tip.text(), "Fill what is empty with paper, so that nothing moves.");
  click(form->tips.next);
  EXPECT_FALSE(form->tips.next.isEnabled());
  click(form->tips.close);
  EXPECT_FALSE(form->tips.isVisible());
  EXPECT_EQ(form->tips.next.property("qzTag"), 10);
  expectHostWorks();
}

TEST_F(HostExample, IsGuidedInAPanelBesideItsControls) {
  const auto part = [this](const char* name) { return form->findChild<QPushButton*>(name); };
  const auto heading = [this] { return form->findChild<QLabel*>("qz-guide-heading")->text(); };
  for (int round = 0; round < 2; ++round) {
    choose(2);
    EXPECT_EQ(heading(), "Welcome");
    click(*part("qz-guide-next"));
    EXPECT_EQ(heading(), "Who gets it?");
    click(*part("qz-guide-next"));
    EXPECT_EQ(heading(), "Faster");
    click(*part("qz-guide-back"));
    EXPECT_EQ(heading(), "Who gets it?");
    click(*part("qz-guide-back"));
    EXPECT_EQ(heading(), "Welcome");
    for (int step = 0; step < 3; ++step) click(*part("qz-guide-next"));
    EXPECT_EQ(heading(), "Send it");
    click(form->order);
    EXPECT_EQ(heading(), "That is all");
    EXPECT_EQ(form->statusBar()->currentMessage(), "");
    click(*part("qz-guide-next"));
    EXPECT_EQ(heading(), "");
    expectHostWorks();
    form->statusBar()->clearMessage();
  }
}

TEST_F(HostExample, TakesEscapeForTheEndOfItsTips) {
  for (int round = 0; round < 2; ++round) {
    choose(1);
    click(form->tips.next);
    QTest::keyClick(&form->tips, Qt::Key_Escape);
    hosts::settle();
    EXPECT_FALSE(form->tips.isVisible());
    EXPECT_EQ(form->tips.next.property("qzTag"), 10);
    expectHostWorks();
  }
}

}  // namespace

}  // namespace qz
