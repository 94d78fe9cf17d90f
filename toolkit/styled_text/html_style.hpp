// SPDX-License-Identifier: MIT
// The styles that elements declare, and the style that results from nested elements.
#pragma once

#include <optional>
#include <string_view>

#include "qz/styled_text/attributed_string.hpp"
#include "toolkit/styled_text/html_fonts.hpp"
#include "toolkit/styled_text/html_tags.hpp"

namespace qz::toolkit::html {

/// The indent of a list, a quoted block and the like, in points.
inline constexpr double indentStep = 36;

/// The declarations of one element: by its tag, its attributes and its inline style. Absent ones
/// are inherited.
struct Declarations {
  std::optional<Font> face;  ///< its size is ignored
  FontSize size;
  std::optional<bool> bold;
  std::optional<bool> italic;
  std::optional<Color> color;
  std::optional<Color> backgroundColor;
  std::optional<Link> link;
  std::optional<TextAlignment> alignment;
  // These add to the inherited values.
  bool underline = false;
  bool strikethrough = false;
  int superscript = 0;
  double indent = 0;
  bool preformatted = false;

  friend bool operator==(const Declarations&, const Declarations&) = default;
};

/// The style that results from the open elements' declarations. Small, because every start tag
/// copies one: it points into the declarations, which must outlive it.
struct Style {
  const Font* face = nullptr;  ///< never absent
  const Color* color = nullptr;
  const Color* backgroundColor = nullptr;
  const Link* link = nullptr;
  double size = defaultFontSize;
  double indent = 0;
  int superscript = 0;
  TextAlignment alignment = TextAlignment::natural;
  bool bold = false;  ///< in addition to the face's own weight
  bool italic = false;
  bool underline = false;
  bool strikethrough = false;
  bool preformatted = false;  ///< white space is kept
};

/// The settings of the document and toolkit that apply to all elements.
struct StyleSource {
  const Fonts& fonts;
  Color linkColor{0, 0, 0.933};
};

/// Returns the declarations of an element.
Declarations declarationsOf(Tag tag, const Attributes& attributes, const StyleSource& source);

/// Returns the style of an element with declarations `own` inside an element of style `parent`.
Style styleWithin(const Style& parent, const Declarations& own);

/// Returns the attributes of text in that style. The first line of a `hanging` paragraph begins one
/// indent further left than the others.
TextAttributes textAttributes(const Style& style, bool hanging);

}  // namespace qz::toolkit::html
