// SPDX-License-Identifier: MIT
// Presses by the user and by object timers.

#include "engine/state.hpp"
#include "engine/tag_key.hpp"
#include "text/number_conversion.hpp"

namespace qz {

void QZ_Plist_State_Parser::buttonPushed(Control sender) {
  if (state_->overridden("buttonPushed:", sender)) return;
  const auto kept = keepAlive();
  if (sender) killAllTimers();
  const toolkit::Tag tag = sender->tag();
  const std::string key = tagKey(tag);
  state_->toolkit.log().write("Button tag " + key + " pressed.");
  state_->buttonStates->setObject(toolkit::Number::withBool(sender->state() == toolkit::State::on),
                                  key);
  state_->notify(&Observer::controlPressed, sender);
  const Value list = state_->plistDictionary->objectForKey(key);
  if (!list || !toolkit::asButton(sender)) return;
  processCommandArray(list, toolkit::Number::withLong(tag));
}

void QZ_Plist_State_Parser::pseudoButtonPush(Timer timer) {
  if (state_->overridden("pseudoButtonPush:", timer)) return;
  const auto kept = keepAlive();
  const auto key = keyOfTimer(timer);
  if (!key) return;  // replaced under its key, or the walk-through is over
  state_->objectIdTimers->removeObjectForKey(*key);
  state_->notify(&Observer::timerFired, *key);
  killAllTimers();
  if (state_->terminating) return;
  if (const auto button = toolkit::asButton(findObjectWithTag(text::integerValueOf(*key)))) {
    button->sendAction("buttonPushed:", shared_from_this());
  } else {
    processCommandArray(state_->plistDictionary->objectForKey(*key),
                        toolkit::Number::withLong(text::intValueOf(*key)));
  }
}

// A timer has no tag; it is found in the table by identity.
std::optional<std::string> QZ_Plist_State_Parser::keyOfTimer(const Timer& timer) const {
  const Timers timers = *state_->objectIdTimers;
  for (const auto& [key, pending] : timers->entries()) {
    if (pending == timer) return key;
  }
  return std::nullopt;
}

}  // namespace qz
