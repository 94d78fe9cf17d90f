// SPDX-License-Identifier: MIT
// A colour for the text of a widget that draws its text in one colour.
#pragma once

#include <QColor>
#include <QPalette>

#include "toolkit/styled_text/color.hpp"

class QWidget;

namespace toolkit::qt {

/// Has `widget` draw its text in a colour, half as strong where it is disabled, until `restore`
/// gives it back what it had. Not at the end: that may be within the widget's own.
class WidgetColors {
 public:
  WidgetColors(QWidget& widget, QPalette::ColorRole text, const Color& color);
  void restore();

 private:
  QWidget& widget_;
  QPalette before_;
  bool hadOwn_;
};

}  // namespace toolkit::qt
