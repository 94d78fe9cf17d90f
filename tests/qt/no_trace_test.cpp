// SPDX-License-Identifier: MIT
// A walk-through over a form leaves no trace, except for what the user has changed meanwhile.

#include <QButtonGroup>
#include <QCheckBox>
#include <QDialog>
#include <QPlainTextEdit>
#include <QRadioButton>
#include <QRandomGenerator>
#include <QScrollBar>
#include <QTemporaryDir>
#include <fstream>

#include "qz/hosts/qt/walk_through.hpp"
#include "tests/qt/crowded_form.hpp"
#include "tests/qt/snapshots.hpp"
#include "tests/qt/support.hpp"

namespace qz {

namespace {

using hosts::CrowdedForm;
using hosts::pictureOfAll;
using hosts::Snapshot;

/// Does everything that commands can do.
constexpr auto busyScript = R"({
  0 = (
    (SET_TITLE_FOR_OBJECT_ID, "A & B", 1), (SET_TITLE_FOR_OBJECT_ID, New, 2),
    (SET_TITLE_FOR_OBJECT_ID, New, 3), (SET_TITLE_FOR_OBJECT_ID, New, 4),
    (SET_TITLE_FOR_OBJECT_ID, New, 5), (SET_TITLE_FOR_OBJECT_ID, New, 6),
    (SET_TITLE_FOR_OBJECT_ID, New, 7), (SET_TITLE_FOR_OBJECT_ID, New, 8),
    (SET_FOREGROUND_COLOR_FOR_OBJECT_ID, red, 2), (SET_FOREGROUND_COLOR_FOR_OBJECT_ID, red, 1),
    (SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID,
      "<b>Bold</b>", "Times", 30, 10),
    (SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID,
      "<b>Bold</b>", "Times", 30, 11),
    (SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID,
      "<b>Bold</b>", "Times", 30, 12),
    (SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID,
      "<b>Bold</b>", "Times", 30, 13),
    (SET_TEXT_FOR_OBJECT_ID, "Plain", 14),
    (SET_BACKGROUND_COLOR_FOR_OBJECT_ID, 1, 2), (SET_BACKGROUND_COLOR_FOR_OBJECT_ID, 1, 1),
    (SET_STATE_ON_FOR_OBJECT_ID, 9), (SET_STATE_ON_FOR_OBJECT_ID, 16),
    (SET_STATE_ON_FOR_OBJECT_ID, 17),
    (SET_TOOL_TIP_FOR_ID, "<tip>", 2), (SET_TOOL_TIP_FOR_ID, tip, 11),
    (LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID, picture, 15), (LOAD_BACKGROUND_WITH_IMAGE, picture),
    (DISABLE_OBJECT_WITH_ID, 3), (DISABLE_OBJECT_WITH_ID, 11), (HIDE_OBJECT_WITH_ID, 12),
    (SHOW_OBJECT_WITH_ID, 18), (ENABLE_OBJECT_WITH_ID, 19),
    (FLASH_ID, YES, 4), (ALLOW_FLASHING, YES), (SET_TAG_FOR_OBJECT_ID, 30, 2)
  );
  30 = ((SET_TITLE_FOR_OBJECT_ID, Again, 30), (SHOW_OBJECT_WITH_ID, 12), (DISABLE_OBJECT_WITH_ID, 30));
  8 = (TERMINATE_PARSER);
})";

/// A form with something for each command.
struct BusyForm : CrowdedForm {
  QPlainTextEdit& plain = *new QPlainTextEdit("plain");
  QTextEdit& rich = *new QTextEdit;
  QLabel& picture = *new QLabel;
  QRadioButton& red = *new QRadioButton("&Red");
  QRadioButton& green = *new QRadioButton("&Green");
  QRadioButton& blue = *new QRadioButton("&Blue");
  QLabel& hidden = *new QLabel("hidden");
  QPushButton& disabled = *new QPushButton("&Disabled");

