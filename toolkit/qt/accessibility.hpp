// SPDX-License-Identifier: MIT
// Tells assistive technology what Qt leaves out: descriptions of tooltips, and changed names.
#pragma once

#include <string>
#include <string_view>

class QString;
class QWidget;

namespace qz::toolkit::qt {

/// Sets the tooltip, as plain text, and announces it. The tooltip is also the widget's description
/// if it has no other. An empty text removes the tooltip.
void showToolTip(QWidget& widget, std::string_view text);
/// Returns the tooltip as plain text.
std::string shownToolTip(const QWidget& widget);

/// Announces the widget's new name `name`, which its content gives it. Replaces an accessible name
/// that the host has set, because that name would now be wrong.
void announceShownName(QWidget& widget, const QString& name);

}  // namespace qz::toolkit::qt
