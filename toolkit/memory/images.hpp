// SPDX-License-Identifier: MIT
// The memory toolkit's images: named files of the resource directory. It draws nothing, so that an
// image is its name and the place of its file.
#pragma once

#include <map>
#include <string>
#include <string_view>
#include <utility>

#include "toolkit/files.hpp"
#include "toolkit/image.hpp"

namespace toolkit::memory {

class MemoryImage final : public Image {
 public:
  MemoryImage(std::string_view name, std::string path) : name_(name), path_(std::move(path)) {}
  std::string name() const override { return name_; }
  /// Where the file was when it was found.
  const std::string& path() const { return path_; }

 private:
  std::string name_;
  std::string path_;
};

class MemoryImages final : public Images {
 public:
  /// `files` says where the resource directory is.
  explicit MemoryImages(const Files& files) : files_(files) {}

  /// The same image whenever the same name leads to the same file.
  Ref<Image> imageNamed(std::string_view name) override;

 private:
  const Files& files_;  // the toolkit's, as this is
  std::map<std::string, std::shared_ptr<MemoryImage>, std::less<>> found_;
};

}  // namespace toolkit::memory
