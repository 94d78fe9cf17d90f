// SPDX-License-Identifier: MIT
// What a walk-through tells its host, and that the host may destroy anything meanwhile.

#include <QCheckBox>
#include <QLineEdit>
#include <QMainWindow>
#include <QPushButton>
#include <QSettings>
#include <QTemporaryDir>
#include <QTimer>

#include "qz/hosts/qt/walk_through.hpp"
#include "qz/property_list/scalars.hpp"
#include "tests/qt/support.hpp"

namespace qz {

namespace {

using hosts::qt::WalkThrough;
using Reason = WalkThrough::Reason;

const QByteArray tour =
    "{ 0 = ((SET_TITLE_FOR_OBJECT_ID, Begun, 1));"
    "  1 = ((SET_TAG_FOR_OBJECT_ID, 3, 1), (SET_TITLE_FOR_OBJECT_ID, Further, 3));"
    "  3 = ((PROCESS_COMMANDS_FOR_ID, 30)); 30 = ((SET_TEXT_FOR_OBJECT_ID, Last, 6));"
    "  5 = (); 2 = (TERMINATE_PARSER); }";

/// A form with a tour that has a toolkit of its own.
struct ToldHost : testing::Test {
  std::unique_ptr<QMainWindow> form = std::make_unique<QMainWindow>();
  QPushButton* next = new QPushButton("Next");
  QPushButton* done = new QPushButton("Done");
  QCheckBox* box = new QCheckBox("Box");
  QLineEdit* field = new QLineEdit;
  std::unique_ptr<WalkThrough> walkThrough = std::make_unique<WalkThrough>();
  QStringList told;

  ToldHost() {
    auto* const content = new QWidget;
    int tag = 1;
    const std::pair<QWidget*, int> tagged[] = {{next, 1}, {done, 2}, {box, 5}, {field, 6}};
    for (const auto& [widget, number] : tagged) {
      widget->setParent(content);
      widget->setGeometry(20, 40 * tag++, 100, 30);
      widget->setProperty("qzTag", number);
    }
    form->setCentralWidget(content);
    form->resize(300, 300);
    form->show();
    listen();
  }

  void listen() {
    walkThrough->toolkit().log().setSink([](std::string_view) {});
    QObject::connect(walkThrough.get(), &WalkThrough::started, [this] { told << "started"; });
    QObject::connect(walkThrough.get(), &WalkThrough::stepChanged,
                     [this](const QString& key) { told << "step " + key; });
    QObject::connect(walkThrough.get(), &WalkThrough::failed,
                     [this](const QString& what) { told << "failed: " + what; });
    QObject::connect(walkThrough.get(), &WalkThrough::finished, [this](Reason reason) {
      told << "finished: " + QVariant::fromValue(reason).toString();
    });
  }

