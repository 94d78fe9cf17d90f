// SPDX-License-Identifier: MIT
// The resource directory of one scenario: a new one in the system's directory for temporary files.
// It is removed with everything in it when the scenario ends, passed or failed.
#pragma once

#include <filesystem>
#include <string>
#include <string_view>

namespace qz::tools::scenario {

class ResourceDirectory {
 public:
  /// Throws a Failure if the directory cannot be made.
  ResourceDirectory();
  ~ResourceDirectory();
  ResourceDirectory(const ResourceDirectory&) = delete;
  ResourceDirectory& operator=(const ResourceDirectory&) = delete;

  /// Returns the absolute path, without a slash at its end.
  std::string path() const;
  /// Returns an absolute path where nothing exists.
  std::string missingPath() const;

  /// Writes a file. `name` may begin with directories, and must not lead out of this one. Throws an
  /// Unmet if the file cannot be written.
  void write(const std::string& name, std::string_view contents) const;
  /// Writes a PNG image of 16 × 16 pixels.
  void writeImage(const std::string& name) const;

 private:
  std::filesystem::path root_;  // holds the directory, and nothing else
};

}  // namespace qz::tools::scenario
