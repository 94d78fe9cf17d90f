// SPDX-License-Identifier: MIT
// Finds the font that a script means by a name, among the fonts of any toolkit.
#pragma once

#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "qz/styled_text/fonts.hpp"

namespace qz::toolkit {

/// A font family that a toolkit can draw plain, bold, italic and bold italic.
struct FontFamily {
  std::string name;  ///< such as "Times New Roman"
  bool fixedPitch = false;
};

/// Returns the font among `families` that `name` means, at `size` points. The name is a family's
/// name or a PostScript name: the family, optionally without its blanks, then optionally "PS" or
/// "MT" (or both), then optionally a hyphen, a style (such as "BoldItalic", "Oblique" or "Roman")
/// and perhaps "MT". Case does not matter. A size that is not above 0 means the default size.
/// Absent if no family or style matches.
std::optional<Font> fontNamed(std::string_view name, double size,
                              std::span<const FontFamily> families);

}  // namespace qz::toolkit
