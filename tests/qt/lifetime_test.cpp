// Widgets that the host deletes: their views are as if they were not there.

#include <QCheckBox>
#include <QLabel>
#include <QPointer>
#include <QPushButton>

#include "tests/qt/support.hpp"
#include "toolkit/qt/widget_node.hpp"

namespace {

using Lifetime = hosts::Host;

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
