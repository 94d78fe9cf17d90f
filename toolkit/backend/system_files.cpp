// SPDX-License-Identifier: MIT
// Files through the standard library, used with error codes: a path that cannot be examined counts
// as a path without a file.

#include "qz/toolkit/system_files.hpp"

#include <filesystem>
#include <fstream>
#include <system_error>

namespace qz::toolkit {

namespace fs = std::filesystem;

namespace {

// Converts from UTF-8, which the interface uses, to the system's encoding. Windows has no file
// whose name is not UTF-8.
fs::path systemPath(std::string_view path) try {
  return std::u8string(path.begin(), path.end());
} catch (const std::system_error&) {
  return {};
}

// Returns the path in UTF-8, with slashes on every system, so that code may append to it.
std::string utf8(const fs::path& path) {
  const std::u8string text = path.generic_u8string();
  return {text.begin(), text.end()};
}

// Returns the kind of file at `path`, following links. A path with a NUL is not found: the system
// would cut it off there and find another file.
fs::file_status statusOf(std::string_view path) {
  if (path.find('\0') != std::string_view::npos) return fs::file_status(fs::file_type::not_found);
  std::error_code error;
  return fs::status(systemPath(path), error);
}

}  // namespace

void SystemFiles::setResourcePath(std::string_view path) {
  std::error_code error;
  resourcePath_ = utf8(fs::current_path(error) / systemPath(path));
  while (resourcePath_.ends_with('/')) resourcePath_.pop_back();
}

bool SystemFiles::fileExistsAtPath(std::string_view path) const {
  return fs::exists(statusOf(path));
}

std::optional<std::string> SystemFiles::contentsAtPath(std::string_view path) const {
  if (!isRegularFile(path)) return std::nullopt;
  std::ifstream file(systemPath(path), std::ios::binary);
  if (!file) return std::nullopt;
  std::string contents;
  char block[1 << 16];
  while (file.read(block, sizeof block) || file.gcount() > 0) {
    contents.append(block, static_cast<std::size_t>(file.gcount()));
  }
  if (file.bad()) return std::nullopt;
  return contents;
}

bool isRegularFile(std::string_view path) { return fs::is_regular_file(statusOf(path)); }

}  // namespace qz::toolkit
