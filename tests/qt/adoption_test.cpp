// SPDX-License-Identifier: MIT
// A whole walk-through over a host's window leaves every property of the host's widgets as it was,
// except for those that the script changes on purpose.

#include <QComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QTextEdit>
#include <set>

#include "qz/engine.hpp"
#include "tests/qt/snapshots.hpp"
#include "tests/qt/support.hpp"
#include "toolkit/qt/widget_node.hpp"

namespace qz {

namespace {

using toolkit::Array;
using toolkit::Number;
using toolkit::String;
using Engine = QZ_Plist_State_Parser;
using hosts::differences;
using hosts::Snapshot;
using hosts::without;

Snapshot snapshotOf(const QWidget& window) {
  Snapshot snapshot;
  hosts::addTo(snapshot, window, window.objectName());
  for (const QWidget* widget : window.findChildren<QWidget*>()) {
    if (!widget->objectName().startsWith("qt_"))
      hosts::addTo(snapshot, *widget, widget->objectName());
  }
  return snapshot;
}

struct Adoption : hosts::Host {
  Adoption() {
    name(add<QPushButton>("&Next"), "next", 2);
    name(add<QPushButton>("&Other"), "other", {});
    name(add<QRadioButton>("Radio"), "radio", 3);
    name(add<QLabel>("Text"), "label", 5);
    name(add<QLineEdit>("line"), "line", 6);
    name(add<QTextEdit>("edit"), "edit", 7);
    name(add<QComboBox>(), "combo", {});
  }

  static void name(QWidget& widget, const char* objectName, const QVariant& tag) {
    widget.setObjectName(objectName);
    widget.setProperty(toolkit::qt::tagProperty, tag);
  }

  // Re-tags, lets the flasher tick, starts a timer, hides and shows; only one title stays changed.
  void walkThrough() {
    const auto text = [](const char* word) { return String::make(word); };
    const auto command = [&](const char* word, std::vector<toolkit::ValueRef<>> rest) {
      rest.insert(rest.begin(), text(word));
      return Array::make(std::move(rest));
    };
    const auto number = [](toolkit::Tag value) { return Number::withLong(value); };
    const auto engine = Engine::initWithWindow(toolkit, window);
    ASSERT_TRUE(engine->getGuiAssetsFromWindow(window));
    const auto list = Array::make({
        command("SET_TITLE_FOR_OBJECT_ID", {text("Go on"), number(2)}),
        command("HIDE_OBJECT_WITH_ID", {number(5)}),
        command("SHOW_OBJECT_WITH_ID", {number(5)}),
    });
    engine->processCommandArray(list, number(2));
    EXPECT_EQ(panel->findChild<QPushButton*>("next")->text(), "Go on");
    engine->startTimerWithValue(60, "3");
    toolkit::asButton(window->contentView()->subviews().at(0))->setTag(40);
    QTest::mouseClick(panel->findChild<QPushButton*>("other"), Qt::LeftButton);
    QTest::qWait(600);  // the flasher's half second
    engine->terminateParser();
  }
};

TEST_F(Adoption, LeavesEveryPropertyAsItWas) {
  toolkit.log().setSink([](std::string_view) {});
  show();
  panel->findChild<QPushButton*>("other")->setFocus();  // the press would focus it anyway
  const Snapshot before = snapshotOf(*panel);
  const std::set<QString> incomparable = differences(before, snapshotOf(*panel));
  for (const QString& name : incomparable) {
    EXPECT_TRUE(name.endsWith("Icon") || name.endsWith(".icon") || name.endsWith(".pixmap"))
        << name.toStdString();  // Qt never finds these equal
  }

  walkThrough();
  window = {};
  hosts::settle();
  show();
  const auto changed = without(differences(before, snapshotOf(*panel)), incomparable);
  const std::set<QString> meant = {"next.text", "next.shortcut"};
  for (const QString& name : without(changed, meant)) ADD_FAILURE() << name.toStdString();
  for (const QString& name : without(meant, changed)) ADD_FAILURE() << name.toStdString();
}

}  // namespace

}  // namespace qz