  BusyForm() {
    picture.setProperty("qzImageView", true);
    picture.setText("no picture");
    inBox.setToolTip("<b>tip</b>");
    inBox.setAccessibleName("name");
    inBox.setAccessibleDescription("description");
    inArea.setShortcut(QKeySequence("Ctrl+J"));
    label.setText("&Line <b>bold</b>");
    label.setBuddy(&line);
    rich.setHtml("<p align=right><i>rich</i> text</p>");
    line.setCursorPosition(2);
    red.setChecked(true);
    disabled.setEnabled(false);
    const std::pair<QWidget*, int> more[] = {{&rich, 13},     {&plain, 14}, {&picture, 15},
                                             {&green, 16},    {&blue, 17},  {&hidden, 18},
                                             {&disabled, 19}, {&red, 0}};
    for (const auto& [widget, tag] : more) {
      if (tag != 0) widget->setProperty("qzTag", tag);
      first->layout()->addWidget(widget);
    }
    hidden.hide();
    resize(900, 900);
  }
};

struct NoTrace : testing::Test {
  QTemporaryDir directory;
  toolkit::qt::QtToolkit toolkit;
  hosts::qt::WalkThrough walkThrough{toolkit};
  std::unique_ptr<BusyForm> form = std::make_unique<BusyForm>();

  NoTrace() {
    toolkit.log().setSink([](std::string_view) {});
    toolkit.files().setResourcePath(directory.path().toStdString());
    std::ofstream(directory.filePath("tour.plist").toStdString()) << busyScript;
    QImage image(20, 20, QImage::Format_RGB32);
    image.fill(Qt::red);
    image.save(directory.filePath("picture.png"));
    showForm();
  }

  void showForm() const {
    form->show();
    form->activateWindow();
    form->line.setFocus();
    hosts::settle();
  }

  // Qt lays a page out when it is shown for the first time.
  void showEveryPage() const {
    for (const int page : {1, 0}) {
      form->tabs->setCurrentIndex(1);
      form->stack->setCurrentIndex(page);
      form->drawers->setCurrentIndex(page);
      form->tabs->setCurrentIndex(page);
      for (int level = 0; level < 5; ++level) hosts::settle();  // of nested layouts
    }
    form->line.setFocus();
  }

  QList<int> sizesOfPanes() const {
    showEveryPage();
    return form->splitter->sizes();
  }

  void begin() { ASSERT_TRUE(walkThrough.play("tour.plist", *form)); }

  void goThrough() {
    hosts::settle();
    form->inBox.click();
    QTest::qWait(600);  // for a flash
    hosts::settle();
  }
};

TEST_F(NoTrace, OfAWalkThroughIsLeftInAnyProperty) {
  showEveryPage();
  pictureOfAll(*form);  // makes what Qt makes when it is asked for the first time
  Snapshot before = pictureOfAll(*form);
  EXPECT_EQ(hosts::differences(before, pictureOfAll(*form)), std::set<QString>());
  begin();
  goThrough();
  EXPECT_GT(hosts::differences(before, pictureOfAll(*form)).size(), 50U);
  EXPECT_EQ(form->inBox.text(), "Again");
  EXPECT_FALSE(form->picture.pixmap(Qt::ReturnByValue).isNull());
  EXPECT_TRUE(form->blue.isChecked());
  form->inDock.click();
  hosts::settle();
  EXPECT_FALSE(walkThrough.engine());
  EXPECT_EQ(form->focusWidget(), &form->line);
  EXPECT_EQ(form->tabs->currentIndex(), 0);
  EXPECT_EQ(form->stack->currentIndex(), 0);
  EXPECT_EQ(form->drawers->currentIndex(), 0);
  showEveryPage();
  Snapshot after = pictureOfAll(*form);
  for (const QString& name : hosts::differences(before, after)) {
    QString was;
    QString is;
    QDebug(&was) << before[name];
    QDebug(&is) << after[name];
    ADD_FAILURE() << name.toStdString() << " was " << was.toStdString() << ", is "
                  << is.toStdString();
  }
  EXPECT_EQ(form->picture.text(), "no picture");
}

