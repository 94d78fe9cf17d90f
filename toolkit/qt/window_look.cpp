// SPDX-License-Identifier: MIT
// Sets a window's palette. Child widgets inherit every colour they do not set.

#include "toolkit/qt/window_look.hpp"

#include <QPalette>
#include <QWidget>

#include "toolkit/qt/contrast.hpp"
#include "toolkit/qt/strings.hpp"

namespace qz::toolkit::qt {

void setWindowColor(QWidget& window, const Color& color) {
  QPalette palette = window.palette();
  const QColor ground = qColor(color);
  palette.setColor(QPalette::Window, ground);
  for (const auto role : {QPalette::WindowText, QPalette::Link, QPalette::LinkVisited}) {
    const QColor text = readableOn(ground, palette.color(QPalette::Active, role));
    palette.setColor(role, text);
    palette.setColor(QPalette::Disabled, role, halfway(text, ground));
  }
  window.setPalette(palette);
}

Color windowColor(const QWidget& window) {
  return toolkitColor(window.palette().color(QPalette::Active, QPalette::Window));
}

}  // namespace qz::toolkit::qt
