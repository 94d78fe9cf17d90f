// SPDX-License-Identifier: MIT
// The views of widgets: their kind, frame and tag; states; keyboard focus.

#include <QCalendarWidget>
#include <QCheckBox>
#include <QDateTimeEdit>
#include <QDial>
#include <QDialog>
#include <QFontComboBox>
#include <QGroupBox>
#include <QKeySequenceEdit>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QMainWindow>
#include <QPlainTextEdit>
#include <QProgressBar>
#include <QPushButton>
#include <QRadioButton>
#include <QScrollBar>
#include <QSpinBox>
#include <QTabBar>
#include <QTabWidget>
#include <QTableWidget>
#include <QTextEdit>
#include <QToolBox>
#include <QTreeWidget>

#include "qz/engine.hpp"
#include "qz/toolkit/exception.hpp"
#include "tests/qt/support.hpp"
#include "toolkit/qt/widget_node.hpp"

namespace qz {

namespace {

using Kinds = hosts::Host;
using toolkit::State;
using toolkit::qt::tagProperty;

std::string kindOf(toolkit::View& view) {
  if (view.asButton()) return "button";
  if (view.asTextField()) return "text field";
  return view.asImageView() ? "image view" : "view";
}

TEST_F(Kinds, GoByTheClassOfTheWidget) {
  QPixmap pixmap(4, 4);
  add<QPushButton>();
  add<QRadioButton>();
  add<QComboBox>();
  add<QLabel>("text");
  add<QLabel>().setPixmap(pixmap);
  add<QLabel>().setProperty(toolkit::qt::imageViewProperty, true);
  add<QLineEdit>();
  add<QTextEdit>();
  add<QPlainTextEdit>();
  add<QWidget>();
  new QDialog(panel.get());  // a window, not a subview
  const char* const expected[] = {"button",     "button",     "view",       "text field",
                                  "image view", "image view", "text field", "text field",
                                  "text field", "view"};
  const auto& views = window->contentView()->subviews();
  ASSERT_EQ(views.size(), std::size(expected));
  for (std::size_t i = 0; i < views.size(); ++i) {
    EXPECT_EQ(kindOf(*views[i]), expected[i]) << views[i]->className();
  }
  EXPECT_EQ(views[2]->className(), "QComboBox");
}

struct FocusTaker : QWidget {
  explicit FocusTaker(QWidget* around) : QWidget(around) { setFocusPolicy(Qt::StrongFocus); }
};

TEST_F(Kinds, CanBeEnabledWhereTheyTakeInput) {
  QWidget* const widgets[] = {
      &add<QComboBox>(),      &add<QFontComboBox>(),   &add<QSlider>(),
      &add<QScrollBar>(),     &add<QDial>(),           &add<QSpinBox>(),
      &add<QDoubleSpinBox>(), &add<QDateTimeEdit>(),   &add<QTabWidget>(),
      &add<QTabBar>(),        &add<QListWidget>(),     &add<QTreeWidget>(),
      &add<QTableWidget>(),   &add<QCalendarWidget>(), &add<QKeySequenceEdit>(),
      &add<QToolBox>(),       &add<FocusTaker>()};
  for (QWidget* const widget : widgets) {
    const auto view = toolkit.application().view(*widget);
    view->setEnabled(false);
    EXPECT_FALSE(widget->isEnabled()) << view->className();
    view->setEnabled(true);
    EXPECT_TRUE(widget->isEnabled()) << view->className();
  }
}

TEST_F(Kinds, CannotBeEnabledWhereTheyTakeNone) {
  auto& box = add<QGroupBox>("box");
  QWidget* const widgets[] = {&box, &add<QWidget>(), &add<QFrame>(), &add<QProgressBar>()};
  for (QWidget* const widget : widgets) {
    const auto view = toolkit.application().view(*widget);
    EXPECT_THROW(view->setEnabled(false), toolkit::InvalidArgumentException) << view->className();
  }
  box.setCheckable(true);
  toolkit.application().view(box)->setEnabled(false);
  EXPECT_FALSE(box.isEnabled());
}

TEST_F(Kinds, AreEnabledByScripts) {
  auto& combo = add<QComboBox>();
  combo.setProperty(tagProperty, 5);
  const auto engine = QZ_Plist_State_Parser::init(toolkit);
  engine->setTutorialWindow(window);
  const auto run = [&](const char* command) {
    engine->processCommandArray(toolkit::Array::make({toolkit::String::make(command)}),
                                toolkit::Number::withLong(5));
    return combo.isEnabled();
  };
  EXPECT_FALSE(run("DISABLE_OBJECT_WITH_ID"));
  EXPECT_TRUE(run("ENABLE_OBJECT_WITH_ID"));
}

TEST_F(Kinds, TakeTheCentralWidgetOfAMainWindowForItsContent) {
  QMainWindow mainWindow;
  const auto shown = toolkit.application().window(mainWindow);
  EXPECT_FALSE(shown->contentView());
  mainWindow.setCentralWidget(new QTextEdit);
  EXPECT_EQ(shown->contentView()->className(), "QTextEdit");
}

TEST_F(Kinds, LieWithTheirOriginAtTheLowerLeft) {
  auto& widget = add<QLabel>("text");
  const auto view = toolkit.application().view(widget);
  EXPECT_EQ(view->frame(), (toolkit::Rect{20, 250, 120, 30}));
  widget.move(7, 0);
  EXPECT_EQ(view->frame(), (toolkit::Rect{7, 270, 120, 30}));
}

TEST_F(Kinds, HaveTheirTagsInAPropertyThatComesAndGoes) {
  auto& plain = add<QLabel>("text");
  auto& tagged = add<QLabel>("text");
  tagged.setProperty(tagProperty, 7);
  const auto plainView = toolkit.application().view(plain);
  const auto taggedView = toolkit.application().view(tagged);
  EXPECT_EQ(taggedView->tag(), 7);
  plainView->setTag(3);
  EXPECT_EQ(plain.property(tagProperty).toLongLong(), 3);
  plainView->setTag(0);
  taggedView->setTag(0);
  EXPECT_TRUE(plain.dynamicPropertyNames().isEmpty());
  EXPECT_EQ(tagged.dynamicPropertyNames().size(), 1);
}

TEST_F(Kinds, KnowMixedStatesOnlyAsTriStateCheckBoxes) {
  auto& three = add<QCheckBox>("three");
  three.setTristate(true);
  auto& two = add<QCheckBox>("two");
  auto& radio = add<QRadioButton>("radio");
  auto& push = add<QPushButton>("push");
  for (QCheckBox* const widget : {&three, &two}) {
    const auto button = adopt(*widget);
    button->setState(State::mixed);
    EXPECT_EQ(button->state(), widget == &three ? State::mixed : State::on);
  }
  EXPECT_EQ(three.checkState(), Qt::PartiallyChecked);
  EXPECT_FALSE(two.isTristate());
  const auto exclusive = adopt(radio);
  exclusive->setState(State::on);
  exclusive->setState(State::off);
  EXPECT_EQ(exclusive->state(), State::off);
  EXPECT_TRUE(radio.autoExclusive());
  const auto pushed = adopt(push);
  pushed->setState(State::on);
  EXPECT_EQ(pushed->state(), State::on);
  EXPECT_TRUE(performer->actions.empty());
}

TEST_F(Kinds, GiveTheFocusAwayWhenTheyAreHiddenOrDisabled) {
  auto& first = add<QPushButton>("first");
  auto& second = add<QPushButton>("second");
  auto& third = add<QPushButton>("third");
  show();
  first.setFocus();
  toolkit.application().view(first)->setHidden(true);
  EXPECT_EQ(panel->focusWidget(), &second);
  toolkit.application().view(second)->setEnabled(false);
  EXPECT_EQ(panel->focusWidget(), &third);
  toolkit.application().view(third)->setHidden(true);
  EXPECT_EQ(panel->focusWidget(), nullptr);
}

}  // namespace

}  // namespace qz
