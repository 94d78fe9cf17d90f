// SPDX-License-Identifier: MIT
// The code of docs/embedding.md about hosts written with Qt, and what it does. scripts/check-docs
// compares the page with this file.

#include <QFile>
#include <QLoggingCategory>
#include <QProgressBar>
#include <QSettings>
#include <QTemporaryDir>
#include <QToolBar>
#include <algorithm>

#include "examples/qt-host/order_form.hpp"
#include "qz/hosts/progress/exploring_meter.hpp"
#include "qz/hosts/qt/guide.hpp"
#include "qz/hosts/qt/walk_through.hpp"
#include "qz/property_list/reader.hpp"
#include "qz/toolkit/qt/adoption.hpp"
#include "tests/qt/support.hpp"

namespace qz {

namespace {

using hosts::qt::Guide;
using hosts::qt::WalkThrough;

/// The form of the example, as an application of the page's readers.
struct PageForm : OrderForm {
  WalkThrough tour;

  PageForm() {
    tour.setResources(":/tour");
    show();
  }

  bool begin() { return tour.play("tour.plist", *this); }
  void press(const char* tag) { tour.engine()->buttonPushed(control(tag)); }
  toolkit::Ref<toolkit::View> control(const char* tag) {
    return tour.engine()->findObjectWithTag(std::stol(tag));
  }
};

/// The same with the guide that the tour drives.
struct PageFormWithGuide : PageForm {
  Guide guide{tour.toolkit(), *this};
};

struct EmbeddingPage : testing::Test {
  QTemporaryDir directory;
  std::unique_ptr<PageForm> form = std::make_unique<PageForm>();

  static void settle() {
    hosts::settle();
    hosts::settle();
  }
};

const char* const twoLists = R"({
  0 = ((SET_TEXT_FOR_OBJECT_ID, "Ada", 1));
  8 = (TERMINATE_PARSER);
})";

TEST_F(EmbeddingPage, GivesTags) {
  form->cancel.setObjectName("cancelButton");
  form->order->setObjectName("orderAction");
  form->order->setProperty("qzTag", QVariant());
  QLineEdit& name = form->name;
  WalkThrough& tour = form->tour;
  name.setProperty("qzTag", 1);
  tour.setAdoption({.tags = {{"cancelButton", 10}, {"orderAction", 8}}});
  ASSERT_TRUE(tour.play(QByteArray(twoLists), *form));
  EXPECT_EQ(name.text(), "Ada");
  const auto controls = tour.engine()->tutorialWindow()->contentView()->subviews();
  std::vector<toolkit::Tag> tags;
  for (const auto& view : controls) tags.push_back(view->tag());
  for (const toolkit::Tag tag : {1, 8, 10}) {
    EXPECT_EQ(std::count(tags.begin(), tags.end(), tag), 1) << tag;
  }
}

TEST_F(EmbeddingPage, ReadsAndRestoresLess) {
  WalkThrough& tour = form->tour;
  using qz::toolkit::qt::Adoption;
  tour.setAdoption({.reading = Adoption::Reading::directSubviews,
                    .bringsIntoView = false,
                    .restoring = Adoption::Restoring::tags});
  ASSERT_TRUE(tour.play(QByteArray(twoLists), *form));
  EXPECT_EQ(form->name.text(), "") << "it is not a direct child of the tabs";
}

TEST_F(EmbeddingPage, LetsAPressServeBoth) {
  QAction* const order = form->order;
  order->setProperty("qzPress", "both");
  ASSERT_TRUE(form->tour.play(QByteArray(twoLists), *form));
  QTest::mouseClick(form->findChild<QToolBar*>()->widgetForAction(order), Qt::LeftButton);
  settle();
  EXPECT_EQ(form->orders.rowCount(), 1);
  EXPECT_FALSE(form->tour.isRunning());
}

struct TellingForm : PageFormWithGuide {
  QStringList told;
  QProgressBar bar;

  void note(const QString& what) { told.push_back(what); }

  void listen() {
    connect(&tour, &WalkThrough::started, this, [this] { note("the tour begins"); });
    connect(&tour, &WalkThrough::stepChanged, this, [this](const QString& key) { note(key); });
    connect(&tour, &WalkThrough::failed, this, [this](const QString& what) { note(what); });
    connect(&tour, &WalkThrough::finished, this, [this](WalkThrough::Reason reason) {
      note(reason == WalkThrough::Reason::endedByScript ? "the user knows it all" : "not yet");
    });
  }

  void showProgress() {
    tour.setProgressMeter(qz::hosts::progress::exploringMeter());
    connect(&tour, &WalkThrough::progressChanged, &bar, [this](double progress) {
      bar.setVisible(progress >= 0);  // -1 if it is not known
      bar.setValue(qRound(100 * progress));
    });
  }
};

