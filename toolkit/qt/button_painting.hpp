// SPDX-License-Identifier: MIT
// Drawing buttons whose widgets do not know all that they show.
#pragma once

#include <QFont>
#include <optional>

#include "toolkit/styled_text/attributed_string.hpp"
#include "toolkit/view.hpp"

class QAbstractButton;

namespace toolkit::qt {

/// What a button shows besides what its widget knows.
struct ButtonAppearance {
  std::optional<AttributedString> title{};
  QFont titleFont{};  ///< of what the title leaves open
  std::optional<Color> face{};
  BezelStyle bezel = BezelStyle::rounded;
  bool pressed = false;   ///< as if it were held down
  bool outlined = false;  ///< what shows in place of that where no motion is wanted

  /// Whether the widget itself would look the same.
  bool isNothing() const {
    return !title && !face && bezel == BezelStyle::rounded && !pressed && !outlined;
  }
};

/// Whether the button leaves its drawing to the widgets' style, so that it can be drawn here: push
/// buttons and command links, check boxes, radio buttons and tool buttons.
bool isDrawnByStyle(const QAbstractButton& button);
/// Draws such a button, within a paint event of its own.
void paintButton(QAbstractButton& button, const ButtonAppearance& appearance);
/// Adds to any other, which has drawn itself, what can be added: all but the title and the bezel.
void paintOver(QAbstractButton& button, const ButtonAppearance& appearance);

}  // namespace toolkit::qt
