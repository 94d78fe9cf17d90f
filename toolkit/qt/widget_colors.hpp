// SPDX-License-Identifier: MIT
// A colour for the text of a widget that draws its text in one colour.
#pragma once

#include <QColor>
#include <QPalette>

#include "qz/styled_text/color.hpp"

class QWidget;

namespace qz::toolkit::qt {

/// Makes `widget` draw its text in a colour, half as strong if disabled, until `restore` puts its
/// former colours back. The destructor does not restore: it may run during the widget's own.
class WidgetColors {
 public:
  WidgetColors(QWidget& widget, QPalette::ColorRole text, const Color& color);
  void restore();

 private:
  QWidget& widget_;
  QPalette before_;
  bool hadOwn_;
};

}  // namespace qz::toolkit::qt
