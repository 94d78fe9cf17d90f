// SPDX-License-Identifier: MIT
// Draws the user's attention to a part of a window.
#pragma once

#include <QVariantAnimation>
#include <QWidget>

namespace qz::hosts::qt {

/// Lies over a window, dims it except for one rectangle, and frames that. The user's clicks go
/// through it. The window's layout does not know it.
class Spotlight final : public QWidget {
 public:
  Spotlight(QWidget& window, bool frames, bool dims);

  /// Returns the rectangle to light for a control whose visible part is `control`, so that the
  /// frame surrounds it and is inside the window. Empty if `control` is empty.
  static QRect around(const QRect& control, const QRect& window);
  /// Lights the rectangle, in the window's coordinates; dims all if it is empty. The light glides
  /// there if that is wanted, unless the user prefers reduced motion.
  void light(const QRect& rect, bool glides);
  /// Returns the rectangle that is lit or to which the light glides.
  const QRect& lit() const { return lit_; }

 protected:
  void paintEvent(QPaintEvent* event) override;

 private:
  void dim(QPainter& painter) const;
  void drawFrame(QPainter& painter) const;

  const bool frames_;
  const bool dims_;
  QRect lit_;
  QRectF now_;  // on its way to `lit_`
  QVariantAnimation glide_;
};

/// Returns the colour of lines that belong to the guide: the palette's highlight, unless it is hard
/// to tell from the ground.
QColor guideLineColor(const QPalette& palette);

}  // namespace qz::hosts::qt
