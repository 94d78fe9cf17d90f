// SPDX-License-Identifier: MIT
// Turns runs, which end where styles change, into paragraphs, which end where lines end.

#include "toolkit/qt/rich_text_parts.hpp"

#include "toolkit/qt/contrast.hpp"
#include "toolkit/qt/strings.hpp"

namespace qz::toolkit::qt {

namespace {

void addTo(Paragraph& paragraph, std::string_view line, const TextAttributes& attributes) {
  if (line.empty()) return;
  if (paragraph.pieces.empty()) paragraph.attributes = &attributes;
  paragraph.pieces.push_back({qString(line), &attributes});
}

void addTo(std::vector<Paragraph>& paragraphs, std::string_view text,
           const TextAttributes& attributes) {
  for (;;) {
    const std::size_t end = text.find_first_of("\r\n");
    addTo(paragraphs.back(), text.substr(0, end), attributes);
    if (end == std::string_view::npos) return;
    text.remove_prefix(end);
    text.remove_prefix(text.starts_with("\r\n") ? 2 : 1);
    paragraphs.push_back({&attributes, {}});
  }
}

Qt::Alignment alignmentOf(const std::optional<ParagraphStyle>& style, const TextSetting& setting) {
  if (!style) return setting.unasked;
  switch (style->alignment) {
    case TextAlignment::left:
      return Qt::AlignLeft | Qt::AlignAbsolute;
    case TextAlignment::right:
      return Qt::AlignRight | Qt::AlignAbsolute;
    case TextAlignment::center:
      return Qt::AlignHCenter;
    case TextAlignment::justified:
      return Qt::AlignJustify;
    case TextAlignment::natural:
      break;
  }
  return setting.natural;
}

}  // namespace

std::vector<Paragraph> paragraphsOf(const AttributedString& text, bool dropsLastLineEnd) {
  static const TextAttributes none;
  std::vector<Paragraph> paragraphs;
  paragraphs.push_back({&none, {}});
  const std::string_view whole = text.string();
  for (const TextRun& run : text.runs()) {
    std::string_view part = whole.substr(run.range.location, run.range.length);
    const bool last = run.range.location + run.range.length == whole.size();
    if (last && dropsLastLineEnd && part.ends_with('\n')) part.remove_suffix(1);
    addTo(paragraphs, part, run.attributes);
  }
  return paragraphs;
}

Qt::LayoutDirection directionOf(const Paragraph& paragraph, const TextSetting& setting) {
  if (setting.direction != Qt::LayoutDirectionAuto) return setting.direction;
  QString text;
  for (const Piece& piece : paragraph.pieces) text += piece.text;
  return text.isRightToLeft() ? Qt::RightToLeft : Qt::LeftToRight;
}

BlockSetting blockSettingOf(const TextAttributes& attributes, const TextSetting& setting) {
  const ParagraphStyle style = attributes.paragraphStyle.value_or(ParagraphStyle{});
  return {alignmentOf(attributes.paragraphStyle, setting), style.headIndent,
          style.firstLineHeadIndent - style.headIndent};
}

std::optional<MarkerStops> markerStopsOf(const BlockSetting& block) {
  constexpr double gap = 8;  // between marker and text
  if (-block.firstLine <= gap) return std::nullopt;
  return MarkerStops{-block.firstLine - gap, -block.firstLine};
}

QColor inkOf(const Color& color, const TextSetting& setting) {
  return setting.greyed ? halfway(qColor(color), setting.ground) : qColor(color);
}

std::optional<QColor> inkOf(const TextAttributes& attributes, const TextSetting& setting) {
  if (attributes.foregroundColor) return inkOf(*attributes.foregroundColor, setting);
  if (!attributes.link) return setting.ink;
  return setting.greyed ? halfway(setting.link, setting.ground) : setting.link;
}

}  // namespace qz::toolkit::qt
