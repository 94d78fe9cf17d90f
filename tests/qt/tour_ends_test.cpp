// SPDX-License-Identifier: MIT
// Walk-throughs that begin and end at random moments, in every way in which they can end.

#include <QComboBox>
#include <QRandomGenerator>
#include <QTemporaryDir>
#include <QWizard>
#include <fstream>
#include <map>

#include "qz/hosts/qt/walk_through.hpp"
#include "tests/qt/crowded_form.hpp"
#include "tests/qt/snapshots.hpp"
#include "tests/qt/support.hpp"
#include "toolkit/qt/coordinates.hpp"

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
    R"((SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID, "<b>Bold</b>", Times, 30, %1))",
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

/// The property by which a widget of one form is known in another.
constexpr const char* numberProperty = "number";

/// A form whose widgets have numbers.
std::unique_ptr<CrowdedForm> makeForm() {
  auto form = std::make_unique<CrowdedForm>();
  int number = 0;
  for (auto* const widget : form->findChildren<QWidget*>()) {
    widget->setProperty(numberProperty, ++number);
  }
  return form;
}

std::map<int, QWidget*> numbered(const QWidget& form) {
  std::map<int, QWidget*> widgets;
  for (auto* const widget : form.findChildren<QWidget*>()) {
    const QVariant number = widget->property(numberProperty);
    if (number.isValid()) widgets[number.toInt()] = widget;
  }
  return widgets;
}

// A page that its stack has lost is never laid out.
bool isInLostPage(const QWidget& widget) {
  const QWidget* const around = widget.parentWidget();
  if (!around || widget.isWindow()) return false;
  const auto* const stack = qobject_cast<const QStackedWidget*>(around);
  return (stack && stack->indexOf(&widget) < 0) || isInLostPage(*around);
}

bool isInSplitter(const QWidget& widget) {
  const QWidget* const around = widget.parentWidget();
  return around && (qobject_cast<const QSplitter*>(around) || isInSplitter(*around));
}

bool isFreeStack(const QStackedWidget& stack) {
  return !qobject_cast<QTabWidget*>(stack.parentWidget());
}

/// Shows each page, with the first as the last: Qt lays a page out when it is shown.
template <class Pages, class Inner>
void showEachPage(Pages& pages, const Inner& showInner) {
  for (int page = pages.count() - 1; page >= 0; --page) {
    pages.setCurrentIndex(page);
    showInner();
    for (int level = 0; level < 5; ++level) hosts::settle();  // of nested layouts
  }
}

void showEachPageOf(QWidget& form) {
  form.show();
  const auto showInner = [&] {
    for (auto* const stack : form.findChildren<QStackedWidget*>()) {
      if (isFreeStack(*stack)) showEachPage(*stack, [] {});
    }
    for (auto* const box : form.findChildren<QToolBox*>()) showEachPage(*box, [] {});
  };
  for (auto* const tabs : form.findChildren<QTabWidget*>()) showEachPage(*tabs, showInner);
}

struct TourEnds : testing::Test {
  QRandomGenerator random{20};
  QTemporaryDir directory;
  toolkit::qt::QtToolkit toolkit;
  std::unique_ptr<hosts::qt::WalkThrough> walkThrough;
  std::unique_ptr<CrowdedForm> form;
  std::unique_ptr<CrowdedForm> twin;  // has no walk-through, but the same host and user
  QWidget other;                      // has no controls
  std::function<void()> whenPressed;  // called once, inside a press
  Snapshot before;
  int clicks = 0;             // that the host has heard
  bool hasSeenPages = false;  // the user, before the walk-through

  TourEnds() {
    toolkit.files().setResourcePath(directory.path().toStdString());
    toolkit.log().setSink([this](std::string_view line) {
      if (line.ends_with("pressed.") && whenPressed) std::exchange(whenPressed, nullptr)();
    });
  }

  int below(int end) { return static_cast<int>(random.bounded(end)); }

