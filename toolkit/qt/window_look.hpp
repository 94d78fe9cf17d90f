// SPDX-License-Identifier: MIT
// The colours of windows.
#pragma once

#include <optional>

#include "toolkit/styled_text/color.hpp"

class QWidget;

namespace toolkit::qt {

/// Gives the window a background colour, and to what has no colour of its own in it (labels, check
/// boxes, links) one that reads well there: by a contrast of at least 4.5 : 1, as WCAG's level AA
/// asks for.
void setWindowColor(QWidget& window, const Color& color);
/// The background as it shows.
Color windowColor(const QWidget& window);

}  // namespace toolkit::qt
