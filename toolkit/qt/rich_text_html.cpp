// SPDX-License-Identifier: MIT
// Writes attributed strings as HTML. Omits what is the default, and prefers tags to styles: Qt
// spends most of its time on HTML parsing styles.

#include <QColor>
#include <QFontMetricsF>
#include <QString>
#include <algorithm>
#include <iterator>
#include <optional>
#include <utility>

#include "toolkit/qt/fonts.hpp"
#include "toolkit/qt/rich_text_parts.hpp"
#include "toolkit/qt/strings.hpp"

namespace qz::toolkit::qt {

namespace {

using namespace Qt::StringLiterals;

/// Returns how HTML writes a character; empty if as it is.
QLatin1String entityFor(QChar character) {
  if (character == u'&') return "&amp;"_L1;
  if (character == u'<') return "&lt;"_L1;
  if (character == u'>') return "&gt;"_L1;
  return character == u'"' ? "&quot;"_L1 : QLatin1String();
}

void writeEscaped(QString& html, QStringView text) {
  qsizetype written = 0;
  for (qsizetype i = 0; i < text.size(); ++i) {
    const QLatin1String entity = entityFor(text[i]);
    if (entity.isEmpty()) continue;
    html += text.sliced(written, i - written);
    html += entity;
    written = i + 1;
  }
  html += text.sliced(written);
}

void writeText(QString& html, QStringView text) {
  for (;;) {
    const qsizetype end = text.indexOf(QChar::LineSeparator);
    if (end < 0) return writeEscaped(html, text);
    writeEscaped(html, text.first(end));
    html += "<br/>"_L1;
    text = text.sliced(end + 1);
  }
}

/// Writes between `opening` and `closing`, or leaves both out if `write` writes nothing. Returns
/// whether they are there.
template <class Writer>
bool writeBetween(QLatin1String opening, QLatin1String closing, QString& html, Writer write) {
  const qsizetype start = html.size();
  html += opening;
  const qsizetype inside = html.size();
  write();
  const bool hasAny = html.size() > inside;
  if (hasAny) {
    html += closing;
  } else {
    html.resize(start);
  }
  return hasAny;
}

void writeCss(QString& html, QLatin1String property, const QString& value, QLatin1String unit) {
  html += property;
  html += value;
  html += unit;
}

void writeCss(QString& html, QLatin1String property, double points) {
  if (points != 0) writeCss(html, property, QString::number(points), "px;"_L1);
}

void writeCss(QString& html, QLatin1String property, const QColor& color) {
  writeCss(html, property, QString::number(color.red()), ","_L1);
  writeCss(html, {}, QString::number(color.green()), ","_L1);
  writeCss(html, {}, QString::number(color.blue()), ","_L1);
  writeCss(html, {}, QString::number(static_cast<double>(color.alphaF())), ");"_L1);
}

void writeCss(QString& html, const Font& font, const QFont& otherwise) {
  html += "font-family:'"_L1;
  writeEscaped(html, drawnFamily(font));
  html += "';"_L1;
  writeCss(html, "font-size:"_L1, QString::number(pixelSize(font)), "px;"_L1);
  if (font.bold || otherwise.bold()) {
    html += font.bold ? "font-weight:700;"_L1 : "font-weight:400;"_L1;
  }
  if (font.italic || otherwise.italic()) {
    html += font.italic ? "font-style:italic;"_L1 : "font-style:normal;"_L1;
  }
}

void writeCss(QString& html, const TextAttributes& attributes, const TextSetting& setting) {
  if (attributes.font) writeCss(html, *attributes.font, setting.font);
  if (const auto ink = inkOf(attributes, setting)) writeCss(html, "color:rgba("_L1, *ink);
  if (const auto& ground = attributes.backgroundColor) {
    writeCss(html, "background-color:rgba("_L1, inkOf(*ground, setting));
  }
  if (attributes.link && !attributes.underline) html += "text-decoration:none;"_L1;
}

void writeGap(QString& html, double width, const QFontMetricsF& metrics) {
  html += "<span style=\""_L1;
  writeCss(html, "letter-spacing:"_L1, width - metrics.horizontalAdvance(QChar::Nbsp));
  html += "\">&nbsp;</span>"_L1;
}

/// Writes the marker of a list item, with blanks as wide as the tabs around it, which HTML lacks.
/// Returns the rest of the text.
QStringView writeMarker(QString& html, const Piece& piece, const MarkerStops& stops,
                        const TextSetting& setting) {
  const QStringView text = piece.text;
  const qsizetype end = text.startsWith(u'\t') ? text.indexOf(u'\t', 1) : -1;
  if (end < 0) return text;
  const QStringView marker = text.sliced(1, end - 1);
  const auto& font = piece.attributes->font;
  const QFontMetricsF metrics(font ? qFont(*font) : setting.font);
  const double width = metrics.horizontalAdvance(marker.toString());
  if (width < stops.marker) writeGap(html, stops.marker - width, metrics);
  writeEscaped(html, marker);
  const double at = std::max(width, stops.marker);
  writeGap(html, (at < stops.text ? stops.text : 2 * stops.text) - at, metrics);
  return text.sliced(end + 1);
}

void writePiece(QString& html, const Piece& piece, const std::optional<MarkerStops>& stops,
                const TextSetting& setting) {
  const TextAttributes& attributes = *piece.attributes;
  const struct {
    bool holds;
    QLatin1String opening, closing;
  } tags[] = {
      {attributes.superscript > 0, "<sup>"_L1, "</sup>"_L1},
      {attributes.superscript < 0, "<sub>"_L1, "</sub>"_L1},
      {attributes.strikethrough, "<s>"_L1, "</s>"_L1},
      {attributes.underline, "<u>"_L1, "</u>"_L1},
  };
  if (attributes.link) {
    html += "<a href=\""_L1;
    writeEscaped(html, qString(attributes.link->address()));
    html += "\">"_L1;
  }
  const bool styled = writeBetween("<span style=\""_L1, "\">"_L1, html,
                                   [&] { writeCss(html, attributes, setting); });
  for (const auto& tag : tags) {
    if (tag.holds) html += tag.opening;
  }
  writeText(html, stops ? writeMarker(html, piece, *stops, setting) : QStringView(piece.text));
  for (auto tag = std::rbegin(tags); tag != std::rend(tags); ++tag) {
    if (tag->holds) html += tag->closing;
  }
  if (styled) html += "</span>"_L1;
  if (attributes.link) html += "</a>"_L1;
}

/// True if HTML would drop or merge blanks of the text.
bool hasBlanksToKeep(QStringView text) {
  bool behindBlank = true;
  for (const QChar c : text) {
    const bool blank = c.isSpace();
    if (blank && (behindBlank || c != u' ')) return true;
    behindBlank = blank;
  }
  return behindBlank;
}

QLatin1String alignmentIn(const BlockSetting& block) {
  if (block.alignment & Qt::AlignHCenter) return " align=\"center\""_L1;
  if (block.alignment & Qt::AlignJustify) return " align=\"justify\""_L1;
  if (block.alignment & Qt::AlignRight) return " align=\"right\""_L1;
  if (block.alignment & Qt::AlignAbsolute) return " align=\"left\""_L1;
  return {};
}

void writeCss(QString& html, const Paragraph& paragraph, const BlockSetting& block,
              const TextSetting& setting) {
  if (paragraph.pieces.empty()) {  // how Qt writes an empty line as high as its font
    html += "-qt-paragraph-type:empty;"_L1;
    writeCss(html, *paragraph.attributes, setting);
  }
  if (std::any_of(paragraph.pieces.begin(), paragraph.pieces.end(),
                  [](const Piece& piece) { return hasBlanksToKeep(piece.text); })) {
    html += "white-space:pre-wrap;"_L1;
  }
  const bool leftwards = directionOf(paragraph, setting) == Qt::RightToLeft;
  writeCss(html, leftwards ? "margin-right:"_L1 : "margin-left:"_L1, block.before);
  writeCss(html, "text-indent:"_L1, block.firstLine);
}

/// True if Qt would lay out the paragraph from right to left.
bool isWrittenLeftwards(const Paragraph& paragraph) {
  TextSetting asItIs;
  asItIs.direction = Qt::LayoutDirectionAuto;
  return directionOf(paragraph, asItIs) == Qt::RightToLeft;
}

void writeParagraph(QString& html, const Paragraph& paragraph, const TextSetting& setting) {
  const BlockSetting block = blockSettingOf(*paragraph.attributes, setting);
  html += "<div"_L1;
  const bool leftwards = directionOf(paragraph, setting) == Qt::RightToLeft;
  if (leftwards) html += " dir=\"rtl\""_L1;
  if (!leftwards && isWrittenLeftwards(paragraph)) html += " dir=\"ltr\""_L1;
  html += alignmentIn(block);
  writeBetween(" style=\""_L1, "\""_L1, html, [&] { writeCss(html, paragraph, block, setting); });
  html += u'>';
  if (paragraph.pieces.empty()) html += "<br/>"_L1;
  auto stops = markerStopsOf(block);
  for (const Piece& piece : paragraph.pieces) {
    writePiece(html, piece, std::exchange(stops, std::nullopt), setting);
  }
  html += "</div>"_L1;
}

}  // namespace

// Writes directly: Qt's own conversion, through a document, takes longer than everything else in a
// command.
QString htmlOf(const AttributedString& text, const TextSetting& setting) {
  QString html;
  html.reserve(static_cast<qsizetype>(text.string().size()) + 200);  // enough for a few styles
  for (const Paragraph& paragraph : paragraphsOf(text, setting.dropsLastLineEnd)) {
    writeParagraph(html, paragraph, setting);
  }
  return html;
}

}  // namespace qz::toolkit::qt
