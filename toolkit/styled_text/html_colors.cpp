// SPDX-License-Identifier: MIT
// The colour names of CSS, and how colours are read.
#include "toolkit/styled_text/html_colors.hpp"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <string>

#include "text/hexadecimal.hpp"
#include "toolkit/styled_text/html_words.hpp"

namespace qz::toolkit::html {
namespace {

struct NamedColor {
  std::string_view name;
  std::uint32_t rgb;
};

// CSS Color Module Level 3, section 4.3, which includes the sixteen of HTML 4.
// clang-format off
constexpr auto namedColors = std::to_array<NamedColor>({
  {"aliceblue", 0xf0f8ff}, {"antiquewhite", 0xfaebd7}, {"aqua", 0x00ffff},
  {"aquamarine", 0x7fffd4}, {"azure", 0xf0ffff}, {"beige", 0xf5f5dc}, {"bisque", 0xffe4c4},
  {"black", 0x000000}, {"blanchedalmond", 0xffebcd}, {"blue", 0x0000ff}, {"blueviolet", 0x8a2be2},
  {"brown", 0xa52a2a}, {"burlywood", 0xdeb887}, {"cadetblue", 0x5f9ea0}, {"chartreuse", 0x7fff00},
  {"chocolate", 0xd2691e}, {"coral", 0xff7f50}, {"cornflowerblue", 0x6495ed},
  {"cornsilk", 0xfff8dc}, {"crimson", 0xdc143c}, {"cyan", 0x00ffff}, {"darkblue", 0x00008b},
  {"darkcyan", 0x008b8b}, {"darkgoldenrod", 0xb8860b}, {"darkgray", 0xa9a9a9},
  {"darkgreen", 0x006400}, {"darkgrey", 0xa9a9a9}, {"darkkhaki", 0xbdb76b},
  {"darkmagenta", 0x8b008b}, {"darkolivegreen", 0x556b2f}, {"darkorange", 0xff8c00},
  {"darkorchid", 0x9932cc}, {"darkred", 0x8b0000}, {"darksalmon", 0xe9967a},
  {"darkseagreen", 0x8fbc8f}, {"darkslateblue", 0x483d8b}, {"darkslategray", 0x2f4f4f},
  {"darkslategrey", 0x2f4f4f}, {"darkturquoise", 0x00ced1}, {"darkviolet", 0x9400d3},
  {"deeppink", 0xff1493}, {"deepskyblue", 0x00bfff}, {"dimgray", 0x696969}, {"dimgrey", 0x696969},
  {"dodgerblue", 0x1e90ff}, {"firebrick", 0xb22222}, {"floralwhite", 0xfffaf0},
  {"forestgreen", 0x228b22}, {"fuchsia", 0xff00ff}, {"gainsboro", 0xdcdcdc},
  {"ghostwhite", 0xf8f8ff}, {"gold", 0xffd700}, {"goldenrod", 0xdaa520}, {"gray", 0x808080},
  {"green", 0x008000}, {"greenyellow", 0xadff2f}, {"grey", 0x808080}, {"honeydew", 0xf0fff0},
  {"hotpink", 0xff69b4}, {"indianred", 0xcd5c5c}, {"indigo", 0x4b0082}, {"ivory", 0xfffff0},
  {"khaki", 0xf0e68c}, {"lavender", 0xe6e6fa}, {"lavenderblush", 0xfff0f5},
  {"lawngreen", 0x7cfc00}, {"lemonchiffon", 0xfffacd}, {"lightblue", 0xadd8e6},
  {"lightcoral", 0xf08080}, {"lightcyan", 0xe0ffff}, {"lightgoldenrodyellow", 0xfafad2},
  {"lightgray", 0xd3d3d3}, {"lightgreen", 0x90ee90}, {"lightgrey", 0xd3d3d3},
  {"lightpink", 0xffb6c1}, {"lightsalmon", 0xffa07a}, {"lightseagreen", 0x20b2aa},
  {"lightskyblue", 0x87cefa}, {"lightslategray", 0x778899}, {"lightslategrey", 0x778899},
  {"lightsteelblue", 0xb0c4de}, {"lightyellow", 0xffffe0}, {"lime", 0x00ff00},
  {"limegreen", 0x32cd32}, {"linen", 0xfaf0e6}, {"magenta", 0xff00ff}, {"maroon", 0x800000},
  {"mediumaquamarine", 0x66cdaa}, {"mediumblue", 0x0000cd}, {"mediumorchid", 0xba55d3},
  {"mediumpurple", 0x9370db}, {"mediumseagreen", 0x3cb371}, {"mediumslateblue", 0x7b68ee},
  {"mediumspringgreen", 0x00fa9a}, {"mediumturquoise", 0x48d1cc}, {"mediumvioletred", 0xc71585},
  {"midnightblue", 0x191970}, {"mintcream", 0xf5fffa}, {"mistyrose", 0xffe4e1},
  {"moccasin", 0xffe4b5}, {"navajowhite", 0xffdead}, {"navy", 0x000080}, {"oldlace", 0xfdf5e6},
  {"olive", 0x808000}, {"olivedrab", 0x6b8e23}, {"orange", 0xffa500}, {"orangered", 0xff4500},
  {"orchid", 0xda70d6}, {"palegoldenrod", 0xeee8aa}, {"palegreen", 0x98fb98},
  {"paleturquoise", 0xafeeee}, {"palevioletred", 0xdb7093}, {"papayawhip", 0xffefd5},
  {"peachpuff", 0xffdab9}, {"peru", 0xcd853f}, {"pink", 0xffc0cb}, {"plum", 0xdda0dd},
  {"powderblue", 0xb0e0e6}, {"purple", 0x800080}, {"red", 0xff0000}, {"rosybrown", 0xbc8f8f},
  {"royalblue", 0x4169e1}, {"saddlebrown", 0x8b4513}, {"salmon", 0xfa8072},
  {"sandybrown", 0xf4a460}, {"seagreen", 0x2e8b57}, {"seashell", 0xfff5ee}, {"sienna", 0xa0522d},
  {"silver", 0xc0c0c0}, {"skyblue", 0x87ceeb}, {"slateblue", 0x6a5acd}, {"slategray", 0x708090},
  {"slategrey", 0x708090}, {"snow", 0xfffafa}, {"springgreen", 0x00ff7f}, {"steelblue", 0x4682b4},
  {"tan", 0xd2b48c}, {"teal", 0x008080}, {"thistle", 0xd8bfd8}, {"tomato", 0xff6347},
  {"turquoise", 0x40e0d0}, {"violet", 0xee82ee}, {"wheat", 0xf5deb3}, {"white", 0xffffff},
  {"whitesmoke", 0xf5f5f5}, {"yellow", 0xffff00}, {"yellowgreen", 0x9acd32}});
// clang-format on

static_assert(std::is_sorted(namedColors.begin(), namedColors.end(),
                             [](const NamedColor& a, const NamedColor& b) {
                               return a.name < b.name;
                             }));

std::optional<Color> colorNamed(std::string_view name) {
  const std::string key = text::lowered(name);
  const NamedColor* const end = namedColors.data() + namedColors.size();
  const NamedColor* const found = std::lower_bound(
      namedColors.data(), end, key,
      [](const NamedColor& color, std::string_view wanted) { return color.name < wanted; });
  if (found == end || found->name != key) return std::nullopt;
  const auto part = [rgb = found->rgb](unsigned shift) { return ((rgb >> shift) & 0xFFU) / 255.0; };
  return Color{part(16), part(8), part(0)};
}

/// Returns one part of a colour from two hexadecimal digits, or from one that counts twice.
double hexPart(std::string_view digits) {
  return (16.0 * text::hexadecimalDigit(digits.front()) + text::hexadecimalDigit(digits.back())) /
         255;
}

/// Returns the colour of `digits`, which are split evenly into three parts.
Color hexColor(std::string_view digits) {
  const std::size_t length = digits.size() / 3;
  return {hexPart(digits.substr(0, length)), hexPart(digits.substr(length, length)),
          hexPart(digits.substr(2 * length))};
}

/// Cuts off a number with its optional percent sign. Returns the part of a colour, from 0 to 1;
/// `full` is written for 1.
std::optional<double> takePart(std::string_view& text, double full) {
  text = trimmed(text);
  const auto number = takeNumber(text);
  if (!number) return std::nullopt;
  text = trimmed(text);
  const bool percentage = text.starts_with('%');
  if (percentage) text.remove_prefix(1);
  text = trimmed(text);
  return std::clamp(*number / (percentage ? 100 : full), 0.0, 1.0);
}

/// Returns the colour of "rgb(...)" or "rgba(...)"; `text` is the text between the brackets.
std::optional<Color> functionColor(std::string_view text) {
  std::array<double, 4> parts = {0, 0, 0, 1};
  std::size_t count = 0;
  while (!text.empty()) {
    if (count == parts.size()) return std::nullopt;
    std::string_view written = takeUntil(text, ',');
    const auto part = takePart(written, count < 3 ? 255 : 1);
    if (!part || !written.empty()) return std::nullopt;
    parts[count++] = *part;
  }
  if (count < 3) return std::nullopt;
  return Color{parts[0], parts[1], parts[2], parts[3]};
}

/// Implements HTML's rules for parsing a legacy colour value: other characters count as the digit
/// 0, the digits are split into three parts, and the first two significant digits of each count.
Color legacyColor(std::string_view value) {
  if (value.starts_with('#')) value.remove_prefix(1);
  std::string digits(value.substr(0, 128));
  std::replace_if(
      digits.begin(), digits.end(), [](char c) { return !text::isHexadecimalDigit(c); }, '0');
  while (digits.empty() || digits.size() % 3 != 0) digits += '0';
  const std::size_t length = digits.size() / 3;
  std::size_t from = length > 8 ? length - 8 : 0;
  const auto isZero = [&](std::size_t part) { return digits[part * length + from] == '0'; };
  while (length - from > 2 && isZero(0) && isZero(1) && isZero(2)) ++from;
  std::string telling;
  for (std::size_t part = 0; part < 3; ++part) {
    if (length == 1) telling += '0';  // "f00", unlike "#f00", is nearly black
    telling += digits.substr(part * length + from, std::min<std::size_t>(length - from, 2));
  }
  return hexColor(telling);
}

}  // namespace

std::optional<Color> cssColor(std::string_view value) {
  value = trimmed(value);
  if (value.starts_with('#')) {
    const std::string_view digits = value.substr(1);
    const bool valid = (digits.size() == 3 || digits.size() == 6) &&
                       std::all_of(digits.begin(), digits.end(), text::isHexadecimalDigit);
    return valid ? std::optional(hexColor(digits)) : std::nullopt;
  }
  if (value.ends_with(')')) {
    const std::string function = text::lowered(takeUntil(value, '('));
    value.remove_suffix(value.empty() ? 0 : 1);
    return function == "rgb" || function == "rgba" ? functionColor(value) : std::nullopt;
  }
  if (text::lowered(value) == "transparent") return Color{0, 0, 0, 0};
  return colorNamed(value);
}

std::optional<Color> attributeColor(std::string_view value) {
  value = trimmed(value);
  if (const auto color = cssColor(value)) return color->alpha > 0 ? color : std::nullopt;
  return value.empty() ? std::nullopt : std::optional(legacyColor(value));
}

}  // namespace qz::toolkit::html
