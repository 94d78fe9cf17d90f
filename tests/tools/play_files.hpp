// SPDX-License-Identifier: MIT
// A temporary working directory for the tests of files that the player reads.
#pragma once

#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <string>
#include <string_view>

namespace qz::tools::play {

/// Makes a temporary directory the working directory; the destructor undoes both.
class WorkingDirectory {
 public:
  WorkingDirectory() : before_(std::filesystem::current_path()) {
    std::string name = (std::filesystem::temp_directory_path() / "play-test-XXXXXX").string();
    path_ = ::mkdtemp(name.data());
    std::filesystem::current_path(path_);
  }
  ~WorkingDirectory() {
    std::filesystem::current_path(before_);
    std::filesystem::remove_all(path_);
  }
  WorkingDirectory(const WorkingDirectory&) = delete;
  WorkingDirectory& operator=(const WorkingDirectory&) = delete;

  std::string path() const { return path_.string(); }
  void write(const std::string& name, std::string_view text) const {
    std::ofstream(path_ / name, std::ios::binary) << text;
  }

 private:
  std::filesystem::path before_;
  std::filesystem::path path_;
};

}  // namespace qz::tools::play
