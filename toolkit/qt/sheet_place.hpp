// SPDX-License-Identifier: MIT
// Places a sheet on its parent.
#pragma once

#include <QPointer>
#include <QWidget>
#include <QWindow>

namespace qz::toolkit::qt {

/// While it lives, `sheet` blocks `parent` and stays at the middle of its top edge when the user
/// moves `parent`. `sheet` must be hidden when this begins. The destructor restores the sheet's
/// former position, transient parent and modality.
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

}  // namespace qz::toolkit::qt
