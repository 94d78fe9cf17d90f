// SPDX-License-Identifier: MIT
// The AppKit toolkit's files: the main bundle's resources, and what `NSFileManager` finds.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "qz/api.hpp"
#include "qz/toolkit/files.hpp"

namespace qz::toolkit::appkit {

/// The main bundle's files.
class QZ_API AppKitFiles final : public Files {
 public:
  /// The resource directory of the main bundle, unless another was set.
  std::string resourcePath() const override;
  /// Sets another resource directory. A relative or empty path is resolved against the current
  /// working directory, once.
  void setResourcePath(std::string_view path);

  bool fileExistsAtPath(std::string_view path) const override;
  /// Reads regular files only: a device or a pipe may never end.
  std::optional<std::string> contentsAtPath(std::string_view path) const override;

 private:
  std::optional<std::string> resourcePath_;
};

}  // namespace qz::toolkit::appkit
