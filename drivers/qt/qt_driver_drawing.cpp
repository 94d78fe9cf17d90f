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
#include <map>
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
      if (x > 0 && from[x] == from[x - 1]) {
        to[x] = to[x - 1];
        continue;
      }
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

/// Returns a grey picture with 16 shades, which are enough for texts and make half the file.
QImage withFewShades(QImage picture) {
  constexpr int step = 17;  // from one shade to the next
  for (int y = 0; y < picture.height(); ++y) {
    auto* const row = reinterpret_cast<QRgb*>(picture.scanLine(y));
    for (int x = 0; x < picture.width(); ++x) {
      const int shade = (qRed(row[x]) + step / 2) / step * step;
      row[x] = qRgb(shade, shade, shade);
    }
  }
  return picture;
}

/// Returns the opaque picture in the form that makes the smallest file.
QImage smallFormOf(const QImage& picture) {
  if (picture.allGray()) return *withColorTable(withFewShades(picture));
  const QImage opaque = picture.convertToFormat(QImage::Format_RGB888);
  return withColorTable(picture).value_or(opaque);
}

Pixels pixelsOf(const QImage& picture) {
  Pixels pixels{.width = picture.width(), .height = picture.height()};
  const QImage image = picture.convertToFormat(QImage::Format_ARGB32);
  for (int y = 0; y < image.height(); ++y) {
    const auto* const row = reinterpret_cast<const QRgb*>(image.constScanLine(y));
    pixels.argb.insert(pixels.argb.end(), row, row + image.width());
  }
  return pixels;
}

/// Returns Qt's number of a font, -1 if it cannot be read. Adds each font once: with two of the
/// same name Qt may draw some texts with the other one, whose shades differ.
int idOf(std::string_view font) {
  static std::map<const char*, int> ids;
  const auto [known, isNew] = ids.try_emplace(font.data(), -1);
  if (isNew) {
    known->second = QFontDatabase::addApplicationFontFromData(
        QByteArray(font.data(), static_cast<qsizetype>(font.size())));
  }
  return known->second;
}

/// Returns the family of the first font that can be read; empty if none can.
QString familyOf(std::span<const std::string_view> fonts) {
  QString family;
  for (const std::string_view font : fonts) {
    const auto families = QFontDatabase::applicationFontFamilies(idOf(font));
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

Pixels QtDriver::draw(const Ref<Window>& window, double density) {
  settleWithoutFiring();
  const auto shown = QtWindow::of(window);
  if (!shown || !shown->widget() || !shown->widget()->isVisible()) return {};
  QWidget& widget = *shown->widget();
  const double drawn = std::max(density, leastDensity);
  QImage picture((QSizeF(widget.size()) * drawn).toSize(), QImage::Format_RGB32);
  picture.setDevicePixelRatio(drawn);
  picture.fill(Qt::white);
  widget.render(&picture);
  if (density == drawn) return pixelsOf(picture);
  return pixelsOf(picture.scaled((QSizeF(widget.size()) * density).toSize(), Qt::IgnoreAspectRatio,
                                 Qt::SmoothTransformation));
}

std::string QtDriver::pngOf(const Pixels& pixels) {
  const QImage picture(reinterpret_cast<const uchar*>(pixels.argb.data()), pixels.width,
                       pixels.height, QImage::Format_ARGB32);
  QByteArray bytes;
  QBuffer buffer(&bytes);
  smallFormOf(picture).save(&buffer, "PNG", smallestFile);
  return bytes.toStdString();
}

}  // namespace qz::drivers
