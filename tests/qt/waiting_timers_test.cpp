// SPDX-License-Identifier: MIT
// Timers wait while the user is busy, and every wait ends.

#include <gtest/gtest.h>

#include <QComboBox>
#include <QDialog>
#include <QDrag>
#include <QEventLoop>
#include <QListWidget>
#include <QMenu>
#include <QMimeData>
#include <QPushButton>
#include <QScrollBar>
#include <QSlider>
#include <QTest>
#include <QTimer>
#include <functional>
#include <memory>
#include <string>
#include <utility>

#include "qz/toolkit/qt/log.hpp"
#include "toolkit/qt/run_loop.hpp"

namespace qz {

namespace {

using toolkit::Ref;
using toolkit::Timer;

/// Records firings of the timer ("a") and presses of the button ("p"), in order.
struct WaitingTimers : testing::Test {
  toolkit::qt::QtLog log;
  toolkit::qt::Calls calls{log};
  toolkit::qt::SteadyClock clock;
  toolkit::qt::QtRunLoop loop{clock, calls};
  std::string noted;
  QWidget window;
  QPushButton button{"Press", &window};

  WaitingTimers() {
    QObject::connect(&button, &QPushButton::clicked, [this] { noted += 'p'; });
    window.resize(300, 200);
    window.show();
    window.activateWindow();
    EXPECT_TRUE(QTest::qWaitForWindowActive(&window));
  }

  Ref<Timer> schedule() {
    noted.clear();
    return loop.schedule(0.01, false, [this](const Ref<Timer>&) { noted += 'a'; });
  }

  /// Schedules a timer. True if it has not fired after it was due.
  bool waits() {
    schedule();
    QTest::qWait(40);
    QCoreApplication::processEvents();  // a busy machine may not have handled the timer yet
    return noted.empty();
  }

  /// True if the waiting timer fires without further input from the user.
  bool fires() {
    return QTest::qWaitFor([&] { return noted.ends_with('a'); });
  }

  bool firesAtOnce() {
    QCoreApplication::processEvents();
    QCoreApplication::processEvents();
    return noted.ends_with('a');
  }

  /// Presses through the window system. Qt tracks this press, unlike events sent to a widget.
  void pressForQt() { QTest::mousePress(window.windowHandle(), Qt::LeftButton, {}, place()); }
  void releaseForQt() { QTest::mouseRelease(window.windowHandle(), Qt::LeftButton, {}, place()); }
  QPoint place() const { return button.geometry().center(); }
};

TEST_F(WaitingTimers, FireOnceAHeldButtonIsLetGoAndThePressComesFirst) {
  QTest::mousePress(&button, Qt::LeftButton);
  EXPECT_TRUE(waits());
  QTest::mouseRelease(&button, Qt::LeftButton);
  EXPECT_EQ(noted, "p");
  EXPECT_TRUE(firesAtOnce());
}

TEST_F(WaitingTimers, DoNotFireWhenThePressCancelsThem) {
  QTest::mousePress(&button, Qt::LeftButton);
  const auto timer = schedule();
  QObject::connect(&button, &QPushButton::clicked, [&] { timer->invalidate(); });
  QTest::qWait(40);
  QTest::mouseRelease(&button, Qt::LeftButton);
  QTest::qWait(150);
  EXPECT_EQ(noted, "p");
}

TEST_F(WaitingTimers, WaitForSlidersListsAndScrollBars) {
  QSlider slider(&window);
  QListWidget list(&window);
  slider.show();
  list.setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOn);
  list.show();
  QWidget* const widgets[] = {&slider, list.viewport(), list.verticalScrollBar()};
  for (QWidget* const widget : widgets) {
    QTest::mousePress(widget, Qt::LeftButton);
    EXPECT_TRUE(waits()) << widget->metaObject()->className();
    QTest::mouseRelease(widget, Qt::LeftButton);
    EXPECT_TRUE(firesAtOnce()) << widget->metaObject()->className();
  }
}

TEST_F(WaitingTimers, DoNotWaitForTheMouseBesideControlsAndForKeys) {
  QTest::mousePress(&window, Qt::LeftButton, {}, {250, 150});
  EXPECT_FALSE(waits()) << "beside all controls";
  QTest::mouseRelease(&window, Qt::LeftButton, {}, {250, 150});
  QTest::keyPress(&button, Qt::Key_Space);
  EXPECT_FALSE(waits()) << "a key is down";
  QTest::keyRelease(&button, Qt::Key_Space);
  button.setEnabled(false);
  QTest::mousePress(&button, Qt::LeftButton);
  EXPECT_FALSE(waits()) << "on a disabled button";
  QTest::mouseRelease(&button, Qt::LeftButton);
}

TEST_F(WaitingTimers, GoOnWaitingWhenAKeyPressesAnotherButtonMeanwhile) {
  QPushButton other("Other", &window);
  other.show();
  QTest::mousePress(&other, Qt::LeftButton);
  EXPECT_TRUE(waits());
  QTest::keyClick(&button, Qt::Key_Space);
  EXPECT_EQ(noted, "p");
  EXPECT_FALSE(firesAtOnce());
  QTest::mouseRelease(&other, Qt::LeftButton);
  EXPECT_TRUE(firesAtOnce());
}

TEST_F(WaitingTimers, GoOnWaitingWhenAKeyPressesTheHeldButton) {
  QTest::mousePress(&button, Qt::LeftButton);
  EXPECT_TRUE(waits());
  QTest::keyClick(&button, Qt::Key_Space);
  EXPECT_FALSE(firesAtOnce());
  QTest::mouseRelease(&button, Qt::LeftButton);
  EXPECT_TRUE(firesAtOnce());
  EXPECT_EQ(noted, "pa") << "one press in all";
}

TEST_F(WaitingTimers, FireWhenTheHeldControlIsGone) {
  for (const bool deletes : {true, false}) {
    auto other = std::make_unique<QPushButton>(&window);
    other->show();
    QTest::mousePress(other.get(), Qt::LeftButton);
    EXPECT_TRUE(waits());
    deletes ? other.reset() : other->hide();
    EXPECT_TRUE(fires()) << deletes;
  }
}

TEST_F(WaitingTimers, FireWhenTheWindowOfTheHeldControlIsClosed) {
  QTest::mousePress(&button, Qt::LeftButton);
  EXPECT_TRUE(waits());
  window.close();
  EXPECT_TRUE(fires());
}

TEST_F(WaitingTimers, FireWhenAnotherWindowTakesTheFocus) {
  QTest::mousePress(&button, Qt::LeftButton);
  EXPECT_TRUE(waits());
  QWidget other;
  other.show();
  other.activateWindow();
  EXPECT_TRUE(fires());
}

/// Intercepts mouse moves and releases, as dragging does.
struct MouseGrab : QObject {
  MouseGrab() { QCoreApplication::instance()->installEventFilter(this); }
  bool eventFilter(QObject*, QEvent* event) override {
    return event->type() == QEvent::MouseMove || event->type() == QEvent::MouseButtonRelease;
  }
};

TEST_F(WaitingTimers, FireWhenTheReleaseReachesNobody) {
  pressForQt();
  EXPECT_TRUE(waits());
  const MouseGrab grab;
  releaseForQt();
  EXPECT_TRUE(fires());
}

struct DragSource : QPushButton {
  using QPushButton::QPushButton;
  std::function<void()> meanwhile;

