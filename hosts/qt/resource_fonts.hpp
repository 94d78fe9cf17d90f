// SPDX-License-Identifier: MIT
// The fonts that come with scripts.
#pragma once

#include <QString>
#include <vector>

namespace qz::hosts::qt {

/// Adds the fonts in a directory, which may be one of the program's resources, to those of the
/// application. Returns their numbers in Qt's database.
std::vector<int> addFontsIn(const QString& directory);
/// Removes them again.
void removeFonts(const std::vector<int>& fonts);

}  // namespace qz::hosts::qt
