// SPDX-License-Identifier: MIT
// How edits that support only one style show text with attributes.
#pragma once

#include <QFont>
#include <optional>

#include "toolkit/qt/rich_text.hpp"
#include "toolkit/qt/widget_colors.hpp"

class QLineEdit;
class QPlainTextEdit;

namespace qz::toolkit::qt {

/// Gives an edit the attributes that its whole text shares: font, colour and alignment for a line
/// edit, alignment for a plain text edit. `takeOff` restores the edit's own.
class EditDress {
 public:
  void putOn(QLineEdit& edit, const AttributedString& text, const TextSetting& setting);
  void putOn(QPlainTextEdit& edit, const AttributedString& text, const TextSetting& setting);
  void takeOff(QLineEdit& edit);
  void takeOff(QPlainTextEdit& edit);

 private:
  std::optional<QFont> font_;  // the edit's own; default-constructed if it had none
  std::optional<WidgetColors> colors_;
  std::optional<Qt::Alignment> alignment_;
};

}  // namespace qz::toolkit::qt
