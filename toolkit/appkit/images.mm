// SPDX-License-Identifier: MIT
// Looks images up. Asks the file system every time, so that a look-up is never older than the
// directory; caches only the contents of files.

#import "toolkit/appkit/images.hpp"

#include <utility>

#import "toolkit/appkit/calling.hpp"
#include "toolkit/backend/image_names.hpp"
#import "toolkit/foundation/strings.hpp"

namespace qz::toolkit::appkit {

namespace {

NSDate* changeOf(const std::string& path) {
  NSDictionary* const attributes =
      [[NSFileManager defaultManager] attributesOfItemAtPath:foundation::nsString(path) error:NULL];
  return [attributes objectForKey:NSFileModificationDate];
}

NSImage* readImage(const std::string& path) {
  NSImage* const image =
      [[[NSImage alloc] initWithContentsOfFile:foundation::nsString(path)] autorelease];
  return [image isValid] ? image : nil;
}

// A name that is a path finds nothing, on every toolkit.
NSImage* knownImage(std::string_view name) {
  const bool isName = !name.empty() && name.find_first_of("/\\") == std::string_view::npos;
  return isName ? [NSImage imageNamed:foundation::nsString(name)] : nil;
}

}  // namespace

AppKitImage::AppKitImage(std::string name, std::string path, NSImage* image)
    : name_(std::move(name)), path_(std::move(path)), written_(changeOf(path_)), object_(image) {}

NSImage* AppKitImage::objectOf(const Ref<Image>& image) {
  const auto own = std::dynamic_pointer_cast<AppKitImage>(image.pointer());
  return own ? own->object() : nil;
}

bool AppKitImage::isOf(const std::string& path) const {
  return path_ == path && [changeOf(path) isEqual:written_.get()];
}

Ref<Image> AppKitImages::imageNamed(std::string_view name) {
  return calling([&]() -> Ref<Image> {
    const auto known = found_.find(name);
    const std::string path = imageFileNamed(name, files_.resourcePath()).value_or("");
    if (known != found_.end() && known->second->isOf(path)) return known->second;
    if (known != found_.end()) found_.erase(known);
    NSImage* const image = path.empty() ? knownImage(name) : readImage(path);
    if (!image) return {};
    const auto found = std::make_shared<AppKitImage>(std::string(name), path, image);
    if (!path.empty()) found_.emplace(name, found);
    return found;
  });
}

}  // namespace qz::toolkit::appkit
