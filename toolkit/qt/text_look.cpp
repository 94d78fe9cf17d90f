// SPDX-License-Identifier: MIT
// What labels, line edits and text edits show.

#include "toolkit/qt/text_look.hpp"

#include <QEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QSignalBlocker>
#include <QTextDocument>
#include <QTextEdit>

#include "toolkit/qt/accessibility.hpp"
#include "toolkit/qt/decoration.hpp"
#include "toolkit/qt/edit_dress.hpp"
#include "toolkit/qt/label_page.hpp"
#include "toolkit/qt/mnemonics.hpp"
#include "toolkit/qt/rich_text.hpp"
#include "toolkit/qt/strings.hpp"

namespace qz::toolkit::qt {

namespace {

/// Returns the document of a text edit or plain text edit; null for other widgets.
QTextDocument* documentOf(const QWidget& widget) {
  if (const auto* const edit = qobject_cast<const QTextEdit*>(&widget)) return edit->document();
  if (const auto* const edit = qobject_cast<const QPlainTextEdit*>(&widget)) {
    return edit->document();
  }
  return nullptr;
}

/// True if `c` ends a line in a Qt document. The last two surround tables.
bool endsLine(QChar c) {
  return c == QChar::ParagraphSeparator || c == QChar::LineSeparator || c == QChar(0xfdd0) ||
         c == QChar(0xfdd1);
}

/// Returns the text with no-break spaces, which `toPlainText` would replace.
QString textOf(const QTextDocument& document) {
  QString text = document.toRawText();
  for (QChar& c : text) {
    if (endsLine(c)) c = u'\n';
  }
  return text;
}

/// Returns the widget's own text, to detect whether somebody has changed it.
QString rawText(const QWidget& widget) {
  if (const auto* const label = qobject_cast<const QLabel*>(&widget)) return label->text();
  if (const auto* const edit = qobject_cast<const QLineEdit*>(&widget)) return edit->text();
  const QTextDocument* const document = documentOf(widget);
  return document ? textOf(*document) : QString();
}

QString plainTextOf(const QLabel& label) {
  const QString text = label.text();
  const Qt::TextFormat format = label.textFormat();
  const bool rich = format == Qt::RichText || (format == Qt::AutoText && Qt::mightBeRichText(text));
  if (rich || format == Qt::MarkdownText) {
    QTextDocument document;
    rich ? document.setHtml(text) : document.setMarkdown(text);
    return document.toPlainText();
  }
  return label.buddy() ? withoutMnemonic(text) : text;
}

/// Makes an edit write further text in its own font and colour.
void forgetFormat(QWidget& widget) {
  if (auto* const edit = qobject_cast<QTextEdit*>(&widget)) edit->setCurrentCharFormat({});
  if (auto* const edit = qobject_cast<QPlainTextEdit*>(&widget)) edit->setCurrentCharFormat({});
}

void showPlain(QLabel& label, const QString& text) {
  const Qt::TextFormat format = label.textFormat();
  const bool guesses = format == Qt::AutoText;
  if (guesses ? Qt::mightBeRichText(text) : format != Qt::PlainText) {
    label.setTextFormat(Qt::PlainText);
  }
  label.setText(label.buddy() ? withoutMeaning(text) : text);
}

void showRich(QLabel& label, const QString& html) {
  const Qt::TextFormat format = label.textFormat();
  if (format != Qt::RichText && format != Qt::AutoText) label.setTextFormat(Qt::RichText);
  label.setText(html);
}

/// Remembers the attributed text of a widget, and shows it again when the widget's colours or
/// direction change: Qt neither greys coloured text nor turns it to the other writing direction.
class TextLook final : public QObject {
 public:
  explicit TextLook(QWidget& widget) : QObject(&widget), widget_(widget) {
    widget.installEventFilter(this);
  }

  void show(const AttributedString& text) {
    takeOff();
    text_ = text;
    draw();
    putOn();
    if (qobject_cast<QLabel*>(&widget_)) announceShownName(widget_, qString(text.string()));
  }
  const AttributedString& text() const { return text_; }
  /// Restores the widget to its state before the text was shown.
  void takeOff() {
    if (auto* const line = qobject_cast<QLineEdit*>(&widget_)) dress_.takeOff(*line);
    if (auto* const edit = qobject_cast<QPlainTextEdit*>(&widget_)) dress_.takeOff(*edit);
  }
  bool isStale() const { return rawText(widget_) != raw_; }

  bool eventFilter(QObject*, QEvent* event) override {
    switch (event->type()) {
      case QEvent::Paint:
        return paint();
      case QEvent::EnabledChange:
      case QEvent::PaletteChange:
      case QEvent::LayoutDirectionChange:
        if (!isStale()) redraw();
        return false;
      case QEvent::FontChange:
      case QEvent::StyleChange:
        page_.forget();
        return false;
      default:
        return false;
    }
  }

