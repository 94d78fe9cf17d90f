// SPDX-License-Identifier: MIT
// Files of the operating system, for toolkits whose platform has no other file access.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "qz/api.hpp"
#include "qz/toolkit/files.hpp"

namespace qz::toolkit {

/// Reads files of the operating system.
class QZ_API SystemFiles final : public Files {
 public:
  /// Starts with the working directory as the resource directory.
  SystemFiles() { setResourcePath(""); }

  std::string resourcePath() const override { return resourcePath_; }
  /// Sets the resource directory. A relative or empty path is resolved against the current working
  /// directory, once.
  void setResourcePath(std::string_view path);

  bool fileExistsAtPath(std::string_view path) const override;
  /// Reads regular files only: a device or a pipe may never end.
  std::optional<std::string> contentsAtPath(std::string_view path) const override;

 private:
  std::string resourcePath_;
};

/// Whether a regular file, or a link to one, is at `path`.
QZ_API bool isRegularFile(std::string_view path);

}  // namespace qz::toolkit
