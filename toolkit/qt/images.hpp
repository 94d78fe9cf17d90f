// SPDX-License-Identifier: MIT
// The Qt toolkit's images: named files of the resource directory, and drawing them sharp.
#pragma once

#include <QImage>
#include <QPixmap>
#include <QSizeF>
#include <filesystem>
#include <map>
#include <string>
#include <string_view>

#include "toolkit/files.hpp"
#include "toolkit/image.hpp"

class QPainter;
class QRect;

namespace toolkit::qt {

class QtImage final : public Image {
 public:
  /// Reads the file at `path`, and, where there is one, the file of twice the resolution beside it
  /// ("disk@2x.png" beside "disk.png"). Of no size when Qt cannot read it.
  QtImage(std::string_view name, std::string path);

  std::string name() const override { return name_; }
  /// Whether the file at `path` is the one that it was read from, as it was then.
  bool isOf(const std::string& path) const;
  /// Width and height in points.
  QSizeF size() const;
  /// The pixels to show at so many pixels a point.
  const QImage& pixels(double ratio) const;
  /// Those at one pixel a point, for widgets that have images of their own.
  const QPixmap& pixmap() const { return pixmap_; }

 private:
  std::string name_;
  std::string path_;
  std::filesystem::file_time_type written_;  // the file, when it was read
  QImage plain_;
  QImage twofold_;  // null when there is none
  QPixmap pixmap_;
};

class QtImages final : public Images {
 public:
  /// `files` says where the resource directory is.
  explicit QtImages(const Files& files) : files_(files) {}

  /// The same image whenever the same name leads to the same file. A file that Qt cannot read is no
  /// image.
  Ref<Image> imageNamed(std::string_view name) override;

 private:
  const Files& files_;  // the toolkit's, as this is
  std::map<std::string, std::shared_ptr<QtImage>, std::less<>> found_;
};

/// Draws all of `image` into `place`, each pixel of the device once.
void drawImage(QPainter& painter, const QRect& place, const QtImage& image);

}  // namespace toolkit::qt
