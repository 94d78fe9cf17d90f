// SPDX-License-Identifier: MIT
#include "hosts/qt/resource_fonts.hpp"

#include <QCoreApplication>
#include <QDir>
#include <QFontDatabase>

namespace qz::hosts::qt {

std::vector<int> addFontsIn(const QString& directory) {
  std::vector<int> added;
  for (const QFileInfo& file : QDir(directory).entryInfoList({"*.ttf", "*.otf"}, QDir::Files)) {
    const int font = QFontDatabase::addApplicationFont(file.filePath());
    if (font >= 0) added.push_back(font);
  }
  return added;
}

void removeFonts(const std::vector<int>& fonts) {
  if (!QCoreApplication::instance()) return;  // they have gone with the application
  for (const int font : fonts) QFontDatabase::removeApplicationFont(font);
}

}  // namespace qz::hosts::qt
