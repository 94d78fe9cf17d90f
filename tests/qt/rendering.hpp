// SPDX-License-Identifier: MIT
// Looking at what widgets draw, for tests of the Qt toolkit.
#pragma once

#include <QColor>
#include <QImage>
#include <QPainter>
#include <QWidget>
#include <algorithm>
#include <functional>

namespace rendering {

/// What `widget` draws, at so many pixels a point, on white.
inline QImage pictureOf(QWidget& widget, double ratio = 1) {
  QImage picture(widget.size() * ratio, QImage::Format_RGB32);
  picture.setDevicePixelRatio(ratio);
  picture.fill(Qt::white);
  widget.render(&picture);
  return picture;
}

/// How many pixels of `area`, in pixels, are as `wanted` says.
inline int countPixels(const QImage& picture, const QRect& area,
                       const std::function<bool(const QColor&)>& wanted) {
  int count = 0;
  for (int y = area.top(); y <= area.bottom(); ++y)
    for (int x = area.left(); x <= area.right(); ++x)
      if (wanted(picture.pixelColor(x, y))) ++count;
  return count;
}

inline int countPixels(const QImage& picture, const std::function<bool(const QColor&)>& wanted) {
  return countPixels(picture, QRect(QPoint(), picture.size()), wanted);
}

inline bool isReddish(const QColor& color) {
  return color.red() > color.green() + 60 && color.red() > color.blue() + 60;
}

inline bool isDark(const QColor& color) { return color.lightness() < 100; }

/// The smallest rectangle around the pixels that are as `wanted` says; empty where there are none.
inline QRect boundsOf(const QImage& picture, const std::function<bool(const QColor&)>& wanted) {
  QRect bounds;
  for (int y = 0; y < picture.height(); ++y)
    for (int x = 0; x < picture.width(); ++x)
      if (wanted(picture.pixelColor(x, y))) bounds |= QRect(x, y, 1, 1);
  return bounds;
}

}  // namespace rendering
