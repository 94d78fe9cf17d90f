// SPDX-License-Identifier: MIT
// Waits for changes of the files in a folder.
#include "tools/support/folder_watch.hpp"

#include <chrono>
#include <filesystem>
#include <map>
#include <system_error>
#include <thread>
#include <utility>

namespace qz::tools {
namespace {

namespace fs = std::filesystem;

constexpr auto pause = std::chrono::milliseconds(200);

/// When each file was written last, and its size: two changes can have one time.
using Contents = std::map<fs::path, std::pair<fs::file_time_type, std::uintmax_t>>;

Contents contentsOf(const fs::path& folder, const fs::path& output) {
  Contents contents;
  std::error_code error;  // a file may go while this looks
  for (const auto& entry : fs::directory_iterator(folder, error)) {
    if (!entry.is_regular_file(error) || entry.path().filename() == output.filename()) continue;
    contents[entry.path()] = {entry.last_write_time(error), entry.file_size(error)};
  }
  return contents;
}

}  // namespace

void watchFolder(const std::string& folder, const std::string& output,
                 const std::function<bool()>& act) {
  for (;;) {
    const Contents before = contentsOf(folder, output);
    if (!act()) return;
    while (contentsOf(folder, output) == before) std::this_thread::sleep_for(pause);
  }
}

}  // namespace qz::tools
