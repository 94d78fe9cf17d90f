// SPDX-License-Identifier: MIT
// Files: the resource directory, and reading.
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace toolkit {

class Files {
 public:
  virtual ~Files() = default;

  /// Absolute path, without a slash at its end, of the directory against which relative script
  /// names are resolved and in which named images are looked up (the main bundle's resources).
  virtual std::string resourcePath() const = 0;

  /// Whether a file or directory exists at `path`.
  virtual bool fileExistsAtPath(std::string_view path) const = 0;

  /// The bytes of the file at `path`; absent when it cannot be read (a directory cannot).
  virtual std::optional<std::string> contentsAtPath(std::string_view path) const = 0;
};

}  // namespace toolkit
