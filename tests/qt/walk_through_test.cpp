// SPDX-License-Identifier: MIT
// The host's side of a walk-through: however it ends, the host learns of the end and gets its
// window back.

#include "qz/hosts/qt/walk_through.hpp"

#include <QCloseEvent>
#include <QDialog>
#include <QMainWindow>
#include <QPushButton>
#include <QTemporaryDir>
#include <fstream>

#include "tests/qt/support.hpp"

namespace qz {

namespace {

struct WalkThroughs : hosts::Host {
  QTemporaryDir directory;
  QPushButton& next = add<QPushButton>("Next");
  QPushButton& done = add<QPushButton>("Done");
  int clicks = 0;
  int ends = 0;
  std::string logged;  // the last line
  hosts::qt::WalkThrough walkThrough{toolkit};

  WalkThroughs() {
    toolkit.log().setSink([this](std::string_view line) { logged = line; });
    toolkit.files().setResourcePath(directory.path().toStdString());
    write("tour.plist", "{ 0 = ((SET_TITLE_FOR_OBJECT_ID, Begun, 1)); 2 = (TERMINATE_PARSER); }");
    write("list.plist", "(no, script)");
    next.setProperty("qzTag", 1);
    done.setProperty("qzTag", 2);
    QObject::connect(&next, &QPushButton::clicked, [this] { ++clicks; });
    walkThrough.whenOver([this] { ++ends; });
    show();
  }

  void write(const char* name, const char* script) const {
    std::ofstream(directory.filePath(name).toStdString()) << script;
  }

