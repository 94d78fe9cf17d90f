// SPDX-License-Identifier: MIT
// Looks up and draws images. Asks the file system every time, so that a look-up is never older than
// the directory; caches only the contents of files.

#include "toolkit/qt/images.hpp"

#include <QImageReader>
#include <QPaintDevice>
#include <QPainter>
#include <filesystem>

#include "qz/toolkit/qt/files.hpp"
#include "toolkit/backend/image_names.hpp"
#include "toolkit/qt/strings.hpp"

namespace qz::toolkit::qt {

namespace {

QImage readImage(const std::string& path) {
  QImageReader reader(qString(path));
  reader.setDecideFormatFromContent(true);  // a suffix may be wrong
  reader.setAutoTransform(true);            // photographs store their orientation
  const QImage image = reader.read();
  // The format that Qt draws fastest.
  return image.hasAlphaChannel() ? image.convertToFormat(QImage::Format_ARGB32_Premultiplied)
                                 : image;
}

std::filesystem::file_time_type timeOf(const std::string& path) {
  std::error_code error;
  return std::filesystem::last_write_time(path, error);
}

std::string twofoldPath(const std::string& path) {
  std::filesystem::path file(path);
  file.replace_filename(file.stem().string() + "@2x" + file.extension().string());
  return file.string();
}

}  // namespace

QtImage::QtImage(std::string_view name, std::string path)
    : name_(name), path_(std::move(path)), written_(timeOf(path_)), plain_(readImage(path_)) {
  plain_.setDevicePixelRatio(1);
  pixmap_ = QPixmap::fromImage(plain_);
  twofold_ = readImage(twofoldPath(path_));
  if (!twofold_.isNull()) twofold_.setDevicePixelRatio(2);
}

bool QtImage::isOf(const std::string& path) const {
  return path_ == path && written_ == timeOf(path);
}

QSizeF QtImage::size() const { return plain_.deviceIndependentSize(); }

const QImage& QtImage::pixels(double ratio) const {
  return ratio > 1 && !twofold_.isNull() ? twofold_ : plain_;
}

Ref<Image> QtImages::imageNamed(std::string_view name) {
  const auto known = found_.find(name);
  const auto path = imageFileNamed(name, files_.resourcePath(), isFileOrResource);
  if (known != found_.end() && path && known->second->isOf(*path)) return known->second;
  if (known != found_.end()) found_.erase(known);
  if (!path) return {};
  const auto image = std::make_shared<QtImage>(name, *path);
  if (image->size().isEmpty()) return {};
  found_.emplace(name, image);
  return image;
}

void drawImage(QPainter& painter, const QRect& place, const QtImage& image) {
  // The painter's ratio, not the device's: a widget drawn into a picture uses the picture's ratio.
  const double ratio = painter.deviceTransform().m11();
  const QSize pixels = place.size() * ratio;
  // Scaled here, because the painter averages only four pixels however much it shrinks.
  QImage scaled = image.pixels(ratio);
  if (scaled.size() != pixels) {
    scaled = scaled.scaled(pixels, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
  }
  scaled.setDevicePixelRatio(ratio);
  painter.drawImage(place.topLeft(), scaled);
}

}  // namespace qz::toolkit::qt