 private:
  void putOn() {
    if (auto* const line = qobject_cast<QLineEdit*>(&widget_)) {
      dress_.putOn(*line, text_, setting());
    }
    if (auto* const edit = qobject_cast<QPlainTextEdit*>(&widget_)) {
      dress_.putOn(*edit, text_, setting());
    }
  }

  void redraw() {
    if (qobject_cast<QLineEdit*>(&widget_)) return;   // the palette does it
    const QSignalBlocker quiet(documentOf(widget_));  // the text stays the same
    draw();
  }

  /// Paints a label's text. Returns false if the widget must paint itself.
  bool paint() {
    auto* const label = qobject_cast<QLabel*>(&widget_);
    if (!label || isStale() || !LabelPage::canDraw(*label)) return false;
    if (!page_.isFor(*label)) page_.set(*label, text_, setting());
    page_.draw(*label);
    return true;
  }

  TextSetting setting() const {
    TextSetting setting{widget_.font(), {}, {}};
    // As Qt does for plain text: a label takes the direction of its whole text, an edit that of
    // each paragraph.
    setting.direction = documentOf(widget_) ? Qt::LayoutDirectionAuto : writingDirectionOf(text_);
    setting.greyed = !widget_.isEnabled();
    // Only if needed: Qt takes long to find the effective palette.
    if (setting.greyed || hasLinks(text_)) setColors(setting);
    if (const auto* const label = qobject_cast<QLabel*>(&widget_)) {
      setting.unasked = label->alignment() & Qt::AlignHorizontal_Mask;
    }
    return setting;
  }

  void setColors(TextSetting& setting) const {
    const QPalette palette = widget_.palette();
    const bool edited = documentOf(widget_);
    setting.link = palette.color(QPalette::Active, QPalette::Link);
    setting.ground = palette.color(edited ? QPalette::Base : widget_.backgroundRole());
    if (setting.greyed) {
      setting.ink = palette.color(edited ? QPalette::Text : widget_.foregroundRole());
    }
  }

  void draw() {
    page_.forget();
    if (auto* const label = qobject_cast<QLabel*>(&widget_)) {
      showRich(*label, htmlOf(text_, setting()));
    } else if (auto* const edit = qobject_cast<QLineEdit*>(&widget_)) {
      edit->setText(qString(text_.string()));
    } else if (QTextDocument* const document = documentOf(widget_)) {
      TextSetting whole = setting();
      whole.dropsLastLineEnd = false;  // the user may edit it
      showIn(*document, text_, whole);
    }
    raw_ = rawText(widget_);
  }

  QWidget& widget_;  // its parent
  AttributedString text_;
  QString raw_;
  LabelPage page_;  // for a label
  EditDress dress_;
};

}  // namespace

bool showsText(const QWidget& widget) {
  return qobject_cast<const QLabel*>(&widget) || qobject_cast<const QLineEdit*>(&widget) ||
         documentOf(widget);
}

std::optional<AttributedString> styledText(const QWidget& widget) {
  const auto* const look = decorationOn<TextLook>(widget);
  return look ? std::optional(look->text()) : std::nullopt;
}

void dropStyledText(QWidget& widget) {
  auto* const look = decorationOn<TextLook>(widget);
  if (!look) return;
  look->takeOff();
  delete look;
  forgetFormat(widget);
}

void showText(QWidget& widget, std::string_view text) {
  dropStyledText(widget);
  const QString plain = qString(text);
  if (auto* const label = qobject_cast<QLabel*>(&widget)) {
    showPlain(*label, plain);
    announceShownName(widget, plain);
  } else if (auto* const line = qobject_cast<QLineEdit*>(&widget)) {
    line->setText(plain);
  } else if (auto* const edit = qobject_cast<QTextEdit*>(&widget)) {
    edit->setPlainText(plain);
  } else if (auto* const plainEdit = qobject_cast<QPlainTextEdit*>(&widget)) {
    plainEdit->setPlainText(plain);
  }
}

void showText(QWidget& widget, const AttributedString& text) {
  if (isPlain(text)) return showText(widget, text.string());
  if (showsText(widget)) decorated<TextLook>(widget).show(text);
}

AttributedString shownText(const QWidget& widget) {
  const auto* const look = decorationOn<TextLook>(widget);
  if (look && !look->isStale()) return look->text();
  const auto* const label = qobject_cast<const QLabel*>(&widget);
  return AttributedString(utf8(label ? plainTextOf(*label) : rawText(widget)));
}

void layOutAsTextField(QLabel& label) {
  label.setWordWrap(true);
  label.setAlignment(Qt::AlignTop | Qt::AlignLeading);
}

}  // namespace qz::toolkit::qt
