// SPDX-License-Identifier: MIT
// The Qt toolkit's files: those of the system, and the resources that are compiled into a program.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "qz/api.hpp"
#include "qz/toolkit/files.hpp"
#include "qz/toolkit/system_files.hpp"

namespace qz::toolkit::qt {

/// A path that begins with ":/" is that of a resource; any other path is one of the system.
class QZ_API QtFiles final : public Files {
 public:
  std::string resourcePath() const override;
  /// Sets the resource directory: ":/tour", for example, or a directory of the system, as
  /// `SystemFiles` does.
  void setResourcePath(std::string_view path);

  bool fileExistsAtPath(std::string_view path) const override;
  std::optional<std::string> contentsAtPath(std::string_view path) const override;

 private:
  SystemFiles system_;
  std::string resources_;  // the directory of resources; empty if it is one of the system
};

/// Whether a regular file or a resource is at `path`.
bool isFileOrResource(std::string_view path);

}  // namespace qz::toolkit::qt
