// SPDX-License-Identifier: MIT
// The AppKit toolkit's images: files of the resource directory, and what `NSImage` finds by name.
#pragma once

#import <AppKit/AppKit.h>

#include <map>
#include <string>
#include <string_view>

#include "qz/toolkit/files.hpp"
#include "qz/toolkit/image.hpp"
#import "toolkit/foundation/kept.hpp"

namespace qz::toolkit::appkit {

class AppKitImage final : public Image {
 public:
  /// `path` is that of its file; empty if AppKit found the image.
  AppKitImage(std::string name, std::string path, NSImage* image);
  /// Returns the object of `image`; nil if it is absent or another toolkit's.
  static NSImage* objectOf(const Ref<Image>& image);

  std::string name() const override { return name_; }
  NSImage* object() const { return object_.get(); }
  /// Whether the image was read from the file at `path` and the file has not changed since.
  bool isOf(const std::string& path) const;

 private:
  std::string name_;
  std::string path_;
  foundation::Kept<NSDate*> written_;  // when the file was changed last
  foundation::Kept<NSImage*> object_;
};

class AppKitImages final : public Images {
 public:
  /// `files` gives the resource directory.
  explicit AppKitImages(const Files& files) : files_(files) {}

  /// Returns the same image whenever the name leads to the same file. Absent for a file that AppKit
  /// cannot read. A name without a file can be one that `NSImage` knows.
  Ref<Image> imageNamed(std::string_view name) override;

 private:
  const Files& files_;  // owned by the toolkit, as this is
  std::map<std::string, std::shared_ptr<AppKitImage>, std::less<>> found_;
};

}  // namespace qz::toolkit::appkit
