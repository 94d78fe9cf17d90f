// SPDX-License-Identifier: MIT
// Presses by mouse and keyboard, and what they do to the host's own connections.

#include <QCheckBox>
#include <QLineEdit>
#include <QPushButton>

#include "qz/engine.hpp"
#include "qz/toolkit/exception.hpp"
#include "tests/qt/support.hpp"

namespace qz {

namespace {

using Presses = hosts::Host;
using Actions = std::vector<std::string>;

TEST_F(Presses, ComeFromMouseSpaceBarTabAndMnemonic) {
  auto& field = add<QLineEdit>();
  auto& next = add<QPushButton>("&Next");
  const auto button = adopt(next);
  show();

  QTest::mouseClick(&next, Qt::LeftButton);
  EXPECT_EQ(performer->actions.size(), 1U) << "mouse";
  field.setFocus();
  QTest::keyClick(panel.get(), Qt::Key_Tab);
  ASSERT_EQ(panel->focusWidget(), &next);
  QTest::keyClick(panel->focusWidget(), Qt::Key_Space);
  EXPECT_EQ(performer->actions.size(), 2U) << "space bar";
  field.setFocus();
  QTest::keyClick(&field, Qt::Key_N, Qt::AltModifier);
  // A mnemonic shows the button pressed before it clicks.
  EXPECT_TRUE(QTest::qWaitFor([&] { return performer->actions.size() == 3; })) << "mnemonic";
  EXPECT_EQ(performer->actions.back(), "go:");
  EXPECT_EQ(performer->senders.back(), toolkit::Ref<toolkit::View>(button));
}

TEST_F(Presses, DoNotReachDisabledButtons) {
  auto& next = add<QPushButton>("Next");
  const auto button = adopt(next);
  show();
  button->setEnabled(false);
  QTest::mouseClick(&next, Qt::LeftButton);
  EXPECT_EQ(performer->actions, Actions{});
}

TEST_F(Presses, KeepTheClickFromTheHostAndNoOtherSignal) {
  auto& box = add<QCheckBox>("Box");
  int clicks = 0;
  int toggles = 0;
  int releases = 0;
  QObject::connect(&box, &QCheckBox::clicked, [&] { ++clicks; });
  QObject::connect(&box, &QCheckBox::toggled, [&] { ++toggles; });
  QObject::connect(&box, &QCheckBox::released, [&] { ++releases; });
  const auto button = adopt(box);
  adopt(box);  // adopted again, it still sends one action a press
  show();
  box.click();
  EXPECT_EQ(clicks, 0);
  EXPECT_EQ(toggles, 1);
  EXPECT_EQ(releases, 1);
  EXPECT_EQ(performer->actions, Actions{"go:"});
}

// The action may still reach an engine that is the window's delegate.
TEST_F(Presses, LeaveTheHostsOwnConnectionsWhenOnlyTheActionIsSet) {
  auto& next = add<QPushButton>("Next");
  int clicks = 0;
  QObject::connect(&next, &QPushButton::clicked, [&] { ++clicks; });
  const auto engine = QZ_Plist_State_Parser::init(toolkit);
  window->setDelegate(performer);
  const auto button = toolkit.application().view(next);
  EXPECT_TRUE(engine->forceButtonPushedToBeActionForGuiAttribute(button));
  EXPECT_TRUE(engine->forceButtonPushedToBeActionForGuiAttribute(button));
  toolkit::asButton(button)->setTarget(nullptr);
  show();
  next.click();
  EXPECT_EQ(clicks, 1);
  EXPECT_EQ(performer->actions, Actions{"buttonPushed:"});

  toolkit::asButton(button)->setTarget(performer);
  next.click();
  EXPECT_EQ(clicks, 1);
  EXPECT_EQ(performer->actions.size(), 2U);
}

TEST_F(Presses, TravelToTheWindowsDelegateWithoutATarget) {
  auto& next = add<QPushButton>("Next");
  window->setDelegate(performer);
  toolkit::asButton(window->contentView()->subviews().at(0))->setAction("go:");
  show();
  QTest::mouseClick(&next, Qt::LeftButton);
  EXPECT_EQ(performer->actions, Actions{"go:"});
}

TEST_F(Presses, CarryNoExceptionThroughQt) {
  auto& next = add<QPushButton>("Next");
  const auto button = adopt(next);
  std::string logged;
  toolkit.log().setSink([&](std::string_view line) { logged = line; });
  performer->then = [] { throw toolkit::RangeException("too far"); };
  show();
  QTest::mouseClick(&next, Qt::LeftButton);
  EXPECT_EQ(logged, "NSRangeException: too far");

  std::exception_ptr caught;
  toolkit.calls().setHandler([&](const std::exception_ptr& thrown) { caught = thrown; });
  performer->then = [] { throw std::bad_alloc(); };
  QTest::mouseClick(&next, Qt::LeftButton);
  ASSERT_TRUE(caught);
  EXPECT_THROW(std::rethrow_exception(caught), std::bad_alloc);
}

}  // namespace

}  // namespace qz
