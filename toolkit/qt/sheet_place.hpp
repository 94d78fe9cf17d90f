// SPDX-License-Identifier: MIT
// Where a sheet hangs.
#pragma once

#include <QPointer>
#include <QWidget>
#include <QWindow>

namespace toolkit::qt {

/// While it lives `sheet`, which is hidden at its beginning, blocks `parent` and hangs at its top
/// edge, wherever the user moves that. What the sheet's widget was like before comes back at the
/// end.
class SheetPlace final : public QObject {
 public:
  SheetPlace(QWidget& sheet, QWidget& parent);
  ~SheetPlace() override;

  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  void hang();

  QPointer<QWidget> sheet_;
  QPointer<QWidget> parent_;
  QPointer<QWindow> transientParent_;
  Qt::WindowModality modality_;
  bool hadPosition_;
  QPoint position_;
};

}  // namespace toolkit::qt
