// SPDX-License-Identifier: MIT
// What Qt and the host change in return when a command changes a form is restored, too.

#include <QDialog>
#include <QMdiArea>
#include <QMdiSubWindow>
#include <QMenu>
#include <QTemporaryDir>
#include <fstream>

#include "qz/hosts/qt/walk_through.hpp"
#include "tests/qt/crowded_form.hpp"
#include "tests/qt/support.hpp"

namespace qz {

namespace {

struct ChangesInReturn : testing::Test {
  QTemporaryDir directory;
  toolkit::qt::QtToolkit toolkit;
  hosts::qt::WalkThrough walkThrough{toolkit};
  hosts::CrowdedForm form;

  ChangesInReturn() {
    toolkit.log().setSink([](std::string_view) {});
    form.show();
    settleLayouts();
  }

  static void settleLayouts() {
    for (int level = 0; level < 5; ++level) hosts::settle();
  }

  void play(const std::string& commands) {
    const std::string path = directory.filePath("tour.plist").toStdString();
    std::ofstream(path) << "{ 0 = (" << commands << "); }";
    ASSERT_TRUE(walkThrough.play(path, form));
    settleLayouts();
  }
};

const std::string enlargingCommand =
    "(SET_TITLE_FOR_OBJECT_ID, \"" + std::string(300, 'm') + "\", 2)";

TEST_F(ChangesInReturn, AreTheSizeOfAWindowThatNeedsMoreRoom) {
  const QSize size = form.size();
  const QRect place = form.inBox.geometry();
  play(enlargingCommand);
  EXPECT_GT(form.width(), size.width());
  walkThrough.end();
  EXPECT_EQ(form.size(), size);
  EXPECT_EQ(form.inBox.geometry(), place);
}

TEST_F(ChangesInReturn, AreNotTheSizeThatTheUserHasChosen) {
  play(enlargingCommand);
  const QSize chosen = form.size() + QSize(10, 10);
  form.resize(chosen);
  walkThrough.end();
  EXPECT_EQ(form.size(), chosen);
}

TEST_F(ChangesInReturn, AreTheSizeEvenIfAPageThatIsNotShownNeededTheRoom) {
  const QSize size = form.size();
  play("(SET_TITLE_FOR_OBJECT_ID, \"" + std::string(300, 'm') + "\", 4)");
  EXPECT_GT(form.width(), size.width());
  form.tabs->setCurrentIndex(0);
  settleLayouts();
  walkThrough.end();
  EXPECT_EQ(form.size(), size);
}

TEST_F(ChangesInReturn, AreWhatASlotOfTheHostEnables) {
  QObject::connect(&form.check, &QCheckBox::toggled, &form.line, &QWidget::setEnabled);
  QObject::connect(&form.edit, &QTextEdit::textChanged, &form.inBox, &QWidget::hide);
  form.line.setEnabled(false);
  play(
      "(SET_STATE_ON_FOR_OBJECT_ID, 9), (DISABLE_OBJECT_WITH_ID, 11), "
      "(SET_TEXT_FOR_OBJECT_ID, New, 12)");
  EXPECT_TRUE(form.inBox.isHidden());
  walkThrough.end();
  EXPECT_FALSE(form.check.isChecked());
  EXPECT_FALSE(form.line.isEnabled());
  EXPECT_FALSE(form.inBox.isHidden());
}

// Qt draws the text of a disabled label in another colour, so the toolkit gives it another text.
TEST_F(ChangesInReturn, AreTheLookOfALabelThatTheHostDisables) {
  play(
      "(SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID, \"<b>Bold</b>\", "
      "Times, 30, 10)");
  form.box->setEnabled(false);
  walkThrough.end();
  EXPECT_EQ(form.label.text(), "Label");
  EXPECT_FALSE(form.label.hasMouseTracking());
}

TEST_F(ChangesInReturn, DoNotShowAHiddenButtonOfAToolBarAgain) {
  play("(HIDE_OBJECT_WITH_ID, 1)");
  form.resize(form.size() + QSize(50, 0));
  form.bar->addAction("Another");
  settleLayouts();
  EXPECT_FALSE(form.saveButton().isVisible());
  walkThrough.end();
  settleLayouts();
  EXPECT_TRUE(form.saveButton().isVisible());
}

TEST_F(ChangesInReturn, HideThePageOfAHiddenTab) {
  form.first->setProperty("qzTag", 20);
  play("(HIDE_OBJECT_WITH_ID, 20)");
  EXPECT_FALSE(form.tabs->isTabVisible(0));
  EXPECT_EQ(form.tabs->currentIndex(), 1);
  walkThrough.end();
  EXPECT_TRUE(form.tabs->isTabVisible(0));
  EXPECT_EQ(form.tabs->currentIndex(), 0);
  EXPECT_TRUE(form.first->isVisible());
}

TEST_F(ChangesInReturn, ReachTheEntryOfAMenu) {
  QMenu* const menu = form.menuBar()->addMenu("File");
  menu->setProperty("qzTag", 20);
  play("(SET_TOOL_TIP_FOR_ID, tip, 20), (DISABLE_OBJECT_WITH_ID, 20), (HIDE_OBJECT_WITH_ID, 20)");
  EXPECT_EQ(menu->toolTip(), "tip");
  EXPECT_FALSE(menu->menuAction()->isEnabled());
  EXPECT_FALSE(menu->menuAction()->isVisible());
  walkThrough.end();
  EXPECT_EQ(menu->toolTip(), "");
  EXPECT_TRUE(menu->menuAction()->isEnabled());
  EXPECT_TRUE(menu->menuAction()->isVisible());
  EXPECT_FALSE(menu->isVisible()) << "it is not open";
}

TEST_F(ChangesInReturn, DoNotLeaveAnotherSubWindowInFront) {
  auto* const area = new QMdiArea(form.second);
  form.second->layout()->addWidget(area);
  auto* const button = new QPushButton("Inner");
  button->setProperty("qzTag", 20);
  QMdiSubWindow* const back = area->addSubWindow(button);
  QMdiSubWindow* const front = area->addSubWindow(new QLabel("front"));
  form.tabs->setCurrentIndex(1);
  area->setActiveSubWindow(front);
  settleLayouts();
  play("(SET_TITLE_FOR_OBJECT_ID, New, 20)");
  EXPECT_EQ(area->currentSubWindow(), back);
  walkThrough.end();
  EXPECT_EQ(area->currentSubWindow(), front);
}

}  // namespace

}  // namespace qz
