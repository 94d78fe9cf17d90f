// SPDX-License-Identifier: MIT
// Actions, buttons, and what controls save.

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

SavedView ControlNode::save() const {
  SavedView saved = ViewNode::save();
  saved.enabled = enabled_;
  saved.text = text_;
  return saved;
}

void ControlNode::restore(const SavedView& saved) {
  ViewNode::restore(saved);
  enabled_ = saved.enabled;
  text_ = saved.text;
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

SavedView MemoryButton::save() const {
  SavedView saved = MemoryControl::save();
  saved.title = title_;
  saved.state = state_;
  saved.highlighted = highlighted_;
  saved.background = background_;
  saved.bezel = bezel_;
  return saved;
}

void MemoryButton::restore(const SavedView& saved) {
  MemoryControl::restore(saved);
  title_ = saved.title;
  state_ = saved.state;
  highlighted_ = saved.highlighted;
  background_ = saved.background;
  bezel_ = saved.bezel;
}

SavedView MemoryImageView::save() const {
  SavedView saved = MemoryControl::save();
  saved.image = image_;
  saved.frameStyle = frameStyle_;
  saved.scaling = scaling_;
  saved.imageAlignment = alignment_;
  return saved;
}

void MemoryImageView::restore(const SavedView& saved) {
  MemoryControl::restore(saved);
  image_ = saved.image;
  frameStyle_ = saved.frameStyle;
  scaling_ = saved.scaling;
  alignment_ = saved.imageAlignment;
}

}  // namespace qz::toolkit::memory
