// SPDX-License-Identifier: MIT
// What the windows and views of one Qt toolkit share: which widget has which view, and how the
// application is called back.
#pragma once

#include <QWidget>
#include <functional>
#include <memory>
#include <unordered_map>
#include <vector>

#include "toolkit/qt/calls.hpp"
#include "toolkit/view.hpp"
#include "toolkit/window.hpp"

namespace toolkit::qt {

class QtWindow;
class WidgetNode;

class Desk : public std::enable_shared_from_this<Desk> {
 public:
  explicit Desk(Log& log) : calls(log) {}
  Desk(const Desk&) = delete;
  Desk& operator=(const Desk&) = delete;

  /// The view of `widget`, the same one as long as anybody has it; made where there is none.
  Ref<View> viewOf(QWidget& widget);
  /// The window of a top-level widget, the same one as long as anybody has it.
  std::shared_ptr<QtWindow> windowOf(QWidget& widget);
  /// The window that `widget` is, if anybody has it; else null.
  std::shared_ptr<QtWindow> knownWindow(const QWidget& widget) const;
  std::vector<std::shared_ptr<QtWindow>> windows() const;

  void enter(const QWidget& widget, const std::shared_ptr<WidgetNode>& view);
  void enter(const QWidget& widget, const std::shared_ptr<QtWindow>& window);
  /// Forgets what has ended under the key.
  void forgetView(const QWidget* key);
  void forgetWindow(const QWidget* key);

  /// Keeps a window alive while it is on the screen.
  void keep(const std::shared_ptr<QtWindow>& window);
  void letGo(const QtWindow& window);
  void letAllGo();

  Calls calls;
  /// Told of each button before its action is sent because the user acted; may be empty.
  std::function<void(const Ref<View>&)> willAct;

 private:
  std::unordered_map<const QWidget*, std::weak_ptr<WidgetNode>> views_;
  std::unordered_map<const QWidget*, std::weak_ptr<QtWindow>> windows_;
  std::vector<std::shared_ptr<QtWindow>> kept_;
};

}  // namespace toolkit::qt
