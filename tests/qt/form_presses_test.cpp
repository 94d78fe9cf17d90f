// SPDX-License-Identifier: MIT
// Presses during a walk-through over a form: the host hears none of those that belong to the
// walk-through, and all others, and its connections stay.

#include <QButtonGroup>
#include <QDialog>
#include <QRadioButton>
#include <QSpinBox>
#include <QTemporaryDir>
#include <QToolButton>
#include <fstream>

#include "qz/hosts/qt/walk_through.hpp"
#include "tests/qt/crowded_form.hpp"
#include "tests/qt/support.hpp"

namespace qz {

namespace {

/// Counts the clicks of a button through each kind of connection.
struct ClickCounter : QObject {
  int byLambda = 0;
  int byUnique = 0;
  int byQueued = 0;
  QSpinBox byName;  // connected as `QMetaObject::connectSlotsByName` does

  explicit ClickCounter(QAbstractButton& button) {
    connect(&button, &QAbstractButton::clicked, [this] { ++byLambda; });
    connect(&button, SIGNAL(clicked()), &byName, SLOT(stepUp()));
    for (int i = 0; i < 2; ++i) {
      connect(&button, &QAbstractButton::clicked, this, &ClickCounter::countUnique,
              Qt::UniqueConnection);
    }
    connect(&button, &QAbstractButton::clicked, this, &ClickCounter::countQueued,
            Qt::QueuedConnection);
  }

  void countUnique() { ++byUnique; }
  void countQueued() { ++byQueued; }

  /// Returns how many clicks each connection has counted since the last call.
  std::vector<int> take() {
    hosts::settle();
    std::vector<int> counts{byLambda, byName.value(), byUnique, byQueued};
    byLambda = byUnique = byQueued = 0;
    byName.setValue(0);
    return counts;
  }
};

const std::vector<int> heard(4, 1);
const std::vector<int> unheard(4, 0);

struct FormPresses : testing::Test {
  QTemporaryDir directory;
  toolkit::qt::QtToolkit toolkit;
  hosts::qt::WalkThrough walkThrough{toolkit};
  std::unique_ptr<hosts::CrowdedForm> form = std::make_unique<hosts::CrowdedForm>();
  int presses = 0;  // that the engine has heard

  FormPresses() {
    toolkit.log().setSink([this](std::string_view line) { presses += line.ends_with("pressed."); });
    toolkit.files().setResourcePath(directory.path().toStdString());
    write("{ 0 = (IDLE_LOOP); }");
    form->show();
    form->activateWindow();
    hosts::settle();
  }

  void write(const char* script) const {
    std::ofstream(directory.filePath("tour.plist").toStdString()) << script;
  }

  std::vector<QAbstractButton*> buttons() const {
    return {&form->saveButton(), &form->inBox,    &form->inArea, &form->onFront, &form->onBack,
            &form->inPane,       &form->inDrawer, &form->inDock, &form->check};
  }

