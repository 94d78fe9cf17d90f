// SPDX-License-Identifier: MIT
// Actions and buttons.

#include "toolkit/memory/views.hpp"

#include "toolkit/backend/responder_chain.hpp"
#include "toolkit/memory/window.hpp"

namespace qz::toolkit::memory {

bool ControlNode::send(std::string_view action, const std::shared_ptr<Responder>& target) {
  const auto self = shared_from_this();
  return sendAlongResponderChain(action, target, view(),
                                 {[](const Ref<View>& view) -> Ref<View> {
                                    const auto superview = of(view)->superview();
                                    return superview ? superview->view() : nullptr;
                                  },
                                  [self]() -> Ref<Window> { return self->window(); }});
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
