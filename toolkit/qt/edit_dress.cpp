// SPDX-License-Identifier: MIT
// Turns the attributes that a whole text shares into properties of the widget.

#include "toolkit/qt/edit_dress.hpp"

#include <QLineEdit>
#include <QPlainTextEdit>
#include <QTextOption>
#include <utility>

#include "toolkit/qt/fonts.hpp"
#include "toolkit/qt/rich_text_parts.hpp"

namespace qz::toolkit::qt {

namespace {

/// Aligns justified text to the leading edge: a line edit would put it to the left even in
/// right-to-left text.
Qt::Alignment inOneLine(Qt::Alignment alignment) {
  return alignment & Qt::AlignJustify ? Qt::AlignLeading : alignment;
}

void align(QPlainTextEdit& edit, Qt::Alignment alignment) {
  QTextOption option = edit.document()->defaultTextOption();
  option.setAlignment(alignment);
  edit.document()->setDefaultTextOption(option);
}

}  // namespace

void EditDress::putOn(QLineEdit& edit, const AttributedString& text, const TextSetting& setting) {
  const TextAttributes common = commonAttributes(text);
  if (common.font) {
    font_ = edit.testAttribute(Qt::WA_SetFont) ? edit.font() : QFont();
    edit.setFont(qFont(*common.font));
  }
  if (common.foregroundColor) colors_.emplace(edit, QPalette::Text, *common.foregroundColor);
  if (common.paragraphStyle) {
    alignment_ = edit.alignment();
    edit.setAlignment(inOneLine(blockSettingOf(common, setting).alignment) |
                      (*alignment_ & Qt::AlignVertical_Mask));
  }
}

void EditDress::putOn(QPlainTextEdit& edit, const AttributedString& text,
                      const TextSetting& setting) {
  const TextAttributes common = commonAttributes(text);
  if (!common.paragraphStyle) return;
  alignment_ = edit.document()->defaultTextOption().alignment();
  align(edit, blockSettingOf(common, setting).alignment);
}

void EditDress::takeOff(QLineEdit& edit) {
  if (const auto font = std::exchange(font_, {})) edit.setFont(*font);
  if (colors_) colors_->restore();
  colors_.reset();
  if (const auto alignment = std::exchange(alignment_, {})) edit.setAlignment(*alignment);
}

void EditDress::takeOff(QPlainTextEdit& edit) {
  if (const auto alignment = std::exchange(alignment_, {})) align(edit, *alignment);
}

}  // namespace qz::toolkit::qt