  static void click(QWidget& widget) {
    QTest::mouseClick(&widget, Qt::LeftButton);
    hosts::settle();
  }
  /// Returns what was told since the last call.
  QStringList news() {
    hosts::settle();
    return std::exchange(told, {});
  }
};

TEST_F(ToldHost, IsToldOfEachStepInOrder) {
  EXPECT_EQ(walkThrough->step(), "");
  EXPECT_FALSE(walkThrough->isRunning());
  ASSERT_TRUE(walkThrough->play(tour, *form));
  EXPECT_EQ(told, QStringList{"started"}) << "steps come from the event loop";
  EXPECT_TRUE(walkThrough->property("running").toBool());
  EXPECT_EQ(news(), (QStringList{"started", "step 0"}));
  click(*next);
  EXPECT_EQ(walkThrough->property("step"), "1");
  click(*next);
  EXPECT_EQ(walkThrough->step(), "3") << "not the list that this one runs";
  EXPECT_EQ(field->text(), "Last");
  click(*done);
  EXPECT_EQ(news(), (QStringList{"step 1", "step 3", "step 2", "finished: endedByScript"}));
  EXPECT_FALSE(walkThrough->isRunning());
}

TEST_F(ToldHost, IsToldOfWhatTimersRun) {
  ASSERT_TRUE(walkThrough->play(
      QByteArray("{ 0 = ((SET_TIMER_FOR_ID, 1, 8)); 8 = (TERMINATE_PARSER); }"), *form));
  ASSERT_TRUE(QTest::qWaitFor([&] { return !walkThrough->isRunning(); }, 5000));
  EXPECT_EQ(news(), (QStringList{"started", "step 0", "step 8", "finished: endedByScript"}));
}

TEST_F(ToldHost, LearnsWhyAWalkThroughIsOver) {
  const struct {
    const char* reason;
    std::function<void()> end;
  } cases[] = {
      {"endedByScript", [this] { click(*done); }},
      {"closedByUser", [this] { form->close(); }},
      {"closedByUser", [this] { form->hide(); }},
      {"replaced", [this] { walkThrough->play(tour, *form); }},
      {"endedByHost", [this] { walkThrough->end(); }},
      {"hostGone",
       [] {
         QTimer::singleShot(0, qApp, [] { QCoreApplication::quit(); });
         QCoreApplication::exec();
       }},
      {"hostGone", [this] { form->setCentralWidget(new QWidget); }},
      {"hostGone", [this] { form.reset(); }},
  };
  for (const auto& c : cases) {
    form->show();
    ASSERT_TRUE(walkThrough->play(tour, *form));
    news();
    c.end();
    EXPECT_EQ(news().filter("finished"), QStringList{QString("finished: ") + c.reason});
    walkThrough->blockSignals(true);
    walkThrough->end();
    walkThrough->blockSignals(false);
  }
}

TEST_F(ToldHost, LearnsWhatFails) {
  EXPECT_FALSE(walkThrough->play("/missing.plist", *form));
  EXPECT_EQ(news(), QStringList{"failed: The walk-through /missing.plist is not played: the file "
                                "does not exist"});
  ASSERT_TRUE(
      walkThrough->play(QByteArray("{ 0 = (IDLE_LOOP); 1 = (IDLE_LOOP, (FLASH_ID)); }"), *form));
  news();
  click(*next);
  const QStringList failures = news();
  ASSERT_EQ(failures.size(), 2);
  EXPECT_EQ(failures[0], "step 1");
  EXPECT_TRUE(failures[1].startsWith("failed: list 1, command 2: ")) << failures[1].toStdString();
  EXPECT_TRUE(walkThrough->isRunning());
}

TEST_F(ToldHost, KeepsItsWalkThroughIfTheNextCannotBePlayed) {
  ASSERT_TRUE(walkThrough->play(tour, *form));
  EXPECT_FALSE(walkThrough->play(QByteArray("{"), *form));
  EXPECT_TRUE(walkThrough->isRunning());
  EXPECT_EQ(next->text(), "Begun");
}

// What settings do to a state.
QVariantMap stored(const QVariantMap& state) {
  QTemporaryDir directory;
  const QString path = directory.filePath("settings.ini");
  QSettings(path, QSettings::IniFormat).setValue("tour", state);
  return QSettings(path, QSettings::IniFormat).value("tour").toMap();
}

TEST_F(ToldHost, TakesAWalkThroughUpAgain) {
  EXPECT_TRUE(walkThrough->state().isEmpty());
  ASSERT_TRUE(walkThrough->play(tour, *form));
  click(*next);
  box->click();
  ASSERT_TRUE(box->isChecked());
  form->close();
  news();
  const QVariantMap state = stored(walkThrough->state());
  EXPECT_EQ(state["steps"].toStringList(), (QStringList{"list 0", "press 1", "press 5 on"}));
  ASSERT_EQ(next->text(), "Next");
  box->setChecked(false);

  form->show();
  walkThrough = std::make_unique<WalkThrough>();
  listen();
  ASSERT_TRUE(walkThrough->resume(state, *form));
  EXPECT_EQ(news(), (QStringList{"started", "step 5"}));
  EXPECT_EQ(next->text(), "Further");
  EXPECT_TRUE(box->isChecked());
  EXPECT_TRUE(walkThrough->engine()->buttonStates()->objectForKey("5")->boolValue());
  EXPECT_EQ(walkThrough->state(), state);
  click(*next);
  EXPECT_EQ(field->text(), "Last");
  click(*done);
  EXPECT_TRUE(walkThrough->state().isEmpty()) << "nothing is left to be done";
}

TEST_F(ToldHost, TakesUpPressesWithoutAListAndListsOfTimers) {
  const QByteArray script =
      "{ 0 = ((SET_TIMER_FOR_ID, 60, 8)); 8 = ((SET_TEXT_FOR_OBJECT_ID, Late, 6)); }";
  ASSERT_TRUE(walkThrough->play(script, *form));
  const auto timers = [this] { return walkThrough->engine()->objectIdTimers()->count(); };
  EXPECT_EQ(timers(), 1U);
  box->click();
  EXPECT_EQ(timers(), 0U) << "every press cancels the timers";
  ASSERT_TRUE(walkThrough->resume(walkThrough->state(), *form));
  EXPECT_EQ(timers(), 0U);
  EXPECT_EQ(walkThrough->state()["steps"].toStringList(), (QStringList{"list 0", "press 5 on"}));
  ASSERT_TRUE(walkThrough->play(script, *form));
  QVariantMap state = walkThrough->state();
  state["steps"] = QStringList{"list 0", "list 8"};
  ASSERT_TRUE(walkThrough->resume(state, *form));
  EXPECT_EQ(field->text(), "Late");
  EXPECT_EQ(timers(), 0U);
}

TEST_F(ToldHost, RefusesStatesThatItCannotTakeUp) {
  const struct {
    QVariantMap state;
    const char* reason;
  } cases[] = {
      {{}, "the state to resume is empty"},
      {{{"script", tour}}, "this state is not one that this version can resume"},
      {{{"script", tour}, {"version", 2}, {"steps", QStringList{"list 0"}}},
       "this state is not one that this version can resume"},
      {{{"script", tour}, {"version", 1}, {"steps", QStringList{"list 0", "leap 1"}}},
       "its state has the unknown step \"leap 1\""},
      {{{"script", tour}, {"version", 1}, {"steps", QStringList{"list 0", "press 1 off"}}},
       "its state has the unknown step \"press 1 off\""},
      {{{"script", tour}, {"version", 1}, {"steps", QStringList{"list 0", "list 77"}}},
       "its state is of another script, which had a list 77"},
      {{{"script", "/missing.plist"}, {"version", 1}, {"steps", QStringList{"list 0"}}},
       "the file does not exist"},
  };
  for (const auto& c : cases) {
    EXPECT_FALSE(walkThrough->resume(c.state, *form));
    const QStringList failures = news();
    ASSERT_EQ(failures.size(), 1) << c.reason;
    EXPECT_TRUE(failures[0].endsWith(QString(" is not played: ") + c.reason))
        << failures[0].toStdString();
    EXPECT_FALSE(walkThrough->isRunning());
  }
}

TEST_F(ToldHost, MayDestroyTheWalkThroughInAnySignal) {
  using Destroy = std::function<void()>;
  const std::function<void(const Destroy&)> ways[] = {
      [this](const Destroy& destroy) {
        QObject::connect(walkThrough.get(), &WalkThrough::started, form.get(), destroy);
      },
      [this](const Destroy& destroy) {
        QObject::connect(walkThrough.get(), &WalkThrough::runningChanged, form.get(), destroy);
      },
      [this](const Destroy& destroy) {
        QObject::connect(walkThrough.get(), &WalkThrough::stepChanged, form.get(), destroy);
      },
      [this](const Destroy& destroy) {
        QObject::connect(walkThrough.get(), &WalkThrough::finished, form.get(), destroy);
      },
      [this](const Destroy& destroy) { walkThrough->whenOver(destroy); },
      // In the middle of a list, from what the host connects to its own widgets.
      [this](const Destroy& destroy) {
        QObject::connect(field, &QLineEdit::textChanged, form.get(), destroy);
      },
      [this](const Destroy& destroy) {
        QObject::connect(next, &QObject::objectNameChanged, form.get(), destroy);
        next->setObjectName("gone");
      },
  };
  for (const auto& way : ways) {
    walkThrough = std::make_unique<WalkThrough>();
    walkThrough->toolkit().log().setSink([](std::string_view) {});
    way([this] { walkThrough.reset(); });
    for (int i = 0; i < 3 && walkThrough; ++i) {
      if (i == 0) walkThrough->play(tour, *form);
      hosts::settle();
      if (walkThrough) click(i < 2 ? *next : *done);
    }
    EXPECT_FALSE(walkThrough);
    hosts::settle();
    EXPECT_EQ(next->text(), "Next");
    EXPECT_EQ(next->property("qzTag"), 1);
    EXPECT_EQ(field->text(), "");
    field->disconnect(form.get());
    next->disconnect(form.get());
    next->setObjectName("next");
  }
}

TEST_F(ToldHost, MayDestroyTheFormWhileItsOwnListRuns) {
  ASSERT_TRUE(walkThrough->play(tour, *form));
  QObject::connect(field, &QLineEdit::textChanged, qApp, [this] { form->deleteLater(); });
  click(*next);
  QTest::mouseClick(next, Qt::LeftButton);
  (void)form.release();
  hosts::settle();
  EXPECT_EQ(news().last(), "finished: hostGone");
  EXPECT_FALSE(walkThrough->isRunning());
}

TEST_F(ToldHost, MayEndTheWalkThroughInItsFirstList) {
  QObject::connect(field, &QLineEdit::textChanged, form.get(), [this] { walkThrough->end(); });
  ASSERT_TRUE(
      walkThrough->play(QByteArray("{ 0 = ((SET_TEXT_FOR_OBJECT_ID, Begun, 6)); }"), *form));
  EXPECT_EQ(news(), QStringList{"finished: endedByHost"});
  EXPECT_EQ(field->text(), "");
}

TEST_F(ToldHost, MayOwnItsWalkThrough) {
  QPointer<WalkThrough> owned = new WalkThrough(form.get());
  owned->toolkit().log().setSink([](std::string_view) {});
  ASSERT_TRUE(owned->play(tour, *form));
  click(*next);
  form.reset();
  hosts::settle();
  EXPECT_FALSE(owned);
}

}  // namespace

}  // namespace qz
