#include "toolkit/memory/images.hpp"

#include <algorithm>

#include "toolkit/memory/files.hpp"

namespace toolkit::memory {

namespace {

constexpr char lowered(char c) {
  return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

bool carriesSuffix(std::string_view name) {
  const std::size_t dot = name.rfind('.');
  if (dot == std::string_view::npos) return false;
  const std::string_view suffix = name.substr(dot + 1);
  return std::any_of(imageSuffixes.begin(), imageSuffixes.end(), [&](std::string_view known) {
    return std::equal(known.begin(), known.end(), suffix.begin(), suffix.end(),
                      [](char a, char b) { return a == lowered(b); });
  });
}

bool isResourceName(std::string_view name) {
  // Both separators, so that a script means the same on every system.
  return !name.empty() && name != ".." && name.find_first_of("/\\") == std::string_view::npos;
}

}  // namespace

std::optional<std::string> MemoryImages::pathOf(std::string_view name) const {
  if (!isResourceName(name)) return std::nullopt;
  const std::string path = files_.resourcePath() + "/" + std::string(name);
  if (carriesSuffix(name) && isRegularFile(path)) return path;
  for (const std::string_view suffix : imageSuffixes) {
    std::string candidate = path + "." + std::string(suffix);
    if (isRegularFile(candidate)) return candidate;
  }
  return std::nullopt;
}

Ref<Image> MemoryImages::imageNamed(std::string_view name) {
  const auto known = found_.find(name);
  const auto path = pathOf(name);
  if (known != found_.end() && known->second->path() == path) return known->second;
  if (known != found_.end()) found_.erase(known);
  if (!path) return {};
  const auto image = std::make_shared<MemoryImage>(name, *path);
  found_.emplace(name, image);
  return image;
}

}  // namespace toolkit::memory
