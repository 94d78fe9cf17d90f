// SPDX-License-Identifier: MIT
// The files of a generated source.
#pragma once

#include <filesystem>
#include <fstream>
#include <string>

#include "tests/steps/source_generator.hpp"

namespace qz::meaning {

/// A directory for one source, which is gone afterwards.
class GeneratedFolder {
 public:
  explicit GeneratedFolder(const Generated& generated) {
    std::string name = (std::filesystem::temp_directory_path() / "qz-source-XXXXXX").string();
    path_ = ::mkdtemp(name.data());
    write("tour.yaml", generated.yaml);
    write("host.plist", generated.window);
    for (const char* picture : pictures) write(std::string(picture) + ".png", "");
  }
  ~GeneratedFolder() { std::filesystem::remove_all(path_); }
  GeneratedFolder(const GeneratedFolder&) = delete;
  GeneratedFolder& operator=(const GeneratedFolder&) = delete;

  std::string source() const { return (path_ / "tour.yaml").string(); }
  std::string path() const { return path_.string(); }

 private:
  void write(const std::string& name, const std::string& text) const {
    std::ofstream(path_ / name) << text;
  }

  std::filesystem::path path_;
};

}  // namespace qz::meaning
