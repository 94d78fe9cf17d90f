// SPDX-License-Identifier: MIT
// The responder chain: who performs the action of a control.
#pragma once

#include <functional>
#include <memory>
#include <string_view>

#include "qz/toolkit/ref.hpp"
#include "qz/toolkit/responder.hpp"
#include "qz/toolkit/view.hpp"
#include "qz/toolkit/window.hpp"

namespace qz::toolkit {

/// The places of a control, as its backend knows them. Both are asked while actions run, which may
/// destroy the control and its window.
struct ResponderPlaces {
  /// Returns the view around a view; absent at the top.
  std::function<Ref<View>(const Ref<View>&)> superviewOf;
  /// Returns the control's window; absent if there is none.
  std::function<Ref<Window>()> window;
};

/// Sends an action: to the target or, without one, to the control itself, the views around it, and
/// the delegate of its window, until one of them performs it. YES if one did. NO for an empty
/// action.
bool sendAlongResponderChain(std::string_view action, const std::shared_ptr<Responder>& target,
                             const Ref<View>& control, const ResponderPlaces& places);

}  // namespace qz::toolkit
