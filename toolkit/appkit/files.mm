// SPDX-License-Identifier: MIT
// Files through `NSFileManager`. A path with a NUL is not found: the system would cut it off there
// and find another file.

#include "qz/toolkit/appkit/files.hpp"

#import <Foundation/Foundation.h>

#import "toolkit/foundation/kept.hpp"
#import "toolkit/foundation/strings.hpp"

namespace qz::toolkit::appkit {

namespace {

using foundation::nsString;
using foundation::utf8;

bool isPath(std::string_view path) {
  return !path.empty() && path.find('\0') == std::string_view::npos;
}

bool isRegularFile(NSString* path) {
  NSFileManager* const manager = [NSFileManager defaultManager];
  NSString* const end = [path stringByResolvingSymlinksInPath];
  NSDictionary* const attributes = [manager attributesOfItemAtPath:end error:NULL];
  return [[attributes fileType] isEqual:NSFileTypeRegular];
}

}  // namespace

std::string AppKitFiles::resourcePath() const {
  const foundation::Pool pool;
  return resourcePath_ ? *resourcePath_ : utf8([[NSBundle mainBundle] resourcePath]);
}

void AppKitFiles::setResourcePath(std::string_view path) {
  const foundation::Pool pool;
  NSString* whole = nsString(path);
  if (![whole isAbsolutePath]) {
    NSString* const here = [[NSFileManager defaultManager] currentDirectoryPath];
    whole = [here stringByAppendingPathComponent:whole];
  }
  resourcePath_ = utf8(whole);
  while (resourcePath_->ends_with('/')) resourcePath_->pop_back();
}

bool AppKitFiles::fileExistsAtPath(std::string_view path) const {
  const foundation::Pool pool;
  return isPath(path) && [[NSFileManager defaultManager] fileExistsAtPath:nsString(path)];
}

std::optional<std::string> AppKitFiles::contentsAtPath(std::string_view path) const {
  const foundation::Pool pool;
  if (!isPath(path) || !isRegularFile(nsString(path))) return std::nullopt;
  NSData* const data = [NSData dataWithContentsOfFile:nsString(path)];
  if (!data) return std::nullopt;
  return std::string(static_cast<const char*>([data bytes]), [data length]);
}

}  // namespace qz::toolkit::appkit