  int takePresses() { return std::exchange(presses, 0); }
};

TEST_F(FormPresses, ReachTheHostBeforeTheEngineDuringAndTheHostAfterwards) {
  for (QAbstractButton* const button : buttons()) {
    ClickCounter counter(*button);
    const std::string name = button->text().toStdString();
    button->click();
    EXPECT_EQ(counter.take(), heard) << name;
    ASSERT_TRUE(walkThrough.play("tour.plist", *form));
    takePresses();
    for (int round = 1; round <= 3; ++round) {
      button->click();
      EXPECT_EQ(takePresses(), 1) << name << " in round " << round;
    }
    EXPECT_EQ(counter.take(), unheard) << name;
    walkThrough.end();
    button->click();
    EXPECT_EQ(counter.take(), heard) << name;
    EXPECT_EQ(takePresses(), 0) << name;
  }
}

TEST_F(FormPresses, OfMarkedButtonsReachBoth) {
  for (QAbstractButton* const button : buttons()) button->setProperty("qzPress", "both");
  ASSERT_TRUE(walkThrough.play("tour.plist", *form));
  for (QAbstractButton* const button : buttons()) {
    ClickCounter counter(*button);
    takePresses();
    button->click();
    EXPECT_EQ(counter.take(), heard) << button->text().toStdString();
    EXPECT_EQ(takePresses(), 1) << button->text().toStdString();
  }
}

TEST_F(FormPresses, OfUntaggedButtonsReachTheHost) {
  ClickCounter counter(form->untagged);
  ASSERT_TRUE(walkThrough.play("tour.plist", *form));
  form->untagged.click();
  EXPECT_EQ(counter.take(), heard);
  EXPECT_EQ(takePresses(), 0);
}

struct ADialog : QDialog {
  QPushButton& button = *new QPushButton("&Go", this);
  QLineEdit& line = *new QLineEdit(this);
  ADialog() {
    button.setProperty("qzTag", 1);
    button.setGeometry(10, 10, 100, 30);
    line.setGeometry(10, 50, 100, 30);
    button.setDefault(true);
    show();
    activateWindow();
    line.setFocus();
    hosts::settle();
  }
};

const struct {
  const char* name;
  void (*click)(ADialog&);
} waysToClick[] = {
    {"mouse", [](ADialog& dialog) { QTest::mouseClick(&dialog.button, Qt::LeftButton); }},
    {"space bar", [](ADialog& dialog) { QTest::keyClick(&dialog.button, Qt::Key_Space); }},
    {"call", [](ADialog& dialog) { dialog.button.click(); }},
    {"default button", [](ADialog& dialog) { QTest::keyClick(&dialog.line, Qt::Key_Return); }},
    {"animation",
     [](ADialog& dialog) {
       dialog.button.animateClick();
       QTest::qWait(200);
     }},
    {"shortcut",
     [](ADialog& dialog) {
       QTest::keyClick(&dialog.line, Qt::Key_G, Qt::AltModifier);
       QTest::qWait(200);
     }},
};

TEST_F(FormPresses, OfEveryWayReachTheRightOne) {
  for (const auto& way : waysToClick) {
    ADialog dialog;
    ClickCounter counter(dialog.button);
    way.click(dialog);
    EXPECT_EQ(counter.take(), heard) << way.name;
    ASSERT_TRUE(walkThrough.play("tour.plist", dialog));
    takePresses();
    for (int i = 0; i < 2; ++i) way.click(dialog);
    EXPECT_EQ(takePresses(), 2) << way.name;
    EXPECT_EQ(counter.take(), unheard) << way.name;
    walkThrough.end();
    way.click(dialog);
    EXPECT_EQ(counter.take(), heard) << way.name;
  }
}

TEST_F(FormPresses, LeaveTheOtherSignalsToTheHost) {
  int emitted = 0;
  const auto count = [&emitted] { ++emitted; };
  QObject::connect(&form->check, &QCheckBox::pressed, count);
  QObject::connect(&form->check, &QCheckBox::toggled, count);
  QObject::connect(&form->check, &QCheckBox::stateChanged, count);
  QObject::connect(&form->check, &QCheckBox::released, count);
  ASSERT_TRUE(walkThrough.play("tour.plist", *form));
  for (int round = 1; round <= 2; ++round) {
    form->check.click();
    EXPECT_EQ(emitted, 4 * round);
  }
}

// The mouse leaves the button, which is then released without a click.
TEST_F(FormPresses, ThatAreGivenUpAreNone) {
  ADialog dialog;
  ClickCounter counter(dialog.button);
  int pressed = 0;
  QObject::connect(&dialog.button, &QPushButton::pressed, [&] { ++pressed; });
  ASSERT_TRUE(walkThrough.play("tour.plist", dialog));
  takePresses();
  const auto moveTo = [&](QPoint place) {
    QMouseEvent move(QEvent::MouseMove, place, dialog.button.mapToGlobal(place), Qt::NoButton,
                     Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(&dialog.button, &move);
  };
  QTest::mousePress(&dialog.button, Qt::LeftButton);
  moveTo({-50, -50});
  moveTo({5, 5});
  EXPECT_EQ(pressed, 2);
  moveTo({-50, -50});
  QTest::mouseRelease(&dialog.button, Qt::LeftButton, {}, {-50, -50});
  EXPECT_EQ(takePresses(), 0);
  EXPECT_FALSE(dialog.button.group());
  hosts::settle();
  EXPECT_FALSE(dialog.button.signalsBlocked());
  dialog.button.click();
  EXPECT_EQ(takePresses(), 1);
  EXPECT_EQ(counter.take(), unheard);
}

TEST_F(FormPresses, RepeatWhileAnAutoRepeatingButtonIsHeld) {
  ADialog dialog;
  dialog.button.setAutoRepeat(true);
  dialog.button.setAutoRepeatDelay(10);
  dialog.button.setAutoRepeatInterval(10);
  ClickCounter counter(dialog.button);
  int pressed = 0;
  QObject::connect(&dialog.button, &QPushButton::pressed, [&] { ++pressed; });
  ASSERT_TRUE(walkThrough.play("tour.plist", dialog));
  takePresses();
  QTest::mousePress(&dialog.button, Qt::LeftButton);
  EXPECT_TRUE(QTest::qWaitFor([&] { return presses >= 3; }));
  QTest::mouseRelease(&dialog.button, Qt::LeftButton);
  EXPECT_EQ(pressed, takePresses());
  EXPECT_EQ(counter.take(), unheard);
}

TEST_F(FormPresses, OfAGroupReachItsHostOnlyOutsideTheWalkThrough) {
  ADialog dialog;
  QButtonGroup group;
  group.setExclusive(true);
  std::vector<QRadioButton*> radios;
  for (const int id : {7, 5, 9}) {
    radios.push_back(new QRadioButton("Radio", &dialog));
    radios.back()->setProperty("qzTag", id);
    group.addButton(radios.back(), id);
  }
  const auto order = group.buttons();
  std::vector<std::string> emitted;
  const auto note = [&](const char* name) {
    return [&emitted, name] { emitted.emplace_back(name); };
  };
  QObject::connect(&group, &QButtonGroup::buttonClicked, note("clicked"));
  QObject::connect(&group, &QButtonGroup::idClicked, note("id clicked"));
  QObject::connect(&group, &QButtonGroup::idReleased, note("id released"));
  QObject::connect(&group, &QButtonGroup::buttonReleased, note("released"));
  radios[2]->click();
  EXPECT_EQ(emitted,
            (std::vector<std::string>{"id released", "released", "id clicked", "clicked"}));
  emitted.clear();
  ASSERT_TRUE(walkThrough.play("tour.plist", dialog));
  takePresses();
  for (QRadioButton* const radio : radios) {
    radio->click();
    EXPECT_EQ(emitted, (std::vector<std::string>{"id released", "released"}));
    emitted.clear();
    EXPECT_EQ(takePresses(), 1);
    EXPECT_EQ(group.buttons(), order);
    EXPECT_EQ(group.checkedButton(), radio);
    EXPECT_EQ(group.id(radios[0]) * 100 + group.id(radios[1]) * 10 + group.id(radios[2]), 759);
  }
  walkThrough.end();
  radios[0]->click();
  EXPECT_EQ(emitted.size(), 4U);
}

TEST_F(FormPresses, OfATogglingActionReachItsHostOnlyOutsideTheWalkThrough) {
  form->save->setCheckable(true);
  int triggers = 0;
  QObject::connect(form->save, &QAction::triggered, [&] { ++triggers; });
  form->saveButton().click();
  EXPECT_EQ(triggers, 1);
  EXPECT_TRUE(form->save->isChecked());
  ASSERT_TRUE(walkThrough.play("tour.plist", *form));
  form->saveButton().click();
  EXPECT_EQ(triggers, 1);
  EXPECT_FALSE(form->save->isChecked()) << "it follows its button";
  EXPECT_FALSE(form->saveButton().isChecked());
  form->save->trigger();
  EXPECT_EQ(triggers, 2) << "what the host triggers is its own";
  walkThrough.end();
  EXPECT_EQ(static_cast<QToolButton&>(form->saveButton()).defaultAction(), form->save);
  form->saveButton().click();
  EXPECT_EQ(triggers, 3);
  form->save->setProperty("qzPress", "both");
  ASSERT_TRUE(walkThrough.play("tour.plist", *form));
  takePresses();
  form->saveButton().click();
  EXPECT_EQ(triggers, 4);
  EXPECT_EQ(takePresses(), 1);
}

TEST_F(FormPresses, MayEndTheWalkThrough) {
  write("{ 0 = (IDLE_LOOP); 2 = (TERMINATE_PARSER); }");
  ClickCounter counter(form->inBox);
  ASSERT_TRUE(walkThrough.play("tour.plist", *form));
  form->inBox.click();
  hosts::settle();
  EXPECT_FALSE(walkThrough.engine());
  EXPECT_EQ(counter.take(), unheard);
  form->inBox.click();
  EXPECT_EQ(counter.take(), heard);
}

// The host ends the walk-through at once, in a slot of the press or in the log.
TEST_F(FormPresses, MayEndTheWalkThroughAtOnce) {
  ClickCounter counter(form->inBox);
  ASSERT_TRUE(walkThrough.play("tour.plist", *form));
  toolkit.log().setSink([this](std::string_view line) {
    if (line.ends_with("pressed.")) walkThrough.end();
  });
  form->inBox.click();
  EXPECT_FALSE(walkThrough.engine());
  EXPECT_EQ(counter.take(), unheard);
  ASSERT_TRUE(walkThrough.play("tour.plist", *form));
  QObject::connect(&form->inBox, &QPushButton::released, [this] { walkThrough.end(); });
  form->inBox.click();
  EXPECT_FALSE(form->inBox.signalsBlocked());
  EXPECT_EQ(counter.take(), heard) << "the walk-through was over before the click";
}

TEST_F(FormPresses, MayDeleteTheirButton) {
  const QPointer<QWidget> button = &form->inBox;
  ASSERT_TRUE(walkThrough.play("tour.plist", *form));
  toolkit.log().setSink([&](std::string_view line) {
    if (line.ends_with("pressed.")) delete button;
  });
  form->inBox.click();
  EXPECT_FALSE(button);
  EXPECT_TRUE(walkThrough.engine());
}

TEST_F(FormPresses, ThatReachBothMayDeleteTheirButtonOrEndTheWalkThrough) {
  for (const bool atOnce : {true, false}) {
    form = std::make_unique<hosts::CrowdedForm>();
    form->show();
    const QPointer<QPushButton> button = &form->inBox;
    button->setProperty("qzPress", "both");
    QObject::connect(button, &QPushButton::clicked, form.get(), [&] {
      atOnce ? delete button.data() : button->deleteLater();
      if (!atOnce) walkThrough.end();
    });
    ASSERT_TRUE(walkThrough.play("tour.plist", *form));
    button->click();
    hosts::settle();
    EXPECT_FALSE(button);
    EXPECT_EQ(walkThrough.engine() != nullptr, atOnce);
    walkThrough.end();
  }
}

TEST_F(FormPresses, ReachTheHostAgainWhenTheEngineIsGone) {
  ADialog dialog;
  ClickCounter counter(dialog.button);
  const auto window = toolkit.application().window(dialog);
  auto engine = QZ_Plist_State_Parser::initWithWindow(toolkit, window);
  engine->getGuiAssetsFromWindow(window);
  dialog.button.click();
  EXPECT_EQ(counter.take(), unheard);
  engine->terminateParser();
  engine.reset();
  dialog.show();
  dialog.button.click();
  EXPECT_EQ(counter.take(), heard);
}

}  // namespace

}  // namespace qz
