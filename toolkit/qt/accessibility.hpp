// SPDX-License-Identifier: MIT
// What assistive technology is told. Qt speaks for most widgets by itself; here is what it leaves
// out.
#pragma once

#include <string>
#include <string_view>

class QString;
class QWidget;

namespace toolkit::qt {

/// Sets the tooltip, plain text, which is also the widget's description where it has no other, and
/// announces it. An empty text removes it.
void showToolTip(QWidget& widget, std::string_view text);
/// The tooltip as it reads.
std::string shownToolTip(const QWidget& widget);

/// Announces that `widget` is called `name` from now on, by what it shows. A name that its host
/// once gave it would be wrong now and is replaced.
void announceShownName(QWidget& widget, const QString& name);

}  // namespace toolkit::qt
