// SPDX-License-Identifier: MIT
// The style of elements: by tag, by attributes, and nested in others.
#include "toolkit/styled_text/html_style.hpp"

#include <algorithm>
#include <cmath>
#include <string>

#include "toolkit/styled_text/html_colors.hpp"
#include "toolkit/styled_text/html_words.hpp"
#include "toolkit/styled_text/inline_css.hpp"

namespace qz::toolkit::html {
namespace {

/// Elements whose `align` aligns their text; that of a caption, for example, places the caption.
constexpr TagSet alignedByAttribute =
    tags::headings | tags::cells | tags::tableParts | TagSet{Tag::div, Tag::p};
/// Elements that `text-align` applies to; inline elements ignore it.
constexpr TagSet aligned = tags::blocks | tags::cells | tags::rowGroups | TagSet{Tag::body};
/// Elements whose `bgcolor` shows behind their text; the body's belongs to the page.
constexpr TagSet coloredBehind = tags::cells | tags::tableParts;

constexpr TagSet bold = tags::headings | TagSet{Tag::b, Tag::strong, Tag::th};
constexpr TagSet italic{Tag::address, Tag::cite, Tag::dfn, Tag::em, Tag::i, Tag::var};
constexpr TagSet underlined{Tag::ins, Tag::u};
constexpr TagSet struckOut{Tag::del, Tag::s, Tag::strike};
constexpr TagSet fixedPitch{Tag::code, Tag::kbd, Tag::pre, Tag::samp, Tag::tt};
constexpr TagSet indented = tags::lists | TagSet{Tag::blockquote, Tag::dd};
constexpr TagSet centered{Tag::caption, Tag::center, Tag::th};

/// Returns the factor by which the element scales the size.
double scaleOf(Tag tag) {
  switch (tag) {
    case Tag::h1:
      return 2;
    case Tag::h2:
      return 1.5;
    case Tag::h3:
      return 1.17;
    case Tag::h5:
      return 0.83;
    case Tag::h6:
      return 0.67;
    case Tag::big:
      return sizeStep;
    case Tag::small:
      return 1 / sizeStep;
    default:
      return 1;
  }
}

/// Adds the declarations that follow from the tag itself.
void declareNature(Tag tag, const Fonts& fonts, Declarations& own) {
  if (bold.contains(tag)) own.bold = true;
  if (italic.contains(tag)) own.italic = true;
  if (fixedPitch.contains(tag)) own.face = fixedPitchFont(fonts);
  own.size.scale = scaleOf(tag);
  own.underline = underlined.contains(tag);
  own.strikethrough = struckOut.contains(tag);
  // Keeps the size: the widget that draws the text chooses the size of super- and subscripts.
  if (tag == Tag::sup) own.superscript = 1;
  if (tag == Tag::sub) own.superscript = -1;
  if (indented.contains(tag)) own.indent = indentStep;
  if (centered.contains(tag)) own.alignment = TextAlignment::center;
  own.preformatted = tag == Tag::pre;
}

void declareFontElement(const Attributes& attributes, const Fonts& fonts, Declarations& own) {
  if (const auto faces = attributes[Attribute::face]) own.face = firstKnownFace(*faces, fonts);
  if (const auto size = attributes[Attribute::size]) {
    if (const auto points = fontElementSize(*size)) own.size = {0, *points};
  }
  if (const auto color = attributes[Attribute::color]) own.color = attributeColor(*color);
}

void declareBody(const Attributes& attributes, Declarations& own) {
  if (const auto color = attributes[Attribute::text]) own.color = attributeColor(*color);
}

void declareLink(const Attributes& attributes, const Color& color, Declarations& own) {
  const auto written = attributes[Attribute::href];
  const std::string_view address = written ? trimmed(*written) : std::string_view();
  // Ignores an address within the document, because text has no anchors.
  if (address.empty() || address.starts_with('#')) return;
  own.link = Link(std::string(address));
  own.color = color;
  own.underline = true;
}

}  // namespace

Declarations declarationsOf(Tag tag, const Attributes& attributes, const StyleSource& source) {
  Declarations own;
  declareNature(tag, source.fonts, own);
  if (tag == Tag::font) declareFontElement(attributes, source.fonts, own);
  if (tag == Tag::body) declareBody(attributes, own);
  if (tag == Tag::a) declareLink(attributes, source.linkColor, own);
  if (alignedByAttribute.contains(tag)) {
    if (const auto align = attributes[Attribute::align]) {
      if (const auto alignment = alignmentNamed(*align)) own.alignment = alignment;
    }
  }
  if (coloredBehind.contains(tag)) {
    if (const auto color = attributes[Attribute::bgcolor]) {
      own.backgroundColor = attributeColor(*color);
    }
  }
  if (const auto css = attributes[Attribute::style]) {
    readInlineStyle(*css, source.fonts, own);
  }
  if (!aligned.contains(tag)) own.alignment.reset();
  if (tag == Tag::body) own.backgroundColor.reset();  // belongs to the page, not to its text
  return own;
}

Style styleWithin(const Style& parent, const Declarations& own) {
  // Clamps absurd sizes to drawable ones, and rounds so that nested sizes do not drift.
  const auto drawable = [](double size) {
    return std::clamp(std::round(size * 100) / 100, 1.0, 1000.0);
  };
  Style style = parent;
  if (own.face) style.face = &*own.face;
  if (own.color) style.color = &*own.color;
  if (own.backgroundColor) style.backgroundColor = &*own.backgroundColor;
  if (own.link) style.link = &*own.link;
  style.size = drawable(parent.size * own.size.scale + own.size.points);
  style.indent += own.indent;
  style.superscript += own.superscript;
  style.alignment = own.alignment.value_or(parent.alignment);
  style.bold = own.bold.value_or(parent.bold);
  style.italic = own.italic.value_or(parent.italic);
  style.underline |= own.underline;
  style.strikethrough |= own.strikethrough;
  style.preformatted |= own.preformatted;
  return style;
}

TextAttributes textAttributes(const Style& style, bool hanging) {
  TextAttributes attributes;
  attributes.font = *style.face;
  attributes.font->size = style.size;
  attributes.font->bold |= style.bold;
  attributes.font->italic |= style.italic;
  if (style.color != nullptr) attributes.foregroundColor = *style.color;
  if (style.backgroundColor != nullptr) attributes.backgroundColor = *style.backgroundColor;
  const double outdent = hanging ? std::min(indentStep, style.indent) : 0;
  const ParagraphStyle paragraph{style.alignment, style.indent - outdent, style.indent};
  if (paragraph != ParagraphStyle{}) attributes.paragraphStyle = paragraph;
  if (style.link != nullptr) attributes.link = *style.link;
  attributes.underline = style.underline;
  attributes.strikethrough = style.strikethrough;
  attributes.superscript = style.superscript;
  return attributes;
}

}  // namespace qz::toolkit::html
