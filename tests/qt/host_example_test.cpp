// SPDX-License-Identifier: MIT
// The example of a Qt host: walk-throughs begin and end, and the application keeps working.
#include <gtest/gtest.h>

#include <QFile>
#include <QMenu>
#include <QStatusBar>
#include <QTest>
#include <QToolBar>
#include <QTranslator>
#include <map>

#include "examples/qt-host/guided_form.hpp"
#include "qz/property_list/collections.hpp"
#include "qz/property_list/reader.hpp"
#include "qz/property_list/scalars.hpp"
#include "support.hpp"

namespace qz {

namespace {

/// While it lives, new windows and tours are German.
struct German {
  QTranslator words;
  const QLocale before;

  German() {
    QLocale::setDefault(QLocale(QLocale::German, QLocale::Austria));
    EXPECT_TRUE(words.load(QLocale(), "parcels", "_", ":/i18n"));
    QCoreApplication::installTranslator(&words);
  }
  ~German() {
    QCoreApplication::removeTranslator(&words);
    QLocale::setDefault(before);
  }
  German(const German&) = delete;
  German& operator=(const German&) = delete;
};

struct HostExample : testing::Test {
  std::unique_ptr<GuidedForm> form = std::make_unique<GuidedForm>();

  HostExample() { show(); }

  void show() {
    form->show();
    form->activateWindow();
  }

  void choose(int item) {
    form->menuBar()->actions()[0]->menu()->actions()[item]->trigger();
    hosts::settle();
  }

  static void click(QWidget& widget) {
    QTest::mouseClick(&widget, Qt::LeftButton);
    hosts::settle();
    hosts::settle();
  }

  QPushButton& part(const char* name) { return *form->findChild<QPushButton*>(name); }
  QString heading() const { return form->findChild<QLabel*>("qz-guide-heading")->text(); }
  QWidget& orderButton() const {
    return *form->findChild<QToolBar*>()->widgetForAction(form->order);
  }

