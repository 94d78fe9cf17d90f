// SPDX-License-Identifier: MIT
// Looks up images. Every look-up reads the directory, so that its result is never out of date; only
// the identity of the images is cached.

#include "toolkit/memory/images.hpp"

#include "toolkit/backend/image_names.hpp"

namespace qz::toolkit::memory {

Ref<Image> MemoryImages::imageNamed(std::string_view name) {
  const auto known = found_.find(name);
  const auto path = imageFileNamed(name, files_.resourcePath());
  if (known != found_.end() && known->second->path() == path) return known->second;
  if (known != found_.end()) found_.erase(known);
  if (!path) return {};
  const auto image = std::make_shared<MemoryImage>(name, *path);
  found_.emplace(name, image);
  return image;
}

}  // namespace qz::toolkit::memory
