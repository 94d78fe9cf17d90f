// SPDX-License-Identifier: MIT
// Files as the operating system has them, for toolkits that have nothing of their own.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "toolkit/files.hpp"

namespace toolkit {

class SystemFiles final : public Files {
 public:
  /// The resource directory is the working directory until another is set.
  SystemFiles() { setResourcePath(""); }

  std::string resourcePath() const override { return resourcePath_; }
  /// A relative path, and an empty one, starts at the working directory of this moment.
  void setResourcePath(std::string_view path);

  bool fileExistsAtPath(std::string_view path) const override;
  /// Regular files only: what a device or a pipe would give is not known beforehand, nor its end.
  std::optional<std::string> contentsAtPath(std::string_view path) const override;

 private:
  std::string resourcePath_;
};

/// Whether a regular file, or a link to one, is at `path`.
bool isRegularFile(std::string_view path);

}  // namespace toolkit
