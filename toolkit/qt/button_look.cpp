// What buttons show. The drawing follows Qt's own styles step by step: bevel or indicator, then the
// label, then the focus; only the step that is ours is replaced.

#include "toolkit/qt/button_look.hpp"

#include <QAbstractTextDocumentLayout>
#include <QApplication>
#include <QCheckBox>
#include <QCommandLinkButton>
#include <QEvent>
#include <QPointer>
#include <QPushButton>
#include <QRadioButton>
#include <QStyleOption>
#include <QStylePainter>
#include <QTextDocument>
#include <QTimer>
#include <QToolButton>

#include "toolkit/qt/accessibility.hpp"
#include "toolkit/qt/contrast.hpp"
#include "toolkit/qt/decoration.hpp"
#include "toolkit/qt/mnemonics.hpp"
#include "toolkit/qt/rich_text.hpp"
#include "toolkit/qt/strings.hpp"

namespace toolkit::qt {

namespace {

/// How long an outline outlasts a highlight, in milliseconds: longer than the half second between
/// two flashes, so that it is steady.
constexpr int outlineRest = 1200;

bool isSet(const QByteArray& value) { return !value.isEmpty() && value != "0"; }

bool prefersReducedMotion() {
  return isSet(qApp->property(reducedMotionProperty).toByteArray()) ||
         isSet(qgetenv(reducedMotionVariable));
}

// The way to operations that Qt keeps for subclasses: subclasses of the host's are asked as well.
struct PushButtonStyle : QPushButton {
  using QPushButton::initStyleOption;
};
struct CheckBoxStyle : QCheckBox {
  using QCheckBox::initStyleOption;
};
struct RadioButtonStyle : QRadioButton {
  using QRadioButton::initStyleOption;
};
struct ToolButtonStyle : QToolButton {
  using QToolButton::initStyleOption;
};

/// Whether the button is of a kind that is drawn here.
bool isDrawnHere(const QAbstractButton& button) {
  if (qobject_cast<const QCommandLinkButton*>(&button)) return false;
  return qobject_cast<const QPushButton*>(&button) || qobject_cast<const QCheckBox*>(&button) ||
         qobject_cast<const QRadioButton*>(&button) || qobject_cast<const QToolButton*>(&button);
}

class ButtonLook final : public QObject {
 public:
  explicit ButtonLook(QAbstractButton& button) : QObject(&button), button_(button) {
    button.installEventFilter(this);
  }

  void setTitle(const AttributedString& title);
  /// The button's own text and font count again.
  void dropTitle();
  const std::optional<AttributedString>& title() const { return title_; }
  bool isTitleStale() const { return title_ && button_.text() != titleText_; }

  void setHighlighted(bool highlighted);
  bool isHighlighted() const { return highlighted_; }

  void setFaceColor(const Color& color) { face_ = color; }
  const std::optional<Color>& faceColor() const { return face_; }
  void setBezel(BezelStyle bezel) { bezel_ = bezel; }

  /// Whether the button looks as it would without this.
  bool isIdle() const {
    return !title_ && !highlighted_ && !outlined_ && !face_ && bezel_ == BezelStyle::rounded;
  }

  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  /// Those of text, and of what it stands on.
  struct Colors {
    QColor ink;
    QColor ground;
  };

  void leaveIfIdle();
  void paint();
  /// Lets a button of another class draw itself and adds what is wanted.
  void paintOver(QEvent& event);
  void paintPushButton(QStylePainter& painter);
  void paintToggle(QStylePainter& painter, QStyleOptionButton& option, bool radio);
  void paintToolButton(QStylePainter& painter);
  void paintSquareBevel(QPainter& painter, const QStyleOptionButton& option) const;
  void paintTitle(QPainter& painter, QRect place, const QIcon& icon, const QSize& iconSize,
                  const Colors& colors, Qt::Alignment unasked) const;
  void paintFace(QPainter& painter, const QStyleOption& option) const;
  void paintOutline(QPainter& painter) const;
  void adapt(QStyleOption& option) const;
  static Colors colorsOf(const QPalette& palette) {
    return {palette.color(QPalette::ButtonText), palette.color(QPalette::Button)};
  }

