// SPDX-License-Identifier: MIT
// Reads resources with Qt, and everything else as all toolkits do.

#include "qz/toolkit/qt/files.hpp"

#include <QFile>
#include <QFileInfo>

#include "toolkit/qt/strings.hpp"

namespace qz::toolkit::qt {

namespace {

bool isResourcePath(std::string_view path) { return path.starts_with(":/"); }

}  // namespace

std::string QtFiles::resourcePath() const {
  return resources_.empty() ? system_.resourcePath() : resources_;
}

void QtFiles::setResourcePath(std::string_view path) {
  resources_ = isResourcePath(path) ? path : "";
  while (resources_.ends_with('/')) resources_.pop_back();
  if (resources_.empty()) system_.setResourcePath(path);
}

bool QtFiles::fileExistsAtPath(std::string_view path) const {
  return isResourcePath(path) ? QFileInfo::exists(qString(path)) : system_.fileExistsAtPath(path);
}

std::optional<std::string> QtFiles::contentsAtPath(std::string_view path) const {
  if (!isResourcePath(path)) return system_.contentsAtPath(path);
  QFile file(qString(path));
  if (!isFileOrResource(path) || !file.open(QIODevice::ReadOnly)) return std::nullopt;
  return file.readAll().toStdString();
}

bool isFileOrResource(std::string_view path) {
  return isResourcePath(path) ? QFileInfo(qString(path)).isFile() : isRegularFile(path);
}

}  // namespace qz::toolkit::qt
