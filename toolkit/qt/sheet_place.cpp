// SPDX-License-Identifier: MIT
// Attaches sheets through their native windows. Changing a widget's parent or flags would make Qt
// create the window again.

#include "toolkit/qt/sheet_place.hpp"

#include <QEvent>

namespace qz::toolkit::qt {

SheetPlace::SheetPlace(QWidget& sheet, QWidget& parent)
    : sheet_(&sheet),
      parent_(&parent),
      modality_(sheet.windowModality()),
      hadPosition_(sheet.testAttribute(Qt::WA_Moved)),
      position_(sheet.pos()) {
  // `winId()` creates the native window.
  sheet.winId();
  parent.winId();
  transientParent_ = sheet.windowHandle()->transientParent();
  sheet.windowHandle()->setTransientParent(parent.windowHandle());
  sheet.setWindowModality(Qt::WindowModal);
  hang();
  sheet.installEventFilter(this);
  parent.installEventFilter(this);
}

SheetPlace::~SheetPlace() {
  if (!sheet_) return;
  sheet_->removeEventFilter(this);
  sheet_->setWindowModality(modality_);
  if (sheet_->windowHandle()) sheet_->windowHandle()->setTransientParent(transientParent_);
  sheet_->move(position_);
  sheet_->setAttribute(Qt::WA_Moved, hadPosition_);
}

void SheetPlace::hang() {
  if (!sheet_ || !parent_) return;
  sheet_->move(parent_->mapToGlobal(QPoint((parent_->width() - sheet_->width()) / 2, 0)));
}

bool SheetPlace::eventFilter(QObject* watched, QEvent* event) {
  const bool moved = event->type() == QEvent::Move && watched == parent_;
  if (moved || event->type() == QEvent::Resize) hang();
  return false;
}

}  // namespace qz::toolkit::qt
