// SPDX-License-Identifier: MIT
// Maps names to image files, and never to a file outside the directory.

#include "toolkit/backend/image_names.hpp"

#include <algorithm>

#include "text/ascii.hpp"

namespace qz::toolkit {

namespace {

bool carriesSuffix(std::string_view name) {
  const std::size_t dot = name.rfind('.');
  if (dot == std::string_view::npos) return false;
  const std::string_view suffix = name.substr(dot + 1);
  return std::any_of(imageSuffixes.begin(), imageSuffixes.end(), [&](std::string_view known) {
    return std::equal(known.begin(), known.end(), suffix.begin(), suffix.end(),
                      [](char a, char b) { return a == text::lowered(b); });
  });
}

bool isResourceName(std::string_view name) {
  // Both separators on every system, so that a script means the same everywhere.
  return !name.empty() && name != ".." && name.find_first_of("/\\") == std::string_view::npos;
}

}  // namespace

std::optional<std::string> imageFileNamed(std::string_view name, std::string_view directory,
                                          bool (*isFile)(std::string_view path)) {
  if (!isResourceName(name)) return std::nullopt;
  std::string path = std::string(directory) + "/" + std::string(name);
  if (carriesSuffix(name) && isFile(path)) return path;
  for (const std::string_view suffix : imageSuffixes) {
    std::string candidate = path + "." + std::string(suffix);
    if (isFile(candidate)) return candidate;
  }
  return std::nullopt;
}

}  // namespace qz::toolkit
