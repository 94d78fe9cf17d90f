// SPDX-License-Identifier: MIT
// Follows the drawing steps of Qt's own styles: bevel or indicator, then the label, then the focus.
// Replaces only the steps that the style cannot do.

#include "toolkit/qt/button_painting.hpp"

#include <QAbstractTextDocumentLayout>
#include <QCheckBox>
#include <QCommandLinkButton>
#include <QPushButton>
#include <QRadioButton>
#include <QStyleOption>
#include <QStylePainter>
#include <QTextDocument>
#include <QToolButton>
#include <algorithm>
#include <optional>

#include "toolkit/qt/contrast.hpp"
#include "toolkit/qt/mnemonics.hpp"
#include "toolkit/qt/rich_text.hpp"
#include "toolkit/qt/strings.hpp"

namespace qz::toolkit::qt {

namespace {

// Give access to protected operations of Qt's classes; overrides in the host's subclasses are
// called too.
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

/// The colours of text and of its background.
struct Colors {
  QColor ink;
  QColor ground;
};

Colors colorsOf(const QPalette& palette) {
  return {palette.color(QPalette::ButtonText), palette.color(QPalette::Button)};
}

bool isSunken(const QStyleOption& option) {
  return option.state & (QStyle::State_Sunken | QStyle::State_On);
}

/// A label that is drawn in place of the style's own.
struct Label {
  QRect place;
  QIcon icon;
  QSize iconSize;
  Colors colors;
  Qt::Alignment unasked;
  QFont font;                // for text that sets no font
  std::optional<int> top{};  // the title begins here if it fits; absent: in the middle
};

/// Returns the width of a frame that covers an eighth of `area`.
int widthOfFrame(const QSize& area) {
  const int wanted = area.width() * area.height() / 8;
  int width = 1;
  while (2 * width * (area.width() + area.height() - 2 * width) < wanted) ++width;
  return width;
}

QRect paintFrame(QPainter& painter, const QRect& area, const QColor& color) {
  const int width = widthOfFrame(area.size());
  const QRect inside = area.adjusted(width, width, -width, -width);
  for (const QRect& side : QRegion(area) - inside) painter.fillRect(side, color);
  return inside;
}

/// Paints the pressed-in look, since the style's own often looks the same or nearly so. On every
/// background either the dark frame or the light frame inside it is visible.
void paintPressedIn(QPainter& painter, const QRect& area) {
  const QRect inside = paintFrame(painter, area, QColor(0, 0, 0, 180));
  paintFrame(painter, inside, QColor(255, 255, 255, 180));
}

/// Tints what is already painted. Half of each colour stays, so a title of any colour stays
/// visible.
void tint(QPainter& painter, const QRect& area, QColor color) {
  color.setAlphaF(0.5F);
  painter.fillRect(area, color);
}

/// True if the button is a check box or a radio button. Then fills `option` as the button does for
/// its style.
bool initToggle(const QAbstractButton& button, QStyleOptionButton& option) {
  if (const auto* const box = qobject_cast<const QCheckBox*>(&button)) {
    (box->*&CheckBoxStyle::initStyleOption)(&option);
  } else if (const auto* const radio = qobject_cast<const QRadioButton*>(&button)) {
    (radio->*&RadioButtonStyle::initStyleOption)(&option);
  } else {
    return false;
  }
  return true;
}

class Painting {
 public:
  Painting(QAbstractButton& button, const ButtonAppearance& appearance)
      : button_(button), appearance_(appearance), painter_(&button) {}

  void paint();
  /// Tints the face of a button that has painted itself.
  void paintTint();
  /// Paints the highlight over everything else.
  void paintFlash();

