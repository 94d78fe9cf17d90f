// SPDX-License-Identifier: MIT
// Writes old-style property lists.

#include "tests/foreign_forms/form_script.hpp"

#include <QAbstractButton>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QTextEdit>

#include "toolkit/qt/input_widgets.hpp"

namespace qz::foreign_forms {

namespace {

std::string command(const std::string& name, const std::string& value, std::size_t tag) {
  return "(" + name + ", \"" + value + "\", " + std::to_string(tag) + "), ";
}

std::string command(const std::string& name, std::size_t tag) {
  return "(" + name + ", " + std::to_string(tag) + "), ";
}

bool showsText(const QWidget& widget) {
  return qobject_cast<const QLabel*>(&widget) || qobject_cast<const QLineEdit*>(&widget) ||
         qobject_cast<const QTextEdit*>(&widget) || qobject_cast<const QPlainTextEdit*>(&widget);
}

std::string htmlFor(std::size_t tag) {
  return "(SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID, "
         "\"<b>Bold</b> and <i>long</i>, longer than it was\", Times, 30, " +
         std::to_string(tag) + "), ";
}

std::string textCommands(std::size_t tag) {
  return command("SET_TEXT_FOR_OBJECT_ID", "A new text", tag) + (tag % 2 ? htmlFor(tag) : "") +
         command("LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID", "picture", tag);
}

std::string buttonCommands(std::size_t tag) {
  return command("SET_TITLE_FOR_OBJECT_ID", "A & new title", tag) +
         command("SET_FOREGROUND_COLOR_FOR_OBJECT_ID", "red", tag) +
         (tag % 3 ? command("SET_BACKGROUND_COLOR_FOR_OBJECT_ID", "1", tag) : "") +
         command("SET_STATE_ON_FOR_OBJECT_ID", tag) + command("FLASH_ID", "YES", tag);
}

// A third of the widgets without a button in them is hidden, so that Qt lays out its form again.
std::string visibilityCommands(const QWidget& widget, std::size_t tag) {
  std::string commands = command("HIDE_OBJECT_WITH_ID", tag);
  if (tag % 3 || widget.findChild<QAbstractButton*>()) {
    commands += command("SHOW_OBJECT_WITH_ID", tag);
  }
  if (toolkit::qt::takesInput(widget)) {
    commands += command("DISABLE_OBJECT_WITH_ID", tag);
    if (tag % 2 || widget.findChild<QAbstractButton*>()) {
      commands += command("ENABLE_OBJECT_WITH_ID", tag);
    }
  }
  return commands;
}

std::string commandsFor(const QWidget& widget, std::size_t tag) {
  const std::string tip = command("SET_TOOL_TIP_FOR_ID", tipAtStart(tag), tag);
  if (qobject_cast<const QAbstractButton*>(&widget)) {
    return buttonCommands(tag) + command("ENABLE_OBJECT_WITH_ID", tag) +
           command("SHOW_OBJECT_WITH_ID", tag) + tip;
  }
  return (showsText(widget) ? textCommands(tag) : "") + visibilityCommands(widget, tag) + tip;
}

std::string listOfButton(std::size_t tag) {
  return std::to_string(tag) + " = (" + command("SET_TITLE_FOR_OBJECT_ID", "Pressed at last", tag) +
         command("SET_STATE_OFF_FOR_OBJECT_ID", tag) +
         command("SET_TOOL_TIP_FOR_ID", tipWhenPressed(tag), tag) +
         (tag % 2 ? "DISABLE_OBJECT_WITH_ID" : "HIDE_OBJECT_WITH_ID") + ");\n";
}

}  // namespace

std::string tipAtStart(std::size_t tag) { return "tip " + std::to_string(tag); }
std::string tipWhenPressed(std::size_t tag) { return "pressed " + std::to_string(tag); }

std::string scriptFor(const std::vector<QWidget*>& widgets) {
  std::string first;
  std::string others;
  for (std::size_t i = 0; i < widgets.size(); ++i) {
    first += commandsFor(*widgets[i], i + 1) + "\n";
    if (qobject_cast<QAbstractButton*>(widgets[i])) others += listOfButton(i + 1);
  }
  return "{ 0 = (" + first + "(ALLOW_FLASHING, YES));\n" + others + "}\n";
}

}  // namespace qz::foreign_forms
