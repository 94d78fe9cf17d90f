// SPDX-License-Identifier: MIT
// State that the windows and views of one AppKit toolkit share: the view of each `NSView`, the
// window of each `NSWindow`, and the objects that stand for responders.
#pragma once

#import <AppKit/AppKit.h>

#include <functional>
#include <memory>
#include <unordered_map>
#include <vector>

#include "qz/toolkit/calls.hpp"
#include "qz/toolkit/view.hpp"
#include "qz/toolkit/window.hpp"

namespace qz::toolkit::appkit {

class AppKitWindow;
class ViewNode;

class Desk : public std::enable_shared_from_this<Desk> {
 public:
  explicit Desk(Log& log) : calls(log) {}
  Desk(const Desk&) = delete;
  Desk& operator=(const Desk&) = delete;

  /// Return the view of `view`, or the window of `window`; make one if there is none. It stays the
  /// same while anybody holds it.
  std::shared_ptr<ViewNode> nodeOf(NSView* view);
  std::shared_ptr<AppKitWindow> windowOf(NSWindow* window);
  /// Returns the window of `window` if anybody holds it; otherwise null.
  std::shared_ptr<AppKitWindow> knownWindow(NSWindow* window) const;
  std::vector<std::shared_ptr<AppKitWindow>> windows() const;

  void enter(NSView* view, const std::shared_ptr<ViewNode>& node);
  void enter(NSWindow* window, const std::shared_ptr<AppKitWindow>& known);
  void forget(NSView* view) { views_.erase(view); }
  void forget(NSWindow* window) { windows_.erase(window); }

  /// Keeps a window alive while it is on the screen.
  void keep(const std::shared_ptr<AppKitWindow>& window);
  void letGo(const AppKitWindow& window);
  void letAllGo();

  /// Makes `object` stand for `responder`; with nil, no object stands for it any more.
  void present(const std::shared_ptr<Responder>& responder, id object);
  /// Returns the object that stands for `responder`; nil if there is none.
  id objectFor(const Responder* responder) const;
  /// Returns the responder for which `object` stands; null if there is none.
  std::shared_ptr<Responder> responderOf(id object) const;

  Calls calls;
  /// Called with each control that the user acts on, before its action is sent; may be empty.
  std::function<void(const Ref<View>&)> willAct;

 private:
  struct Presented {
    id object;                           // kept alive by its owner
    std::weak_ptr<Responder> responder;  // the same
  };

  std::unordered_map<NSView*, std::weak_ptr<ViewNode>> views_;
  std::unordered_map<NSWindow*, std::weak_ptr<AppKitWindow>> windows_;
  std::vector<std::shared_ptr<AppKitWindow>> kept_;
  std::unordered_map<const Responder*, Presented> presented_;
};

}  // namespace qz::toolkit::appkit
