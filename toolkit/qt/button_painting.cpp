// SPDX-License-Identifier: MIT
// Drawing follows Qt's own styles step by step: bevel or indicator, then the label, then the focus;
// only the step that is ours is replaced.

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

#include "toolkit/qt/contrast.hpp"
#include "toolkit/qt/rich_text.hpp"
#include "toolkit/qt/strings.hpp"

namespace toolkit::qt {

namespace {

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

/// Those of text, and of what it stands on.
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

/// What is drawn in place of the style's own label.
struct Label {
  QRect place;
  QIcon icon;
  QSize iconSize;
  Colors colors;
  Qt::Alignment unasked;
};

class Painting {
 public:
  Painting(QAbstractButton& button, const ButtonAppearance& appearance)
      : button_(button), appearance_(appearance), painter_(&button) {}

  void paint();
  void paintOutline();

 private:
  void paintPushButton(const QPushButton& button);
  void paintToggle(QStyleOptionButton& option, bool radio);
  void paintToolButton(const QToolButton& button);
  void paintSquareBevel(const QStyleOptionButton& option);
  void paintFocus(const QStyleOptionButton& option);
  void paintLabel(const Label& label);
  QRect paintIcon(const Label& label);
  void paintTitle(const QRect& place, const Label& label);
  void paintFace(const QStyleOption& option);
  void adapt(QStyleOption& option) const;

  QAbstractButton& button_;
  const ButtonAppearance& appearance_;
  QStylePainter painter_;
};

void Painting::paint() {
  if (const auto* const push = qobject_cast<QPushButton*>(&button_)) {
    paintPushButton(*push);
  } else if (const auto* const box = qobject_cast<QCheckBox*>(&button_)) {
    QStyleOptionButton option;
    (box->*&CheckBoxStyle::initStyleOption)(&option);
    paintToggle(option, false);
  } else if (const auto* const radio = qobject_cast<QRadioButton*>(&button_)) {
    QStyleOptionButton option;
    (radio->*&RadioButtonStyle::initStyleOption)(&option);
    paintToggle(option, true);
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

void Painting::paintPushButton(const QPushButton& button) {
  QStyleOptionButton option;
  (button.*&PushButtonStyle::initStyleOption)(&option);
  adapt(option);
  if (appearance_.bezel == BezelStyle::texturedSquare) {
    paintSquareBevel(option);
  } else {
    painter_.drawControl(QStyle::CE_PushButtonBevel, option);
  }
  if (appearance_.face) paintFace(option);

  QStyleOptionButton label = option;
  label.rect = button.style()->subElementRect(QStyle::SE_PushButtonContents, &option, &button);
  if (appearance_.title) {
    paintLabel(
        {label.rect, option.icon, option.iconSize, colorsOf(option.palette), Qt::AlignHCenter});
  } else {
    painter_.drawControl(QStyle::CE_PushButtonLabel, label);
  }
  if (option.state & QStyle::State_HasFocus) paintFocus(option);
}

void Painting::paintFocus(const QStyleOptionButton& option) {
  QStyleOptionFocusRect focus;
  focus.QStyleOption::operator=(option);
  focus.rect = button_.style()->subElementRect(QStyle::SE_PushButtonFocusRect, &option, &button_);
  painter_.drawPrimitive(QStyle::PE_FrameFocusRect, focus);
}

void Painting::paintToggle(QStyleOptionButton& option, bool radio) {
  adapt(option);
  const QRect contents = button_.style()->subElementRect(
      radio ? QStyle::SE_RadioButtonContents : QStyle::SE_CheckBoxContents, &option, &button_);
  Colors colors{option.palette.color(QPalette::WindowText), option.palette.color(QPalette::Window)};
  if (appearance_.face) {
    colors = {option.palette.color(QPalette::ButtonText), qColor(*appearance_.face)};
    painter_.fillRect(contents.adjusted(-2, 0, 2, 0), colors.ground);
    option.palette.setColor(QPalette::WindowText, colors.ink);
  }
  const Label label{contents, option.icon, option.iconSize, colors, Qt::AlignLeading};
  if (appearance_.title) {
    option.text.clear();
    option.icon = {};
  }
  painter_.drawControl(radio ? QStyle::CE_RadioButton : QStyle::CE_CheckBox, option);
  if (appearance_.title) paintLabel(label);
}

void Painting::paintToolButton(const QToolButton& button) {
  QStyleOptionToolButton option;
  (button.*&ToolButtonStyle::initStyleOption)(&option);
  adapt(option);
  const QRect face = button.style()->subControlRect(QStyle::CC_ToolButton, &option,
                                                    QStyle::SC_ToolButton, &button);
  const Label label{face, option.icon, option.iconSize, colorsOf(option.palette), Qt::AlignHCenter};
  if (appearance_.title) {
    option.text.clear();
    option.icon = {};
  }
  painter_.drawComplexControl(QStyle::CC_ToolButton, option);
  if (appearance_.title) paintLabel(label);
}

/// A flat square with a slight sheen, pressed in where the option says so.
void Painting::paintSquareBevel(const QStyleOptionButton& option) {
  const QColor face = option.palette.color(QPalette::Button);
  const bool sunken = isSunken(option);
  const QRectF square = QRectF(option.rect).adjusted(0.5, 0.5, -0.5, -0.5);
  QLinearGradient sheen(square.topLeft(), square.bottomLeft());
  // Less deep where the title is grey, which would drown in it.
  const int depth = button_.isEnabled() ? 130 : 110;
  sheen.setColorAt(0, sunken ? face.darker(depth) : face.lighter(106));
  sheen.setColorAt(1, sunken ? face.darker(depth - 10) : face.darker(106));
  const bool focused = option.state & QStyle::State_HasFocus;
  painter_.setPen(focused ? option.palette.color(QPalette::Highlight) : face.darker(170));
  painter_.setBrush(sheen);
  painter_.drawRect(square);
}

/// The colour itself, within the bezel: styles make lighter and darker shades of it.
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

/// Gives the room that the icon leaves.
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
  TextSetting setting{appearance_.titleFont,
                      button_.palette().color(QPalette::Active, QPalette::Link),
                      label.colors.ground, label.unasked, button_.layoutDirection()};
  setting.greyed = !button_.isEnabled();
  showIn(document, *appearance_.title, setting);
  document.setTextWidth(place.width());
  if (document.size().height() > place.height()) {
    // Too much to break lines: the beginning of each is better than the upper half of some.
    QTextOption option = document.defaultTextOption();
    option.setWrapMode(QTextOption::NoWrap);
    document.setDefaultTextOption(option);
  }
  const double spare = place.height() - document.size().height();
  painter_.translate(place.x(), place.y() + std::max(0.0, spare / 2));
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

}  // namespace

bool isDrawnByStyle(const QAbstractButton& button) {
  if (qobject_cast<const QCommandLinkButton*>(&button)) return false;
  return qobject_cast<const QPushButton*>(&button) || qobject_cast<const QCheckBox*>(&button) ||
         qobject_cast<const QRadioButton*>(&button) || qobject_cast<const QToolButton*>(&button);
}

void paintButton(QAbstractButton& button, const ButtonAppearance& appearance) {
  Painting painting(button, appearance);
  painting.paint();
  if (appearance.outlined) painting.paintOutline();
}

void paintOver(QAbstractButton& button, const ButtonAppearance& appearance) {
  if (appearance.pressed) QPainter(&button).fillRect(button.rect(), QColor(0, 0, 0, 80));
  if (appearance.outlined) Painting(button, appearance).paintOutline();
}

}  // namespace toolkit::qt
