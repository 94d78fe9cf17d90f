// The memory toolkit's files: those of the file system, with a resource directory that the host
// chooses.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "toolkit/files.hpp"

namespace toolkit::memory {

class MemoryFiles final : public Files {
 public:
  /// The resource directory is the working directory, as it was then, until another is set.
  MemoryFiles() { setResourcePath("."); }

  std::string resourcePath() const override { return resourcePath_; }
  /// A relative path is taken from the working directory.
  void setResourcePath(std::string_view path);

  bool fileExistsAtPath(std::string_view path) const override;
  /// Regular files only: what a device or a pipe would give is not known beforehand, nor its end.
  std::optional<std::string> contentsAtPath(std::string_view path) const override;

 private:
  std::string resourcePath_;
};

/// Whether a regular file, or a link to one, is at `path`.
bool isRegularFile(std::string_view path);

}  // namespace toolkit::memory
