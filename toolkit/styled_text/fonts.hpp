// SPDX-License-Identifier: MIT
// Fonts by name and size.
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace toolkit {

/// A font as text asks for it.
struct Font {
  std::string family;  ///< such as "Times"
  double size = 12;    ///< points
  bool bold = false;
  bool italic = false;
  bool fixedPitch = false;  ///< every character is equally wide

  friend bool operator==(const Font&, const Font&) = default;
};

/// The catalogue of the fonts that a toolkit can draw.
class Fonts {
 public:
  virtual ~Fonts() = default;

  /// The font named `name` (a family, or a family with "-Bold", "-Italic", "-BoldItalic" or the
  /// oblique forms behind it) at `size` points; size 0 is the default size, 12. Absent when the
  /// toolkit knows no font of that name.
  virtual std::optional<Font> fontWithName(std::string_view name, double size) const = 0;
};

/// The size, in points, of a font that is asked for at size 0.
inline constexpr double defaultFontSize = 12;

}  // namespace toolkit
