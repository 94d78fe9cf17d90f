// SPDX-License-Identifier: MIT
// A host with its own window, for tests of the Qt toolkit.
#pragma once

#include <gtest/gtest.h>

#include <QAbstractButton>
#include <QApplication>
#include <QTest>
#include <QWidget>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "qz/toolkit/qt/qt_toolkit.hpp"

namespace qz::hosts {

/// Performs every action, and records the actions and their senders.
struct Performer : toolkit::Responder {
  std::vector<std::string> actions;
  std::vector<toolkit::Ref<toolkit::View>> senders;
  std::function<void()> then = [] {};

  bool tryToPerform(std::string_view action, const toolkit::Ref<toolkit::View>& sender) override {
    actions.emplace_back(action);
    senders.push_back(sender);
    then();
    return true;
  }
};

/// Handles all posted events, including deferred deletions.
inline void settle() {
  QCoreApplication::processEvents();
  QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

struct Host : testing::Test {
  toolkit::qt::QtToolkit toolkit;
  std::unique_ptr<QWidget> panel = std::make_unique<QWidget>();
  std::shared_ptr<Performer> performer = std::make_shared<Performer>();
  toolkit::Ref<toolkit::Window> window = toolkit.application().window(*panel);

  Host() {
    panel->setGeometry(100, 100, 400, 300);
    panel->setObjectName("panel");
  }

  /// Adds a widget to the panel, below those added before.
  template <class W, class... Arguments>
  W& add(Arguments... arguments) {
    auto* const widget = new W(arguments..., panel.get());
    widget->setGeometry(20, 20 + 40 * added_++, 120, 30);
    return *widget;
  }

  void show() {
    panel->show();
    panel->activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(panel.get()));
  }

  /// Makes the button send "go:" to the performer.
  toolkit::Ref<toolkit::Button> adopt(QAbstractButton& widget) {
    auto button = toolkit::asButton(toolkit.application().view(widget));
    button->setTarget(performer);
    button->setAction("go:");
    return button;
  }

 private:
  int added_ = 0;
};

}  // namespace qz::hosts
