// SPDX-License-Identifier: MIT
// Files for the tests of what the player reads, in a directory of their own.
#pragma once

#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <string>
#include <string_view>

namespace tools::play {

/// A directory that is the working directory for as long as this lives, and is gone afterwards.
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

}  // namespace tools::play
