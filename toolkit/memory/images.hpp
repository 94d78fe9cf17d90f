// SPDX-License-Identifier: MIT
// The memory toolkit's images: named files in the resource directory. The toolkit draws nothing, so
// an image consists of its name and the path of its file.
#pragma once

#include <map>
#include <string>
#include <string_view>
#include <utility>

#include "qz/toolkit/files.hpp"
#include "qz/toolkit/image.hpp"

namespace qz::toolkit::memory {

class MemoryImage final : public Image {
 public:
  MemoryImage(std::string_view name, std::string path) : name_(name), path_(std::move(path)) {}
  std::string name() const override { return name_; }
  /// The path of the file at the time of the look-up.
  const std::string& path() const { return path_; }

 private:
  std::string name_;
  std::string path_;
};

class MemoryImages final : public Images {
 public:
  /// `files` provides the resource directory.
  explicit MemoryImages(const Files& files) : files_(files) {}

  /// Returns the same image each time the same name leads to the same file.
  Ref<Image> imageNamed(std::string_view name) override;

 private:
  const Files& files_;  // owned by the toolkit, like this object
  std::map<std::string, std::shared_ptr<MemoryImage>, std::less<>> found_;
};

}  // namespace qz::toolkit::memory
