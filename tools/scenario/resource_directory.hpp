// SPDX-License-Identifier: MIT
// The resource directory of one scenario: a fresh one in the system's directory for temporary
// files, which is removed with everything in it when the scenario ends, however it ends.
#pragma once

#include <filesystem>
#include <string>
#include <string_view>

namespace tools::scenario {

class ResourceDirectory {
 public:
  /// Throws a Failure when the directory cannot be made.
  ResourceDirectory();
  ~ResourceDirectory();
  ResourceDirectory(const ResourceDirectory&) = delete;
  ResourceDirectory& operator=(const ResourceDirectory&) = delete;

  /// Absolute, without a slash at its end.
  std::string path() const;
  /// Absolute; nothing is there.
  std::string missingPath() const;

  /// Writes a file; `name` may begin with directories, and does not lead out of this one. Throws
  /// an Unmet when the file cannot be written.
  void write(const std::string& name, std::string_view contents) const;
  /// Writes a PNG image of 16 × 16 pixels.
  void writeImage(const std::string& name) const;

 private:
  std::filesystem::path root_;  // holds the directory, and nothing else
};

}  // namespace tools::scenario
