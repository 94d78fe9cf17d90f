// SPDX-License-Identifier: MIT
// Looking images up. The file system is asked every time, so that what was found earlier is never
// older than the directory; only the identity of the images is remembered.

#include "toolkit/memory/images.hpp"

#include "toolkit/image_names.hpp"

namespace toolkit::memory {

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

}  // namespace toolkit::memory
