// SPDX-License-Identifier: MIT
// The colours of windows.
#pragma once

#include <optional>

#include "qz/styled_text/color.hpp"

class QWidget;

namespace qz::toolkit::qt {

/// Gives the window a background colour. Widgets in it that set no colours (labels, check boxes,
/// links) get a text colour that is readable there: contrast at least 4.5 : 1, WCAG level AA.
void setWindowColor(QWidget& window, const Color& color);
/// Returns the visible background colour.
Color windowColor(const QWidget& window);

}  // namespace qz::toolkit::qt
