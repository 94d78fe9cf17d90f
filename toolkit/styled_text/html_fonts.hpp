// SPDX-License-Identifier: MIT
// The fonts that HTML's faces and sizes mean. Sizes are in points; a browser's pixel is 3/4 point,
// so 16 pixels of normal text are 12 points.
#pragma once

#include <optional>
#include <string_view>

#include "qz/styled_text/fonts.hpp"

namespace qz::toolkit::html {

inline constexpr double pointsPerPixel = 0.75;
/// The factor of "larger" and `<big>`, and the divisor of "smaller" and `<small>`.
inline constexpr double sizeStep = 1.2;

/// Returns Times, the font of text that requests none.
Font commonFont(const Fonts& fonts);

/// Returns the font of `<tt>`, `<code>` and `<pre>`.
Font fixedPitchFont(const Fonts& fonts);

/// Returns the first face in the comma-separated `list` that `fonts` has; absent if it has none of
/// them. A face may be quoted, or be a generic family of CSS.
std::optional<Font> firstKnownFace(std::string_view list, const Fonts& fonts);

/// Returns the points of `<font size>`: "1" to "7"; "3" is 12 points. A value with a sign is
/// relative to 3, never to the text around it. Absent if the value is not a number.
std::optional<double> fontElementSize(std::string_view value);

/// A size relative to the size around it: a factor plus points; one of the two is 0.
struct FontSize {
  double scale = 1;
  double points = 0;

  friend bool operator==(const FontSize&, const FontSize&) = default;
};

/// Reads a value of CSS's `font-size`: a length, a percentage or a keyword; absent if it is none of
/// these.
std::optional<FontSize> cssFontSize(std::string_view value);

}  // namespace qz::toolkit::html
