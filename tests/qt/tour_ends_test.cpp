// SPDX-License-Identifier: MIT
// Walk-throughs that begin and end at random moments, in every way in which they can end.

#include <QRandomGenerator>
#include <QTemporaryDir>
#include <fstream>

#include "qz/hosts/qt/walk_through.hpp"
#include "tests/qt/crowded_form.hpp"
#include "tests/qt/snapshots.hpp"
#include "tests/qt/support.hpp"

namespace qz {

namespace {

using hosts::CrowdedForm;
using hosts::Snapshot;

constexpr int lastTag = 12;    // of the form
constexpr int lastButton = 9;  // its tag

/// Commands for a control; %1 is its tag.
constexpr const char* randomCommands[] = {
    "(SET_TITLE_FOR_OBJECT_ID, \"A & longer title than it was\", %1)",
    "(SET_TEXT_FOR_OBJECT_ID, \"Another text\", %1)",
    "(SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID, \"<b>Bold</b>\", "
    "Times, "
    "30, %1)",
    "(SET_FOREGROUND_COLOR_FOR_OBJECT_ID, red, %1)",
    "(SET_BACKGROUND_COLOR_FOR_OBJECT_ID, 1, %1)",
    "(SET_STATE_ON_FOR_OBJECT_ID, %1)",
    "(SET_STATE_OFF_FOR_OBJECT_ID, %1)",
    "(SET_TOOL_TIP_FOR_ID, tip, %1)",
    "(DISABLE_OBJECT_WITH_ID, %1)",
    "(ENABLE_OBJECT_WITH_ID, %1)",
    "(HIDE_OBJECT_WITH_ID, %1)",
    "(SHOW_OBJECT_WITH_ID, %1)",
    "(FLASH_ID, YES, %1)",
    "(ALLOW_FLASHING, YES)",
    "(SET_TAG_FOR_OBJECT_ID, 30, %1)",
    "(SET_TIMER_FOR_ID, 0.001, %1)",
};

struct TourEnds : testing::Test {
  QRandomGenerator random{20};
  QTemporaryDir directory;
  toolkit::qt::QtToolkit toolkit;
  std::unique_ptr<hosts::qt::WalkThrough> walkThrough;
  std::unique_ptr<CrowdedForm> form;
  QWidget other;                      // has no controls
  std::function<void()> whenPressed;  // called once, inside a press
  Snapshot before;
  int clicks = 0;  // that the host has heard

  TourEnds() {
    toolkit.files().setResourcePath(directory.path().toStdString());
    toolkit.log().setSink([this](std::string_view line) {
      if (line.ends_with("pressed.") && whenPressed) std::exchange(whenPressed, nullptr)();
    });
  }

  int below(int end) { return static_cast<int>(random.bounded(end)); }

  QString list(int length) {
    QStringList items;
    for (int i = 0; i < length; ++i) {
      QString command = randomCommands[below(std::size(randomCommands))];
      items += command.replace("%1", QString::number(1 + below(lastTag)));
    }
    return "(" + items.join(", ") + ")";
  }

  void writeScript() {
    QString script = "{ 0 = " + list(10) + ";";
    for (int tag = 1; tag <= lastButton; ++tag) {
      const QString last = below(8) == 0 ? "(TERMINATE_PARSER)" : list(3);
      script += QString(" %1 = %2;").arg(tag).arg(last);
    }
    std::ofstream(directory.filePath("tour.plist").toStdString()) << script.toStdString() << " }";
  }

  QAbstractButton* anyButton() {
    const auto all = form->findChildren<QAbstractButton*>();
    return all.isEmpty() ? nullptr : all[below(static_cast<int>(all.size()))];
  }

  void press() {
    if (auto* const button = form ? anyButton() : nullptr) button->click();
  }

  // Presses buttons until the walk-through has heard one.
  void pressTagged() {
    for (int tries = 0; whenPressed && tries < 100; ++tries) press();
  }

