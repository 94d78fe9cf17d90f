// SPDX-License-Identifier: MIT
// Notices when widgets, menus and tags change.
#pragma once

#include <QObject>
#include <utility>

namespace qz::toolkit::qt {

/// Watches all widgets and actions of the application. It hears of each change before any filter of
/// the host, which could keep the event from the others.
class TreeWatch final : public QObject {
 public:
  TreeWatch();

  /// True if a form may have other controls, or the same in another order, than at the last call.
  bool hasChanged() { return std::exchange(hasChanged_, false); }

  bool eventFilter(QObject* receiver, QEvent* event) override;

 private:
  bool hasChanged_ = true;
};

}  // namespace qz::toolkit::qt
