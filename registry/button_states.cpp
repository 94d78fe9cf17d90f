// SPDX-License-Identifier: MIT
// The states of pressed buttons, which a host can carry over to another walk-through.

#include "engine/state.hpp"

namespace qz {

QZ_Plist_State_Parser::Dictionary QZ_Plist_State_Parser::buttonStates() const {
  return state_->buttonStates ? state_->buttonStates->copy(toolkit::Mutability::immutable)
                              : nullptr;
}

bool QZ_Plist_State_Parser::setButtonSates(Dictionary states) {
  const auto kept = keepAlive();
  const Control content = tutorialWindow()->contentView();
  if (content->subviews().empty()) return false;
  bool changed = false;
  const Dictionary snapshot = states->copy(toolkit::Mutability::immutable);
  for (const auto& [key, value] : snapshot->entries()) {
    const auto button = toolkit::asButton(findObjectWithTag(key->integerValue()));
    if (!button) continue;
    button->setState(value->boolValue() ? toolkit::State::on : toolkit::State::off);
    changed = true;
  }
  return changed;
}

}  // namespace qz