  QAbstractButton& button_;  // its parent
  std::optional<AttributedString> title_;
  QString titleText_;  // what the button was given for it
  QFont ownFont_;      // which the title replaced
  bool hadOwnFont_ = false;
  bool highlighted_ = false;
  bool outlined_ = false;  // the highlight's stand-in where no motion is wanted
  std::optional<Color> face_;
  BezelStyle bezel_ = BezelStyle::rounded;
  bool isPaintingItself_ = false;
  QTimer outlineEnd_;
};

void ButtonLook::setTitle(const AttributedString& title) {
  dropTitle();
  ownFont_ = button_.font();
  hadOwnFont_ = button_.testAttribute(Qt::WA_SetFont);
  title_ = title;
  titleText_ = withoutMeaning(qString(title.string()));
  button_.setText(titleText_);
  // Qt measures a button by its font: this makes room for the title in layouts.
  const QFont largest = largestFont(title, ownFont_);
  if (QFontMetrics(largest).height() > QFontMetrics(ownFont_).height()) button_.setFont(largest);
}

void ButtonLook::dropTitle() {
  if (!title_) return;
  title_.reset();
  button_.setFont(hadOwnFont_ ? ownFont_ : QFont());
}

void ButtonLook::setHighlighted(bool highlighted) {
  highlighted_ = highlighted;
  if (prefersReducedMotion() && highlighted) {
    outlined_ = true;
    outlineEnd_.stop();
  } else if (outlined_ && !outlineEnd_.isActive()) {
    outlineEnd_.setSingleShot(true);
    outlineEnd_.callOnTimeout(this, [this] {
      outlined_ = false;
      button_.update();
      leaveIfIdle();
    });
    outlineEnd_.start(outlineRest);
  }
}

bool ButtonLook::eventFilter(QObject*, QEvent* event) {
  if (event->type() != QEvent::Paint) return false;
  if (isTitleStale()) {
    dropTitle();
    leaveIfIdle();
  }
  if (isIdle() || isPaintingItself_) return false;
  if (!isDrawnHere(button_)) {
    paintOver(*event);
  } else {
    paint();
  }
  return true;
}

// Not at once: this may be called from what must not be gone when it returns.
void ButtonLook::leaveIfIdle() {
  const QPointer<ButtonLook> look(this);
  QTimer::singleShot(0, &button_, [look] {
    if (look && look->isIdle()) delete look;
  });
}

void ButtonLook::paintOver(QEvent& event) {
  isPaintingItself_ = true;
  static_cast<QObject&>(button_).event(&event);
  isPaintingItself_ = false;
  QPainter painter(&button_);
  if (highlighted_ && !outlined_) painter.fillRect(button_.rect(), QColor(0, 0, 0, 80));
  if (outlined_) paintOutline(painter);
}

void ButtonLook::adapt(QStyleOption& option) const {
  if (highlighted_ && !outlined_) {
    option.state |= QStyle::State_Sunken;
    option.state &= ~QStyle::State_Raised;
  }
  if (!face_) return;
  const bool sunken = option.state & (QStyle::State_Sunken | QStyle::State_On);
  const QColor face = sunken ? qColor(*face_).darker(125) : qColor(*face_);
  const QColor ink = readableOn(face, option.palette.color(QPalette::Active, QPalette::ButtonText));
  option.palette.setColor(QPalette::Button, face);
  option.palette.setColor(QPalette::ButtonText, ink);
  option.palette.setColor(QPalette::Disabled, QPalette::ButtonText, halfway(ink, face));
}

void ButtonLook::paint() {
  QStylePainter painter(&button_);
  QStyleOptionButton option;
  if (qobject_cast<QPushButton*>(&button_)) {
    paintPushButton(painter);
  } else if (auto* const box = qobject_cast<QCheckBox*>(&button_)) {
    (box->*&CheckBoxStyle::initStyleOption)(&option);
    paintToggle(painter, option, false);
  } else if (auto* const radio = qobject_cast<QRadioButton*>(&button_)) {
    (radio->*&RadioButtonStyle::initStyleOption)(&option);
    paintToggle(painter, option, true);
  } else {
    paintToolButton(painter);
  }
  if (outlined_) paintOutline(painter);
}

void ButtonLook::paintPushButton(QStylePainter& painter) {
  QStyleOptionButton option;
  (qobject_cast<QPushButton*>(&button_)->*&PushButtonStyle::initStyleOption)(&option);
  adapt(option);
  if (bezel_ == BezelStyle::texturedSquare) {
    paintSquareBevel(painter, option);
  } else {
    painter.drawControl(QStyle::CE_PushButtonBevel, option);
  }

  if (face_) paintFace(painter, option);

  QStyle& style = *button_.style();
  QStyleOptionButton label = option;
  label.rect = style.subElementRect(QStyle::SE_PushButtonContents, &option, &button_);
  if (title_) {
    paintTitle(painter, label.rect, option.icon, option.iconSize, colorsOf(option.palette),
               Qt::AlignHCenter);
  } else {
    painter.drawControl(QStyle::CE_PushButtonLabel, label);
  }
  if (!(option.state & QStyle::State_HasFocus)) return;
  QStyleOptionFocusRect focus;
  focus.QStyleOption::operator=(option);
  focus.rect = style.subElementRect(QStyle::SE_PushButtonFocusRect, &option, &button_);
  painter.drawPrimitive(QStyle::PE_FrameFocusRect, focus);
}

void ButtonLook::paintToggle(QStylePainter& painter, QStyleOptionButton& option, bool radio) {
  adapt(option);
  const QRect contents = button_.style()->subElementRect(
      radio ? QStyle::SE_RadioButtonContents : QStyle::SE_CheckBoxContents, &option, &button_);
  QColor ink = option.palette.color(QPalette::WindowText);
  QColor ground = option.palette.color(QPalette::Window);
  if (face_) {
    painter.fillRect(contents.adjusted(-2, 0, 2, 0), qColor(*face_));
    ground = qColor(*face_);
    ink = option.palette.color(QPalette::ButtonText);
    option.palette.setColor(QPalette::WindowText, ink);
  }
  const QIcon icon = option.icon;
  if (title_) {
    option.text.clear();
    option.icon = {};
  }
  painter.drawControl(radio ? QStyle::CE_RadioButton : QStyle::CE_CheckBox, option);
  if (title_) paintTitle(painter, contents, icon, option.iconSize, {ink, ground}, Qt::AlignLeading);
}

void ButtonLook::paintToolButton(QStylePainter& painter) {
  QStyleOptionToolButton option;
  (qobject_cast<QToolButton*>(&button_)->*&ToolButtonStyle::initStyleOption)(&option);
  adapt(option);
  const QIcon icon = option.icon;
  if (title_) {
    option.text.clear();
    option.icon = {};
  }
  painter.drawComplexControl(QStyle::CC_ToolButton, option);
  if (!title_) return;
  const QRect face = button_.style()->subControlRect(QStyle::CC_ToolButton, &option,
                                                     QStyle::SC_ToolButton, &button_);
  paintTitle(painter, face, icon, option.iconSize, colorsOf(option.palette), Qt::AlignHCenter);
}

/// A flat square with a slight sheen, pressed in where the option says so.
void ButtonLook::paintSquareBevel(QPainter& painter, const QStyleOptionButton& option) const {
  const QColor face = option.palette.color(QPalette::Button);
  const bool sunken = option.state & (QStyle::State_Sunken | QStyle::State_On);
  const QRectF square = QRectF(option.rect).adjusted(0.5, 0.5, -0.5, -0.5);
  QLinearGradient sheen(square.topLeft(), square.bottomLeft());
  // Less deep where the title is grey, which would drown in it.
  const int depth = button_.isEnabled() ? 130 : 110;
  sheen.setColorAt(0, sunken ? face.darker(depth) : face.lighter(106));
  sheen.setColorAt(1, sunken ? face.darker(depth - 10) : face.darker(106));
  const bool focused = option.state & QStyle::State_HasFocus;
  painter.setPen(focused ? option.palette.color(QPalette::Highlight) : face.darker(170));
  painter.setBrush(sheen);
  painter.drawRect(square);
}

void ButtonLook::paintTitle(QPainter& painter, QRect place, const QIcon& icon,
                            const QSize& iconSize, const Colors& colors,
                            Qt::Alignment unasked) const {
  painter.save();
  painter.setClipRect(place, Qt::IntersectClip);
  if (!icon.isNull()) {
    const QRect around = QStyle::alignedRect(button_.layoutDirection(),
                                             Qt::AlignLeading | Qt::AlignVCenter, iconSize, place);
    icon.paint(&painter, around, Qt::AlignCenter,
               button_.isEnabled() ? QIcon::Normal : QIcon::Disabled);
    const int used = iconSize.width() + 4;
    button_.isRightToLeft() ? place.setRight(place.right() - used)
                            : place.setLeft(place.left() + used);
  }

  QTextDocument document;
  document.setDocumentMargin(0);
  document.documentLayout()->setPaintDevice(&button_);
  TextSetting setting{ownFont_, button_.palette().color(QPalette::Active, QPalette::Link),
                      colors.ground, unasked, button_.layoutDirection()};
  setting.greyed = !button_.isEnabled();
  showIn(document, *title_, setting);
  document.setTextWidth(place.width());
  if (document.size().height() > place.height()) {
    // Too much to break lines: the beginning of each is better than the upper half of some.
    QTextOption option = document.defaultTextOption();
    option.setWrapMode(QTextOption::NoWrap);
    document.setDefaultTextOption(option);
  }
  const double spare = place.height() - document.size().height();
  painter.translate(place.x(), place.y() + std::max(0.0, spare / 2));
  QAbstractTextDocumentLayout::PaintContext context;
  context.palette = button_.palette();
  context.palette.setColor(QPalette::Text, colors.ink);
  document.documentLayout()->draw(&painter, context);
  painter.restore();
}

/// The colour itself, within the bezel: styles make lighter and darker shades of it.
void ButtonLook::paintFace(QPainter& painter, const QStyleOption& option) const {
  painter.save();
  painter.setRenderHint(QPainter::Antialiasing);
  painter.setPen(Qt::NoPen);
  painter.setBrush(option.palette.color(QPalette::Button));
  painter.drawRoundedRect(option.rect.adjusted(2, 2, -2, -2), 1, 1);
  painter.restore();
}

void ButtonLook::paintOutline(QPainter& painter) const {
  painter.setBrush(Qt::NoBrush);
  painter.setPen(QPen(button_.palette().color(QPalette::Highlight), 2));
  painter.drawRect(QRectF(button_.rect()).adjusted(1, 1, -1, -1));
}

/// Changes the button's look and redraws it; a look that changes nothing any more goes.
template <class Change>
void changeLook(QAbstractButton& button, const Change& change) {
  ButtonLook& look = decorated<ButtonLook>(button);
  change(look);
  if (look.isIdle()) delete &look;
  button.update();
}

}  // namespace

void showTitle(QAbstractButton& button, std::string_view title) {
  if (decorationOn<ButtonLook>(button)) {
    changeLook(button, [](ButtonLook& look) { look.dropTitle(); });
  }
  button.setText(withoutMeaning(qString(title)));
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

void setFaceColor(QAbstractButton& button, const Color& color) {
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

}  // namespace toolkit::qt