  QString list(int length, int tags = lastTag) {
    QStringList items;
    for (int i = 0; i < length; ++i) {
      QString command = randomCommands[below(std::size(randomCommands))];
      items += command.replace("%1", QString::number(1 + below(tags)));
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
    auto all = form->findChildren<QAbstractButton*>();
    all.removeIf([](const QAbstractButton* button) { return hosts::isSparePart(*button); });
    return all.isEmpty() ? nullptr : all[below(static_cast<int>(all.size()))];
  }

  void press() {
    auto* const button = form ? anyButton() : nullptr;
    if (!button) return;
    const auto twins = numbered(*twin);
    const auto same = twins.find(button->property(numberProperty).toInt());
    if (button->isEnabled() && same != twins.end()) {
      static_cast<QAbstractButton*>(same->second)->click();
    }
    button->click();
  }

  // Presses buttons until the walk-through has heard one.
  void pressTagged() {
    for (int tries = 0; whenPressed && tries < 100; ++tries) press();
  }

  void actLikeAUser();
  Snapshot picture() const;
  void expectRestored(const std::string& name);
  void expectSamePlaces(const std::string& name) const;
};

// What has nothing to do with the place of a widget, which `expectSamePlaces` compares, or with
// what the user does here.
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

// Expects each widget where it would be without the walk-through.
void TourEnds::expectSamePlaces(const std::string& name) const {
  showEachPageOf(*form);
  showEachPageOf(*twin);
  const auto twins = numbered(*twin);
  EXPECT_EQ(form->geometry().size(), twin->geometry().size()) << name;
  for (const auto& [number, widget] : numbered(*form)) {
    const auto same = twins.find(number);
    // A splitter that appears during a walk-through shares its room out among what it shows then.
    const bool isNew = !hasSeenPages && isInSplitter(*widget);
    const bool isInDock = widget == form->dock || form->dock->isAncestorOf(widget);
    const bool isAway = isInDock && (form->dock->isFloating() || form->dock->isHidden());
    const bool isLost = isInLostPage(*widget) || hosts::isSparePart(*widget) || isAway;
    if (same == twins.end() || isNew || isLost) continue;
    const auto place = toolkit::qt::exactly(widget->geometry());
    const auto expected = toolkit::qt::exactly(same->second->geometry());
    EXPECT_EQ(place, expected) << name << ": " << number << ' '
                               << hosts::nameOf(*widget).toStdString();
  }
}

void TourEnds::expectRestored(const std::string& name) {
  if (!form) return;
  expectSamePlaces(name);
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

/// What happens to the form happens to its twin, too.
void onBoth(const TourEnds& test, void (*change)(CrowdedForm&)) {
  change(*test.form);
  change(*test.twin);
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
    {"tab removed",
     [](TourEnds& test) { onBoth(test, [](CrowdedForm& form) { form.tabs->removeTab(1); }); }},
    {"page deleted",
     [](TourEnds& test) { onBoth(test, [](CrowdedForm& form) { delete form.second; }); }},
    {"content replaced",
     [](TourEnds& test) {
       onBoth(test, [](CrowdedForm& form) { form.setCentralWidget(new QWidget); });
     }},
    {"application quits",
     [](TourEnds&) {
       QMetaObject::invokeMethod(
           qApp, [] { QCoreApplication::quit(); }, Qt::QueuedConnection);
       QCoreApplication::exec();
     }},
    {"button deleted in its press",
     [](TourEnds& test) {
       test.whenPressed = [&test] { onBoth(test, [](CrowdedForm& form) { delete &form.inBox; }); };
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

/// A wizard with a control of each kind on two pages.
struct AWizard : QWizard {
  QPushButton& button = *new QPushButton("&Go");
  QLineEdit& line = *new QLineEdit("line");
  QComboBox& combo = *new QComboBox;
  QCheckBox& check = *new QCheckBox("&Check");

  AWizard() {
    combo.setEditable(true);
    combo.addItems({"one", "two"});
    int tag = 0;
    for (const auto& [first, second] : {std::pair<QWidget*, QWidget*>{&button, &line},
                                        std::pair<QWidget*, QWidget*>{&combo, &check}}) {
      auto* const page = new QWizardPage;
      auto* const column = new QVBoxLayout(page);
      for (QWidget* const widget : {first, second}) {
        widget->setProperty("qzTag", ++tag);
        column->addWidget(widget);
      }
      addPage(page);
    }
    resize(500, 400);
  }

  /// Returns everything, also where each widget is, while the first page is shown. But a wizard
  /// sets its own least size whenever it likes.
  Snapshot picture() {
    show();
    if (currentId() != 0) restart();
    for (const auto& turn : {&QWizard::next, &QWizard::back}) {
      (this->*turn)();  // a page is laid out when it is shown
      for (int level = 0; level < 5; ++level) hosts::settle();
    }
    Snapshot picture = hosts::pictureOfAll(*this);
    for (const char* const least : {".minimumHeight", ".minimumWidth", ".minimumSize"}) {
      picture.erase(hosts::nameOf(*this) + least);
    }
    return picture;
  }
};

const struct {
  const char* name;
  void (*end)(AWizard&, hosts::qt::WalkThrough&);
} waysToEndWizards[] = {
    {"rejected", [](AWizard& wizard, auto&) { wizard.reject(); }},
    {"accepted", [](AWizard& wizard, auto&) { wizard.accept(); }},
    {"closed", [](AWizard& wizard, auto&) { wizard.close(); }},
    {"rejected in a press",
     [](AWizard& wizard, auto&) {
       QObject::connect(&wizard.button, &QAbstractButton::released, &wizard, &QDialog::reject,
                        Qt::SingleShotConnection);
       wizard.button.setEnabled(true);
       wizard.button.click();
       wizard.reject();
     }},
    {"ended on the second page",
     [](AWizard& wizard, auto& walkThrough) {
       wizard.next();
       walkThrough.end();
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
    form = makeForm();
    twin = makeForm();
    walkThrough = std::make_unique<hosts::qt::WalkThrough>(toolkit);
    for (auto* const button : form->findChildren<QAbstractButton*>()) {
      QObject::connect(button, &QAbstractButton::clicked, [this] { ++clicks; });
    }
    form->show();
    twin->show();
    other.show();
    if (below(2)) hosts::settle();
    hasSeenPages = below(2) != 0;
    if (hasSeenPages) {
      showEachPageOf(*form);
      showEachPageOf(*twin);
    }
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

TEST_F(TourEnds, OfWizardsRestoreTheirPagesWithEveryPlace) {
  for (int tour = 0; tour < tourCount(); ++tour) {
    const auto& way = waysToEndWizards[below(std::size(waysToEndWizards))];
    const std::string name = "tour " + std::to_string(tour) + ", wizard " + way.name;
    AWizard wizard;
    hosts::qt::WalkThrough tours(toolkit);
    wizard.show();
    wizard.next();
    const Snapshot untouched = wizard.picture();
    const QString lists = QString("{ 0 = %1; 1 = %2; }").arg(list(6, 4), list(3, 4));
    ASSERT_TRUE(tours.play(lists.toUtf8(), wizard)) << name;
    for (int act = below(3); act > 0; --act) hosts::settle();
    way.end(wizard, tours);
    hosts::settle();
    ASSERT_FALSE(tours.isRunning()) << name;
    for (const QString& what : hosts::differences(untouched, wizard.picture())) {
      ADD_FAILURE() << name << ": " << what.toStdString() << " " << lists.toStdString();
    }
    if (testing::Test::HasFailure()) return;
  }
}

}  // namespace

}  // namespace qz