  /// Expects the window's own buttons to work as before any walk-through, once per press.
  void expectHostWorks() {
    const int orders = form->orders.rowCount();
    form->tabs.setCurrentIndex(0);
    form->name.setText("Ada");
    click(orderButton());
    ASSERT_EQ(form->orders.rowCount(), orders + 1);
    EXPECT_EQ(form->orders.item(orders, 0)->text(), "Ada");
    EXPECT_EQ(form->statusBar()->currentMessage(), "Ordered for Ada: 6 €");
    click(form->clear);
    EXPECT_EQ(form->name.text(), "");
    form->tabs.setCurrentIndex(1);
    form->orders.selectRow(orders);
    click(form->cancel);
    EXPECT_EQ(form->orders.rowCount(), orders);
    form->tabs.setCurrentIndex(0);
    form->statusBar()->clearMessage();
  }
};

TEST_F(HostExample, WorksBeforeAnyWalkThrough) { expectHostWorks(); }

TEST_F(HostExample, IsGuidedThroughBothOfItsTabs) {
  for (int round = 0; round < 2; ++round) {
    choose(0);
    EXPECT_EQ(heading(), "Welcome");
    EXPECT_FALSE(orderButton().isEnabled());
    click(part("qz-guide-next"));
    EXPECT_EQ(heading(), "Who gets it?");
    EXPECT_EQ(form->guide.target(), &form->name);
    click(part("qz-guide-next"));
    EXPECT_EQ(heading(), "Faster");
    form->express.click();
    EXPECT_EQ(form->price.text(), "11 €") << "the form reads it during the tour, too";
    form->express.click();
    click(part("qz-guide-back"));
    EXPECT_EQ(heading(), "Who gets it?");
    click(part("qz-guide-back"));
    EXPECT_EQ(heading(), "Welcome");
    for (int step = 0; step < 3; ++step) click(part("qz-guide-next"));
    EXPECT_EQ(heading(), "Send it");
    click(orderButton());
    EXPECT_EQ(heading(), "On its way");
    EXPECT_EQ(form->orders.rowCount(), 1) << "the press is for both";
    EXPECT_EQ(form->tabs.currentIndex(), 1);
    EXPECT_EQ(form->guide.target(), &form->orders);
    click(part("qz-guide-next"));
    EXPECT_EQ(heading(), "");
    EXPECT_EQ(form->tabs.currentIndex(), 0);
    form->orders.setRowCount(0);
    expectHostWorks();
  }
}

TEST_F(HostExample, ClosesInTheMiddleOfAWalkThroughWhenTheUserWantsIt) {
  choose(0);
  EXPECT_TRUE(form->close());
  EXPECT_FALSE(form->isVisible());
}

TEST_F(HostExample, ShowsTipsInASheet) {
  choose(1);
  EXPECT_TRUE(form->tips.isVisible());
  EXPECT_TRUE(form->tips.isModal());
  click(form->tips.next);
  EXPECT_EQ(form->tips.tip.text(), "Fill what is empty with paper, so that nothing moves.");
  click(form->tips.next);
  EXPECT_FALSE(form->tips.next.isEnabled());
  click(form->tips.close);
  EXPECT_FALSE(form->tips.isVisible());
  EXPECT_EQ(form->tips.next.property("qzTag"), 10);
  expectHostWorks();
}

TEST_F(HostExample, TakesEscapeForTheEndOfItsTips) {
  for (int round = 0; round < 2; ++round) {
    choose(1);
    click(form->tips.next);
    QTest::keyClick(&form->tips, Qt::Key_Escape);
    hosts::settle();
    EXPECT_FALSE(form->tips.isVisible());
    EXPECT_EQ(form->tips.next.property("qzTag"), 10);
    expectHostWorks();
  }
}

TEST_F(HostExample, SpeaksTheUsersLanguage) {
  const German german;
  form = std::make_unique<GuidedForm>();
  show();
  EXPECT_EQ(form->windowTitle(), "Pakete");
  EXPECT_EQ(form->clear.text(), "&Leeren");
  choose(0);
  EXPECT_EQ(heading(), "Willkommen");
  EXPECT_EQ(part("qz-guide-skip").text(), "Überspringen");
  click(part("qz-guide-skip"));
  choose(1);
  EXPECT_EQ(form->tips.heading.text().contains("Tipp 1 von 3"), true);
}

std::string textOf(const QString& path) {
  QFile file(path);
  return file.open(QIODevice::ReadOnly) ? file.readAll().toStdString() : std::string();
}

// The classes of the controls with tags.
std::map<toolkit::Tag, std::string> classesIn(const std::string& description) {
  std::map<toolkit::Tag, std::string> classes;
  const auto entries = toolkit::asArray(toolkit::readPropertyList(description).value);
  for (std::size_t i = 0; entries && i < entries->count(); ++i) {
    const auto entry = toolkit::asDictionary(entries->objectAtIndex(i));
    const auto tag = entry->objectForKey("tag");
    if (tag) classes[tag->longValue()] = entry->objectForKey("class")->description();
  }
  return classes;
}

TEST_F(HostExample, IsDescribedForTheTools) {
  const auto described = classesIn(form->walkThrough.describe(*form).toStdString());
  EXPECT_EQ(classesIn(textOf(QZ_SOURCE_DIR "/examples/qt-host/tour-host.plist")), described);
  EXPECT_EQ(classesIn(textOf(QZ_SOURCE_DIR "/examples/qt-host/tips-host.plist")),
            classesIn(form->walkThrough.describe(form->tips).toStdString()));
}

// A translation that is not finished would show the text of the source.
TEST_F(HostExample, IsTranslatedAsAWhole) {
  for (const char* const script : {"tour", "tips"}) {
    const std::string path = std::string(QZ_SOURCE_DIR "/examples/qt-host/") + script;
    const auto lists = [](const std::string& file) {
      return toolkit::asDictionary(
          toolkit::readPropertyList(textOf(QString::fromStdString(file))).value);
    };
    const auto english = lists(path + ".plist");
    const auto german = lists(path + "_de.plist");
    ASSERT_TRUE(english && german);
    for (const auto& [key, list] : english->entries()) {
      const auto other = toolkit::asArray(german->objectForKey(key->description()));
      ASSERT_TRUE(other) << script << ": " << key->description();
      EXPECT_EQ(toolkit::asArray(list)->count(), other->count())
          << script << ": " << key->description();
    }
    EXPECT_EQ(english->count(), german->count());
  }
}

}  // namespace

}  // namespace qz
