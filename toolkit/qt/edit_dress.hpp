// SPDX-License-Identifier: MIT
// What edits of one style show of a text with attributes.
#pragma once

#include <QFont>
#include <optional>

#include "toolkit/qt/rich_text.hpp"
#include "toolkit/qt/widget_colors.hpp"

class QLineEdit;
class QPlainTextEdit;

namespace toolkit::qt {

/// Gives an edit what all of its text has in common: a line edit the font, the colour and the
/// alignment, a plain text edit the alignment. What it had comes back by `takeOff`.
class EditDress {
 public:
  void putOn(QLineEdit& edit, const AttributedString& text, const TextSetting& setting);
  void putOn(QPlainTextEdit& edit, const AttributedString& text, const TextSetting& setting);
  void takeOff(QLineEdit& edit);
  void takeOff(QPlainTextEdit& edit);

 private:
  std::optional<QFont> font_;  // the edit's own; the default where it had none
  std::optional<WidgetColors> colors_;
  std::optional<Qt::Alignment> alignment_;
};

}  // namespace toolkit::qt
