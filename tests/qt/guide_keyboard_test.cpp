// SPDX-License-Identifier: MIT
// The keyboard in the guide's panel, and between the panel and the form.

#include <QPlainTextEdit>

#include "tests/qt/guided.hpp"

namespace qz {

namespace {

using hosts::threeSteps;

struct GuideKeyboard : hosts::Guided {
  QWidget* focused() const { return QApplication::focusWidget(); }
};

TEST_F(GuideKeyboard, IsInThePanelWhenItAppears) {
  show();
  play(threeSteps);
  EXPECT_TRUE(panel().isActiveWindow());
  EXPECT_EQ(focused(), &panel().next);
}

TEST_F(GuideKeyboard, StaysInTheFormIfTheHostWantsThat) {
  for (const bool inside : {false, true}) {
    show({.takesFocus = false, .insideWindow = inside});
    play(threeSteps);
    EXPECT_TRUE(panel().isVisible());
    EXPECT_TRUE(form->isActiveWindow());
    EXPECT_EQ(focused(), &name);
  }
}

TEST_F(GuideKeyboard, StaysWhereTheUserHasPutItInLaterSteps) {
  show();
  play(threeSteps);
  form->activateWindow();
  remark.setFocus();
  settle();
  panel().next.click();
  settle();
  EXPECT_EQ(guide->target(), &send);
  EXPECT_EQ(focused(), &remark);
}

TEST_F(GuideKeyboard, GoesToTheControlThatTheUserIsToPressAndBack) {
  show();
  play(
      "0 = ((SET_TEXT_FOR_OBJECT_ID, Hi, 901));"
      "2000 = ((SET_TEXT_FOR_OBJECT_ID, \"Press Send\", 901), (SET_TEXT_FOR_OBJECT_ID, 2, 905),"
      "        (HIDE_OBJECT_WITH_ID, 2000));"
      "2 = ((SET_TEXT_FOR_OBJECT_ID, Done, 901), (SHOW_OBJECT_WITH_ID, 2000));");
  press(Qt::Key_Return);
  EXPECT_EQ(focused(), &send);
  EXPECT_TRUE(form->isActiveWindow());
  press(Qt::Key_Space);
  EXPECT_EQ(panel().heading.text(), "Done");
  EXPECT_EQ(focused(), &panel().next);
}

TEST_F(GuideKeyboard, StaysInTheFormWhenTheUserIsToPressAControl) {
  show();
  play(
      "0 = ((SET_TEXT_FOR_OBJECT_ID, Hi, 901));"
      "2000 = ((SET_TEXT_FOR_OBJECT_ID, \"Press Send\", 901), (SET_TEXT_FOR_OBJECT_ID, 2, 905),"
      "        (HIDE_OBJECT_WITH_ID, 2000));"
      "2 = ((SET_TEXT_FOR_OBJECT_ID, Done, 901), (SHOW_OBJECT_WITH_ID, 2000));");
  form->activateWindow();
  remark.setFocus();
  settle();
  panel().next.click();
  settle();
  EXPECT_EQ(focused(), &remark);
  send.click();
  settle();
  EXPECT_EQ(focused(), &remark);
}

TEST_F(GuideKeyboard, GoesOnWithEnterAndEndsWithEscape) {
  show();
  play(threeSteps);
  press(Qt::Key_Return);
  EXPECT_EQ(panel().heading.text(), "Send");
  panel().back.setFocus();
  press(Qt::Key_Enter);
  EXPECT_EQ(panel().heading.text(), "Welcome") << "Enter presses the button with the focus";
  press(Qt::Key_Escape);
  EXPECT_FALSE(walkThrough.engine());
  EXPECT_FALSE(panel().isVisible());
  EXPECT_TRUE(form->isActiveWindow());
  EXPECT_EQ(focused(), &name);
}

TEST_F(GuideKeyboard, DoesNotGoOnWithEnterNorEndWithEscapeIfTheHostWantsThat) {
  show({.enter = false, .escape = false});
  play(threeSteps);
  press(Qt::Key_Return);
  EXPECT_EQ(panel().heading.text(), "Name");
  press(Qt::Key_Escape);
  EXPECT_TRUE(panel().isVisible());
  press(Qt::Key_Space);
  EXPECT_EQ(panel().heading.text(), "Send") << "Space presses any button";
}

TEST_F(GuideKeyboard, DoesNotSkipWithAButtonThatTheScriptHidesOrDisables) {
  show();
  for (const char* command : {"HIDE_OBJECT_WITH_ID", "DISABLE_OBJECT_WITH_ID"}) {
    play((std::string(threeSteps) + "1000 = ((" + command + ", 906));").c_str());
    click(panel().back);
    press(Qt::Key_Escape);
    EXPECT_TRUE(walkThrough.engine()) << command;
    EXPECT_TRUE(panel().isVisible());
  }
}

TEST_F(GuideKeyboard, FindsThePanelRightAfterTheControlInTheTabOrder) {
  for (const bool inside : {false, true}) {
    show({.insideWindow = inside});
    play(threeSteps);
    form->activateWindow();
    name.setFocus();
    settle();
    std::vector<QWidget*> places;
    for (int i = 0; i < 6; ++i) {
      press(Qt::Key_Tab);
      places.push_back(focused());
    }
    EXPECT_EQ(places, (std::vector<QWidget*>{&panel().skip, &panel().back, &panel().next, &send,
                                             &remark, &name}))
        << inside;
    places.clear();
    for (int i = 0; i < 6; ++i) {
      press(Qt::Key_Backtab, Qt::ShiftModifier);
      places.push_back(focused());
    }
    EXPECT_EQ(places, (std::vector<QWidget*>{&remark, &send, &panel().next, &panel().back,
                                             &panel().skip, &name}))
        << inside;
  }
}

TEST_F(GuideKeyboard, IsWhereItWasAtTheEnd) {
  for (const bool inside : {false, true}) {
    show({.insideWindow = inside});
    remark.setFocus();
    play(
        "0 = ((SET_TEXT_FOR_OBJECT_ID, Hi, 901), (SET_TEXT_FOR_OBJECT_ID, 2, 905),"
        "     (HIDE_OBJECT_WITH_ID, 2000)); 2 = (TERMINATE_PARSER); 906 = (TERMINATE_PARSER);");
    EXPECT_EQ(focused(), &send) << "the user is to press it";
    press(Qt::Key_Space);
    EXPECT_FALSE(walkThrough.engine());
    EXPECT_EQ(focused(), &remark);
    play("0 = ((SET_TEXT_FOR_OBJECT_ID, Hi, 901)); 906 = (TERMINATE_PARSER);");
    press(Qt::Key_Escape);
    EXPECT_FALSE(walkThrough.engine());
    EXPECT_EQ(focused(), &remark);
  }
}

TEST_F(GuideKeyboard, LeavesOutButtonsThatCannotBePressed) {
  show();
  play(threeSteps);
  panel().skip.hide();
  panel().next.setEnabled(false);
  form->activateWindow();
  name.setFocus();
  settle();
  press(Qt::Key_Tab);
  EXPECT_EQ(focused(), &panel().back);
  press(Qt::Key_Tab);
  EXPECT_EQ(focused(), &send);
}

TEST_F(GuideKeyboard, StaysWithinThePanelIfTheHostWantsThat) {
  show({.tab = false});
  play(threeSteps);
  std::vector<QWidget*> places;
  for (int i = 0; i < 3; ++i) {
    press(Qt::Key_Tab);
    places.push_back(focused());
  }
  EXPECT_EQ(places, (std::vector<QWidget*>{&panel().skip, &panel().back, &panel().next}));
  form->activateWindow();
  name.setFocus();
  settle();
  press(Qt::Key_Tab);
  EXPECT_EQ(focused(), &send);
}

TEST_F(GuideKeyboard, LeavesTheTabKeyToEditsThatTakeItAsText) {
  auto* const edit = new QPlainTextEdit(form.get());
  edit->setProperty("qzTag", 9);
  form->layout()->addWidget(edit);
  show();
  play("0 = ((SET_TEXT_FOR_OBJECT_ID, Hi, 901), (SET_TEXT_FOR_OBJECT_ID, 9, 905));");
  form->activateWindow();
  edit->setFocus();
  settle();
  press(Qt::Key_Tab);
  EXPECT_EQ(edit->toPlainText(), "\t");
  EXPECT_EQ(focused(), edit);
}

TEST_F(GuideKeyboard, ReturnsFromAStepWithoutAControlToWhereItWas) {
  show();
  play("0 = ((SET_TEXT_FOR_OBJECT_ID, Hi, 901));");
  EXPECT_EQ(focused(), &panel().next);
  press(Qt::Key_Tab);
  EXPECT_EQ(focused(), &send) << "what follows the form's focus";
  press(Qt::Key_Backtab, Qt::ShiftModifier);
  EXPECT_EQ(focused(), &name);
}

TEST_F(GuideKeyboard, KeepsTheFormsShortcutsWhileThePanelIsActive) {
  show();
  play("0 = ((SET_TEXT_FOR_OBJECT_ID, Hi, 901)); 2 = ((SET_TEXT_FOR_OBJECT_ID, Sent, 901));");
  EXPECT_TRUE(panel().isActiveWindow());
  press(Qt::Key_S, Qt::AltModifier);
  EXPECT_TRUE(QTest::qWaitFor([this] { return panel().heading.text() == "Sent"; }));
}

// The script hides the button that the user has just pressed.
TEST_F(GuideKeyboard, StaysInAPanelInsideTheWindowWhenItsButtonIsHidden) {
  show({.insideWindow = true});
  play(
      "0 = ((SET_TEXT_FOR_OBJECT_ID, Press, 901), (SET_TEXT_FOR_OBJECT_ID, 3, 905));"
      "2000 = ((HIDE_OBJECT_WITH_ID, 2000), (SET_TEXT_FOR_OBJECT_ID, Again, 901));"
      "1000 = ((HIDE_OBJECT_WITH_ID, 1000), (HIDE_OBJECT_WITH_ID, 906));");
  panel().next.setFocus();
  panel().next.click();
  settle();
  EXPECT_EQ(form->focusWidget(), &remark) << "the control, because there is no Next";
}

TEST_F(GuideKeyboard, StaysInAPanelWithoutButtons) {
  show({.insideWindow = true});
  play(
      "0 = ((SET_TEXT_FOR_OBJECT_ID, Press, 901));"
      "2000 = ((HIDE_OBJECT_WITH_ID, 2000)); 906 = ((HIDE_OBJECT_WITH_ID, 906));"
      "1000 = ((HIDE_OBJECT_WITH_ID, 1000));");
  panel().next.setFocus();
  panel().next.click();
  EXPECT_EQ(form->focusWidget(), &panel().skip);
  panel().skip.click();
  EXPECT_EQ(form->focusWidget(), &panel().back);
  panel().back.click();
  EXPECT_EQ(form->focusWidget(), &panel());
}

TEST_F(GuideKeyboard, PassesAControlThatTakesNoFocus) {
  show();
  send.setFocusPolicy(Qt::NoFocus);
  play(threeSteps);
  click(panel().next);
  ASSERT_EQ(guide->target(), &send);
  panel().next.setFocus();
  press(Qt::Key_Tab);
  EXPECT_EQ(focused(), &remark) << "the panel is behind the control before";
  press(Qt::Key_Backtab, Qt::ShiftModifier);
  EXPECT_EQ(focused(), &panel().next);
}

TEST_F(GuideKeyboard, StaysInThePanelIfTheFormTakesNoFocus) {
  show();
  for (QWidget* const widget : {static_cast<QWidget*>(&name), static_cast<QWidget*>(&send),
                                static_cast<QWidget*>(&remark)}) {
    widget->setFocusPolicy(Qt::NoFocus);
  }
  play(threeSteps);
  ASSERT_EQ(focused(), &panel().next);
  press(Qt::Key_Tab);
  EXPECT_TRUE(panel().isAncestorOf(focused()));
  EXPECT_TRUE(panel().isActiveWindow());
}

}  // namespace

}  // namespace qz
