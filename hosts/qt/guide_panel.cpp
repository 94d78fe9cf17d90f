// SPDX-License-Identifier: MIT
// Lays out the panel, and follows the keyboard in it.

#include "hosts/qt/guide_panel.hpp"

#include <QApplication>
#include <QKeyEvent>
#include <QPainter>
#include <QScrollBar>
#include <QVBoxLayout>
#include <algorithm>

#include "hosts/qt/guide_spotlight.hpp"
#include "toolkit/qt/strings.hpp"
#include "toolkit/qt/text_look.hpp"
#include "toolkit/qt/user_preferences.hpp"
#include "toolkit/qt/widget_node.hpp"

namespace qz::hosts::qt {

namespace {

constexpr int letters = 44;       // of the average width, in a line
constexpr int panelMargin = 14;   // in points
constexpr int buttonGap = 8;      // between the buttons
constexpr int largestImage = 96;  // in points

bool isInside(const GuideOptions& options) {
  return options.insideWindow.value_or(QGuiApplication::platformName() == "wayland");
}

QString translated(const char* word) { return QCoreApplication::translate("qz::Guide", word); }

QFont headingFont(QFont font) {
  font.setBold(true);
  if (font.pixelSize() > 0) {
    font.setPixelSize(font.pixelSize() * 6 / 5);
  } else {
    font.setPointSizeF(font.pointSizeF() * 1.2);
  }
  return font;
}

}  // namespace

QString GuideLabel::words() const {
  return toolkit::qt::qString(toolkit::qt::shownText(*this).string());
}

GuideScroll::GuideScroll(QLabel& label, QWidget* parent) : QScrollArea(parent), label_(label) {
  setFrameShape(NoFrame);
  setFocusPolicy(Qt::NoFocus);
  setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
  setWidgetResizable(true);
  new QVBoxLayout(viewport());  // otherwise a hidden label would not report its changes
  setWidget(&label);
  label.setAutoFillBackground(false);
  viewport()->setAutoFillBackground(false);
}

bool GuideScroll::event(QEvent* event) {
  if (event->type() == QEvent::LayoutRequest) updateGeometry();
  return QScrollArea::event(event);
}

// Some lines, and the bar.
QSize GuideScroll::minimumSizeHint() const {
  const QSize all = label_.minimumSizeHint();
  return {all.width(), std::min(all.height(), 3 * fontMetrics().lineSpacing())};
}

GuidePanel::GuidePanel(QWidget& form, const GuideOptions& options)
    : QDialog(&form, Qt::Tool | Qt::FramelessWindowHint), escapes_(options.escape) {
  setProperty(toolkit::qt::panelProperty, true);
  setAttribute(Qt::WA_WindowPropagation);
  setAutoFillBackground(true);
  setObjectName("qz-guide");
  const GuideTags& tags = options.tags;
  setUp(heading, "qz-guide-heading", tags.heading);
  setUp(text, "qz-guide-text", tags.text);
  setUp(picture, "qz-guide-picture", tags.picture);
  setUp(progress, "qz-guide-progress", tags.progress);
  setUp(target, "qz-guide-target", tags.target);
  setUp(skip, "qz-guide-skip", tags.skip);
  setUp(back, "qz-guide-back", tags.back);
  setUp(next, "qz-guide-next", tags.next);
  skip.setText(translated(QT_TRANSLATE_NOOP("qz::Guide", "Skip")));
  back.setText(translated(QT_TRANSLATE_NOOP("qz::Guide", "Back")));
  next.setText(translated(QT_TRANSLATE_NOOP("qz::Guide", "Next")));
  for (QPushButton* const button : {&skip, &back, &next}) button->setAutoDefault(options.enter);
  next.setDefault(options.enter);
  layOut();
  if (isInside(options)) stayInside();
}

// The form's own order of the Tab key must not contain the buttons.
void GuidePanel::stayInside() {
  setWindowFlags(Qt::Widget);
  for (QPushButton* const button : {&skip, &back, &next}) button->setFocusPolicy(Qt::ClickFocus);
}

void GuidePanel::setUp(QWidget& widget, const char* name, toolkit::Tag tag) {
  widget.setObjectName(name);
  widget.setProperty(toolkit::qt::tagProperty, static_cast<qlonglong>(tag));
  widget.show();  // until then it would not report its changes to the layout
}

void GuidePanel::layOut() {
  target.hide();
  scroll.show();  // as the others
  picture.setProperty(toolkit::qt::imageViewProperty, true);
  picture.setMaximumSize(largestImage, largestImage);
  for (GuideLabel* const label : {&heading, &text}) {
    label->setWordWrap(true);
    label->setAlignment(Qt::AlignTop | Qt::AlignLeading);
    label->setContentsMargins(0, 0, 0, panelMargin / 2);
  }
  grid_.setContentsMargins(panelMargin, panelMargin, panelMargin, panelMargin);
  grid_.setVerticalSpacing(0);
  grid_.addWidget(&picture, 0, 0, 2, 1, Qt::AlignTop);
  grid_.addWidget(&heading, 0, 1);
  grid_.addWidget(&scroll, 1, 1);
  grid_.addLayout(&buttons_, 2, 0, 1, 2);
  grid_.setColumnStretch(1, 1);
  grid_.setRowStretch(1, 1);
  buttons_.setSpacing(buttonGap);
  buttons_.addWidget(&skip);
  buttons_.addWidget(&progress, 1, Qt::AlignCenter);
  buttons_.addWidget(&back);
  buttons_.addWidget(&next);
}

void GuidePanel::clear() {
  for (GuideLabel* const label : {&heading, &text, &picture, &progress}) label->clear();
  target.clear();
}

void GuidePanel::retire() {
  leave = [](bool) { return false; };
  for (QWidget* const control : findChildren<QWidget*>()) {
    control->setProperty(toolkit::qt::tagProperty, QVariant());
  }
  hide();
}

int GuidePanel::widthFor(int bound) const {
  return std::min(bound, std::max(letters * fontMetrics().averageCharWidth() + 2 * panelMargin,
                                  minimumSizeHint().width()));
}

// A text that is too long for a panel of the usual width makes the panel wider. A scroll bar that
// is not needed would take room from the lines, and so be needed.
void GuidePanel::fit(const QSize& bounds) {
  heading.setFont(headingFont(font()));
  grid_.setHorizontalSpacing(picture.speaks() ? panelMargin : 0);
  grid_.activate();
  int width = widthFor(bounds.width());
  while (grid_.totalHeightForWidth(width) > bounds.height() && width < bounds.width()) {
    width = std::min(width * 3 / 2, bounds.width());
  }
  const int height = grid_.totalHeightForWidth(width);
  const bool fits = height <= bounds.height();
  scroll.setVerticalScrollBarPolicy(fits ? Qt::ScrollBarAlwaysOff : Qt::ScrollBarAsNeeded);
  resize(width, std::min(height, bounds.height()));
}

void GuidePanel::scrollToBeginning() { scroll.verticalScrollBar()->setValue(0); }

void GuidePanel::keyPressEvent(QKeyEvent* event) {
  QScrollBar& bar = *scroll.verticalScrollBar();
  if (event->key() == Qt::Key_PageDown) return bar.triggerAction(QScrollBar::SliderPageStepAdd);
  if (event->key() == Qt::Key_PageUp) return bar.triggerAction(QScrollBar::SliderPageStepSub);
  QDialog::keyPressEvent(event);
}

std::vector<QPushButton*> GuidePanel::stops() {
  std::vector<QPushButton*> buttons{&skip, &back, &next};
  std::erase_if(buttons, [](const QPushButton* button) {
    return button->isHidden() || !button->isEnabled();
  });
  return buttons;
}

void GuidePanel::focus(bool first) {
  if (isWindow()) activateWindow();
  const auto buttons = stops();
  if (buttons.empty()) return setFocus(Qt::TabFocusReason);
  (first ? buttons.front() : buttons.back())->setFocus(Qt::TabFocusReason);
}

bool GuidePanel::hasFocusInside() const {
  const QWidget* const focused = QApplication::focusWidget();
  return focused && (focused == this || isAncestorOf(focused));
}

bool GuidePanel::focusNextPrevChild(bool forward) {
  auto buttons = stops();
  if (!forward) std::reverse(buttons.begin(), buttons.end());
  const auto now = std::find(buttons.begin(), buttons.end(), focusWidget());
  const bool isAtEnd = buttons.empty() || now == buttons.end() - 1;
  if (isAtEnd && leave(forward)) return true;
  if (buttons.empty()) return false;
  QPushButton* const then = now == buttons.end() || isAtEnd ? buttons.front() : *(now + 1);
  then->setFocus(forward ? Qt::TabFocusReason : Qt::BacktabFocusReason);
  return true;
}

void GuidePanel::reject() {
  if (escapes_ && !skip.isHidden()) skip.click();
}

void GuidePanel::paintEvent(QPaintEvent* event) {
  QDialog::paintEvent(event);
  const int width = toolkit::qt::prefersHighContrast() ? 3 : 2;
  QPainter painter(this);
  painter.setPen(
      QPen(guideLineColor(palette()), width, Qt::SolidLine, Qt::SquareCap, Qt::MiterJoin));
  const double half = width / 2.0;
  painter.drawRect(QRectF(rect()).adjusted(half, half, -half, -half));
}

}  // namespace qz::hosts::qt
