// SPDX-License-Identifier: MIT
// Colours text through the widget's palette.

#include "toolkit/qt/widget_colors.hpp"

#include <QWidget>

#include "toolkit/qt/contrast.hpp"
#include "toolkit/qt/strings.hpp"

namespace qz::toolkit::qt {

WidgetColors::WidgetColors(QWidget& widget, QPalette::ColorRole text, const Color& color)
    : widget_(widget), before_(widget.palette()), hadOwn_(widget.testAttribute(Qt::WA_SetPalette)) {
  const QColor ink = qColor(color);
  QPalette palette = before_;
  palette.setColor(QPalette::Active, text, ink);
  palette.setColor(QPalette::Inactive, text, ink);
  palette.setColor(QPalette::Disabled, text,
                   halfway(ink, before_.color(QPalette::Disabled, widget.backgroundRole())));
  widget.setPalette(palette);
}

void WidgetColors::restore() { widget_.setPalette(hadOwn_ ? before_ : QPalette()); }

}  // namespace qz::toolkit::qt
