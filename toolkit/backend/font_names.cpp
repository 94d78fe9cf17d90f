// SPDX-License-Identifier: MIT
// Names are compared in their folded form: without blanks, in lower case. A name alone may be
// ambiguous (is "MT" an ending or part of the family's name?). Therefore the whole name is tried as
// a family before an ending is removed.

#include "toolkit/backend/font_names.hpp"

#include "text/ascii.hpp"

namespace qz::toolkit {

namespace {

struct Style {
  std::string_view folded;
  bool bold;
  bool italic;
};

constexpr Style styles[] = {
    {"roman", false, false},     {"regular", false, false}, {"bold", true, false},
    {"italic", false, true},     {"oblique", false, true},  {"bolditalic", true, true},
    {"boldoblique", true, true},
};

std::string folded(std::string_view name) {
  std::string result;
  for (const char c : name) {
    if (c != ' ') result += text::lowered(c);
  }
  return result;
}

std::string_view without(std::string_view name, std::string_view ending) {
  if (name.ends_with(ending)) name.remove_suffix(ending.size());
  return name;
}

const FontFamily* familyNamed(std::string_view foldedName, std::span<const FontFamily> families) {
  for (const FontFamily& family : families) {
    if (folded(family.name) == foldedName) return &family;
  }
  return nullptr;
}

// Finds "arial" for "arialmt" too, and "timesnewroman" for "timesnewromanpsmt" and
// "timesnewromanps".
const FontFamily* familyOfPostScriptName(std::string_view foldedName,
                                         std::span<const FontFamily> families) {
  if (const FontFamily* const family = familyNamed(foldedName, families)) return family;
  return familyNamed(without(without(foldedName, "mt"), "ps"), families);
}

const Style* styleNamed(std::string_view foldedName) {
  for (const Style& style : styles) {
    if (style.folded == foldedName) return &style;
  }
  return nullptr;
}

Font font(const FontFamily& family, double size, bool bold, bool italic) {
  // Not `size <= 0`: NaN means the default size too.
  return {family.name, size > 0 ? size : defaultFontSize, bold, italic, family.fixedPitch};
}

}  // namespace

std::optional<Font> fontNamed(std::string_view name, double size,
                              std::span<const FontFamily> families) {
  const std::string whole = folded(name);
  if (const FontFamily* const family = familyOfPostScriptName(whole, families)) {
    return font(*family, size, false, false);
  }

  const std::size_t hyphen = whole.rfind('-');
  if (hyphen == std::string::npos) return std::nullopt;
  const std::string_view parts = whole;
  const Style* const style = styleNamed(without(parts.substr(hyphen + 1), "mt"));
  const FontFamily* const family = familyOfPostScriptName(parts.substr(0, hyphen), families);
  if (!style || !family) return std::nullopt;
  return font(*family, size, style->bold, style->italic);
}

}  // namespace qz::toolkit
