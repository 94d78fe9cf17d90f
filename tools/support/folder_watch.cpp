// SPDX-License-Identifier: MIT
// Waits for changes of the files in folders.
#include "tools/support/folder_watch.hpp"

#include <filesystem>
#include <map>
#include <system_error>
#include <utility>

namespace qz::tools {
namespace {

namespace fs = std::filesystem;

/// When each file was written last, and its size: two changes can have one time.
using Contents = std::map<fs::path, std::pair<fs::file_time_type, std::uintmax_t>>;

fs::path normal(const fs::path& path) { return fs::absolute(path).lexically_normal(); }

Contents contentsOf(const std::set<std::string>& folders, const std::set<fs::path>& outputs) {
  Contents contents;
  std::error_code error;  // a file may go while this looks
  for (const std::string& folder : folders) {
    for (const auto& entry : fs::directory_iterator(folder, error)) {
      if (!entry.is_regular_file(error) || outputs.contains(normal(entry.path()))) continue;
      contents[entry.path()] = {entry.last_write_time(error), entry.file_size(error)};
    }
  }
  return contents;
}

}  // namespace

void watchFolders(std::set<std::string> folders, const std::set<std::string>& outputs,
                  const std::function<std::set<std::string>()>& act,
                  const std::function<bool()>& rest) {
  std::set<fs::path> own;
  for (const std::string& output : outputs) own.insert(normal(output));
  for (;;) {
    const Contents before = contentsOf(folders, own);
    const auto next = act();
    if (next.empty()) return;
    // In folders that were not watched, files may have changed since `act` has read them.
    const bool isKnown = std::exchange(folders, next) == next;
    while (isKnown && contentsOf(folders, own) == before) {
      if (!rest()) return;
    }
  }
}

}  // namespace qz::tools
