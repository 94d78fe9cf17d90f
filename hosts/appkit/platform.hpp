// SPDX-License-Identifier: MIT
// Platform: the AppKit toolkit of all Objective-C engines, and its objects.
#pragma once

#import <AppKit/AppKit.h>

#include <memory>

#include "qz/toolkit/appkit/appkit_toolkit.hpp"

namespace qz::hosts::appkit {

class Platform {
 public:
  /// Returns the only one; made at the first call.
  static Platform& shared();

  toolkit::Toolkit& toolkit() { return toolkit_; }

  /// Return the view or window of an object; absent for nil. Raise an invalid-argument exception
  /// for an object of another class.
  toolkit::Ref<toolkit::View> view(id object);
  toolkit::Ref<toolkit::Window> window(id object);
  /// Return the object of a view or window, autoreleased; nil for an absent one.
  NSView* object(const toolkit::Ref<toolkit::View>& view);
  NSWindow* object(const toolkit::Ref<toolkit::Window>& window);

  /// Makes `object`, which is not retained, the target and delegate that controls and windows have
  /// for `engine`.
  void present(const std::shared_ptr<toolkit::Responder>& engine, id object);
  /// Undoes `present`: removes `object` from the targets and the delegate of `window`, if there is
  /// a window.
  void withdraw(const std::shared_ptr<toolkit::Responder>& engine, id object,
                const toolkit::Ref<toolkit::Window>& window);

 private:
  toolkit::appkit::AppKitApplication& application() { return toolkit_.application(); }

  toolkit::appkit::AppKitToolkit toolkit_;
};

}  // namespace qz::hosts::appkit
