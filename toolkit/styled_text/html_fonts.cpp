// SPDX-License-Identifier: MIT
// Faces and sizes.
#include "toolkit/styled_text/html_fonts.hpp"

#include <algorithm>
#include <array>
#include <string>

#include "toolkit/styled_text/html_words.hpp"

namespace qz::toolkit::html {
namespace {

/// The points of `<font size>` 1 to 7: browsers' 10, 13, 16, 18, 24, 32 and 48 pixels.
constexpr std::array<double, 7> elementSizes = {7.5, 9.75, 12, 13.5, 18, 24, 36};

struct GenericFamily {
  std::string_view name;
  std::string_view face;
};

constexpr std::array<GenericFamily, 3> genericFamilies = {
    {{"serif", "Times"}, {"sans-serif", "Helvetica"}, {"monospace", "Courier"}}};

struct Keyword {
  std::string_view name;
  FontSize size;
};

constexpr std::array<Keyword, 9> sizeKeywords = {{{"xx-small", {0, 6.75}},
                                                  {"x-small", {0, 7.5}},
                                                  {"small", {0, 9.75}},
                                                  {"medium", {0, 12}},
                                                  {"large", {0, 13.5}},
                                                  {"x-large", {0, 18}},
                                                  {"xx-large", {0, 24}},
                                                  {"smaller", {1 / sizeStep, 0}},
                                                  {"larger", {sizeStep, 0}}}};

// The size of one unit. An "ex" counts as half the font size, as in browsers that cannot measure
// it.
constexpr std::array<Keyword, 10> sizeUnits = {{{"pt", {0, 1}},
                                                {"px", {0, pointsPerPixel}},
                                                {"em", {1, 0}},
                                                {"%", {0.01, 0}},
                                                {"ex", {0.5, 0}},
                                                {"rem", {0, defaultFontSize}},
                                                {"in", {0, 72}},
                                                {"cm", {0, 72 / 2.54}},
                                                {"mm", {0, 72 / 25.4}},
                                                {"pc", {0, 12}}}};

template <std::size_t N>
std::optional<FontSize> sizeNamed(const std::array<Keyword, N>& sizes, std::string_view name) {
  const std::string key = text::lowered(name);
  const auto found = std::find_if(sizes.begin(), sizes.end(),
                                  [&key](const Keyword& keyword) { return keyword.name == key; });
  return found != sizes.end() ? std::optional(found->size) : std::nullopt;
}

std::string_view unquoted(std::string_view face) {
  if (face.size() >= 2 && (face.front() == '"' || face.front() == '\'') &&
      face.back() == face.front()) {
    face = face.substr(1, face.size() - 2);
  }
  return trimmed(face);
}

std::string_view faceMeant(std::string_view written) {
  const std::string key = text::lowered(written);
  for (const auto& [name, face] : genericFamilies) {
    if (name == key) return face;
  }
  return written;
}

}  // namespace

Font commonFont(const Fonts& fonts) {
  return fonts.fontWithName("Times", defaultFontSize).value_or(Font{"Times"});
}

Font fixedPitchFont(const Fonts& fonts) {
  Font font = firstKnownFace("Courier, Courier New, Menlo, DejaVu Sans Mono", fonts)
                  .value_or(Font{"Courier"});
  font.fixedPitch = true;
  return font;
}

std::optional<Font> firstKnownFace(std::string_view list, const Fonts& fonts) {
  while (!list.empty()) {
    const std::string_view face = faceMeant(unquoted(trimmed(takeUntil(list, ','))));
    if (face.empty()) continue;
    if (auto font = fonts.fontWithName(face, defaultFontSize)) return font;
  }
  return std::nullopt;
}

std::optional<double> fontElementSize(std::string_view value) {
  constexpr int common = 3;
  value = trimmed(value);
  const auto number = leadingInteger(value);
  if (!number) return std::nullopt;
  const bool relative = value.starts_with('+') || value.starts_with('-');
  const int clamped = std::clamp(*number, -common, 7);
  return elementSizes[static_cast<std::size_t>(
                          std::clamp(clamped + (relative ? common : 0), 1, 7)) -
                      1];
}

std::optional<FontSize> cssFontSize(std::string_view value) {
  value = trimmed(value);
  if (const auto size = sizeNamed(sizeKeywords, value)) return size;
  const auto number = takeNumber(value);
  if (!number || *number < 0) return std::nullopt;
  if (*number == 0 && value.empty()) return FontSize{0, 0};
  const auto unit = sizeNamed(sizeUnits, value);
  if (!unit) return std::nullopt;
  return FontSize{*number * unit->scale, *number * unit->points};
}

}  // namespace qz::toolkit::html
