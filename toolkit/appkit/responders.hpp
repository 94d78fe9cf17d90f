// SPDX-License-Identifier: MIT
// Responders of the toolkit interface as objects of AppKit, and the other way round.
#pragma once

#import <AppKit/AppKit.h>

#include <memory>
#include <string_view>

#include "qz/toolkit/responder.hpp"
#import "toolkit/appkit/desk.hpp"
#import "toolkit/foundation/kept.hpp"

namespace qz::toolkit::appkit {

/// The object that AppKit has as a control's target, or as a delegate, for a responder. Retains the
/// object that it made; keeps neither the responder nor a host's object alive.
class Stand {
 public:
  /// Stands for nothing.
  Stand() = default;
  Stand(const std::shared_ptr<Responder>& responder, const std::shared_ptr<Desk>& desk);

  id object() const { return object_; }
  /// Whether AppKit's `object` is the one that was made here.
  bool made(id object) const { return object && object == own_.get(); }

 private:
  foundation::Kept<id> own_;  // nil if the host presents an object of its own
  id object_ = nil;
};

/// Returns the responder that AppKit's target or delegate stands for; null for nil, and if the
/// responder has been destroyed. A foreign object becomes a responder that sends it the action.
std::shared_ptr<Responder> responderFor(id object, const std::shared_ptr<Desk>& desk);

/// Returns the selector of that name, and lets the responders of C++ receive it from the responder
/// chain. NULL for an empty name.
SEL selectorOf(std::string_view action);

}  // namespace qz::toolkit::appkit
