// SPDX-License-Identifier: MIT
// What a screen reader finds in the guide, and what it speaks at each step.

#include <QMetaEnum>

#include "tests/qt/announcements.hpp"
#include "tests/qt/guided.hpp"
#include "toolkit/qt/strings.hpp"

namespace qz {

namespace {

using hosts::threeSteps;
using toolkit::qt::utf8;
using Lines = std::vector<std::string>;

std::string roleName(QAccessible::Role role) {
  return QMetaEnum::fromType<QAccessible::Role>().valueToKey(role);
}

struct GuideAccessibility : hosts::Guided {
  GuideAccessibility() { hosts::listen(); }

  /// Lists what the panel shows, as a screen reader that explores it reads it.
  static void read(QAccessibleInterface& object, Lines& lines) {
    if (object.state().invisible || object.rect().isEmpty()) return;
    std::string line = roleName(object.role()) + " \"" + utf8(object.text(QAccessible::Name)) + '"';
    const QString description = object.text(QAccessible::Description);
    if (!description.isEmpty()) line += ": " + utf8(description);
    if (object.state().disabled) line += " (disabled)";
    if (object.state().focused) line += " (focused)";
    lines.push_back(line);
    for (int i = 0; i < object.childCount(); ++i) {
      EXPECT_EQ(object.child(i)->parent(), &object) << line;
      EXPECT_EQ(object.indexOfChild(object.child(i)), i) << line;
      read(*object.child(i), lines);
    }
  }
  Lines readPanel() const {
    Lines lines;
    read(*QAccessible::queryAccessibleInterface(&panel()), lines);
    return lines;
  }

  /// Lists what is spoken: alerts, what gets the focus, and what changes of the object that has it.
  /// Forgets what was announced.
  Lines hear() const {
    Lines lines;
    for (const auto& said : hosts::announcements) {
      const std::string called = '"' + utf8(said.name) + '"';
      if (said.event == QAccessible::Alert) {
        lines.push_back("alert: " + roleName(said.role) + ' ' + called + ": " +
                        utf8(said.description));
      } else if (said.event == QAccessible::Focus && said.object == QApplication::focusWidget()) {
        lines.push_back("focus: " + roleName(said.role) + ' ' + called);
      } else if (said.event == QAccessible::DescriptionChanged && !said.description.isEmpty() &&
                 said.object == QApplication::focusWidget()) {
        lines.push_back("at the focus: " + utf8(said.description));
      }
    }
    hosts::listen();
    return lines;
  }
};

TEST_F(GuideAccessibility, TellsEachStepOnce) {
  show();
  hosts::listen();
  play(threeSteps);
  EXPECT_EQ(hear(), (Lines{"alert: Dialog \"Name\": Type your name. Points at: Your name. 1 of 2.",
                           "focus: Button \"Next\""}));
  click(panel().next);
  EXPECT_EQ(hear(), (Lines{"at the focus: Send. Send it. Points at: Send. 2 of 2.",
                           "alert: Dialog \"Send\": Send it. Points at: Send. 2 of 2."}));
  press(Qt::Key_Backtab, Qt::ShiftModifier);
  EXPECT_EQ(hear(), (Lines{"focus: Button \"Back\""}));
  press(Qt::Key_Space);
  EXPECT_EQ(hear(), (Lines{"at the focus: Welcome.", "alert: Dialog \"Welcome\": "}));
  form->move(300, 300);
  settle();
  EXPECT_EQ(hear(), Lines{}) << "a move is not a step";
}

TEST_F(GuideAccessibility, TellsAStepToAUserWhoIsInTheForm) {
  show({.takesFocus = false});
  hosts::listen();
  play(threeSteps);
  EXPECT_EQ(hear(), (Lines{"alert: Dialog \"Name\": Type your name. Points at: Your name. 1 of 2.",
                           "focus: EditableText \"Your name\""}))
      << "the desktop has activated the panel for a moment";
  EXPECT_EQ(name.accessibleDescription(), "") << "the form's controls are the host's";
}

TEST_F(GuideAccessibility, HasNamesAndRoles) {
  show();
  play((std::string(threeSteps) +
        "2000 = ((SET_ATTRIBUTED_STRING_AS_IS_WITH_HTML_WITH_FONT_NAME_"
        "WITH_SIZE_FOR_OBJECT_ID, YES, \"<b>Now</b> <i>send</i> it\", \"\", 0, 902),"
        "(DISABLE_OBJECT_WITH_ID, 1000), (HIDE_OBJECT_WITH_ID, 906));")
           .c_str());
  EXPECT_EQ(readPanel(),
            (Lines{"Dialog \"Name\": Type your name. Points at: Your name. 1 of 2.",
                   "StaticText \"Name\"", "StaticText \"Type your name\"", "StaticText \"1 of 2\"",
                   "Button \"Skip\"", "Button \"Back\"", "Button \"Next\" (focused)"}));
  click(panel().next);
  EXPECT_EQ(
      readPanel(),
      (Lines{"Dialog \"Name\": Now send it. Points at: Your name. 1 of 2.", "StaticText \"Name\"",
             "StaticText \"Now send it\"", "StaticText \"1 of 2\"", "Button \"Back\" (disabled)",
             "Button \"Next\": Name. Now send it. Points at: Your name. 1 of 2. (focused)"}));
}

TEST_F(GuideAccessibility, LeavesNothingBehind) {
  show();
  play(threeSteps);
  click(panel().skip);
  EXPECT_EQ(panel().accessibleName(), "");
  EXPECT_EQ(panel().accessibleDescription(), "");
  EXPECT_EQ(panel().next.accessibleDescription(), "");
}

}  // namespace

}  // namespace qz
