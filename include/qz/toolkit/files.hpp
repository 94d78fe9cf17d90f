// SPDX-License-Identifier: MIT
// Files: the resource directory and reading.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "qz/api.hpp"

namespace qz::toolkit {

/// Reads files, and knows the resource directory.
class QZ_API Files {
 public:
  virtual ~Files() = default;

  /// Returns the absolute path, without a slash at its end, of the resource directory: relative
  /// script names start there, and named images are looked up there (the main bundle's resources).
  virtual std::string resourcePath() const = 0;

  /// Whether a file or directory exists at `path`.
  virtual bool fileExistsAtPath(std::string_view path) const = 0;

  /// Returns the bytes of the file at `path`; absent if it cannot be read or is a directory.
  virtual std::optional<std::string> contentsAtPath(std::string_view path) const = 0;
};

}  // namespace qz::toolkit
