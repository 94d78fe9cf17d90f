// SPDX-License-Identifier: MIT
// Paints over the window.

#include "hosts/qt/guide_spotlight.hpp"

#include <QPainter>
#include <QPainterPath>

#include "toolkit/qt/contrast.hpp"
#include "toolkit/qt/user_preferences.hpp"

namespace qz::hosts::qt {

namespace {

using toolkit::qt::prefersHighContrast;

constexpr int glideTime = 200;         // milliseconds
constexpr double corner = 4;           // radius in points
constexpr double visibleContrast = 3;  // that WCAG requires of graphics
constexpr QColor shade(0, 0, 0, 90);   // over what is dimmed

int lineWidth() { return prefersHighContrast() ? 5 : 3; }

}  // namespace

QColor guideLineColor(const QPalette& palette) {
  const QColor ground = palette.color(QPalette::Window);
  const QColor line = palette.color(QPalette::Highlight);
  return toolkit::qt::contrast(line, ground) >= visibleContrast
             ? line
             : palette.color(QPalette::WindowText);
}

Spotlight::Spotlight(QWidget& window, bool frames, bool dims)
    : QWidget(&window), frames_(frames), dims_(dims) {
  setAttribute(Qt::WA_TransparentForMouseEvents);
  setAttribute(Qt::WA_NoSystemBackground);
  setFocusPolicy(Qt::NoFocus);
  glide_.setDuration(glideTime);
  connect(&glide_, &QVariantAnimation::valueChanged, this, [this](const QVariant& value) {
    now_ = value.toRectF();
    update();
  });
}

QRect Spotlight::around(const QRect& control, const QRect& window) {
  if (control.isEmpty()) return {};
  const int margin = lineWidth() + 2;
  const int edge = lineWidth() - 1;
  return control.adjusted(-margin, -margin, margin, margin) &
         window.adjusted(edge, edge, -edge, -edge);
}

void Spotlight::light(const QRect& rect, bool glides) {
  setGeometry(parentWidget()->rect());
  if (rect == lit_) return;
  const bool jumps = !glides || now_.isEmpty() || rect.isEmpty() ||
                     toolkit::qt::prefersReducedMotion() || !isVisible();
  lit_ = rect;
  glide_.stop();
  if (jumps) {
    now_ = rect;
    return update();
  }
  glide_.setStartValue(now_);
  glide_.setEndValue(QRectF(rect));
  glide_.start();
}

void Spotlight::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  if (dims_ && !prefersHighContrast()) dim(painter);
  if (frames_ && !now_.isEmpty()) drawFrame(painter);
}

void Spotlight::dim(QPainter& painter) const {
  QPainterPath dimmed;  // what is inside both shapes is left out
  dimmed.addRect(rect());
  if (!now_.isEmpty()) dimmed.addRoundedRect(now_, corner, corner);
  painter.fillPath(dimmed, shade);
}

// The line has an edge in the colour of the ground, so that it is visible on what is dimmed too.
void Spotlight::drawFrame(QPainter& painter) const {
  for (const auto& [color, width] : {std::pair(palette().color(QPalette::Window), lineWidth() + 2),
                                     std::pair(guideLineColor(palette()), lineWidth())}) {
    painter.setPen(QPen(color, width));
    painter.drawRoundedRect(now_, corner, corner);
  }
}

}  // namespace qz::hosts::qt
