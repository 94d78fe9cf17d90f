// SPDX-License-Identifier: MIT
// A form with a guide, and walk-throughs in it.
#pragma once

#include <QLineEdit>
#include <QPushButton>
#include <QTemporaryDir>
#include <QVBoxLayout>
#include <fstream>

#include "hosts/qt/guide_panel.hpp"
#include "hosts/qt/guide_spotlight.hpp"
#include "qz/hosts/qt/guide.hpp"
#include "qz/hosts/qt/walk_through.hpp"
#include "tests/qt/support.hpp"
#include "toolkit/qt/user_preferences.hpp"

namespace qz::hosts {

/// A form with three controls, one below the other. The light jumps.
struct Guided : testing::Test {
  QTemporaryDir directory;
  toolkit::qt::QtToolkit toolkit;
  std::unique_ptr<QWidget> form = std::make_unique<QWidget>();
  QLineEdit& name = *new QLineEdit(form.get());               // tag 1
  QPushButton& send = *new QPushButton("&Send", form.get());  // tag 2
  QLineEdit& remark = *new QLineEdit(form.get());             // tag 3
  std::vector<std::string> log;
  std::unique_ptr<qt::Guide> guide;
  qt::WalkThrough walkThrough{toolkit};

  Guided() {
    qApp->setProperty(toolkit::qt::reducedMotionProperty, true);
    toolkit.files().setResourcePath(directory.path().toStdString());
    toolkit.log().setSink([this](std::string_view line) {
      if (line.starts_with("The ") || line.starts_with("No ")) log.emplace_back(line);
    });
    auto* const column = new QVBoxLayout(form.get());
    int tag = 0;
    for (QWidget* const widget : {static_cast<QWidget*>(&name), static_cast<QWidget*>(&send),
                                  static_cast<QWidget*>(&remark)}) {
      column->addWidget(widget);
      widget->setProperty("qzTag", ++tag);
    }
    name.setAccessibleName("Your name");
    form->setGeometry(100, 100, 240, 140);
  }

  ~Guided() override { qApp->setProperty(toolkit::qt::reducedMotionProperty, QVariant()); }

  void show(const qt::GuideOptions& options = {}) {
    guide = std::make_unique<qt::Guide>(toolkit, *form, options);
    form->show();
    form->activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(form.get()));
    name.setFocus();
  }

  /// Plays the lists of a script.
  void play(const char* lists) {
    std::ofstream(directory.filePath("script.plist").toStdString()) << "{" << lists << "}";
    ASSERT_TRUE(walkThrough.play("script.plist", *form));
    settle();
  }

  qt::GuidePanel& panel() const { return static_cast<qt::GuidePanel&>(*guide->panel()); }
  /// Null if nothing is lit or dimmed.
  qt::Spotlight* spotlight() const {
    for (QObject* const child : form->children()) {
      if (auto* const found = dynamic_cast<qt::Spotlight*>(child)) return found;
    }
    return nullptr;
  }
  static QRect onScreen(const QWidget& widget) {
    return {widget.mapToGlobal(QPoint()), widget.size()};
  }

  /// The end of a walk-through is an event, and so is the change that it makes to the panel.
  static void settle() {
    hosts::settle();
    hosts::settle();
  }

  static void click(QWidget& widget) {
    QTest::mouseClick(&widget, Qt::LeftButton);
    settle();
  }
  /// Presses a key in the widget that has the focus.
  static void press(Qt::Key key, Qt::KeyboardModifiers with = Qt::NoModifier) {
    QTest::keyClick(QApplication::focusWidget(), key, with);
    settle();
  }
};

/// Begins with a step at the control 1. Next leads to a step at the control 2, Back to one at none.
inline constexpr const char* threeSteps = R"(
  0 = ((SET_TEXT_FOR_OBJECT_ID, Name, 901), (SET_TEXT_FOR_OBJECT_ID, "Type your name", 902),
       (SET_TEXT_FOR_OBJECT_ID, 1, 905), (SET_TEXT_FOR_OBJECT_ID, "1 of 2", 904));
  2000 = ((SET_TEXT_FOR_OBJECT_ID, Send, 901), (SET_TEXT_FOR_OBJECT_ID, "Send it.", 902),
       (SET_TEXT_FOR_OBJECT_ID, 2, 905), (SET_TEXT_FOR_OBJECT_ID, "2 of 2", 904));
  1000 = ((SET_TEXT_FOR_OBJECT_ID, Welcome, 901), (SET_TEXT_FOR_OBJECT_ID, "", 902),
       (SET_TEXT_FOR_OBJECT_ID, "", 905), (SET_TEXT_FOR_OBJECT_ID, "", 904));
  906 = (TERMINATE_PARSER);
)";

}  // namespace qz::hosts
