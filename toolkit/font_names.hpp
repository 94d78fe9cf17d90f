// SPDX-License-Identifier: MIT
// Fonts by the names that scripts write: what a name says, whichever fonts a toolkit has.
#pragma once

#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "toolkit/styled_text/fonts.hpp"

namespace toolkit {

/// A family of fonts that a toolkit can draw, plain, bold, italic and both.
struct FontFamily {
  std::string name;  ///< such as "Times New Roman"
  bool fixedPitch = false;
};

/// The font among `families` that `name` means, at `size` points. The name is a family's, or a
/// PostScript name made from it: behind the family, perhaps without its blanks, may stand "PS" or
/// "MT", then a hyphen and a style ("-BoldItalic", "-Oblique", "-Roman" and the like), then "MT".
/// Case does not matter. A size that is not above 0 is the default size. Absent when no family
/// fits.
std::optional<Font> fontNamed(std::string_view name, double size,
                              std::span<const FontFamily> families);

}  // namespace toolkit