  void mouseMoveEvent(QMouseEvent*) override {
    if (!meanwhile) return;
    QTimer::singleShot(0, std::exchange(meanwhile, nullptr));
    auto* const drag = new QDrag(this);
    drag->setMimeData(new QMimeData);
    drag->exec();
  }
};

TEST_F(WaitingTimers, WaitWhileTheUserDragsAndFireAtTheEndOfIt) {
  for (const bool cancels : {false, true}) {
    DragSource source("Drag me", &window);
    source.setGeometry(button.geometry());
    source.show();
    source.meanwhile = [&] {
      EXPECT_TRUE(waits());
      if (cancels) QTest::keyClick(window.windowHandle(), Qt::Key_Escape);
      releaseForQt();
    };
    pressForQt();
    QTest::mouseMove(window.windowHandle(), place() + QPoint(5, 5));
    EXPECT_FALSE(source.meanwhile) << "the drag has begun";
    EXPECT_TRUE(fires()) << cancels;
  }
}

TEST_F(WaitingTimers, WaitForMenusAndTheActionComesFirst) {
  QMenu menu;
  menu.addAction("Press", [this] { noted += 'p'; });
  menu.popup({100, 100});
  EXPECT_TRUE(waits());
  QTest::keyClick(&menu, Qt::Key_Down);
  QTest::keyClick(&menu, Qt::Key_Return);
  EXPECT_EQ(noted, "p");
  EXPECT_TRUE(firesAtOnce());
}

TEST_F(WaitingTimers, FireWhenEscapeClosesAMenu) {
  QMenu menu;
  menu.addAction("Press");
  menu.popup({100, 100});
  EXPECT_TRUE(waits());
  QTest::keyClick(&menu, Qt::Key_Escape);
  EXPECT_TRUE(firesAtOnce());
}

TEST_F(WaitingTimers, FireWhenAnOpenMenuIsDeleted) {
  auto menu = std::make_unique<QMenu>();
  menu->addAction("Press");
  menu->popup({100, 100});
  EXPECT_TRUE(waits());
  menu.reset();
  EXPECT_TRUE(firesAtOnce());
}

TEST_F(WaitingTimers, WaitForTheListsOfComboBoxes) {
  QComboBox combo(&window);
  combo.addItems({"one", "two"});
  combo.show();
  for (const auto key : {Qt::Key_Escape, Qt::Key_Return}) {
    combo.showPopup();
    EXPECT_TRUE(waits());
    QTest::keyClick(combo.view(), key);
    EXPECT_TRUE(fires()) << key;
  }
}

TEST_F(WaitingTimers, WaitForApplicationModalDialogsAndWhatFollowsThem) {
  for (const auto key : {Qt::Key_Escape, Qt::Key_Return}) {
    QDialog dialog(&window);
    QPushButton ok("OK", &dialog);
    QObject::connect(&ok, &QPushButton::clicked, &dialog, &QDialog::accept);
    bool waited = false;
    QTimer::singleShot(0, [&] {
      waited = waits();
      QTest::keyClick(&dialog, key);
    });
    dialog.exec();
    noted += 'd';
    EXPECT_TRUE(waited);
    EXPECT_TRUE(fires());
    EXPECT_EQ(noted, "da");
  }
}

TEST_F(WaitingTimers, WaitBehindAWindowModalDialogOverAnApplicationModalOne) {
  QDialog outer(&window);
  outer.setModal(true);
  outer.show();
  QDialog inner(&outer);
  inner.open();
  EXPECT_TRUE(waits());
  inner.close();
  EXPECT_FALSE(firesAtOnce());
  outer.close();
  EXPECT_TRUE(firesAtOnce());
}

TEST_F(WaitingTimers, DoNotWaitForWindowModalDialogsAndEventLoops) {
  QDialog dialog(&window);
  dialog.open();
  EXPECT_FALSE(waits());
  dialog.close();

  QEventLoop inner;
  QTimer::singleShot(0, [&] {
    EXPECT_FALSE(waits());
    inner.quit();
  });
  inner.exec();
}

}  // namespace

}  // namespace qz
