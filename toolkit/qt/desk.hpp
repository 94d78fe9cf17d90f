// SPDX-License-Identifier: MIT
// State that the windows and views of one Qt toolkit share: the view of each widget, and how to
// call the application back.
#pragma once

#include <QWidget>
#include <functional>
#include <memory>
#include <unordered_map>
#include <vector>

#include "qz/toolkit/qt/calls.hpp"
#include "qz/toolkit/view.hpp"
#include "qz/toolkit/window.hpp"

class QAction;

namespace qz::toolkit::qt {

class QtAction;
class QtWindow;
class WidgetNode;

class Desk : public std::enable_shared_from_this<Desk> {
 public:
  explicit Desk(Log& log) : calls(log) {}
  Desk(const Desk&) = delete;
  Desk& operator=(const Desk&) = delete;

  /// Returns the view of `widget`; makes one if there is none. It stays the same while anybody
  /// holds it.
  Ref<View> viewOf(QWidget& widget);
  /// The same for a widget or an action.
  Ref<View> viewOf(QObject& object);
  /// Returns the window of a top-level widget; makes one if there is none. It stays the same while
  /// anybody holds it.
  std::shared_ptr<QtWindow> windowOf(QWidget& widget);
  /// Returns the window of `widget` if anybody holds it; otherwise null.
  std::shared_ptr<QtWindow> knownWindow(const QWidget& widget) const;
  std::vector<std::shared_ptr<QtWindow>> windows() const;

  void enter(const QWidget& widget, const std::shared_ptr<WidgetNode>& view);
  void enter(const QWidget& widget, const std::shared_ptr<QtWindow>& window);
  /// Removes the key's entry if its view or window has ended.
  void forgetView(const QWidget* key);
  void forgetWindow(const QWidget* key);
  void forgetAction(const QAction* key);

  /// Keeps a window alive while it is on the screen.
  void keep(const std::shared_ptr<QtWindow>& window);
  void letGo(const QtWindow& window);
  void letAllGo();

  Calls calls;
  /// Called with each button that the user presses, before its action is sent; may be empty.
  std::function<void(const Ref<View>&)> willAct;

 private:
  Ref<View> viewOf(QAction& action);

  std::unordered_map<const QWidget*, std::weak_ptr<WidgetNode>> views_;
  std::unordered_map<const QAction*, std::weak_ptr<QtAction>> actions_;
  std::unordered_map<const QWidget*, std::weak_ptr<QtWindow>> windows_;
  std::vector<std::shared_ptr<QtWindow>> kept_;
};

}  // namespace qz::toolkit::qt
