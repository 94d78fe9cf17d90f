// SPDX-License-Identifier: MIT
// Pictures of widgets, and their pixels, for tests of the Qt toolkit.
#pragma once

#include <QColor>
#include <QImage>
#include <QPainter>
#include <QWidget>
#include <algorithm>
#include <functional>

namespace qz::rendering {

/// Returns a picture of `widget` on white, at `ratio` pixels a point.
inline QImage pictureOf(QWidget& widget, double ratio = 1) {
  QImage picture(widget.size() * ratio, QImage::Format_RGB32);
  picture.setDevicePixelRatio(ratio);
  picture.fill(Qt::white);
  widget.render(&picture);
  return picture;
}

/// Counts the pixels of `area`, which is in pixels, for which `wanted` is true.
inline int countPixels(const QImage& picture, const QRect& area,
                       const std::function<bool(const QColor&)>& wanted) {
  int count = 0;
  for (int y = area.top(); y <= area.bottom(); ++y) {
    for (int x = area.left(); x <= area.right(); ++x) {
      if (wanted(picture.pixelColor(x, y))) ++count;
    }
  }
  return count;
}

inline int countPixels(const QImage& picture, const std::function<bool(const QColor&)>& wanted) {
  return countPixels(picture, QRect(QPoint(), picture.size()), wanted);
}

inline bool isReddish(const QColor& color) {
  return color.red() > color.green() + 60 && color.red() > color.blue() + 60;
}

inline bool isDark(const QColor& color) { return color.lightness() < 100; }

/// Returns the smallest rectangle around the pixels for which `wanted` is true, or an empty one.
inline QRect boundsOf(const QImage& picture, const std::function<bool(const QColor&)>& wanted) {
  QRect bounds;
  for (int y = 0; y < picture.height(); ++y) {
    for (int x = 0; x < picture.width(); ++x) {
      if (wanted(picture.pixelColor(x, y))) bounds |= QRect(x, y, 1, 1);
    }
  }
  return bounds;
}

}  // namespace qz::rendering
