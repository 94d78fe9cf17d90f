// SPDX-License-Identifier: MIT
// Widgets that the host deletes: their views then behave as absent ones.

#include <QCheckBox>
#include <QLabel>
#include <QPointer>
#include <QPushButton>

#include "qz/engine.hpp"
#include "qz/property_list/reader.hpp"
#include "tests/qt/support.hpp"
#include "toolkit/qt/widget_node.hpp"

namespace qz {

namespace {

using Lifetime = hosts::Host;
using toolkit::qt::tagProperty;

TEST_F(Lifetime, OfADeletedWidgetEveryMessageDoesNothing) {
  auto* const widget = &add<QCheckBox>("Box");
  const auto button = adopt(*widget);
  button->setState(toolkit::State::on);
  delete widget;
  button->setTitle("new");
  button->setHidden(true);
  button->setEnabled(false);
  button->setToolTip("tip");
  button->highlight(true);
  button->setState(toolkit::State::on);
  button->setBackgroundColor(toolkit::colors::red);
  button->setAction("other:");
  button->setTag(4);
  EXPECT_EQ(button->tag(), 0);
  EXPECT_EQ(button->state(), toolkit::State::off);
  EXPECT_EQ(button->attributedTitle(), std::nullopt);
  EXPECT_EQ(button->stringValue(), "");
  EXPECT_EQ(button->frame(), toolkit::Rect());
  EXPECT_FALSE(button->sendAction("go:", performer));
  EXPECT_TRUE(window->contentView()->subviews().empty());
}

TEST_F(Lifetime, AWidgetMayBeDeletedInItsOwnClick) {
  auto* const widget = &add<QPushButton>("Next");
  const auto button = adopt(*widget);
  performer->then = [&] { widget->deleteLater(); };
  show();
  QTest::mouseClick(widget, Qt::LeftButton);
  hosts::settle();
  EXPECT_EQ(performer->actions.size(), 1U);
  EXPECT_TRUE(window->contentView()->subviews().empty());
}

TEST_F(Lifetime, AWidgetMayBeDeletedAtOnceInItsOwnClick) {
  auto* const widget = &add<QPushButton>("Next");
  const auto button = adopt(*widget);
  performer->then = [&] { delete widget; };
  show();
  QTest::mouseClick(widget, Qt::LeftButton);
  EXPECT_EQ(performer->actions.size(), 1U);
  button->highlight(true);
  EXPECT_TRUE(window->contentView()->subviews().empty());
}

/// Returns an engine over the host's window, with this script.
std::shared_ptr<QZ_Plist_State_Parser> walkThrough(hosts::Host& host, std::string_view script) {
  host.toolkit.log().setSink([](std::string_view) {});
  auto engine = QZ_Plist_State_Parser::initWithWindow(host.toolkit, host.window);
  engine->getGuiAssetsFromWindow(host.window);
  engine->setPlistDictionary(toolkit::dictionaryFromPropertyList(script));
  return engine;
}

// The list checks the box, and the host then deletes the label, so the next command finds none. The
// last command unchecks the box, and the host deletes the box while the command runs.
TEST_F(Lifetime, WidgetsMayBeDeletedWhileAListRuns) {
  auto* const box = &add<QCheckBox>("Box");
  QPointer<QLabel> label = &add<QLabel>("Text");
  auto* const next = &add<QPushButton>("Next");
  box->setProperty(tagProperty, 1);
  label->setProperty(tagProperty, 2);
  next->setProperty(tagProperty, 3);
  QObject::connect(box, &QCheckBox::toggled, [&](bool on) {
    if (on) {
      delete label;
    } else {
      delete box;
    }
  });
  const auto engine = walkThrough(
      *this,
      "{ 3 = ((SET_STATE_ON_FOR_OBJECT_ID, 1), (SET_TEXT_FOR_OBJECT_ID, late, 2),"
      "       (SET_TITLE_FOR_OBJECT_ID, Done, 3), (SET_STATE_OFF_FOR_OBJECT_ID, 1)); }");
  show();
  QTest::mouseClick(next, Qt::LeftButton);
  EXPECT_FALSE(label);
  EXPECT_EQ(next->text(), "Done");
  EXPECT_EQ(window->contentView()->subviews().size(), 1U);
  engine->terminateParser();
}

TEST_F(Lifetime, AnEngineMayOutliveItsWindowWithATimerPending) {
  auto* const next = &add<QPushButton>("Next");
  next->setProperty(tagProperty, 3);
  const auto engine = walkThrough(
      *this, "{ 3 = ((SET_TIMER_FOR_ID, 1, 4)); 4 = ((SET_TITLE_FOR_OBJECT_ID, late, 3)); }");
  show();
  QTest::mouseClick(next, Qt::LeftButton);
  panel.reset();
  EXPECT_TRUE(QTest::qWaitFor([&] { return engine->currentCommandState() == "4"; }));
  engine->terminateParser();
}

TEST_F(Lifetime, ATimerMayOutliveTheWindow) {
  add<QLabel>("Text");
  const auto label = toolkit::asTextField(window->contentView()->subviews().at(0));
  bool fired = false;
  toolkit.runLoop().schedule(0.01, false, [&](const auto&) {
    label->setStringValue("late");
    window->close();
    fired = true;
  });
  panel.reset();
  EXPECT_TRUE(QTest::qWaitFor([&] { return fired; }));
  EXPECT_FALSE(window->contentView());
}

TEST_F(Lifetime, AWidgetThatTakesTheAddressOfAnotherHasAViewOfItsOwn) {
  auto* const first = &add<QPushButton>("first");
  const auto view = toolkit.application().view(*first);
  first->~QPushButton();
  auto* const second = new (first) QPushButton("second", panel.get());
  EXPECT_FALSE(toolkit.application().view(*second) == view);
  EXPECT_EQ(window->contentView()->subviews().size(), 1U);
}

TEST_F(Lifetime, AControlThatIsPutNowhereEndsWithItsView) {
  QPointer<QWidget> widget;
  {
    const auto button = toolkit.application().makeButton({0, 0, 10, 10});
    widget = toolkit::qt::WidgetNode::of(button)->widget();
    ASSERT_TRUE(widget);
  }
  hosts::settle();
  EXPECT_FALSE(widget);
}

}  // namespace

}  // namespace qz
