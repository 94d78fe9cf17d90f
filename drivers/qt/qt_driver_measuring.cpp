// SPDX-License-Identifier: MIT
// Measures texts, in windows that need no screen.

#include <QAbstractButton>
#include <QApplication>
#include <QCheckBox>
#include <QEvent>
#include <QLabel>
#include <QPushButton>
#include <QStyle>
#include <QStyleOptionButton>
#include <QTextDocument>
#include <cmath>

#include "drivers/qt/qt_driver.hpp"
#include "toolkit/qt/button_look.hpp"
#include "toolkit/qt/rich_text.hpp"
#include "toolkit/qt/widget_node.hpp"

namespace qz::drivers {

namespace {

/// Keeps windows off the screen: Qt polishes a widget before it shows it for the first time.
class OffScreen final : public QObject {
 public:
  bool eventFilter(QObject* object, QEvent* event) override {
    auto* const widget = event->type() == QEvent::Polish ? qobject_cast<QWidget*>(object) : nullptr;
    if (widget && widget->isWindow()) widget->setAttribute(Qt::WA_DontShowOnScreen);
    return false;
  }
};

QSizeF sizeOf(const AttributedString& title, const QFont& font) {
  QTextDocument page;
  page.setDocumentMargin(0);
  showIn(page, title, {font, {}, {}});
  return {page.idealWidth(), page.size().height()};
}

/// Returns the size that the button has for its title.
QSizeF roomOf(const QAbstractButton& button) {
  QStyleOptionButton option;
  option.initFrom(&button);
  const bool isBox = qobject_cast<const QCheckBox*>(&button) != nullptr;
  if (isBox || qobject_cast<const QPushButton*>(&button)) {
    const auto part = isBox ? QStyle::SE_CheckBoxContents : QStyle::SE_PushButtonContents;
    return button.style()->subElementRect(part, &option, &button).size();
  }
  // Others say only what they need in all.
  const QSizeF text = button.fontMetrics().size(Qt::TextShowMnemonic, button.text());
  return button.size() - (button.sizeHint() - text);
}

// Less than a point is the difference of two ways of rounding.
double shortage(double needed, double available) {
  return needed - available < 1 ? 0 : std::ceil(needed - available);
}

MissingRoom between(const QSizeF& needed, const QSizeF& room) {
  return {shortage(needed.width(), room.width()), shortage(needed.height(), room.height())};
}

MissingRoom missingIn(const QLabel& label) {
  if (!label.wordWrap()) return between(label.minimumSizeHint(), label.size());
  return between(QSizeF(label.minimumSizeHint().width(), label.heightForWidth(label.width())),
                 label.size());
}

}  // namespace

void QtDriver::workOffScreen() {
  if (offScreen_) return;
  offScreen_ = std::make_unique<OffScreen>();
  qApp->installEventFilter(offScreen_.get());
}

MissingRoom QtDriver::missingRoom(const Ref<View>& view) {
  const auto node = WidgetNode::of(view);
  if (!node || !node->widget()) return {};
  QWidget& widget = *node->widget();
  widget.ensurePolished();
  if (const auto* const button = qobject_cast<const QAbstractButton*>(&widget)) {
    return between(sizeOf(shownTitle(*button), button->font()), roomOf(*button));
  }
  const auto* const label = qobject_cast<const QLabel*>(&widget);
  return label && view->asTextField() ? missingIn(*label) : MissingRoom{};
}

}  // namespace qz::drivers
