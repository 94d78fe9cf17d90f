// SPDX-License-Identifier: MIT
// Platform: the toolkit of the engines that Objective-C code makes, and its objects. It is
// AppKit's; tests may use another one.
#pragma once

#import <Foundation/Foundation.h>

#include <memory>

#include "qz/toolkit/toolkit.hpp"

namespace qz::hosts::appkit {

class Platform {
 public:
  virtual ~Platform() = default;

  virtual toolkit::Toolkit& toolkit() = 0;

  /// Return the view or window of an object; absent for nil. Raise an invalid-argument exception
  /// for an object of another class.
  virtual toolkit::Ref<toolkit::View> view(id object) = 0;
  virtual toolkit::Ref<toolkit::Window> window(id object) = 0;
  /// Return the object of a view or window, autoreleased; nil for an absent one.
  virtual id object(const toolkit::Ref<toolkit::View>& view) = 0;
  virtual id object(const toolkit::Ref<toolkit::Window>& window) = 0;

  /// Makes `object`, which is not retained, the target and delegate that controls and windows have
  /// for `engine`.
  virtual void present(const std::shared_ptr<toolkit::Responder>& engine, id object) = 0;
  /// Ends that; `object` is no longer a target or delegate in `window`, which may be absent.
  virtual void withdraw(const std::shared_ptr<toolkit::Responder>& engine, id object,
                        const toolkit::Ref<toolkit::Window>& window) = 0;
};

/// Returns the platform of new engines.
Platform& platform();
/// Sets it; it must outlive the engines made from now on. Null sets AppKit's again.
void setPlatform(Platform* platform);

}  // namespace qz::hosts::appkit
