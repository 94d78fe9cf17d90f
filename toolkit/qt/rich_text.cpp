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

QTextCharFormat formatOf(const TextAttributes& attributes, const TextSetting& setting) {
  QTextCharFormat format;
  if (setting.ink) format.setForeground(*setting.ink);
  if (attributes.font)
    format.setFont(qFont(*attributes.font), QTextCharFormat::FontPropertiesSpecifiedOnly);
  if (attributes.link) {
    format.setAnchor(true);
    format.setAnchorHref(qString(attributes.link->address()));
    format.setForeground(setting.greyed ? halfway(setting.link, setting.ground) : setting.link);
  }
  if (attributes.foregroundColor) {
    format.setForeground(inkOf(*attributes.foregroundColor, setting));
  }
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

QString cssColor(const QBrush& brush) {
  const QColor color = brush.color();
  return QString("rgba(%1,%2,%3,%4)")
      .arg(color.red())
      .arg(color.green())
      .arg(color.blue())
      .arg(static_cast<double>(color.alphaF()));
}

QString cssOf(const QTextCharFormat& format) {
  QString css;
  if (format.hasProperty(QTextFormat::FontFamilies))
    css += "font-family:'" + format.fontFamilies().toStringList().value(0) + "';";
  if (format.hasProperty(QTextFormat::FontPixelSize))
    css += QString("font-size:%1px;").arg(format.intProperty(QTextFormat::FontPixelSize));
  if (format.hasProperty(QTextFormat::FontWeight))
    css += QString("font-weight:%1;").arg(format.fontWeight());
  if (format.hasProperty(QTextFormat::FontItalic))
    css += format.fontItalic() ? "font-style:italic;" : "font-style:normal;";
  if (format.fontUnderline() && format.fontStrikeOut())
    css += "text-decoration:underline line-through;";
  else if (format.fontUnderline())
    css += "text-decoration:underline;";
  else if (format.fontStrikeOut())
    css += "text-decoration:line-through;";
  if (format.hasProperty(QTextFormat::ForegroundBrush))
    css += "color:" + cssColor(format.foreground()) + ";";
  if (format.hasProperty(QTextFormat::BackgroundBrush))
    css += "background-color:" + cssColor(format.background()) + ";";
  if (format.verticalAlignment() == QTextCharFormat::AlignSuperScript)
    css += "vertical-align:super;";
  if (format.verticalAlignment() == QTextCharFormat::AlignSubScript) css += "vertical-align:sub;";
  return css;
}

QString htmlOf(const Piece& piece, const TextSetting& setting) {
  const QTextCharFormat format = formatOf(*piece.attributes, setting);
  QString html = piece.text.toHtmlEscaped().replace(QChar::LineSeparator, "<br/>");
  if (const QString css = cssOf(format); !css.isEmpty())
    html = "<span style=\"" + css.toHtmlEscaped() + "\">" + html + "</span>";
  if (format.isAnchor())
    html = "<a href=\"" + format.anchorHref().toHtmlEscaped() + "\">" + html + "</a>";
  return html;
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
  QString css = QString("white-space:pre-wrap;margin:0 %1px 0 %2px;text-indent:%3px;")
                    .arg(format.rightMargin())
                    .arg(format.leftMargin())
                    .arg(format.textIndent());
  QString html;
  for (const Piece& piece : paragraph.pieces) html += htmlOf(piece, setting);
  if (paragraph.pieces.empty()) {  // Qt's own way of writing an empty line, as high as its font
    css += "-qt-paragraph-type:empty;" + cssOf(formatOf(*paragraph.attributes, setting));
    html = "<br/>";
  }
  return "<p" + attributesOf(format) + " style=\"" + css.toHtmlEscaped() + "\">" + html + "</p>";
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
