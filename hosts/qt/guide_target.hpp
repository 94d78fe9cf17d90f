// SPDX-License-Identifier: MIT
// The control at which a guide points: which it is, where it is, when it moves.
#pragma once

#include <QObject>
#include <QPointer>
#include <QRect>
#include <functional>
#include <string>
#include <vector>

#include "qz/toolkit/qt/qt_toolkit.hpp"

class QWidget;

namespace qz::hosts::qt {

/// What the text of a guide's target means.
struct Pointing {
  QWidget* control = nullptr;  ///< null if there is none
  std::string complaint;       ///< why there is none; empty if the text is
};

/// Finds the control in the window of `form` that has the tag `text` at this moment. The controls
/// in `panel` are not meant.
Pointing controlMeantBy(const QString& text, toolkit::qt::QtToolkit& toolkit, QWidget& form,
                        const QWidget& panel);

/// Brings a control into view as a command that changes it does.
void bringControlIntoView(toolkit::qt::QtToolkit& toolkit, QWidget& control);

/// Returns the part of the widget that the widgets around it let the user see, in the coordinates
/// of its window; empty if there is none.
QRect visiblePartOf(const QWidget& widget);

/// Tells when widgets may have moved on the screen, or become visible, hidden or deleted.
class Follower final : public QObject {
 public:
  explicit Follower(std::function<void()> moved) : moved_(std::move(moved)) {}

  /// Follows a widget and all widgets around it instead of those before.
  void follow(QWidget* widget);
  bool eventFilter(QObject* receiver, QEvent* event) override;

 private:
  void leaveAll();

  const std::function<void()> moved_;
  QPointer<QWidget> widget_;
  std::vector<QPointer<QWidget>> watched_;
};

}  // namespace qz::hosts::qt
