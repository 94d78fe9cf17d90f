// SPDX-License-Identifier: MIT
// Actions that are only in menus are controls of a walk-through: their presses, their looks, and
// that nothing of the walk-through stays.

#include <QActionGroup>
#include <QToolButton>
#include <algorithm>
#include <functional>

#include "hosts/qt/outline.hpp"
#include "qz/hosts/qt/guide.hpp"
#include "qz/hosts/qt/walk_through.hpp"
#include "tests/qt/crowded_form.hpp"
#include "tests/qt/snapshots.hpp"
#include "tests/qt/support.hpp"
#include "toolkit/qt/action_view.hpp"

namespace qz {

namespace {

using hosts::qt::WalkThrough;
using Lines = std::vector<std::string>;

struct MenuActions : testing::Test {
  int presses = 0;  // that the engine has heard
  Lines heard;      // by the host
  toolkit::qt::QtToolkit toolkit;
  hosts::CrowdedForm form;
  QMenu& file = *form.menuBar()->addMenu("&File");
  QMenu& recent = *file.addMenu("&Recent");
  QAction& open = *file.addAction("&Open…");
  QAction& wrap = *file.addAction("&Wrap");
  QAction& later = *recent.addAction("Later");
  QAction& quit = *file.addAction("Quit");
  WalkThrough walkThrough{toolkit};

  MenuActions() {
    toolkit.log().setSink([this](std::string_view line) { presses += line.ends_with("pressed."); });
    for (const auto& [action, tag] : {std::pair{&open, 70}, {&wrap, 71}, {&later, 72}}) {
      action->setProperty("qzTag", tag);
    }
    open.setShortcut(QKeySequence("Ctrl+O"));
    wrap.setCheckable(true);
    for (QAction* const action : {&open, &wrap, &later}) {
      QObject::connect(action, &QAction::triggered, [this] { heard.emplace_back("action"); });
    }
    for (QMenu* const menu : {&file, &recent}) {
      QObject::connect(menu, &QMenu::triggered, [this] { heard.emplace_back("menu"); });
    }
    QObject::connect(form.menuBar(), &QMenuBar::triggered, [this] { heard.emplace_back("bar"); });
    form.show();
    form.activateWindow();
    hosts::settle();
  }

  bool play(const char* lists = "{ 0 = (IDLE_LOOP); }") {
    const bool plays = walkThrough.play(QByteArray(lists), form);
    presses = 0;
    return plays;
  }

  /// Returns what the host has heard, sorted: menus may tell it before the action or after.
  Lines takeHeard() {
    std::sort(heard.begin(), heard.end());
    return std::exchange(heard, {});
  }

  /// Returns what a user sees in the menu.
  static std::vector<QString> shownIn(const QMenu& menu) {
    std::vector<QString> texts;
    for (const QAction* const action : menu.actions()) {
      if (action->isVisible()) texts.push_back(action->text());
    }
    return texts;
  }

  static QAction* shown(const QMenu& menu, const QString& text) {
    for (QAction* const action : menu.actions()) {
      if (action->text().startsWith(text)) return action;
    }
    return nullptr;
  }

  toolkit::Ref<toolkit::View> control(int tag) const {
    return walkThrough.engine()->findObjectWithTag(tag);
  }

  static void chooseByMouse(QMenu& menu, const QString& text) {
    menu.popup({10, 10});
    hosts::settle();
    QTest::mouseClick(&menu, Qt::LeftButton, {}, menu.actionGeometry(shown(menu, text)).center());
    hosts::settle();
  }

  void pressKeys(Qt::Key key) {
    form.activateWindow();
    hosts::settle();
    QTest::keyClick(&form, key, Qt::ControlModifier);
    hosts::settle();
  }

