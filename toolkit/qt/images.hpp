// SPDX-License-Identifier: MIT
// The Qt toolkit's images: loads named files of the resource directory and draws them sharp.
#pragma once

#include <QImage>
#include <QPixmap>
#include <QSizeF>
#include <filesystem>
#include <map>
#include <string>
#include <string_view>

#include "qz/toolkit/files.hpp"
#include "qz/toolkit/image.hpp"

class QPainter;
class QRect;

namespace qz::toolkit::qt {

class QtImage final : public Image {
 public:
  /// Reads the file at `path` and, if there is one, the double-resolution file next to it
  /// ("disk@2x.png" next to "disk.png"). The size is empty if Qt cannot read the file.
  QtImage(std::string_view name, std::string path);

  std::string name() const override { return name_; }
  /// True if the image was read from the file at `path` and the file has not changed since.
  bool isOf(const std::string& path) const;
  /// Returns the width and height in points.
  QSizeF size() const;
  /// Returns the pixels to show at `ratio` pixels a point.
  const QImage& pixels(double ratio) const;
  /// Returns the pixels at one pixel a point, for widgets that show pixmaps themselves.
  const QPixmap& pixmap() const { return pixmap_; }

 private:
  std::string name_;
  std::string path_;
  std::filesystem::file_time_type written_;  // the file's modification time when it was read
  QImage plain_;
  QImage twofold_;  // double resolution; null if there is none
  QPixmap pixmap_;
};

class QtImages final : public Images {
 public:
  /// `files` gives the resource directory.
  explicit QtImages(const Files& files) : files_(files) {}

  /// Returns the same image whenever the name leads to the same file. Absent for a file that Qt
  /// cannot read.
  Ref<Image> imageNamed(std::string_view name) override;

 private:
  const Files& files_;  // owned by the toolkit, as this is
  std::map<std::string, std::shared_ptr<QtImage>, std::less<>> found_;
};

/// Draws all of `image` into `place`, and paints each device pixel once.
void drawImage(QPainter& painter, const QRect& place, const QtImage& image);

}  // namespace qz::toolkit::qt
