// SPDX-License-Identifier: MIT
// Leads the presses of a button away from the host, without touching the host's connections.
#pragma once

#include <QButtonGroup>
#include <QObject>
#include <QPointer>
#include <functional>

class QAbstractButton;

namespace qz::toolkit::qt {

/// While it exists, it may take each press of a button: then the button does not emit `clicked`,
/// and its group emits nothing in its place. All other signals, such as `toggled`, are emitted. The
/// gate may be destroyed at any time, even in a press that it has taken.
class PressGate final : public QObject {
 public:
  /// At each press `takes` says whether the gate takes it. `pressed` is called for each press that
  /// it has taken, when the button would emit `clicked`.
  PressGate(QAbstractButton& button, std::function<bool()> takes, std::function<void()> pressed);
  ~PressGate() override;

  bool eventFilter(QObject* receiver, QEvent* event) override;

 private:
  void released();
  void groupReleased(QAbstractButton* released);
  void clicked();
  void shut();
  void open();
  void leaveGroup();
  void returnToGroup();

  const QPointer<QAbstractButton> button_;
  const std::function<bool()> takes_;
  const std::function<void()> pressed_;
  bool isShut_ = false;
  unsigned shuttings_ = 0;
  QButtonGroup gate_;             // the button is in it while the gate is shut
  QPointer<QButtonGroup> group_;  // the button's own; null if it has none
  int id_ = 0;                    // in its own group
  qsizetype place_ = 0;           // the same
};

}  // namespace qz::toolkit::qt
