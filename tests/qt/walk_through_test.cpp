// SPDX-License-Identifier: MIT
// The host's side of a walk-through: however it ends, the host learns of it and has its window
// back.

#include "hosts/qt/walk_through.hpp"

#include <QCloseEvent>
#include <QPushButton>
#include <QTemporaryDir>
#include <fstream>

#include "tests/qt/support.hpp"

namespace {

struct WalkThroughs : hosts::Host {
  QTemporaryDir directory;
  QPushButton& next = add<QPushButton>("Next");
  QPushButton& done = add<QPushButton>("Done");
  int clicks = 0;
  int ends = 0;
  std::string logged;  // last
  hosts::qt::WalkThrough walkThrough{toolkit};

  WalkThroughs() {
    toolkit.log().setSink([this](std::string_view line) { logged = line; });
    toolkit.files().setResourcePath(directory.path().toStdString());
    std::ofstream(directory.filePath("tour.plist").toStdString())
        << "{ 0 = ((SET_TITLE_FOR_OBJECT_ID, Begun, 1)); 2 = (TERMINATE_PARSER); }";
    std::ofstream(directory.filePath("list.plist").toStdString()) << "(no, script)";
    std::ofstream(directory.filePath("wrong.plist").toStdString()) << "{ 0 = word; }";
    next.setProperty("qzTag", 1);
    done.setProperty("qzTag", 2);
    QObject::connect(&next, &QPushButton::clicked, [this] { ++clicks; });
    walkThrough.whenOver([this] { ++ends; });
    show();
  }

  static void click(QWidget& widget) {
    QTest::mouseClick(&widget, Qt::LeftButton);
    hosts::settle();
  }
};

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

TEST_F(WalkThroughs, CarryNoExceptionOutOfTheScript) {
  EXPECT_TRUE(walkThrough.play("wrong.plist", *panel));
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
