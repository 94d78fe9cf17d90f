// Sheets are attached through their native windows, so that neither widget's parent nor its flags
// change: Qt would make the window anew.

#include "toolkit/qt/sheet_place.hpp"

namespace toolkit::qt {

SheetPlace::SheetPlace(QWidget& sheet, QWidget& parent)
    : sheet_(&sheet),
      modality_(sheet.windowModality()),
      hadPosition_(sheet.testAttribute(Qt::WA_Moved)),
      position_(sheet.pos()) {
  // Asking for the number makes the native window.
  sheet.winId();
  parent.winId();
  transientParent_ = sheet.windowHandle()->transientParent();
  sheet.windowHandle()->setTransientParent(parent.windowHandle());
  sheet.setWindowModality(Qt::WindowModal);
  const QPoint top = parent.mapToGlobal(QPoint((parent.width() - sheet.width()) / 2, 0));
  sheet.move(top);
}

SheetPlace::~SheetPlace() {
  if (!sheet_) return;
  sheet_->setWindowModality(modality_);
  if (sheet_->windowHandle()) sheet_->windowHandle()->setTransientParent(transientParent_);
  sheet_->move(position_);
  sheet_->setAttribute(Qt::WA_Moved, hadPosition_);
}

}  // namespace toolkit::qt