  static void click(QWidget& widget) {
    QTest::mouseClick(&widget, Qt::LeftButton);
    hosts::settle();
  }
};

std::string refusal(const std::string& script, const std::string& reason) {
  return "The walk-through " + script + " is not played: " + reason;
}

TEST_F(WalkThroughs, EndByTheScriptAndLeaveTheWindowOpen) {
  ASSERT_TRUE(walkThrough.play("tour.plist", *panel));
  EXPECT_EQ(next.text(), "Begun");
  click(done);
  EXPECT_EQ(ends, 1);
  EXPECT_FALSE(walkThrough.engine());
  EXPECT_TRUE(panel->isVisible());
  EXPECT_TRUE(panel->close());
  hosts::settle();
  EXPECT_EQ(ends, 1);
}

TEST_F(WalkThroughs, TakeOverTheirWindowAsTheHostWants) {
  auto& box = add<QWidget>();
  next.setParent(&box);
  ASSERT_TRUE(walkThrough.play("tour.plist", *panel));
  EXPECT_EQ(next.text(), "Begun");
  next.setText("Next");
  walkThrough.setAdoption({.reading = toolkit::qt::Adoption::Reading::directSubviews});
  ASSERT_TRUE(walkThrough.play("tour.plist", *panel));
  EXPECT_EQ(next.text(), "Next") << "it is not a direct child";
}

TEST_F(WalkThroughs, EndWhenTheUserClosesTheWindow) {
  ASSERT_TRUE(walkThrough.play("tour.plist", *panel));
  panel->close();
  hosts::settle();
  EXPECT_EQ(ends, 1);
  EXPECT_FALSE(walkThrough.engine());
}

TEST_F(WalkThroughs, GoOnWhenTheHostDoesNotLetTheUserCloseTheWindow) {
  struct Refuser : QObject {
    bool eventFilter(QObject*, QEvent* event) override {
      if (event->type() == QEvent::Close) event->ignore();
      return event->type() == QEvent::Close;
    }
  } refuser;
  ASSERT_TRUE(walkThrough.play("tour.plist", *panel));
  panel->installEventFilter(&refuser);
  EXPECT_FALSE(panel->close());
  hosts::settle();
  EXPECT_EQ(ends, 0);
  EXPECT_TRUE(walkThrough.engine());
}

TEST_F(WalkThroughs, EndWithTheirWindow) {
  ASSERT_TRUE(walkThrough.play("tour.plist", *panel));
  panel.reset();
  hosts::settle();
  EXPECT_EQ(ends, 1);
}

TEST_F(WalkThroughs, EndWhenAnotherBegins) {
  ASSERT_TRUE(walkThrough.play("tour.plist", *panel));
  const std::weak_ptr<QZ_Plist_State_Parser> first = walkThrough.engine();
  ASSERT_TRUE(walkThrough.play("tour.plist", *panel));
  EXPECT_TRUE(first.expired());
  EXPECT_EQ(ends, 1);
}

TEST_F(WalkThroughs, TouchNothingWithoutAScript) {
  for (const char* name : {"missing.plist", "list.plist", ""}) {
    EXPECT_FALSE(walkThrough.play(name, *panel)) << name;
    EXPECT_FALSE(walkThrough.engine());
  }
  click(next);
  EXPECT_EQ(clicks, 1);
  EXPECT_EQ(ends, 0);
}

TEST_F(WalkThroughs, SayInTheLogWhyAScriptIsNotPlayed) {
  const struct {
    const char* script;
    const char* reason;
  } cases[] = {
      {"missing.plist", "the file does not exist"},
      {"", "the path is empty"},
      {"empty.plist", "it contains no list"},
      {"list.plist", "it is not a dictionary of lists"},
      {"torn.plist",
       "it is not a property list: line 1, column 8: expected ',' or ')', found the end of the "
       "file (read as old-style property list)"},
      {"http://example.org/tour.plist", "only URLs of files and resources can be played"},
      {"word.plist", "the value under the smallest tag, 0, is not a list"},
      {"names.plist", "no key is a tag (a whole decimal number)"},
      {"loop.plist", "lists run each other endlessly: 1 -> 2 -> 1"},
  };
  write("empty.plist", "{ }");
  write("torn.plist", "{ 0 = (");
  write("word.plist", "{ 0 = word; }");
  write("names.plist", "{ start = (IDLE_LOOP); }");
  write("loop.plist",
        "{ 0 = (); 1 = ((PROCESS_COMMANDS_FOR_ID, 2)); 2 = ((PROCESS_COMMANDS_FOR_ID, 1)); }");
  for (const auto& c : cases) {
    EXPECT_FALSE(walkThrough.play(c.script, *panel));
    EXPECT_EQ(logged, refusal(c.script, c.reason));
    EXPECT_FALSE(walkThrough.engine());
  }
  click(next);
  EXPECT_EQ(clicks, 1);
  logged.clear();
  EXPECT_TRUE(walkThrough.play("tour.plist", *panel));
  EXPECT_FALSE(logged.starts_with("The walk-through")) << logged;
}

void (*const waysToDismiss[])(QDialog&) = {
    [](QDialog& dialog) { QTest::keyClick(&dialog, Qt::Key_Escape); },
    [](QDialog& dialog) { dialog.accept(); },
    [](QDialog& dialog) { dialog.reject(); },
    [](QDialog& dialog) { dialog.done(3); },
    [](QDialog& dialog) { dialog.hide(); },
};

TEST_F(WalkThroughs, EndWhenTheirDialogIsDismissedEvenIfItIsShownAgainAtOnce) {
  for (const auto& dismiss : waysToDismiss) {
    for (const bool showsAgain : {false, true}) {
      QDialog dialog;
      ends = 0;
      dialog.show();
      ASSERT_TRUE(walkThrough.play("tour.plist", dialog));
      dismiss(dialog);
      if (showsAgain) dialog.show();
      hosts::settle();
      EXPECT_EQ(ends, 1);
      EXPECT_FALSE(walkThrough.engine());
      EXPECT_EQ(dialog.isVisible(), showsAgain);
    }
  }
}

TEST_F(WalkThroughs, InSheetsEndWhenTheDialogIsDismissed) {
  for (const auto& dismiss : waysToDismiss) {
    QDialog sheet;
    sheet.show();
    ends = 0;
    ASSERT_TRUE(walkThrough.playInSheet("tour.plist", sheet, *panel));
    hosts::settle();
    EXPECT_EQ(ends, 0);
    dismiss(sheet);
    hosts::settle();
    EXPECT_EQ(ends, 1);
    EXPECT_FALSE(sheet.isVisible());
  }
}

// Sends the event that arrives when the desktop hides a window that it minimises.
TEST_F(WalkThroughs, GoOnWhenTheDesktopHidesTheWindow) {
  ASSERT_TRUE(walkThrough.play("tour.plist", *panel));
  QHideEvent hide;
  QSpontaneKeyEvent::setSpontaneous(&hide);
  qApp->notify(panel.get(), &hide);  // `sendEvent` would clear the spontaneous flag
  hosts::settle();
  EXPECT_EQ(ends, 0);
}

TEST_F(WalkThroughs, EndWhenTheHostReplacesTheCentralWidget) {
  for (const bool takes : {false, true}) {
    QMainWindow mainWindow;
    mainWindow.setCentralWidget(new QWidget);
    const std::unique_ptr<QWidget> kept(takes ? mainWindow.centralWidget() : nullptr);
    mainWindow.show();
    ends = 0;
    ASSERT_TRUE(walkThrough.play("tour.plist", mainWindow));
    hosts::settle();
    EXPECT_EQ(ends, 0);
    if (takes) mainWindow.takeCentralWidget();
    mainWindow.setCentralWidget(new QWidget);
    hosts::settle();
    EXPECT_EQ(ends, 1) << takes;
    EXPECT_FALSE(walkThrough.engine());
    EXPECT_TRUE(mainWindow.isVisible());
  }
}

TEST_F(WalkThroughs, DoNotBeginWhileAnotherIsBeginning) {
  bool began = true;
  std::string line;
  walkThrough.whenOver([&] {
    ++ends;
    began = walkThrough.play("tour.plist", *panel);
    line = logged;
    walkThrough.whenOver([this] { ++ends; });
  });
  ASSERT_TRUE(walkThrough.play("tour.plist", *panel));
  QWidget other;
  ASSERT_TRUE(walkThrough.play("tour.plist", other));
  EXPECT_FALSE(began);
  EXPECT_EQ(line, refusal("tour.plist", "another walk-through is beginning"));
  EXPECT_EQ(ends, 1);
  const std::weak_ptr<QZ_Plist_State_Parser> engine = walkThrough.engine();
  walkThrough.end();
  EXPECT_TRUE(engine.expired());
  EXPECT_EQ(ends, 2);
}

TEST_F(WalkThroughs, BeginInTheEndOfTheOneBefore) {
  walkThrough.whenOver([this] {
    ++ends;
    EXPECT_TRUE(walkThrough.play("tour.plist", *panel));
    walkThrough.whenOver({});
  });
  ASSERT_TRUE(walkThrough.play("tour.plist", *panel));
  click(done);
  EXPECT_EQ(ends, 1);
  EXPECT_TRUE(walkThrough.engine());
}

TEST_F(WalkThroughs, CarryNoExceptionOutOfTheScript) {
  write("wrong.plist", "{ 0 = (IDLE_LOOP); 1 = word; }");
  ASSERT_TRUE(walkThrough.play("wrong.plist", *panel));
  click(next);
  EXPECT_TRUE(logged.starts_with("NSInvalidArgumentException")) << logged;
}

TEST_F(WalkThroughs, InSheetsEndWithTheSheet) {
  QWidget sheet;
  for (int round = 0; round < 2; ++round) {
    ASSERT_TRUE(walkThrough.playInSheet("tour.plist", sheet, *panel));
    EXPECT_TRUE(QTest::qWaitForWindowActive(&sheet));
    QTest::keyClick(&sheet, Qt::Key_Escape);
    hosts::settle();
    EXPECT_FALSE(sheet.isVisible());
    EXPECT_EQ(ends, round + 1);
  }
  EXPECT_TRUE(panel->isVisible());
}

}  // namespace

}  // namespace qz
