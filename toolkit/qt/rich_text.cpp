// Runs become fragments with a character format, paragraphs become blocks with a block format.

#include "toolkit/qt/rich_text.hpp"

#include <QTextBlockFormat>
#include <QTextCharFormat>
#include <QTextCursor>
#include <QTextOption>
#include <algorithm>
#include <utility>
#include <vector>

#include "toolkit/qt/contrast.hpp"
#include "toolkit/qt/fonts.hpp"
#include "toolkit/qt/strings.hpp"

namespace toolkit::qt {

namespace {

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

QTextBlockFormat blockFormatOf(const TextAttributes& attributes, const TextSetting& setting) {
  const ParagraphStyle style = attributes.paragraphStyle.value_or(ParagraphStyle{});
  QTextBlockFormat format;
  format.setAlignment(alignmentOf(attributes.paragraphStyle, setting.unasked));
  format.setLayoutDirection(setting.direction);
  if (setting.direction == Qt::RightToLeft) {
    format.setRightMargin(style.headIndent);
  } else {
    format.setLeftMargin(style.headIndent);
  }
  // Qt counts the first line's indent from the others'.
  format.setTextIndent(style.firstLineHeadIndent - style.headIndent);
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

void addTo(std::vector<Paragraph>& paragraphs, QString text, const TextAttributes& attributes) {
  const QStringList lines = text.replace("\r\n", "\n").replace('\r', '\n').split('\n');
  for (qsizetype i = 0; i < lines.size(); ++i) {
    if (i > 0) paragraphs.push_back({&attributes, {}});
    if (lines[i].isEmpty()) continue;
    if (paragraphs.back().pieces.empty()) paragraphs.back().attributes = &attributes;
    paragraphs.back().pieces.push_back({lines[i], &attributes});
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
    addTo(paragraphs, qString(part), run.attributes);
  }
  return paragraphs;
}

// In HTML nothing is written that holds anyway, and tags rather than styles: most of the time that
// it takes to show some text Qt spends reading styles.

QString cssOf(const char* property, const QColor& color) {
  return QString("%1:rgba(%2,%3,%4,%5);")
      .arg(property)
      .arg(color.red())
      .arg(color.green())
      .arg(color.blue())
      .arg(static_cast<double>(color.alphaF()));
}

QString cssOf(const Font& font, const QFont& otherwise) {
  QString css = "font-family:'" + drawnFamily(font) +
                "';font-size:" + QString::number(pixelSize(font)) + "px;";
  if (font.bold || otherwise.bold()) css += font.bold ? "font-weight:700;" : "font-weight:400;";
  if (font.italic || otherwise.italic())
    css += font.italic ? "font-style:italic;" : "font-style:normal;";
  return css;
}

QString cssOf(const TextAttributes& attributes, const TextSetting& setting) {
  QString css;
  if (attributes.font) css += cssOf(*attributes.font, setting.font);
  if (const auto ink = inkOf(attributes, setting)) css += cssOf("color", *ink);
  if (attributes.backgroundColor)
    css += cssOf("background-color", inkOf(*attributes.backgroundColor, setting));
  if (attributes.link && !attributes.underline) css += "text-decoration:none;";
  return css;
}

void wrapIn(QString& html, const QString& tag, const QString& attributes = {}) {
  html = "<" + tag + attributes + ">" + html + "</" + tag + ">";
}

QString htmlOf(const Piece& piece, const TextSetting& setting) {
  const TextAttributes& attributes = *piece.attributes;
  QString html = piece.text.toHtmlEscaped().replace(QChar::LineSeparator, "<br/>");
  if (attributes.underline) wrapIn(html, "u");
  if (attributes.strikethrough) wrapIn(html, "s");
  if (attributes.superscript != 0) wrapIn(html, attributes.superscript > 0 ? "sup" : "sub");
  if (const QString css = cssOf(attributes, setting); !css.isEmpty())
    wrapIn(html, "span", " style=\"" + css.toHtmlEscaped() + "\"");
  if (attributes.link)
    wrapIn(html, "a", " href=\"" + qString(attributes.link->address()).toHtmlEscaped() + "\"");
  return html;
}

bool hasBlanksToKeep(const Paragraph& paragraph) {
  return std::any_of(paragraph.pieces.begin(), paragraph.pieces.end(), [](const Piece& piece) {
    return piece.text.front().isSpace() || piece.text.back().isSpace() ||
           piece.text.simplified() != piece.text;
  });
}

QString attributesOf(const QTextBlockFormat& format) {
  QString html = format.layoutDirection() == Qt::RightToLeft ? " dir=\"rtl\"" : "";
  const Qt::Alignment alignment = format.alignment();
  if (alignment & Qt::AlignHCenter)
    html += " align=\"center\"";
  else if (alignment & Qt::AlignJustify)
    html += " align=\"justify\"";
  else if (alignment & Qt::AlignRight)
    html += " align=\"right\"";
  else if (alignment & Qt::AlignAbsolute)
    html += " align=\"left\"";
  return html;
}

QString htmlOf(const Paragraph& paragraph, const TextSetting& setting) {
  const QTextBlockFormat format = blockFormatOf(*paragraph.attributes, setting);
  QString html;
  for (const Piece& piece : paragraph.pieces) html += htmlOf(piece, setting);
  QString css;
  if (paragraph.pieces.empty()) {  // Qt's own way of writing an empty line, as high as its font
    css = "-qt-paragraph-type:empty;" + cssOf(*paragraph.attributes, setting);
    html = "<br/>";
  }
  if (hasBlanksToKeep(paragraph)) css += "white-space:pre-wrap;";
  if (format.leftMargin() != 0) css += QString("margin-left:%1px;").arg(format.leftMargin());
  if (format.rightMargin() != 0) css += QString("margin-right:%1px;").arg(format.rightMargin());
  if (format.textIndent() != 0) css += QString("text-indent:%1px;").arg(format.textIndent());
  QString attributes = attributesOf(format);
  if (!css.isEmpty()) attributes += " style=\"" + css.toHtmlEscaped() + "\"";
  wrapIn(html, "div", attributes);
  return html;
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
    html += htmlOf(paragraph, setting);
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
