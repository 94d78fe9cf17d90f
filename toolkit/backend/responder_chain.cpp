// SPDX-License-Identifier: MIT
// The responder chain.

#include "toolkit/backend/responder_chain.hpp"

#include <string>

namespace qz::toolkit {

bool sendAlongResponderChain(std::string_view action, const std::shared_ptr<Responder>& target,
                             const Ref<View>& control, const ResponderPlaces& places) {
  if (action.empty()) return false;
  // The responder may destroy the control and its window, or change its action and target.
  // Therefore this function holds everything that it needs until its end.
  const std::string selector(action);
  const Ref<View> sender = control;  // NOLINT(performance-unnecessary-copy-initialization)
  // NOLINTNEXTLINE(performance-unnecessary-copy-initialization)
  if (const auto receiver = target) return receiver->tryToPerform(selector, sender);

  for (Ref<View> responder = sender; responder; responder = places.superviewOf(responder)) {
    if (responder->tryToPerform(selector, sender)) return true;
  }
  const Ref<Window> window = places.window();
  const auto delegate = window ? window->delegate() : nullptr;
  return delegate && delegate->tryToPerform(selector, sender);
}

}  // namespace qz::toolkit