TEST_F(NoTrace, IsLeftWhenTheFormIsClosedOrTheWalkThroughIsReplaced) {
  for (const bool replaced : {false, true}) {
    begin();
    EXPECT_EQ(form->label.text().contains("Bold"), true);
    if (replaced) {
      QWidget other;
      ASSERT_TRUE(walkThrough.play("tour.plist", other));
      walkThrough.end();
    } else {
      form->close();
    }
    hosts::settle();
    EXPECT_EQ(form->inBox.text(), "&Box");
    EXPECT_EQ(form->inArea.shortcut(), QKeySequence("Ctrl+J"));
    EXPECT_EQ(form->label.text(), "&Line <b>bold</b>");
    EXPECT_EQ(form->inBox.property("qzTag"), 2);
    EXPECT_TRUE(form->red.isChecked());
    showForm();
  }
}

TEST_F(NoTrace, IsLeftInThePlacesThatCommandsHaveOpened) {
  showEveryPage();
  form->tabs->setCurrentIndex(1);
  hosts::settle();
  form->splitter->setSizes({300, 0});
  form->tabs->setCurrentIndex(0);
  QDockWidget other("Other");
  form->addDockWidget(Qt::RightDockWidgetArea, &other);
  for (const bool closed : {true, false}) {
    if (closed) {
      form->dock->close();
    } else {
      form->dock->show();
      form->tabifyDockWidget(form->dock, &other);
      other.raise();
    }
    hosts::settle();
    const auto sizes = sizesOfPanes();
    begin();
    goThrough();
    EXPECT_GT(form->splitter->sizes()[1], 0);
    EXPECT_GT(form->area->verticalScrollBar()->value(), 0);
    EXPECT_FALSE(form->inDock.visibleRegion().isEmpty());
    walkThrough.end();
    EXPECT_EQ(sizesOfPanes(), sizes);
    EXPECT_EQ(form->area->verticalScrollBar()->value(), 0);
    EXPECT_EQ(form->dock->isHidden(), closed);
    EXPECT_TRUE(form->inDock.visibleRegion().isEmpty());
    EXPECT_FALSE(other.visibleRegion().isEmpty());
  }
}

TEST_F(NoTrace, ButWhatTheUserHasChangedStays) {
  begin();
  goThrough();
  form->plain.setPlainText("by the user");
  form->line.setEnabled(true);
  form->line.setText("by the user");
  form->check.click();
  form->red.click();
  form->tabs->setCurrentIndex(1);
  form->edit.setFocus();
  walkThrough.end();
  EXPECT_EQ(form->plain.toPlainText(), "by the user");
  EXPECT_EQ(form->line.text(), "by the user");
  EXPECT_FALSE(form->line.testAttribute(Qt::WA_SetFont)) << "the script's font goes";
  EXPECT_FALSE(form->check.isChecked()) << "turned on by the script, then off by the user";
  EXPECT_TRUE(form->red.isChecked());
}

TEST_F(NoTrace, ButThePresentChoiceOfTheUserStays) {
  begin();
  EXPECT_TRUE(form->blue.isChecked());
  form->green.click();
  walkThrough.end();
  EXPECT_TRUE(form->green.isChecked());
}

TEST_F(NoTrace, OfTagsAloneIsLeftIfTheHostWantsThat) {
  walkThrough.setAdoption({.restoring = toolkit::qt::Adoption::Restoring::tags});
  begin();
  goThrough();
  walkThrough.end();
  EXPECT_EQ(form->inBox.text(), "Again");
  EXPECT_EQ(form->inBox.property("qzTag"), 2);
  EXPECT_TRUE(form->blue.isChecked());
}

// --- many walk-throughs, each ended at some moment in some way ---

void endAtOnce(NoTrace& test) { test.walkThrough.end(); }
void close(NoTrace& test) { test.form->close(); }
void replace(NoTrace& test) { test.begin(); }
void deleteForm(NoTrace& test) { test.form.reset(); }
void deleteButton(NoTrace& test) { delete &test.form->inBox; }
void removeTab(NoTrace& test) { test.form->tabs->removeTab(0); }
void deletePage(NoTrace& test) { delete test.form->first; }
void deleteDock(NoTrace& test) { delete test.form->dock; }
void endByScript(NoTrace& test) { test.form->inDock.click(); }

