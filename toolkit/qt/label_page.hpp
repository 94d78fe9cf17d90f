// SPDX-License-Identifier: MIT
// Draws a label's styled text from a cached document.
//
// A label on its own parses its HTML at every change and lays it out four times, which takes longer
// than everything else in a command list.
#pragma once

#include <QLabel>
#include <QTextDocument>
#include <optional>

#include "toolkit/qt/rich_text.hpp"

namespace qz::toolkit::qt {

class LabelPage {
 public:
  /// True if the label's class paints like `QLabel` and only text is to be drawn, without a
  /// selection or a focused link.
  static bool canDraw(const QLabel& label);

  void forget() { document_.reset(); }
  /// True if a text is set and the label's layout has not changed since.
  bool isFor(const QLabel& label) const;
  void set(const QLabel& label, const AttributedString& text, const TextSetting& setting);
  /// Draws the text that is set exactly as `label` itself would draw it as HTML. Call it in the
  /// label's paint event.
  void draw(QLabel& label);

 private:
  std::optional<QTextDocument> document_;
  // The label's settings when the text was set.
  bool wraps_ = false;
  Qt::Alignment alignment_;
};

/// Draws the frame around a label. Call it in the label's paint event.
void drawFrame(QLabel& label, QPainter& painter);

}  // namespace qz::toolkit::qt
