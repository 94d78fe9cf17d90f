// SPDX-License-Identifier: MIT
// A label's styled text, drawn from a document of its own.
//
// By itself a label reads its HTML at every change and lays it out four times, which takes longer
// than everything else that a command list does.
#pragma once

#include <QLabel>
#include <QTextDocument>
#include <optional>

#include "toolkit/qt/rich_text.hpp"

namespace toolkit::qt {

class LabelPage {
 public:
  /// Whether the label's class paints as `QLabel` does, and only text is to be drawn: neither a
  /// selection nor the focus of a link.
  static bool canDraw(const QLabel& label);

  void forget() { document_.reset(); }
  /// Whether a text is set, for the label as it stands.
  bool isFor(const QLabel& label) const;
  void set(const QLabel& label, const AttributedString& text, const TextSetting& setting);
  /// Draws what `label` itself would draw of the text that is set, in HTML; in its paint event.
  void draw(QLabel& label);

 private:
  std::optional<QTextDocument> document_;
  // The label's, when the text was set.
  bool wraps_ = false;
  Qt::Alignment alignment_;
};

/// Draws the frame around a label, in a paint event of it.
void drawFrame(QLabel& label, QPainter& painter);

}  // namespace toolkit::qt