TEST_F(EmbeddingPage, TellsTheHost) {
  TellingForm telling;
  telling.listen();
  EXPECT_FALSE(telling.tour.play("none.plist", telling));
  ASSERT_TRUE(telling.begin());
  settle();
  telling.press("2001");
  settle();
  telling.press("906");
  settle();
  EXPECT_EQ(telling.told,
            QStringList({"The walk-through none.plist is not played: the file does not exist",
                         "the tour begins", "0", "2001", "906", "the user knows it all"}));
  ASSERT_TRUE(telling.begin());
  telling.tour.end();
  EXPECT_EQ(telling.told.last(), "not yet");
}

TEST_F(EmbeddingPage, ShowsTheProgress) {
  TellingForm telling;
  telling.showProgress();
  const QByteArray steps = "{ 0 = ((SET_TAG_FOR_OBJECT_ID, 20, 9)); 20 = (TERMINATE_PARSER); }";
  ASSERT_TRUE(telling.tour.play(steps, telling));
  EXPECT_TRUE(QTest::qWaitFor([&] { return telling.tour.progress() == 0; }));
  telling.press("20");
  EXPECT_TRUE(QTest::qWaitFor([&] { return telling.bar.value() == 100; }));
}

struct ResumingForm : PageFormWithGuide {
  QSettings settings;

  explicit ResumingForm(const QString& file) : settings(file, QSettings::IniFormat) {
    connect(&tour, &WalkThrough::finished, this,
            [this] { settings.setValue("tour", tour.state()); });

    if (!tour.resume(settings.value("tour").toMap(), *this)) tour.play("tour.plist", *this);
  }
};

TEST_F(EmbeddingPage, GoesOnLater) {
  const QString file = directory.filePath("settings.ini");
  for (const char* const step : {"0", "2001"}) {
    ResumingForm resuming(file);
    EXPECT_EQ(resuming.tour.step(), step);
    resuming.press(resuming.tour.step() == "0" ? "2001" : "2002");
    resuming.close();
    settle();
  }
  EXPECT_EQ(ResumingForm(file).tour.step(), "2002");
}

TEST_F(EmbeddingPage, TakesScriptsFromEverywhere) {
  const QString path = directory.filePath("tour.plist");
  ASSERT_TRUE(QFile::copy(":/tour/tour.plist", path));
  QFile script(path);
  ASSERT_TRUE(script.open(QIODevice::ReadOnly));
  const QByteArray bytes = script.readAll();
  WalkThrough& tour = form->tour;
  QWidget& window = *form;
  const auto isWelcome = [&](bool played) { return played && tour.step() == "0"; };
  EXPECT_TRUE(isWelcome(tour.play(path, window)));
  EXPECT_TRUE(isWelcome(tour.play(QUrl::fromLocalFile(path), window)));
  EXPECT_TRUE(isWelcome(tour.play("qrc:/tour/tour.plist", window)));
  EXPECT_TRUE(isWelcome(tour.play(bytes, window)));
  const std::unique_ptr<Guide> guide = std::make_unique<Guide>(tour.toolkit(), window);
  tour.setLocale(QLocale(QLocale::German, QLocale::Austria));
  tour.play("tour.plist", window);  // plays tour_de.plist
  EXPECT_EQ(form->findChild<QLabel*>("qz-guide-heading")->text(), "Willkommen");
}

TEST_F(EmbeddingPage, TurnsTheLogOff) {
  static int lines;
  lines = 0;
  const auto before =
      qInstallMessageHandler([](QtMsgType, const QMessageLogContext&, const QString&) { ++lines; });
  ASSERT_TRUE(form->begin());
  EXPECT_GT(lines, 0);
  QLoggingCategory::setFilterRules("qz.walkthrough=false");
  lines = 0;
  ASSERT_TRUE(form->begin());
  EXPECT_EQ(lines, 0);
  QLoggingCategory::setFilterRules({});
  qInstallMessageHandler(before);
}

TEST_F(EmbeddingPage, DescribesTheWindow) {
  WalkThrough& tour = form->tour;
  QWidget& window = *form;
  const QString path = directory.filePath("host.plist");
  {
    QFile file(path);
    if (file.open(QIODevice::WriteOnly)) file.write(tour.describe(window));
  }
  QFile written(path);
  ASSERT_TRUE(written.open(QIODevice::ReadOnly));
  const auto described = toolkit::readPropertyList(written.readAll().toStdString());
  EXPECT_TRUE(toolkit::asArray(described.value));
}

TEST_F(EmbeddingPage, MakesAGuideOfItsOwn) {
  WalkThrough& tour = form->tour;
  QWidget& window = *form;
  Guide guide(tour.toolkit(), window, {.frame = false, .dimming = false});
  guide.panel()->setStyleSheet("#qz-guide-heading { color: #205090; }");
  tour.play("tour.plist", window);
  EXPECT_EQ(form->findChild<QLabel*>("qz-guide-heading")->text(), "Welcome");
  EXPECT_FALSE(guide.target());
  form->press("2001");
  EXPECT_EQ(guide.target(), &form->name);
}

TEST_F(EmbeddingPage, MayLoseEverythingAtAnyMoment) {
  QObject::connect(&form->tour, &WalkThrough::stepChanged, form.get(), [this] { form.reset(); });
  ASSERT_TRUE(form->begin());
  settle();
  EXPECT_FALSE(form);
}

}  // namespace

}  // namespace qz
