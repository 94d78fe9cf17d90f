// SPDX-License-Identifier: MIT
// Draws windows without a screen, the same on every machine.

#include <QApplication>
#include <QBuffer>
#include <QFontDatabase>
#include <QHash>
#include <QImage>
#include <QStyle>
#include <QWidget>
#include <algorithm>
#include <optional>

#include "drivers/qt/qt_driver.hpp"
#include "toolkit/qt/window.hpp"

namespace qz::drivers {

namespace {

constexpr int textHeight = 13;  // pixels, so that it does not depend on the screen's resolution
constexpr double leastDensity =
    2;  // below, widgets are drawn coarsely; pictures are scaled instead
constexpr int mostColors = 256;
constexpr int smallestFile = 0;  // the quality of PNG files is how fast they are written

/// Returns the same picture with a table of its colours; absent if it has too many.
std::optional<QImage> withColorTable(const QImage& picture) {
  QHash<QRgb, uchar> numbers;
  QList<QRgb> colors;
  QImage small(picture.size(), QImage::Format_Indexed8);
  for (int y = 0; y < picture.height(); ++y) {
    const auto* const from = reinterpret_cast<const QRgb*>(picture.constScanLine(y));
    uchar* const to = small.scanLine(y);
    for (int x = 0; x < picture.width(); ++x) {
      const auto known = numbers.constFind(from[x]);
      if (known != numbers.constEnd()) {
        to[x] = *known;
        continue;
      }
      if (colors.size() == mostColors) return std::nullopt;
      to[x] = static_cast<uchar>(colors.size());
      numbers.insert(from[x], to[x]);
      colors.append(from[x]);
    }
  }
  small.setColorTable(colors);
  return small;
}

std::string pngOf(const QImage& picture) {
  QByteArray bytes;
  QBuffer buffer(&bytes);
  withColorTable(picture).value_or(picture).save(&buffer, "PNG", smallestFile);
  return bytes.toStdString();
}

/// Returns the family of the first font that can be read; empty if none can.
QString familyOf(std::span<const std::string_view> fonts) {
  QString family;
  for (const std::string_view font : fonts) {
    const int id = QFontDatabase::addApplicationFontFromData(
        QByteArray(font.data(), static_cast<qsizetype>(font.size())));
    const auto families = QFontDatabase::applicationFontFamilies(id);
    if (family.isEmpty() && !families.isEmpty()) family = families.first();
  }
  return family;
}

}  // namespace

void QtDriver::drawAlike(std::span<const std::string_view> fonts) {
  workOffScreen();
  QApplication::setStyle("Fusion");
  QApplication::setPalette(QApplication::style()->standardPalette());
  const QString family = familyOf(fonts);
  QFont font = family.isEmpty() ? QApplication::font() : QFont(family);
  font.setPixelSize(textHeight);
  QApplication::setFont(font);
}

std::string QtDriver::drawPicture(const Ref<Window>& window, double density) {
  settleWithoutFiring();
  const auto shown = QtWindow::of(window);
  if (!shown || !shown->widget() || !shown->widget()->isVisible()) return {};
  QWidget& widget = *shown->widget();
  const double drawn = std::max(density, leastDensity);
  QImage picture((QSizeF(widget.size()) * drawn).toSize(), QImage::Format_RGB32);
  picture.setDevicePixelRatio(drawn);
  picture.fill(Qt::white);
  widget.render(&picture);
  if (density == drawn) return pngOf(picture);
  return pngOf(picture.scaled((QSizeF(widget.size()) * density).toSize(), Qt::IgnoreAspectRatio,
                              Qt::SmoothTransformation));
}

}  // namespace qz::drivers
