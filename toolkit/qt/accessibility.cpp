// SPDX-License-Identifier: MIT
// Announces names and descriptions.

#include "toolkit/qt/accessibility.hpp"

#include <QAccessible>
#include <QTextDocumentFragment>
#include <QWidget>

#include "toolkit/qt/strings.hpp"

namespace qz::toolkit::qt {

namespace {

void announce(QWidget& widget, QAccessible::Event what) {
  QAccessibleEvent event(&widget, what);
  QAccessible::updateAccessibility(&event);
}

}  // namespace

void showToolTip(QWidget& widget, std::string_view text) {
  const QString plain = qString(text);
  const bool looksRich = Qt::mightBeRichText(plain);
  // Qt guesses whether a tooltip's text is HTML; a script's text never is.
  const QString shown = looksRich ? Qt::convertFromPlainText(plain, Qt::WhiteSpaceNormal) : plain;
  if (widget.toolTip() == shown) return;
  widget.setToolTip(shown);
  if (looksRich || !widget.accessibleDescription().isEmpty()) {
    widget.setAccessibleDescription(plain);  // also announces it
  } else {
    announce(widget, QAccessible::DescriptionChanged);
  }
}

std::string shownToolTip(const QWidget& widget) {
  const QString shown = widget.toolTip();
  return utf8(Qt::mightBeRichText(shown) ? QTextDocumentFragment::fromHtml(shown).toPlainText()
                                         : shown);
}

void announceShownName(QWidget& widget, const QString& name) {
  if (!widget.accessibleName().isEmpty()) widget.setAccessibleName(name);  // also announces it
}

}  // namespace qz::toolkit::qt
