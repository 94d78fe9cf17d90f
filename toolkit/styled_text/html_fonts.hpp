// SPDX-License-Identifier: MIT
// Which fonts HTML's faces and sizes mean. Sizes are points; browsers' pixels are 3/4 of one, so
// that their 16 pixels of common text are 12 points.
#pragma once

#include <optional>
#include <string_view>

#include "toolkit/styled_text/fonts.hpp"

namespace toolkit::html {

inline constexpr double pointsPerPixel = 0.75;
/// What "larger" and `<big>` multiply by, "smaller" and `<small>` divide by.
inline constexpr double sizeStep = 1.2;

/// Times, which text is in when no font is asked for.
Font commonFont(const Fonts& fonts);

/// What `<tt>`, `<code>` and `<pre>` are in.
Font fixedPitchFont(const Fonts& fonts);

/// The first of the faces in the comma-separated `list` that `fonts` has; absent where it has none
/// of them. A face may be in quotes, or one of CSS's generic families.
std::optional<Font> firstKnownFace(std::string_view list, const Fonts& fonts);

/// The points of `<font size>`: "1" to "7", of which "3" is 12 points. With a sign it counts from
/// 3, wherever it stands. Absent where the value is no number.
std::optional<double> fontElementSize(std::string_view value);

/// A size as a multiple of the size around it, and points on top; one of the two is 0.
struct FontSize {
  double scale = 1;
  double points = 0;

  friend bool operator==(const FontSize&, const FontSize&) = default;
};

/// The value of CSS's `font-size`: a length, a percentage or a keyword; absent where it is none.
std::optional<FontSize> cssFontSize(std::string_view value);

}  // namespace toolkit::html
