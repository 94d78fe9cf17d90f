// SPDX-License-Identifier: MIT
// One function for each property: it reads the value, and changes nothing if the value is invalid.
#include "toolkit/styled_text/inline_css.hpp"

#include <array>
#include <string>

#include "toolkit/styled_text/html_colors.hpp"
#include "toolkit/styled_text/html_words.hpp"

namespace qz::toolkit::html {
namespace {

void readFamily(std::string_view value, const Fonts& fonts, Declarations& own) {
  if (auto face = firstKnownFace(value, fonts)) own.face = std::move(face);
}

void readSize(std::string_view value, const Fonts&, Declarations& own) {
  if (const auto size = cssFontSize(value)) own.size = *size;
}

void readWeight(std::string_view value, const Fonts&, Declarations& own) {
  constexpr int boldFrom = 600;  // a family has two weights; this and above is nearer to bold
  const std::string name = text::lowered(value);
  if (name == "bold" || name == "bolder") {
    own.bold = true;
  } else if (name == "normal" || name == "lighter") {
    own.bold = false;
  } else if (const auto weight = leadingInteger(name); weight && *weight >= 1 && *weight <= 1000) {
    own.bold = *weight >= boldFrom;
  }
}

void readFontStyle(std::string_view value, const Fonts&, Declarations& own) {
  const std::string name = text::lowered(value);
  if (name == "italic" || name == "oblique") own.italic = true;
  if (name == "normal") own.italic = false;
}

// Replaces the element's own lines, such as a link's, but not those of enclosing elements, which
// draw them.
void readDecoration(std::string_view value, const Fonts&, Declarations& own) {
  bool valid = false;
  bool underline = false;
  bool strikethrough = false;
  while (!value.empty()) {
    const std::string name = text::lowered(takeWord(value));
    underline |= name == "underline";
    strikethrough |= name == "line-through";
    valid |= underline || strikethrough || name == "none" || name == "overline" || name == "blink";
  }
  if (!valid) return;
  own.underline = underline;
  own.strikethrough = strikethrough;
}

void readColor(std::string_view value, const Fonts&, Declarations& own) {
  if (const auto color = cssColor(value)) own.color = color;
}

void readBackground(std::string_view value, const Fonts&, Declarations& own) {
  const auto color = cssColor(value);
  // A transparent background shows the one behind it.
  if (color && color->alpha > 0) own.backgroundColor = color;
}

void readAlignment(std::string_view value, const Fonts&, Declarations& own) {
  if (const auto alignment = alignmentNamed(value)) own.alignment = alignment;
}

struct Property {
  std::string_view name;
  void (*read)(std::string_view value, const Fonts& fonts, Declarations& own);
};

constexpr std::array<Property, 8> properties = {{{"font-family", readFamily},
                                                 {"font-size", readSize},
                                                 {"font-weight", readWeight},
                                                 {"font-style", readFontStyle},
                                                 {"text-decoration", readDecoration},
                                                 {"color", readColor},
                                                 {"background-color", readBackground},
                                                 {"text-align", readAlignment}}};

/// Cuts off and returns one declaration, up to a semicolon outside quotes.
std::string_view takeDeclaration(std::string_view& css) {
  char quote = '\0';
  std::size_t end = 0;
  for (; end < css.size(); ++end) {
    const char c = css[end];
    if (quote != '\0') {
      if (c == quote) quote = '\0';
    } else if (c == '"' || c == '\'') {
      quote = c;
    } else if (c == ';') {
      break;
    }
  }
  const std::string_view declaration = css.substr(0, end);
  css.remove_prefix(std::min(end + 1, css.size()));
  return declaration;
}

std::string withoutComments(std::string_view css) {
  std::string result;
  while (true) {
    const std::size_t begin = css.find("/*");
    result += css.substr(0, begin);
    if (begin == std::string_view::npos) return result;
    const std::size_t end = css.find("*/", begin + 2);
    if (end == std::string_view::npos) return result;
    css.remove_prefix(end + 2);
  }
}

}  // namespace

std::optional<TextAlignment> alignmentNamed(std::string_view value) {
  const std::string name = text::lowered(trimmed(value));
  if (name == "left") return TextAlignment::left;
  if (name == "right" || name == "end") return TextAlignment::right;
  if (name == "center" || name == "middle") return TextAlignment::center;
  if (name == "justify") return TextAlignment::justified;
  if (name == "start") return TextAlignment::natural;
  return std::nullopt;
}

void readInlineStyle(std::string_view css, const Fonts& fonts, Declarations& own) {
  const std::string sheet = withoutComments(css);
  for (std::string_view rest = sheet; !rest.empty();) {
    std::string_view value = takeDeclaration(rest);
    const std::string name = text::lowered(trimmed(takeUntil(value, ':')));
    // Ignores "!important": nothing competes with an inline style.
    value = trimmed(takeUntil(value, '!'));
    for (const Property& property : properties) {
      if (property.name == name) property.read(value, fonts, own);
    }
  }
}

}  // namespace qz::toolkit::html
