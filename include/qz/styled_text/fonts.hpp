// SPDX-License-Identifier: MIT
// Fonts by name and size.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "qz/api.hpp"

namespace qz::toolkit {

/// The font that a text requests.
struct QZ_API Font {
  std::string family;       ///< such as "Times"
  double size = 12;         ///< points
  bool bold = false;        ///< whether it is a bold face
  bool italic = false;      ///< whether it is an italic face
  bool fixedPitch = false;  ///< all characters have the same width

  friend bool operator==(const Font&, const Font&) = default;
};

/// The catalogue of the fonts that a toolkit can draw.
class QZ_API Fonts {
 public:
  virtual ~Fonts() = default;

  /// Returns the font named `name` at `size` points. `name` is a family, with or without the suffix
  /// "-Bold", "-Italic", "-BoldItalic" or an oblique form. Size 0 is the default size, 12. Absent
  /// if the toolkit has no font of that name.
  virtual std::optional<Font> fontWithName(std::string_view name, double size) const = 0;
};

/// The size, in points, of a font requested at size 0.
inline constexpr double defaultFontSize = 12;

}  // namespace qz::toolkit