  void actLikeAUser();
  Snapshot picture() const;
  void expectRestored(const std::string& name);
};

// What has nothing to do with the place of a widget, or with what the user does here.
bool isLasting(const QString& name) {
  static const QStringList lasting = {
      "text",         "title",      "toolTip", "accessibleName", "accessibleDescription",
      "qzTag",        "font",       "palette", "html",           "plainText",
      "shortcut",     "styleSheet", "pixmap",  "readOnly",       "clicked(bool)",
      "toggled(bool)"};
  return lasting.contains(name.section('.', -1));
}

Snapshot TourEnds::picture() const {
  Snapshot picture;
  for (const auto& [name, value] : hosts::pictureOfAll(*form)) {
    if (isLasting(name)) picture[name] = value;
  }
  for (const QWidget* const widget : form->findChildren<QWidget*>()) {
    const bool isControl = widget->property("qzTag").isValid();
    if (isControl) picture[hosts::nameOf(*widget) + ".isHidden()"] = widget->isHidden();
  }
  return picture;
}

void TourEnds::actLikeAUser() {
  switch (below(4)) {
    case 0:
      if (form) form->tabs->setCurrentIndex(below(2));
      break;
    case 1:
      hosts::settle();
      break;
    case 2:
      QTest::qWait(below(5));
      break;
    default:
      press();
  }
}

void TourEnds::expectRestored(const std::string& name) {
  if (!form) return;
  const Snapshot after = picture();
  for (const QString& what : hosts::differences(before, after)) {
    // Some ways to end delete widgets, or add one.
    if (!before.contains(what) || !after.contains(what)) continue;
    ADD_FAILURE() << name << ": " << what.toStdString();
  }
  for (auto* const button : form->findChildren<QAbstractButton*>()) {
    button->setEnabled(true);
    if (!button->isEnabled()) continue;
    clicks = 0;
    button->click();
    EXPECT_EQ(clicks, 1) << name << ": " << button->objectName().toStdString();
  }
}

const struct {
  const char* name;
  void (*end)(TourEnds&);
} waysToEnd[] = {
    {"end", [](TourEnds& test) { test.walkThrough->end(); }},
    {"window closed", [](TourEnds& test) { test.form->close(); }},
    {"window hidden", [](TourEnds& test) { test.form->hide(); }},
    {"window deleted", [](TourEnds& test) { test.form.reset(); }},
    {"walk-through destroyed", [](TourEnds& test) { test.walkThrough.reset(); }},
    {"replaced", [](TourEnds& test) { test.walkThrough->play("tour.plist", test.other); }},
    {"played again", [](TourEnds& test) { test.walkThrough->play("tour.plist", *test.form); }},
    {"tab removed", [](TourEnds& test) { test.form->tabs->removeTab(1); }},
    {"page deleted", [](TourEnds& test) { delete test.form->second; }},
    {"content replaced", [](TourEnds& test) { test.form->setCentralWidget(new QWidget); }},
    {"application quits",
     [](TourEnds&) {
       QMetaObject::invokeMethod(
           qApp, [] { QCoreApplication::quit(); }, Qt::QueuedConnection);
       QCoreApplication::exec();
     }},
    {"button deleted in its press",
     [](TourEnds& test) {
       test.whenPressed = [&test] { delete &test.form->inBox; };
       test.form->inBox.click();
     }},
    {"window deleted in a press",
     [](TourEnds& test) {
       test.whenPressed = [&test] { test.form.release()->deleteLater(); };
       test.pressTagged();
     }},
    {"end in a press",
     [](TourEnds& test) {
       test.whenPressed = [&test] { test.walkThrough->end(); };
       test.pressTagged();
     }},
};

// QZ_TOURS=1000 takes some minutes under the address sanitizer.
int tourCount() {
  const int wanted = qEnvironmentVariableIntValue("QZ_TOURS");
  return wanted > 0 ? wanted : 100;
}

TEST_F(TourEnds, AtAnyMomentAreSafeAndRestoreTheForm) {
  const int end = tourCount();
  for (int tour = 0; tour < end; ++tour) {
    const auto& way = waysToEnd[below(std::size(waysToEnd))];
    const std::string name = "tour " + std::to_string(tour) + ", " + way.name;
    form = std::make_unique<CrowdedForm>();
    walkThrough = std::make_unique<hosts::qt::WalkThrough>(toolkit);
    for (auto* const button : form->findChildren<QAbstractButton*>()) {
      QObject::connect(button, &QAbstractButton::clicked, [this] { ++clicks; });
    }
    form->show();
    other.show();
    if (below(2)) hosts::settle();
    before = picture();
    writeScript();
    ASSERT_TRUE(walkThrough->play("tour.plist", *form)) << name;
    for (int act = below(6); act > 0; --act) actLikeAUser();
    if (form) way.end(*this);
    whenPressed = nullptr;
    hosts::settle();
    walkThrough.reset();
    hosts::settle();
    expectRestored(name);
    if (testing::Test::HasFailure()) return;
    form.reset();
    hosts::settle();
  }
}

}  // namespace

}  // namespace qz
