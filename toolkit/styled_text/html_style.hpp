// SPDX-License-Identifier: MIT
// What elements ask of their text, and what that amounts to within others.
#pragma once

#include <optional>
#include <string_view>

#include "toolkit/styled_text/attributed_string.hpp"
#include "toolkit/styled_text/html_fonts.hpp"
#include "toolkit/styled_text/html_tags.hpp"

namespace toolkit::html {

/// The indent of a list, a quoted block and the like, in points.
inline constexpr double indentStep = 36;

/// What one element declares: by being what it is, by its attributes, by its inline style. What is
/// absent is inherited.
struct Declarations {
  std::optional<Font> face;  ///< its size does not count
  FontSize size;
  std::optional<bool> bold;
  std::optional<bool> italic;
  std::optional<Color> color;
  std::optional<Color> backgroundColor;
  std::optional<Link> link;
  std::optional<TextAlignment> alignment;
  // These add to what is inherited.
  bool underline = false;
  bool strikethrough = false;
  int superscript = 0;
  double indent = 0;
  bool preformatted = false;

  friend bool operator==(const Declarations&, const Declarations&) = default;
};

/// What the open elements' declarations amount to. Small, for every start tag copies one: it points
/// to values within the declarations, which must outlive it.
struct Style {
  const Font* face = nullptr;  ///< never absent
  const Color* color = nullptr;
  const Color* backgroundColor = nullptr;
  const Link* link = nullptr;
  double size = defaultFontSize;
  double indent = 0;
  int superscript = 0;
  TextAlignment alignment = TextAlignment::natural;
  bool bold = false;  ///< besides what the face itself is
  bool italic = false;
  bool underline = false;
  bool strikethrough = false;
  bool preformatted = false;  ///< white space counts
};

/// What a document and its toolkit say to all elements.
struct StyleSource {
  const Fonts& fonts;
  Color linkColor{0, 0, 0.933};
};

/// What an element declares.
Declarations declarationsOf(Tag tag, const Attributes& attributes, const StyleSource& source);

/// The style in an element that declares `own` within one of style `parent`.
Style styleWithin(const Style& parent, const Declarations& own);

/// The attributes of text of that style. In a `hanging` paragraph the first line begins an indent
/// further out than the others.
TextAttributes textAttributes(const Style& style, bool hanging);

}  // namespace toolkit::html
