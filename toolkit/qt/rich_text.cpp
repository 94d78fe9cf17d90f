// Runs become fragments with a character format, paragraphs become blocks with a block format.

#include "toolkit/qt/rich_text.hpp"

#include <QTextBlock>
#include <QTextBlockFormat>
#include <QTextCharFormat>
#include <QTextCursor>
#include <QTextOption>
#include <algorithm>

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

/// Writes runs one behind the other; a paragraph has the format of its first character.
class Writer {
 public:
  Writer(QTextDocument& document, const TextSetting& setting)
      : cursor_(&document), setting_(setting) {}

  void write(QString text, const TextAttributes& attributes) {
    const QTextCharFormat format = formatOf(attributes, setting_);
    const QStringList lines = text.replace("\r\n", "\n").replace('\r', '\n').split('\n');
    for (qsizetype i = 0; i < lines.size(); ++i) {
      if (i > 0) {
        cursor_.insertBlock(blockFormatOf(attributes, setting_), format);
        atStart_ = true;
      }
      if (lines[i].isEmpty()) continue;
      if (atStart_) cursor_.setBlockFormat(blockFormatOf(attributes, setting_));
      atStart_ = false;
      cursor_.insertText(lines[i], format);
    }
  }

 private:
  QTextCursor cursor_;
  const TextSetting& setting_;
  bool atStart_ = true;  // of a paragraph
};

}  // namespace

void showIn(QTextDocument& document, const AttributedString& text, const TextSetting& setting) {
  const bool undo = document.isUndoRedoEnabled();
  document.setUndoRedoEnabled(false);  // what a script shows is no edit of the user's
  document.clear();
  document.setDefaultFont(setting.font);
  QTextOption option = document.defaultTextOption();
  option.setTextDirection(setting.direction);
  document.setDefaultTextOption(option);

  Writer writer(document, setting);
  const std::string& whole = text.string();
  for (const TextRun& run : text.runs()) {
    std::string_view part = std::string_view(whole).substr(run.range.location, run.range.length);
    const bool last = run.range.location + run.range.length == whole.size();
    if (last && setting.dropsLastLineEnd && part.ends_with('\n')) part.remove_suffix(1);
    writer.write(qString(part), run.attributes);
  }
  document.setUndoRedoEnabled(undo);
}

QString htmlOf(const AttributedString& text, const TextSetting& setting) {
  QTextDocument document;
  showIn(document, text, setting);
  QString html = document.toHtml();
  // Qt leaves out that a paragraph is on the left, and takes the label's alignment for it then.
  qsizetype tag = -1;
  for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
    tag = html.indexOf("<p", tag + 1);
    if (tag < 0) break;
    if (block.blockFormat().alignment() & Qt::AlignAbsolute)
      html.insert(tag + 2, " align=\"left\"");
  }
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
