// SPDX-License-Identifier: MIT
// Paints buttons that show more than their Qt widget supports.
#pragma once

#include <QFont>
#include <optional>

#include "qz/styled_text/attributed_string.hpp"
#include "qz/toolkit/view.hpp"

class QAbstractButton;

namespace qz::toolkit::qt {

/// What a button shows that its widget does not support.
struct ButtonAppearance {
  std::optional<AttributedString> title{};
  QFont titleFont{};  ///< for text that sets no font
  std::optional<Color> face{};
  BezelStyle bezel = BezelStyle::rounded;
  bool pressed = false;   ///< looks held down
  bool outlined = false;  ///< shown instead of `pressed` if the user wants reduced motion

  /// True if the widget itself would look the same.
  bool isNothing() const {
    return !title && !face && bezel == BezelStyle::rounded && !pressed && !outlined;
  }
};

/// True if the button leaves its drawing to the widget style, so that it can be drawn here: push
/// buttons and command links, check boxes, radio buttons and tool buttons.
bool isDrawnByStyle(const QAbstractButton& button);
/// Draws such a button. Call it in the button's paint event.
void paintButton(QAbstractButton& button, const ButtonAppearance& appearance);
/// Draws over a button that has painted itself: everything but the title and the bezel.
void paintOver(QAbstractButton& button, const ButtonAppearance& appearance);

}  // namespace qz::toolkit::qt
