// SPDX-License-Identifier: MIT
// Actions and buttons.

#include "toolkit/memory/views.hpp"

#include "toolkit/memory/window.hpp"

namespace qz::toolkit::memory {

bool ControlNode::send(std::string_view action, const std::shared_ptr<Responder>& target) {
  if (action.empty()) return false;
  // The responder may destroy the sender and its window, or change its action and target. Therefore
  // everything needed until the end is held here.
  const std::string selector(action);
  const Ref<View> sender = view();
  // NOLINTNEXTLINE(performance-unnecessary-copy-initialization)
  if (const auto receiver = target) return receiver->tryToPerform(selector, sender);

  for (auto responder = shared_from_this(); responder; responder = responder->superview())
    if (responder->view()->tryToPerform(selector, sender)) return true;
  const auto window = this->window();
  const auto delegate = window ? window->delegate() : nullptr;
  return delegate && delegate->tryToPerform(selector, sender);
}

MemoryButton::MemoryButton(ButtonBehavior behavior, const Rect& frame,
                           const std::shared_ptr<Screen>& screen)
    : MemoryControl(
          behavior == ButtonBehavior::popUp ? class_names::popUpButton : class_names::button, frame,
          screen),
      behavior_(behavior),
      title_(behavior == ButtonBehavior::popUp ? "" : "Button") {}

void MemoryButton::setState(State state) {
  const bool knowsMixed = behavior_ == ButtonBehavior::mixed;
  change(state_, state == State::mixed && !knowsMixed ? State::on : state);
}

State MemoryButton::stateAfterClick() const {
  switch (behavior_) {
    case ButtonBehavior::toggle:
      return state_ == State::on ? State::off : State::on;
    case ButtonBehavior::mixed:
      if (state_ == State::off) return State::mixed;
      return state_ == State::mixed ? State::on : State::off;
    case ButtonBehavior::push:
    case ButtonBehavior::popUp:
      break;
  }
  return state_;
}

void MemoryButton::click() {
  if (!takesClicks()) return;
  highlight(false);  // the mouse button is up again
  setState(stateAfterClick());
  send(action_, target());
}

}  // namespace qz::toolkit::memory
