// SPDX-License-Identifier: MIT
// The markers of list items.
#include "toolkit/styled_text/list_markers.hpp"

#include <algorithm>
#include <array>

#include "toolkit/styled_text/html_words.hpp"

namespace qz::toolkit::html {
namespace {

struct Numeral {
  std::int64_t value;
  std::string_view digits;
};

constexpr std::array<Numeral, 13> romanNumerals = {{{1000, "m"},
                                                    {900, "cm"},
                                                    {500, "d"},
                                                    {400, "cd"},
                                                    {100, "c"},
                                                    {90, "xc"},
                                                    {50, "l"},
                                                    {40, "xl"},
                                                    {10, "x"},
                                                    {9, "ix"},
                                                    {5, "v"},
                                                    {4, "iv"},
                                                    {1, "i"}}};

std::string roman(std::int64_t number) {
  constexpr std::int64_t largest = 3999;
  if (number < 1 || number > largest) return std::to_string(number);
  std::string result;
  for (const auto& [value, digits] : romanNumerals) {
    for (; number >= value; number -= value) result += digits;
  }
  return result;
}

/// Returns a to z, then aa, ab and so on; decimal below 1.
std::string letters(std::int64_t number) {
  if (number < 1) return std::to_string(number);
  std::string result;
  for (; number > 0; number = (number - 1) / 26) {
    result += static_cast<char>('a' + (number - 1) % 26);
  }
  std::reverse(result.begin(), result.end());
  return result;
}

std::string uppercase(std::string text) {
  for (char& c : text) {
    if (isLetter(c)) c = static_cast<char>(c - 'a' + 'A');
  }
  return text;
}

}  // namespace

std::optional<MarkerKind> markerKindNamed(std::string_view type) {
  type = trimmed(type);
  // Only the letters are case-sensitive.
  if (type == "1") return MarkerKind::decimal;
  if (type == "a") return MarkerKind::lowerAlpha;
  if (type == "A") return MarkerKind::upperAlpha;
  if (type == "i") return MarkerKind::lowerRoman;
  if (type == "I") return MarkerKind::upperRoman;
  const std::string name = text::lowered(type);
  if (name == "disc") return MarkerKind::disc;
  if (name == "circle") return MarkerKind::circle;
  if (name == "square") return MarkerKind::square;
  return std::nullopt;
}

MarkerKind bulletAtLevel(std::size_t level) {
  if (level <= 1) return MarkerKind::disc;
  return level == 2 ? MarkerKind::circle : MarkerKind::square;
}

std::string marker(MarkerKind kind, std::int64_t number) {
  switch (kind) {
    case MarkerKind::disc:
      return "\u2022";
    case MarkerKind::circle:
      return "\u25E6";
    case MarkerKind::square:
      return "\u25AA";
    case MarkerKind::decimal:
      return std::to_string(number) + '.';
    case MarkerKind::lowerAlpha:
      return letters(number) + '.';
    case MarkerKind::upperAlpha:
      return uppercase(letters(number)) + '.';
    case MarkerKind::lowerRoman:
      return roman(number) + '.';
    case MarkerKind::upperRoman:
      return uppercase(roman(number)) + '.';
  }
  return {};
}

}  // namespace qz::toolkit::html