void (*const endings[])(NoTrace&) = {endAtOnce, close,      replace,    deleteForm, deleteButton,
                                     removeTab, deletePage, deleteDock, endByScript};

TEST_F(NoTrace, IsLeftByManyWalkThroughsThatEndAtRandomMoments) {
  QRandomGenerator random(1);
  for (int round = 0; round < 200; ++round) {
    const auto end = endings[random.bounded(static_cast<int>(std::size(endings)))];
    form = std::make_unique<BusyForm>();
    showForm();
    begin();
    const bool inPress = random.bounded(2) == 0;
    bool ended = false;
    toolkit.log().setSink([&](std::string_view line) {
      if (!inPress || ended || !line.ends_with("pressed.")) return;
      ended = true;
      end(*this);
    });
    for (int i = random.bounded(3); i >= 0 && !ended; --i) form->inBox.click();
    if (!ended) end(*this);
    toolkit.log().setSink([](std::string_view) {});
    if (random.bounded(2) == 0) hosts::settle();
    walkThrough.end();
    EXPECT_FALSE(walkThrough.engine());
    if (!form) continue;
    EXPECT_EQ(form->inArea.text(), "&Area") << round;
    EXPECT_FALSE(form->inArea.signalsBlocked());
    EXPECT_FALSE(form->inArea.group());
  }
}

TEST_F(NoTrace, OfButtonsInAGroupInWhichSeveralCanBeOn) {
  QDialog dialog;
  QButtonGroup group;
  group.setExclusive(false);
  auto* const one = new QCheckBox("One", &dialog);
  auto* const two = new QCheckBox("Two", &dialog);
  for (QCheckBox* const box : {one, two}) group.addButton(box);
  one->setProperty("qzTag", 1);
  two->setProperty("qzTag", 2);
  two->setChecked(true);
  dialog.show();
  ASSERT_TRUE(walkThrough.play(
      QByteArray("{ 0 = ((SET_STATE_ON_FOR_OBJECT_ID, 1), (SET_STATE_OFF_FOR_OBJECT_ID, 2)); }"),
      dialog));
  EXPECT_TRUE(one->isChecked());
  EXPECT_FALSE(two->isChecked());
  walkThrough.end();
  EXPECT_FALSE(one->isChecked());
  EXPECT_TRUE(two->isChecked());
}

TEST_F(NoTrace, OfAChoiceThatNobodyHadMade) {
  QDialog dialog;
  QButtonGroup group;
  for (const int tag : {1, 2}) {
    auto* const radio = new QRadioButton("Radio", &dialog);
    radio->setProperty("qzTag", tag);
    group.addButton(radio);
  }
  dialog.show();
  ASSERT_TRUE(walkThrough.play(QByteArray("{ 0 = ((SET_STATE_ON_FOR_OBJECT_ID, 2)); }"), dialog));
  EXPECT_EQ(group.checkedButton(), group.buttons()[1]);
  walkThrough.end();
  EXPECT_EQ(group.checkedButton(), nullptr);
  EXPECT_TRUE(group.exclusive());
}

TEST_F(NoTrace, OfAFocusThatTheHostSetsInReturnWhereThereWasNone) {
  QDialog dialog;
  auto* const check = new QCheckBox("Check", &dialog);
  auto* const line = new QLineEdit(&dialog);
  check->setProperty("qzTag", 1);
  QObject::connect(check, &QCheckBox::toggled, line, [line] { line->setFocus(); });
  dialog.show();
  hosts::settle();
  if (dialog.focusWidget()) dialog.focusWidget()->clearFocus();
  ASSERT_EQ(dialog.focusWidget(), nullptr);
  ASSERT_TRUE(walkThrough.play(QByteArray("{ 0 = ((SET_STATE_ON_FOR_OBJECT_ID, 1)); }"), dialog));
  EXPECT_EQ(dialog.focusWidget(), line);
  QObject::disconnect(check, nullptr, line, nullptr);
  walkThrough.end();
  EXPECT_EQ(dialog.focusWidget(), nullptr);
}

}  // namespace

}  // namespace qz
