// Runs become fragments with a character format, paragraphs become blocks with a block format.

#include "toolkit/qt/rich_text.hpp"

#include <QTextBlockFormat>
#include <QTextCharFormat>
#include <QTextCursor>
#include <QTextOption>
#include <algorithm>
#include <ranges>
#include <utility>
#include <vector>

#include "toolkit/qt/contrast.hpp"
#include "toolkit/qt/fonts.hpp"
#include "toolkit/qt/strings.hpp"

namespace toolkit::qt {

namespace {

using namespace Qt::StringLiterals;

QColor inkOf(const Color& color, const TextSetting& setting) {
  return setting.greyed ? halfway(qColor(color), setting.ground) : qColor(color);
}

/// Absent where the viewer has the choice.
std::optional<QColor> inkOf(const TextAttributes& attributes, const TextSetting& setting) {
  if (attributes.foregroundColor) return inkOf(*attributes.foregroundColor, setting);
  if (!attributes.link) return setting.ink;
  return setting.greyed ? halfway(setting.link, setting.ground) : setting.link;
}

QTextCharFormat formatOf(const TextAttributes& attributes, const TextSetting& setting) {
  QTextCharFormat format;
  if (attributes.font)
    format.setFont(qFont(*attributes.font), QTextCharFormat::FontPropertiesSpecifiedOnly);
  if (attributes.link) {
    format.setAnchor(true);
    format.setAnchorHref(qString(attributes.link->address()));
  }
  if (const auto ink = inkOf(attributes, setting)) format.setForeground(*ink);
  if (attributes.backgroundColor) format.setBackground(inkOf(*attributes.backgroundColor, setting));
  if (attributes.underline) format.setFontUnderline(true);
  if (attributes.strikethrough) format.setFontStrikeOut(true);
  if (attributes.superscript != 0) {
    format.setVerticalAlignment(attributes.superscript > 0 ? QTextCharFormat::AlignSuperScript
                                                           : QTextCharFormat::AlignSubScript);
  }
  return format;
}

Qt::Alignment alignmentOf(const std::optional<ParagraphStyle>& style, Qt::Alignment otherwise) {
  if (!style) return otherwise;
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
  return Qt::AlignLeading;
}

/// How a paragraph stands.
struct BlockSetting {
  Qt::Alignment alignment;
  double before;     ///< between the edge at which lines begin and the lines, in points
  double firstLine;  ///< what the first line stands further in than the others
};

BlockSetting blockSettingOf(const TextAttributes& attributes, const TextSetting& setting) {
  const ParagraphStyle style = attributes.paragraphStyle.value_or(ParagraphStyle{});
  return {alignmentOf(attributes.paragraphStyle, setting.unasked), style.headIndent,
          style.firstLineHeadIndent - style.headIndent};
}

QTextBlockFormat blockFormatOf(const TextAttributes& attributes, const TextSetting& setting) {
  const BlockSetting block = blockSettingOf(attributes, setting);
  QTextBlockFormat format;
  format.setAlignment(block.alignment);
  format.setLayoutDirection(setting.direction);
  if (setting.direction == Qt::RightToLeft) {
    format.setRightMargin(block.before);
  } else {
    format.setLeftMargin(block.before);
  }
  format.setTextIndent(block.firstLine);
  return format;
}

/// Text of one style.
struct Piece {
  QString text;
  const TextAttributes* attributes;
};

/// A line of the text, with the attributes by which it is laid out: those of its first character,
/// and of an empty one those of the line end before it.
struct Paragraph {
  const TextAttributes* attributes;
  std::vector<Piece> pieces;
};

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

/// Takes `text` apart, which outlives the paragraphs.
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

// In HTML nothing is written that holds anyway, and tags rather than styles: most of the time that
// it takes to show some text Qt spends reading styles.

void writeEscaped(QString& html, QStringView text) {
  qsizetype written = 0;
  for (qsizetype i = 0; i < text.size(); ++i) {
    QLatin1String entity;
    if (text[i] == u'&') entity = "&amp;"_L1;
    if (text[i] == u'<') entity = "&lt;"_L1;
    if (text[i] == u'>') entity = "&gt;"_L1;
    if (text[i] == u'"') entity = "&quot;"_L1;
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

/// Between `opening` and `closing`, neither of which is written around nothing. Tells whether they
/// are.
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

void writeCss(QString& html, QLatin1String property, double points) {
  if (points != 0) html += property + QString::number(points) + "px;"_L1;
}

void writeCss(QString& html, QLatin1String property, const QColor& color) {
  html += property + QString::number(color.red()) + u',' + QString::number(color.green()) + u',' +
          QString::number(color.blue()) + u',' +
          QString::number(static_cast<double>(color.alphaF())) + ");"_L1;
}

void writeCss(QString& html, const Font& font, const QFont& otherwise) {
  html += "font-family:'"_L1;
  writeEscaped(html, drawnFamily(font));
  html += "';"_L1;
  writeCss(html, "font-size:"_L1, pixelSize(font));
  if (font.bold || otherwise.bold())
    html += font.bold ? "font-weight:700;"_L1 : "font-weight:400;"_L1;
  if (font.italic || otherwise.italic())
    html += font.italic ? "font-style:italic;"_L1 : "font-style:normal;"_L1;
}

void writeCss(QString& html, const TextAttributes& attributes, const TextSetting& setting) {
  if (attributes.font) writeCss(html, *attributes.font, setting.font);
  if (const auto ink = inkOf(attributes, setting)) writeCss(html, "color:rgba("_L1, *ink);
  if (const auto& ground = attributes.backgroundColor)
    writeCss(html, "background-color:rgba("_L1, inkOf(*ground, setting));
  if (attributes.link && !attributes.underline) html += "text-decoration:none;"_L1;
}

void writePiece(QString& html, const Piece& piece, const TextSetting& setting) {
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
  for (const auto& tag : tags)
    if (tag.holds) html += tag.opening;
  writeText(html, piece.text);
  for (const auto& tag : std::ranges::reverse_view(tags))
    if (tag.holds) html += tag.closing;
  if (styled) html += "</span>"_L1;
  if (attributes.link) html += "</a>"_L1;
}

/// Whether HTML would drop or merge blanks of the text.
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
  if (paragraph.pieces.empty()) {  // Qt's own way of writing an empty line, as high as its font
    html += "-qt-paragraph-type:empty;"_L1;
    writeCss(html, *paragraph.attributes, setting);
  }
  if (std::any_of(paragraph.pieces.begin(), paragraph.pieces.end(),
                  [](const Piece& piece) { return hasBlanksToKeep(piece.text); }))
    html += "white-space:pre-wrap;"_L1;
  const bool leftwards = setting.direction == Qt::RightToLeft;
  writeCss(html, leftwards ? "margin-right:"_L1 : "margin-left:"_L1, block.before);
  writeCss(html, "text-indent:"_L1, block.firstLine);
}

void writeParagraph(QString& html, const Paragraph& paragraph, const TextSetting& setting) {
  const BlockSetting block = blockSettingOf(*paragraph.attributes, setting);
  html += "<div"_L1;
  if (setting.direction == Qt::RightToLeft) html += " dir=\"rtl\""_L1;
  html += alignmentIn(block);
  writeBetween(" style=\""_L1, "\""_L1, html, [&] { writeCss(html, paragraph, block, setting); });
  html += u'>';
  if (paragraph.pieces.empty()) html += "<br/>"_L1;
  for (const Piece& piece : paragraph.pieces) writePiece(html, piece, setting);
  html += "</div>"_L1;
}

}  // namespace

void showIn(QTextDocument& document, const AttributedString& text, const TextSetting& setting) {
  const bool undo = document.isUndoRedoEnabled();
  document.setUndoRedoEnabled(false);  // what a script shows is no edit of the user's
  document.clear();
  document.setDefaultFont(setting.font);
  QTextOption option = document.defaultTextOption();
  option.setTextDirection(setting.direction);
  document.setDefaultTextOption(option);

  QTextCursor cursor(&document);
  bool first = true;
  for (const Paragraph& paragraph : paragraphsOf(text, setting.dropsLastLineEnd)) {
    if (!std::exchange(first, false)) cursor.insertBlock();
    cursor.setBlockFormat(blockFormatOf(*paragraph.attributes, setting));
    cursor.setBlockCharFormat(formatOf(*paragraph.attributes, setting));
    for (const Piece& piece : paragraph.pieces)
      cursor.insertText(piece.text, formatOf(*piece.attributes, setting));
  }
  document.setUndoRedoEnabled(undo);
}

// Qt's own way there, by a document, takes longer than all else that a command does.
QString htmlOf(const AttributedString& text, const TextSetting& setting) {
  QString html;
  for (const Paragraph& paragraph : paragraphsOf(text, setting.dropsLastLineEnd))
    writeParagraph(html, paragraph, setting);
  return html;
}

bool hasLinks(const AttributedString& text) {
  return std::any_of(text.runs().begin(), text.runs().end(),
                     [](const TextRun& run) { return run.attributes.link.has_value(); });
}

bool isPlain(const AttributedString& text) {
  return std::all_of(text.runs().begin(), text.runs().end(),
                     [](const TextRun& run) { return run.attributes == TextAttributes{}; });
}

QFont largestFont(const AttributedString& text, const QFont& otherwise) {
  const Font* largest = nullptr;
  for (const TextRun& run : text.runs()) {
    const auto& font = run.attributes.font;
    if (font && (!largest || font->size > largest->size)) largest = &*font;
  }
  return largest ? qFont(*largest) : otherwise;
}

}  // namespace toolkit::qt
