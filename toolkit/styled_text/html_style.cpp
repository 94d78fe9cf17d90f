// The style of elements: by what they are, by their attributes, within others.
#include "toolkit/styled_text/html_style.hpp"

#include <algorithm>
#include <cmath>
#include <string>

#include "toolkit/styled_text/html_colors.hpp"
#include "toolkit/styled_text/html_words.hpp"
#include "toolkit/styled_text/inline_css.hpp"

namespace toolkit::html {
namespace {

/// Elements whose `align` is that of the text in them; a caption's, for one, says where it stands.
constexpr TagSet alignedByAttribute =
    tags::headings | tags::cells | tags::tableParts | TagSet{Tag::div, Tag::p};
/// Elements that `text-align` applies to. Within a line it has no meaning.
constexpr TagSet aligned = tags::blocks | tags::cells | tags::rowGroups | TagSet{Tag::body};
/// Elements whose `bgcolor` shows behind their text; the body's is the page's.
constexpr TagSet coloredBehind = tags::cells | tags::tableParts;

void makeHeading(Declarations& own, double scale) {
  own.size.scale = scale;
  own.bold = true;
}

/// Declares what the element does to letters.
void declareLetters(Tag tag, const Fonts& fonts, Declarations& own) {
  switch (tag) {
    case Tag::b:
    case Tag::strong:
    case Tag::th:
      own.bold = true;
      break;
    case Tag::address:
    case Tag::cite:
    case Tag::dfn:
    case Tag::em:
    case Tag::i:
    case Tag::var:
      own.italic = true;
      break;
    case Tag::ins:
    case Tag::u:
      own.underline = true;
      break;
    case Tag::del:
    case Tag::s:
    case Tag::strike:
      own.strikethrough = true;
      break;
    // The size stays: whoever draws the text chooses how small it is off the base line.
    case Tag::sup:
      own.superscript = 1;
      break;
    case Tag::sub:
      own.superscript = -1;
      break;
    case Tag::big:
      own.size.scale = sizeStep;
      break;
    case Tag::small:
      own.size.scale = 1 / sizeStep;
      break;
    case Tag::code:
    case Tag::kbd:
    case Tag::pre:
    case Tag::samp:
    case Tag::tt:
      own.face = fixedPitchFont(fonts);
      break;
    case Tag::h1:
      makeHeading(own, 2);
      break;
    case Tag::h2:
      makeHeading(own, 1.5);
      break;
    case Tag::h3:
      makeHeading(own, 1.17);
      break;
    case Tag::h4:
      makeHeading(own, 1);
      break;
    case Tag::h5:
      makeHeading(own, 0.83);
      break;
    case Tag::h6:
      makeHeading(own, 0.67);
      break;
    default:
      break;
  }
}

/// Declares what the element does to lines.
void declareLines(Tag tag, Declarations& own) {
  const bool indented = tags::lists.contains(tag) || tag == Tag::blockquote || tag == Tag::dd;
  const bool centered = tag == Tag::center || tag == Tag::caption || tag == Tag::th;
  if (indented) own.indent = indentStep;
  if (centered) own.alignment = TextAlignment::center;
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
  // An address within the document leads nowhere: text has no places to go to.
  if (address.empty() || address.starts_with('#')) return;
  own.link = Link(std::string(address));
  own.color = color;
  own.underline = true;
}

}  // namespace

Declarations declarationsOf(Tag tag, const Attributes& attributes, const StyleSource& source) {
  Declarations own;
  declareLetters(tag, source.fonts, own);
  declareLines(tag, own);
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
  if (tag == Tag::body) own.backgroundColor.reset();  // the page's, no attribute of text on it
  return own;
}

Style styleWithin(const Style& parent, const Declarations& own) {
  // Nested or absurd sizes stay within what can be drawn, and do not wear off by their rounding.
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

}  // namespace toolkit::html
