// SPDX-License-Identifier: MIT
// Follows QLabel's own painting step by step, so that there is no visible difference.

#include "toolkit/qt/label_page.hpp"

#include <QAbstractTextDocumentLayout>
#include <QPainter>
#include <QStyle>
#include <QStyleOption>
#include <QTextOption>
#include <algorithm>
#include <typeinfo>

namespace qz::toolkit::qt {

namespace {

struct FrameDrawer : QFrame {
  using QFrame::drawFrame;
};

/// Returns the indent of a label's text; if the label sets none, a frame indents by half a letter.
int indentOf(const QLabel& label) {
  if (label.indent() >= 0 || label.frameWidth() <= 0) return label.indent();
  return label.fontMetrics().horizontalAdvance(u'x') / 2 - label.margin();
}

/// Returns the area of a label's text: inside the margin, and indented from the edge at which the
/// text is aligned.
QRect textAreaOf(const QLabel& label) {
  const int margin = label.margin();
  QRect area = label.contentsRect().adjusted(margin, margin, -margin, -margin);
  const int indent = indentOf(label);
  if (indent <= 0) return area;
  const auto edges = QStyle::visualAlignment(Qt::LayoutDirectionAuto, label.alignment());
  if (edges & Qt::AlignLeft) area.setLeft(area.left() + indent);
  if (edges & Qt::AlignRight) area.setRight(area.right() - indent);
  if (edges & Qt::AlignTop) area.setTop(area.top() + indent);
  if (edges & Qt::AlignBottom) area.setBottom(area.bottom() - indent);
  return area;
}

/// Returns how far below the area's top a text of that height begins.
qreal topOf(qreal height, const QRect& area, Qt::Alignment alignment) {
  const qreal free = std::max(area.height() - height, 0.0);
  if (alignment & Qt::AlignVCenter) return free / 2;
  return alignment & Qt::AlignBottom ? free : 0;
}

QAbstractTextDocumentLayout::PaintContext contextOf(const QLabel& label) {
  QStyleOption option;
  option.initFrom(&label);
  QAbstractTextDocumentLayout::PaintContext context;
  context.palette = option.palette;
  const QPalette::ColorRole role = label.foregroundRole();
  if (role != QPalette::Text && label.isEnabled()) {
    context.palette.setColor(QPalette::Text, context.palette.color(role));
  }
  return context;
}

}  // namespace

bool LabelPage::canDraw(const QLabel& label) {
  constexpr Qt::TextInteractionFlags drawn = Qt::LinksAccessibleByMouse;
  return typeid(label) == typeid(QLabel) && (label.textInteractionFlags() & ~drawn) == 0;
}

bool LabelPage::isFor(const QLabel& label) const {
  return document_ && wraps_ == label.wordWrap() && alignment_ == label.alignment();
}

void LabelPage::set(const QLabel& label, const AttributedString& text, const TextSetting& setting) {
  wraps_ = label.wordWrap();
  alignment_ = label.alignment();
  document_.emplace();
  document_->setLayoutEnabled(false);  // until the width is known
  document_->setDocumentMargin(0);
  QTextOption option = document_->defaultTextOption();
  option.setWrapMode(wraps_ ? QTextOption::WordWrap : QTextOption::ManualWrap);
  document_->setDefaultTextOption(option);
  showIn(*document_, text, setting);
}

void LabelPage::draw(QLabel& label) {
  const QRect area = textAreaOf(label);
  document_->setLayoutEnabled(true);
  // Setting even the same width would repeat the layout.
  if (document_->textWidth() != area.width()) document_->setTextWidth(area.width());
  const qreal top = topOf(document_->size().height(), area, label.alignment());
  const QRect place = QRectF(area).translated(0, top).toAlignedRect();
  QPainter painter(&label);
  drawFrame(label, painter);
  painter.translate(place.topLeft());
  painter.setClipRect(QRect(QPoint(), place.size()));
  document_->documentLayout()->draw(&painter, contextOf(label));
}

void drawFrame(QLabel& label, QPainter& painter) { (label.*&FrameDrawer::drawFrame)(&painter); }

}  // namespace qz::toolkit::qt