  static void chooseByKeyboard(QMenu& menu, const QString& text) {
    menu.popup({10, 10});
    menu.setActiveAction(shown(menu, text));
    QTest::keyClick(&menu, Qt::Key_Return);
    hosts::settle();
  }
};

TEST_F(MenuActions, AreControlsBehindTheirMenus) {
  form.menuBar()->addMenu("Other")->addAction(&open);
  quit.setObjectName("quit");
  walkThrough.setAdoption({.tags = {{"quit", 73}}});
  ASSERT_TRUE(play());
  std::vector<toolkit::Tag> tags;
  for (const auto& view : walkThrough.engine()->tutorialWindow()->contentView()->subviews()) {
    if (view->tag() >= 70) tags.push_back(view->tag());
  }
  EXPECT_EQ(tags, (std::vector<toolkit::Tag>{70, 71, 73, 72})) << "each once";
  EXPECT_EQ(control(70)->className(), "QAction");
  EXPECT_EQ(control(70)->asButton()->attributedTitle()->string(), "Open…");
  EXPECT_TRUE(control(70)->subviews().empty());
}

TEST_F(MenuActions, GiveTheirPressesToTheEngineDuringAndToTheHostAfterwards) {
  const struct {
    const char* name;
    std::function<void()> press;
  } ways[] = {
      {"mouse", [&] { chooseByMouse(file, "&Open"); }},
      {"keyboard", [&] { chooseByKeyboard(file, "&Open"); }},
      {"shortcut", [&] { pressKeys(Qt::Key_O); }},
      {"assistive technology", [&] { shown(file, "&Open")->trigger(); }},
      {"in a menu of a menu", [&] { chooseByMouse(recent, "Later"); }},
  };
  for (const auto& way : ways) {
    takeHeard();
    way.press();
    const Lines before = takeHeard();
    EXPECT_EQ(std::count(before.begin(), before.end(), "action"), 1) << way.name;
    ASSERT_TRUE(play());
    for (int round = 1; round <= 3; ++round) {
      way.press();
      EXPECT_EQ(presses, round) << way.name;
    }
    hosts::settle();
    EXPECT_EQ(heard, Lines{}) << way.name;
    walkThrough.end();
    way.press();
    EXPECT_EQ(takeHeard(), before) << way.name;
    EXPECT_EQ(presses, 3) << way.name;
  }
}

TEST_F(MenuActions, ThatTheHostTriggersAreTheHosts) {
  ASSERT_TRUE(play());
  open.trigger();
  EXPECT_EQ(heard, Lines{"action"});
  EXPECT_EQ(presses, 0);
}

TEST_F(MenuActions, ThatAreMarkedServeBoth) {
  open.setProperty("qzPress", "both");
  ASSERT_TRUE(play());
  chooseByMouse(file, "&Open");
  EXPECT_EQ(std::count(heard.begin(), heard.end(), "action"), 1);
  EXPECT_EQ(presses, 1);
}

TEST_F(MenuActions, ShowWhatCommandsChange) {
  ASSERT_TRUE(
      play("{ 0 = ((SET_TITLE_FOR_OBJECT_ID, \"Save & go\", 70), (HIDE_OBJECT_WITH_ID, 72),"
           "       (DISABLE_OBJECT_WITH_ID, 71), (SET_STATE_ON_FOR_OBJECT_ID, 71)); }"));
  EXPECT_EQ(open.text(), "Save && go");
  EXPECT_EQ(shownIn(file), (std::vector<QString>{"&Recent", "Save && go", "&Wrap", "Quit"}));
  EXPECT_EQ(shownIn(recent), std::vector<QString>{});
  EXPECT_FALSE(shown(file, "&Wrap")->isEnabled());
  EXPECT_TRUE(shown(file, "&Wrap")->isChecked());
  wrap.setText("By the host");
  EXPECT_TRUE(shown(file, "By the host"));
}

TEST_F(MenuActions, ToggleOncePerPress) {
  std::vector<bool> states;
  QObject::connect(&wrap, &QAction::toggled, [&](bool on) { states.push_back(on); });
  ASSERT_TRUE(play());
  for (int i = 0; i < 2; ++i) chooseByMouse(file, "&Wrap");
  EXPECT_EQ(states, (std::vector<bool>{true, false}));
  EXPECT_EQ(presses, 2);
}

TEST_F(MenuActions, LeaveNoTrace) {
  auto* const group = new QActionGroup(&form);
  QAction* sizes[2];
  for (int i = 0; i < 2; ++i) {
    sizes[i] = file.addAction(i ? "Large" : "Small");
    sizes[i]->setCheckable(true);
    sizes[i]->setProperty("qzTag", 80 + i);
    group->addAction(sizes[i]);
  }
  sizes[0]->setChecked(true);
  file.setDefaultAction(&open);
  wrap.setToolTip("Own");
  const auto order = file.actions();
  hosts::settle();
  const auto before = hosts::pictureOfAll(form);
  ASSERT_TRUE(
      play("{ 0 = ((SET_TITLE_FOR_OBJECT_ID, New, 70), (SET_TITLE_FOR_OBJECT_ID, New, 71),"
           "       (HIDE_OBJECT_WITH_ID, 72), (DISABLE_OBJECT_WITH_ID, 71),"
           "       (SET_STATE_ON_FOR_OBJECT_ID, 71), (SET_STATE_ON_FOR_OBJECT_ID, 81),"
           "       (SET_TOOL_TIP_FOR_ID, Tip, 70), (SET_TOOL_TIP_FOR_ID, Tip, 71),"
           "       (SET_TAG_FOR_OBJECT_ID, 90, 70)); }"));
  EXPECT_TRUE(sizes[1]->isChecked());
  EXPECT_EQ(wrap.toolTip(), "Tip");
  EXPECT_EQ(open.property("qzTag"), 90);
  EXPECT_NE(hosts::differences(before, hosts::pictureOfAll(form)), std::set<QString>{});
  walkThrough.end();
  hosts::settle();
  EXPECT_EQ(hosts::differences(before, hosts::pictureOfAll(form)), std::set<QString>{});
  EXPECT_EQ(file.actions(), order);
  EXPECT_EQ(file.defaultAction(), &open);
  open.setText("Other");
  EXPECT_EQ(open.toolTip(), "Other") << "follows the text again";
}

TEST_F(MenuActions, KeepWhatTheUserHasChosenMeanwhile) {
  ASSERT_TRUE(play("{ 0 = ((SET_STATE_ON_FOR_OBJECT_ID, 71)); }"));
  chooseByMouse(file, "&Wrap");
  chooseByMouse(file, "&Wrap");
  wrap.setText("By the host");
  walkThrough.end();
  EXPECT_EQ(wrap.text(), "By the host");
}

TEST_F(MenuActions, OfATurnedOnGroupWithoutAChoiceAreTurnedOffAgain) {
  QActionGroup group(nullptr);
  wrap.setActionGroup(&group);
  ASSERT_TRUE(play("{ 0 = ((SET_STATE_ON_FOR_OBJECT_ID, 71)); }"));
  EXPECT_EQ(group.checkedAction(), &wrap);
  walkThrough.end();
  EXPECT_EQ(group.checkedAction(), nullptr);
  wrap.setActionGroup(nullptr);
}

TEST_F(MenuActions, InAToolBarTooPressTheButtonThere) {
  file.addAction(form.save);
  form.save->setShortcut(QKeySequence("Ctrl+S"));
  int saved = 0;
  QObject::connect(form.save, &QAction::triggered, [&] { ++saved; });
  ASSERT_TRUE(play());
  EXPECT_EQ(shown(file, "Save")->text(),
            "Save\t" + QKeySequence("Ctrl+S").toString(QKeySequence::NativeText));
  chooseByMouse(file, "Save");
  EXPECT_EQ(presses, 1);
  pressKeys(Qt::Key_S);
  EXPECT_EQ(presses, 2);
  EXPECT_EQ(saved, 0);
  walkThrough.end();
  EXPECT_EQ(file.actions().back(), form.save);
  pressKeys(Qt::Key_S);
  chooseByMouse(file, "Save");
  EXPECT_EQ(saved, 2);
}

TEST_F(MenuActions, MayEndTheWalkThroughInTheirPress) {
  ASSERT_TRUE(play("{ 0 = (IDLE_LOOP); 70 = (TERMINATE_PARSER); }"));
  chooseByMouse(file, "&Open");
  EXPECT_FALSE(walkThrough.isRunning());
  EXPECT_EQ(heard, Lines{});
  EXPECT_EQ(file.actions()[1], &open);
  chooseByMouse(file, "&Open");
  EXPECT_EQ(std::count(heard.begin(), heard.end(), "action"), 1);
}

TEST_F(MenuActions, MayBeDeletedAtAnyTime) {
  ASSERT_TRUE(play());
  const auto view = control(70);
  const auto other = control(71);
  delete &open;
  hosts::settle();
  EXPECT_EQ(shownIn(file), (std::vector<QString>{"&Recent", "&Wrap", "Quit"}));
  view->setHidden(true);
  view->setTag(5);
  view->setToolTip("None");
  view->setEnabled(false);
  view->asButton()->setTitle("None");
  view->asButton()->setState(toolkit::State::on);
  EXPECT_EQ(view->tag(), 0);
  EXPECT_EQ(view->className(), "");
  EXPECT_FALSE(view->attributedTitle());
  EXPECT_FALSE(view->asButton()->sendAction("buttonPushed:", nullptr));
  EXPECT_FALSE(control(70));
  file.clear();
  EXPECT_FALSE(control(71)) << "no menu shows it any more";
  walkThrough.end();
  hosts::settle();
}

TEST_F(MenuActions, ShowOfAButtonWhatAnActionCan) {
  ASSERT_TRUE(play());
  const auto view = control(70);
  auto* const button = view->asButton();
  const QIcon icon = open.icon();
  view->setWantsLayer(true);
  view->setLayerContents(nullptr);
  button->setBackgroundColor(toolkit::colors::red);
  button->setBezelStyle({});
  EXPECT_EQ(open.icon().cacheKey(), icon.cacheKey());
  button->setStringValue("plain");
  EXPECT_EQ(button->stringValue(), "plain");
  button->setAttributedStringValue(toolkit::AttributedString("styled"));
  EXPECT_EQ(button->stringValue(), "styled");
  EXPECT_EQ(open.text(), "&Open…") << "the value is not the title";
  button->setAttributedTitle(toolkit::AttributedString("Title"));
  EXPECT_EQ(open.text(), "Title");
  button->highlight(true);
  EXPECT_TRUE(button->isHighlighted());
  EXPECT_THROW(view->addSubview(control(71)), toolkit::Exception);
}

TEST_F(MenuActions, OfAMenuThatNothingOpensReachNoWindow) {
  ASSERT_TRUE(play());
  const auto view = control(70);
  auto* const button = view->asButton();
  EXPECT_FALSE(button->sendAction("isUnknown:", nullptr));
  form.menuBar()->removeAction(file.menuAction());
  EXPECT_EQ(toolkit::qt::QtAction::of(view)->place(), nullptr);
  EXPECT_FALSE(button->sendAction("isUnknown:", nullptr));
}

TEST_F(MenuActions, WithoutATargetAreTheHosts) {
  ASSERT_TRUE(play());
  const auto view = control(70);
  view->asButton()->setTarget(nullptr);
  chooseByMouse(file, "&Open");
  EXPECT_EQ(std::count(heard.begin(), heard.end(), "action"), 1);
  EXPECT_EQ(presses, 0);
}

TEST_F(MenuActions, AreInDescriptionsAndOutlines) {
  later.setVisible(false);
  wrap.setEnabled(false);
  wrap.setChecked(true);
  ASSERT_TRUE(play());
  const QByteArray description = walkThrough.describe(form);
  EXPECT_TRUE(description.contains("<string>Open…</string>"));
  EXPECT_TRUE(description.contains("NSButton:toggle"));
  for (const auto& outlined : hosts::qt::outlineOf(*walkThrough.engine()).controls) {
    if (outlined.tag < 70) continue;
    EXPECT_EQ(outlined.isHidden, outlined.tag == 72);
    EXPECT_EQ(outlined.isEnabled, outlined.tag == 70) << outlined.tag;
  }
}

TEST_F(MenuActions, AreWhereTheirMenuBarIsForAGuide) {
  const hosts::qt::Guide guide(toolkit, form);
  ASSERT_TRUE(
      play("{ 0 = ((SET_TEXT_FOR_OBJECT_ID, Open, 901),"
           "       (SET_TEXT_FOR_OBJECT_ID, 72, 905)); }"));
  EXPECT_EQ(guide.target(), form.menuBar());
}

}  // namespace

}  // namespace qz
