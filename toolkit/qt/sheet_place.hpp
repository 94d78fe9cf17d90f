// Where a sheet hangs.
#pragma once

#include <QPointer>
#include <QWidget>
#include <QWindow>

namespace toolkit::qt {

/// While it lives `sheet`, which is hidden at its beginning, blocks `parent` and hangs at its top
/// edge. What the sheet's widget was like before comes back at the end.
class SheetPlace {
 public:
  SheetPlace(QWidget& sheet, QWidget& parent);
  ~SheetPlace();
  SheetPlace(const SheetPlace&) = delete;
  SheetPlace& operator=(const SheetPlace&) = delete;

 private:
  QPointer<QWidget> sheet_;
  QPointer<QWindow> transientParent_;
  Qt::WindowModality modality_;
  bool hadPosition_;
  QPoint position_;
};

}  // namespace toolkit::qt