 private:
  void paintOutline();
  void paintPushButton(const QPushButton& button);
  void paintCommandLink(const QCommandLinkButton& button);
  void paintDescription(const QCommandLinkButton& button, const QStyleOption& option,
                        const QRect& place);
  void paintToggle(QStyleOptionButton& option, bool radio);
  void paintIndicatorAgain();
  void paintToggleLabel(const QStyleOptionButton& option, const Label& label, bool radio);
  void paintToolButton(const QToolButton& button);
  void paintToolLabel(QStyleOptionToolButton option, Label label);
  void paintArrow(const QStyleOption& option, const QRect& place);
  void paintBevel(const QStyleOptionButton& option);
  void paintSquareBevel(const QStyleOptionButton& option);
  void paintFocus(const QStyleOptionButton& option, QStyle::SubElement place);
  void paintLabel(const Label& label);
  QRect paintIcon(const Label& label);
  void paintTitle(const QRect& place, const Label& label);
  void paintFace(const QStyleOption& option);
  void adapt(QStyleOption& option) const;
  Qt::Alignment leadingEdge() const;
  bool drawsTitle() const;
  AttributedString title() const;
  QFont titleFont() const;

  QAbstractButton& button_;
  const ButtonAppearance& appearance_;
  QStylePainter painter_;
};

void Painting::paint() {
  if (const auto* const link = qobject_cast<QCommandLinkButton*>(&button_)) {
    paintCommandLink(*link);
  } else if (const auto* const push = qobject_cast<QPushButton*>(&button_)) {
    paintPushButton(*push);
  } else if (QStyleOptionButton option; initToggle(button_, option)) {
    paintToggle(option, qobject_cast<QRadioButton*>(&button_));
  } else if (const auto* const tool = qobject_cast<QToolButton*>(&button_)) {
    paintToolButton(*tool);
  }
}

void Painting::adapt(QStyleOption& option) const {
  if (appearance_.pressed) {
    option.state |= QStyle::State_Sunken;
    option.state &= ~QStyle::State_Raised;
  }
  if (!appearance_.face) return;
  const QColor color = qColor(*appearance_.face);
  const QColor face = isSunken(option) ? color.darker(125) : color;
  const QColor ink = readableOn(face, option.palette.color(QPalette::Active, QPalette::ButtonText));
  option.palette.setColor(QPalette::Button, face);
  option.palette.setColor(QPalette::ButtonText, ink);
  option.palette.setColor(QPalette::Disabled, QPalette::ButtonText, halfway(ink, face));
}

/// The edge at which the button's lines begin, whatever the direction of their text.
Qt::Alignment Painting::leadingEdge() const {
  return (button_.isRightToLeft() ? Qt::AlignRight : Qt::AlignLeft) | Qt::AlignAbsolute;
}

/// True if the title is drawn here and not by the style. Style sheets draw titles in a colour of
/// their own, which may be unreadable on the face.
bool Painting::drawsTitle() const {
  return appearance_.title || (appearance_.face && button_.style()->inherits("QStyleSheetStyle") &&
                               !button_.text().isEmpty());
}

AttributedString Painting::title() const {
  return appearance_.title.value_or(AttributedString(utf8(withoutMnemonic(button_.text()))));
}

QFont Painting::titleFont() const {
  return appearance_.title ? appearance_.titleFont : button_.font();
}

void Painting::paintPushButton(const QPushButton& button) {
  QStyleOptionButton option;
  (button.*&PushButtonStyle::initStyleOption)(&option);
  adapt(option);
  paintBevel(option);

  QStyleOptionButton label = option;
  label.rect = button.style()->subElementRect(QStyle::SE_PushButtonContents, &option, &button);
  if (drawsTitle()) {
    paintLabel({label.rect, option.icon, option.iconSize, colorsOf(option.palette),
                Qt::AlignHCenter, titleFont()});
  } else {
    painter_.drawControl(QStyle::CE_PushButtonLabel, label);
  }
  paintFocus(option, QStyle::SE_PushButtonFocusRect);
}

void Painting::paintBevel(const QStyleOptionButton& option) {
  if (appearance_.bezel == BezelStyle::texturedSquare) {
    paintSquareBevel(option);
  } else {
    painter_.drawControl(QStyle::CE_PushButtonBevel, option);
  }
  if (appearance_.face) paintFace(option);
}

// The widget places its texts by itself, without the style; the numbers here are the widget's.
void Painting::paintCommandLink(const QCommandLinkButton& button) {
  QStyleOptionButton option;
  (button.*&PushButtonStyle::initStyleOption)(&option);
  adapt(option);
  option.features |= QStyleOptionButton::CommandLinkButton;
  paintBevel(option);

  const QSize icon = option.icon.isNull() ? QSize() : option.icon.actualSize(option.iconSize);
  option.icon.paint(&painter_, QRect(QPoint(7, 10), icon), Qt::AlignCenter,
                    button.isEnabled() ? QIcon::Normal : QIcon::Disabled);
  QFont font = titleFont();
  font.setBold(true);
  font.setPointSizeF(9);
  const int lineHeight = QFontMetrics(font).height();
  const bool alone = button.description().isEmpty();
  QRect place = button.rect().adjusted(icon.width() + 13, 10, -4, 0);
  if (alone) place.translate(0, std::max(0, (icon.height() - lineHeight) / 2));
  if (!alone) paintDescription(button, option, place.adjusted(0, lineHeight, 0, -10));
  if (appearance_.title) {
    const auto top = alone ? std::optional(place.top()) : std::nullopt;
    place = alone ? place.adjusted(0, -place.top(), 0, 0)
                  : QRect(place.topLeft(), QSize(place.width(), lineHeight));
    paintLabel({place, {}, {}, colorsOf(option.palette), leadingEdge(), font, top});
  } else {
    painter_.setFont(font);
    painter_.drawItemText(place, Qt::TextShowMnemonic, option.palette, button.isEnabled(),
                          button.text(), QPalette::ButtonText);
  }
  paintFocus(option, QStyle::SE_PushButtonFocusRect);
}

void Painting::paintDescription(const QCommandLinkButton& button, const QStyleOption& option,
                                const QRect& place) {
  painter_.setFont(button.font());
  painter_.drawItemText(place, Qt::TextShowMnemonic | Qt::TextWordWrap, option.palette,
                        button.isEnabled(), button.description(), QPalette::ButtonText);
}

void Painting::paintFocus(const QStyleOptionButton& option, QStyle::SubElement place) {
  if (!(option.state & QStyle::State_HasFocus)) return;
  QStyleOptionFocusRect focus;
  focus.QStyleOption::operator=(option);
  focus.rect = button_.style()->subElementRect(place, &option, &button_);
  painter_.drawPrimitive(QStyle::PE_FrameFocusRect, focus);
}

void Painting::paintToggle(QStyleOptionButton& option, bool radio) {
  QStyleOptionButton indicator = option;
  adapt(option);
  const QRect contents = button_.style()->subElementRect(
      radio ? QStyle::SE_RadioButtonContents : QStyle::SE_CheckBoxContents, &option, &button_);
  Colors colors{option.palette.color(QPalette::WindowText), option.palette.color(QPalette::Window)};
  if (appearance_.face) {
    colors = {option.palette.color(QPalette::ButtonText), qColor(*appearance_.face)};
    option.palette.setColor(QPalette::WindowText, colors.ink);
  }
  const auto control = radio ? QStyle::CE_RadioButton : QStyle::CE_CheckBox;
  if (!appearance_.title && !appearance_.face) return painter_.drawControl(control, option);
  indicator.state = option.state;  // keeps its own colours: a style may fill it with the face
  indicator.text.clear();
  indicator.icon = {};
  painter_.drawControl(control, indicator);
  paintToggleLabel(
      option, {contents, option.icon, option.iconSize, colors, leadingEdge(), titleFont()}, radio);
}

/// Repaints the indicator at the button's edge, part of which the frame of a flash covers.
void Painting::paintIndicatorAgain() {
  QStyleOptionButton option;
  if (!initToggle(button_, option)) return;
  const bool radio = qobject_cast<QRadioButton*>(&button_);
  option.state |= QStyle::State_Sunken;
  option.rect = button_.style()->subElementRect(
      radio ? QStyle::SE_RadioButtonIndicator : QStyle::SE_CheckBoxIndicator, &option, &button_);
  painter_.drawPrimitive(radio ? QStyle::PE_IndicatorRadioButton : QStyle::PE_IndicatorCheckBox,
                         option);
}

/// Paints the label over anything that a style sheet has drawn behind it.
void Painting::paintToggleLabel(const QStyleOptionButton& option, const Label& label, bool radio) {
  const QRect face =
      label.place.adjusted(button_.isRightToLeft() ? 0 : -2, 0, button_.isRightToLeft() ? 2 : 0, 0);
  if (appearance_.face) painter_.fillRect(face, label.colors.ground);
  if (drawsTitle()) {
    paintLabel(label);
  } else {
    QStyleOptionButton text = option;
    text.rect = label.place;
    painter_.drawControl(radio ? QStyle::CE_RadioButtonLabel : QStyle::CE_CheckBoxLabel, text);
  }
  if (appearance_.face) {
    paintFocus(option, radio ? QStyle::SE_RadioButtonFocusRect : QStyle::SE_CheckBoxFocusRect);
  }
}

void Painting::paintToolButton(const QToolButton& button) {
  QStyleOptionToolButton option;
  (button.*&ToolButtonStyle::initStyleOption)(&option);
  adapt(option);
  if (!appearance_.title && !appearance_.face) {
    return painter_.drawComplexControl(QStyle::CC_ToolButton, option);
  }
  QStyleOptionToolButton panel = option;
  panel.text.clear();
  panel.icon = {};
  panel.features &= ~QStyleOptionToolButton::Arrow;
  painter_.drawComplexControl(QStyle::CC_ToolButton, panel);
  option.rect = button.style()->subControlRect(QStyle::CC_ToolButton, &option,
                                               QStyle::SC_ToolButton, &button);
  if (appearance_.face) paintFace(option);
  paintToolLabel(option, {option.rect, option.icon, option.iconSize, colorsOf(option.palette),
                          Qt::AlignHCenter, titleFont()});
}

void Painting::paintToolLabel(QStyleOptionToolButton option, Label label) {
  const bool opensMenu = option.features & QStyleOptionToolButton::HasMenu;
  const bool hasPart = option.features & QStyleOptionToolButton::MenuButtonPopup;
  if (opensMenu && !hasPart) {
    paintArrow(option, QRect(option.rect.bottomRight() - QPoint(9, 9), QSize(7, 7)));
  }
  if (!appearance_.title) {
    option.rect.adjust(3, 3, -3, -3);
    return painter_.drawControl(QStyle::CE_ToolButtonLabel, option);
  }
  if (option.features & QStyleOptionToolButton::Arrow) {
    const QRect place = QStyle::alignedRect(option.direction, Qt::AlignLeading | Qt::AlignVCenter,
                                            QSize(16, 16), label.place.adjusted(4, 0, -4, 0));
    paintArrow(option, place.adjusted(3, 3, -3, -3));
    label.place.adjust(20, 0, -20, 0);
    // The style places plain titles like this.
    if (option.toolButtonStyle == Qt::ToolButtonTextBesideIcon) label.unasked = leadingEdge();
  }
  paintLabel(label);
}

void Painting::paintArrow(const QStyleOption& option, const QRect& place) {
  QStyleOption arrow = option;
  arrow.rect = place;
  painter_.drawPrimitive(QStyle::PE_IndicatorArrowDown, arrow);
}

/// Paints a flat square with a slight sheen, pressed in if the option says so.
void Painting::paintSquareBevel(const QStyleOptionButton& option) {
  const QColor face = option.palette.color(QPalette::Button);
  const bool sunken = isSunken(option);
  const QRectF square = QRectF(option.rect).adjusted(0.5, 0.5, -0.5, -0.5);
  QLinearGradient sheen(square.topLeft(), square.bottomLeft());
  // Less dark in a disabled button, whose grey title would be hard to see.
  const int depth = button_.isEnabled() ? 130 : 110;
  sheen.setColorAt(0, sunken ? face.darker(depth) : face.lighter(106));
  sheen.setColorAt(1, sunken ? face.darker(depth - 10) : face.darker(106));
  const bool focused = option.state & QStyle::State_HasFocus;
  painter_.setPen(focused ? option.palette.color(QPalette::Highlight) : face.darker(170));
  painter_.setBrush(sheen);
  painter_.drawRect(square);
}

/// Paints the exact colour within the bezel; styles paint lighter and darker shades of it.
void Painting::paintFace(const QStyleOption& option) {
  painter_.save();
  painter_.setRenderHint(QPainter::Antialiasing);
  painter_.setPen(Qt::NoPen);
  painter_.setBrush(option.palette.color(QPalette::Button));
  painter_.drawRoundedRect(option.rect.adjusted(2, 2, -2, -2), 1, 1);
  painter_.restore();
}

void Painting::paintLabel(const Label& label) {
  painter_.save();
  painter_.setClipRect(label.place, Qt::IntersectClip);
  paintTitle(paintIcon(label), label);
  painter_.restore();
}

/// Returns the area that the icon leaves free.
QRect Painting::paintIcon(const Label& label) {
  QRect left = label.place;
  if (label.icon.isNull()) return left;
  const QRect around = QStyle::alignedRect(
      button_.layoutDirection(), Qt::AlignLeading | Qt::AlignVCenter, label.iconSize, label.place);
  label.icon.paint(&painter_, around, Qt::AlignCenter,
                   button_.isEnabled() ? QIcon::Normal : QIcon::Disabled);
  const int used = label.iconSize.width() + 4;
  button_.isRightToLeft() ? left.setRight(left.right() - used) : left.setLeft(left.left() + used);
  return left;
}

void Painting::paintTitle(const QRect& place, const Label& label) {
  QTextDocument document;
  document.setDocumentMargin(0);
  document.documentLayout()->setPaintDevice(&button_);
  const AttributedString shown = title();
  TextSetting setting{label.font, button_.palette().color(QPalette::Active, QPalette::Link),
                      label.colors.ground, label.unasked, leadingEdge()};
  setting.direction = writingDirectionOf(shown);
  setting.greyed = !button_.isEnabled();
  showIn(document, shown, setting);
  document.setTextWidth(place.width());
  if (document.size().height() > place.height()) {
    // The lines do not fit: the beginning of each is better than the upper half of some.
    QTextOption option = document.defaultTextOption();
    option.setWrapMode(QTextOption::NoWrap);
    document.setDefaultTextOption(option);
  }
  const double middle = std::max(0.0, (place.height() - document.size().height()) / 2);
  painter_.translate(place.x(),
                     place.y() + (label.top ? std::min<double>(middle, *label.top) : middle));
  QAbstractTextDocumentLayout::PaintContext context;
  context.palette = button_.palette();
  context.palette.setColor(QPalette::Text, label.colors.ink);
  document.documentLayout()->draw(&painter_, context);
}

void Painting::paintOutline() {
  painter_.setBrush(Qt::NoBrush);
  painter_.setPen(QPen(button_.palette().color(QPalette::Highlight), 2));
  painter_.drawRect(QRectF(button_.rect()).adjusted(1, 1, -1, -1));
}

void Painting::paintFlash() {
  if (appearance_.pressed) {
    paintPressedIn(painter_, button_.rect());
    paintIndicatorAgain();
  }
  if (appearance_.outlined) paintOutline();
}

void Painting::paintTint() {
  if (appearance_.face) tint(painter_, button_.rect(), qColor(*appearance_.face));
}

}  // namespace

bool isDrawnByStyle(const QAbstractButton& button) {
  return qobject_cast<const QPushButton*>(&button) || qobject_cast<const QCheckBox*>(&button) ||
         qobject_cast<const QRadioButton*>(&button) || qobject_cast<const QToolButton*>(&button);
}

void paintButton(QAbstractButton& button, const ButtonAppearance& appearance) {
  Painting painting(button, appearance);
  painting.paint();
  painting.paintFlash();
}

void paintOver(QAbstractButton& button, const ButtonAppearance& appearance) {
  Painting painting(button, appearance);
  painting.paintTint();
  painting.paintFlash();
}

}  // namespace qz::toolkit::qt
