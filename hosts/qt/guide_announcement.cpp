// SPDX-License-Identifier: MIT
// Qt 6.8 can announce a text. Before that, a changed dialog is announced as an alert, as Qt's own
// message boxes are. On Linux Qt passes no alerts on, but all changes of descriptions.

#include "hosts/qt/guide_announcement.hpp"

#include <QAccessible>
#include <QCoreApplication>

#include "hosts/qt/guide_panel.hpp"

namespace qz::hosts::qt {

namespace {

// For Qt's own notes about the control, Qt connects to it: only if somebody listens.
QString nameOf(QWidget& control) {
  if (!QAccessible::isActive()) return {};
  const QAccessibleInterface* const known = QAccessible::queryAccessibleInterface(&control);
  return known ? known->text(QAccessible::Name) : QString();
}

QString wordsOf(const GuideLabel& label) { return label.speaks() ? label.words() : QString(); }

bool endsSentence(const QString& text) {
  const QChar last = text.back();
  return last.isPunct() && last != '"' && last != '\'' && last != ')';
}

QString asSentence(const QString& text) { return endsSentence(text) ? text : text + '.'; }

// Qt announces even a description that stays the same.
void describeWidget(QWidget& widget, const QString& description) {
  if (widget.accessibleDescription() != description) widget.setAccessibleDescription(description);
}

void alert(QWidget& widget, [[maybe_unused]] const QString& spoken) {
#if QT_VERSION >= QT_VERSION_CHECK(6, 8, 0)
  QAccessibleAnnouncementEvent event(&widget, spoken);
#else
  QAccessibleEvent event(&widget, QAccessible::Alert);
#endif
  QAccessible::updateAccessibility(&event);
}

}  // namespace

QString GuideMessage::spoken() const {
  QStringList sentences;
  const QString pointing =
      control.isEmpty() ? QString()
                        : QCoreApplication::translate("qz::Guide", "Points at: %1").arg(control);
  for (const QString& part : {heading, text, pointing, progress}) {
    const QString words = part.simplified();
    if (!words.isEmpty()) sentences.push_back(asSentence(words));
  }
  return sentences.join(' ');
}

GuideMessage messageOf(const GuidePanel& panel, QWidget* control) {
  return {wordsOf(panel.heading), wordsOf(panel.text), wordsOf(panel.progress),
          control ? nameOf(*control) : QString()};
}

void describe(GuidePanel& panel, const GuideMessage& message) {
  GuideMessage rest = message;
  rest.heading.clear();
  panel.setAccessibleName(message.heading);
  describeWidget(panel, rest.spoken());
  for (QPushButton* const button : {&panel.skip, &panel.back, &panel.next}) {
    describeWidget(*button, button->hasFocus() ? message.spoken() : QString());
  }
}

void announceStep(GuidePanel& panel, const GuideMessage& message) {
  describe(panel, message);
  alert(panel, message.spoken());
}

}  // namespace qz::hosts::qt
