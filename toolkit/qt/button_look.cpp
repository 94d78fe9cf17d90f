// SPDX-License-Identifier: MIT
// Remembers what buttons show, and takes over their painting while there is something to add.

#include "toolkit/qt/button_look.hpp"

#include <QAbstractButton>
#include <QApplication>
#include <QEvent>
#include <QTimer>

#include "toolkit/qt/accessibility.hpp"
#include "toolkit/qt/button_painting.hpp"
#include "toolkit/qt/decoration.hpp"
#include "toolkit/qt/fonts.hpp"
#include "toolkit/qt/mnemonics.hpp"
#include "toolkit/qt/rich_text.hpp"
#include "toolkit/qt/strings.hpp"
#include "toolkit/qt/user_preferences.hpp"
#include "toolkit/qt/widget_colors.hpp"

namespace qz::toolkit::qt {

namespace {

/// How long an outline outlasts a highlight, in milliseconds. Longer than the half second between
/// two flashes, so that the outline does not blink.
constexpr int outlineRest = 1200;

class ButtonLook final : public QObject {
 public:
  explicit ButtonLook(QAbstractButton& button) : QObject(&button), button_(button) {
    button.installEventFilter(this);
    outlineEnd_.setSingleShot(true);
    outlineEnd_.callOnTimeout(this, [this] { dropOutline(); });
  }

  void setTitle(const AttributedString& title);
  /// Restores the button's own text and font.
  void dropTitle();
  const std::optional<AttributedString>& title() const { return shown_.title; }
  bool isTitleStale() const { return title() && button_.text() != titleText_; }

  void setHighlighted(bool highlighted);
  bool isHighlighted() const { return highlighted_; }

  void setFaceColor(const std::optional<Color>& color) { shown_.face = color; }
  const std::optional<Color>& faceColor() const { return shown_.face; }
  void setBezel(BezelStyle bezel) { shown_.bezel = bezel; }

  /// True if the button looks and reads as it would without this object.
  bool isIdle() const { return shown_.isNothing() && !highlighted_; }

  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  void giveToWidget(const TextAttributes& attributes);
  void dropOutline();
  void leaveIfIdle();

  QAbstractButton& button_;  // its parent
  ButtonAppearance shown_;
  QString titleText_;  // the text that the button was given
  bool hadOwnFont_ = false;
  std::optional<WidgetColors> colors_;  // for a button that draws its title itself
  bool highlighted_ = false;
  bool isPaintingItself_ = false;
  QTimer outlineEnd_;
};

void ButtonLook::setTitle(const AttributedString& title) {
  dropTitle();
  const QFont own = button_.font();
  hadOwnFont_ = button_.testAttribute(Qt::WA_SetFont);
  shown_.title = title;
  shown_.titleFont = own;
  titleText_ = withoutMeaning(qString(title.string()));
  button_.setText(titleText_);
  // Qt measures a button by its font, so the largest font makes room for the title in layouts.
  const QFont largest = largestFont(title, own);
  if (QFontMetrics(largest).height() > QFontMetrics(own).height()) button_.setFont(largest);
  if (!isDrawnByStyle(button_)) giveToWidget(commonAttributes(title));
}

void ButtonLook::giveToWidget(const TextAttributes& attributes) {
  if (attributes.font) button_.setFont(qFont(*attributes.font));
  if (attributes.foregroundColor) {
    colors_.emplace(button_, button_.foregroundRole(), *attributes.foregroundColor);
  }
}

void ButtonLook::dropTitle() {
  if (!title()) return;
  shown_.title.reset();
  if (colors_) colors_->restore();
  colors_.reset();
  button_.setFont(hadOwnFont_ ? shown_.titleFont : QFont());
}

void ButtonLook::setHighlighted(bool highlighted) {
  highlighted_ = highlighted;
  if (highlighted && prefersReducedMotion()) {
    shown_.outlined = true;
    outlineEnd_.stop();
  } else if (shown_.outlined && !outlineEnd_.isActive()) {
    outlineEnd_.start(outlineRest);
  }
  shown_.pressed = highlighted && !shown_.outlined;
}

void ButtonLook::dropOutline() {
  shown_.outlined = false;
  button_.update();
  leaveIfIdle();
}

bool ButtonLook::eventFilter(QObject*, QEvent* event) {
  if (event->type() != QEvent::Paint) return false;
  if (isTitleStale()) {
    dropTitle();
    leaveIfIdle();
  }
  if (isIdle() || isPaintingItself_) return false;
  if (isDrawnByStyle(button_)) {
    paintButton(button_, shown_);
  } else {
    isPaintingItself_ = true;
    static_cast<QObject&>(button_).event(event);
    isPaintingItself_ = false;
    paintOver(button_, shown_);
  }
  return true;
}

// Waits for the event loop: a caller may still be using this object.
void ButtonLook::leaveIfIdle() {
  QTimer::singleShot(0, this, [this] {
    if (isIdle()) delete this;
  });
}

/// Changes the button's look and redraws the button; a look that adds nothing any more is deleted.
template <class Change>
void changeLook(QAbstractButton& button, const Change& change) {
  auto& look = decorated<ButtonLook>(button);
  change(look);
  if (look.isIdle()) delete &look;
  button.update();
}

}  // namespace

void restoreTitle(QAbstractButton& button, const QString& text) {
  if (decorationOn<ButtonLook>(button)) {
    changeLook(button, [](ButtonLook& look) { look.dropTitle(); });
  }
  button.setText(text);
}

std::optional<AttributedString> styledTitle(const QAbstractButton& button) {
  const auto* const look = decorationOn<ButtonLook>(button);
  return look ? look->title() : std::nullopt;
}

void showTitle(QAbstractButton& button, std::string_view title) {
  restoreTitle(button, withoutMeaning(qString(title)));
  announceShownName(button, qString(title));
}

void showTitle(QAbstractButton& button, const AttributedString& title) {
  if (isPlain(title)) return showTitle(button, title.string());
  changeLook(button, [&](ButtonLook& look) { look.setTitle(title); });
  announceShownName(button, qString(title.string()));
}

AttributedString shownTitle(const QAbstractButton& button) {
  const auto* const look = decorationOn<ButtonLook>(button);
  if (look && look->title() && !look->isTitleStale()) return *look->title();
  return AttributedString(utf8(withoutMnemonic(button.text())));
}

void setHighlighted(QAbstractButton& button, bool highlighted) {
  if (isHighlighted(button) == highlighted) return;
  changeLook(button, [&](ButtonLook& look) { look.setHighlighted(highlighted); });
}

bool isHighlighted(const QAbstractButton& button) {
  const auto* const look = decorationOn<ButtonLook>(button);
  return look && look->isHighlighted();
}

void setFaceColor(QAbstractButton& button, const std::optional<Color>& color) {
  changeLook(button, [&](ButtonLook& look) { look.setFaceColor(color); });
}

std::optional<Color> faceColor(const QAbstractButton& button) {
  const auto* const look = decorationOn<ButtonLook>(button);
  return look ? look->faceColor() : std::nullopt;
}

void setBezel(QAbstractButton& button, BezelStyle style) {
  if (style == BezelStyle::rounded && !decorationOn<ButtonLook>(button)) return;
  changeLook(button, [&](ButtonLook& look) { look.setBezel(style); });
}

}  // namespace qz::toolkit::qt
