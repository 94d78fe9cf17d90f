// SPDX-License-Identifier: MIT
// The catalogue: the font families that walk-throughs written on the Mac use.

#include "toolkit/memory/fonts.hpp"

#include "toolkit/backend/font_names.hpp"

namespace qz::toolkit::memory {

std::optional<Font> MemoryFonts::fontWithName(std::string_view name, double size) const {
  static const FontFamily families[] = {
      {"Arial", false},   {"Courier", true},          {"Courier New", true},
      {"Georgia", false}, {"Helvetica", false},       {"Lucida Grande", false},
      {"Menlo", true},    {"Monaco", true},           {"Times", false},
      {"Verdana", false}, {"Times New Roman", false},
  };
  return fontNamed(name, size, families);
}

}  // namespace qz::toolkit::memory
