// SPDX-License-Identifier: MIT
// Presses by the user and by object timers.

#include "QZ_Plist_State_Parser.hpp"
#include "engine/tag_key.hpp"
#include "toolkit/property_list/number_conversion.hpp"

void QZ_Plist_State_Parser::buttonPushed(Control sender) {
  const auto kept = keepAlive();
  if (sender) killAllTimers();
  const toolkit::Tag tag = sender->tag();
  const std::string key = tagKey(tag);
  toolkit_.log().write("Button tag " + key + " pressed.");
  buttonStates_->setObject(toolkit::Number::withBool(sender->state() == toolkit::State::on), key);
  const Value list = plistDictionary_->objectForKey(key);
  if (!list || !toolkit::asButton(sender)) return;
  processCommandArray(list, toolkit::Number::withLong(tag));
}

void QZ_Plist_State_Parser::pseudoButtonPush(Timer timer) {
  const auto kept = keepAlive();
  const auto key = keyOfTimer(timer);
  if (!key) return;  // replaced under its key, or the walk-through is over
  objectIdTimers_->removeObjectForKey(*key);
  notify(&qz::Observer::timerFired, *key);
  killAllTimers();
  if (terminating_) return;
  if (const auto button = toolkit::asButton(findObjectWithTag(toolkit::integerValueOf(*key)))) {
    button->sendAction("buttonPushed:", shared_from_this());
  } else {
    processCommandArray(plistDictionary_->objectForKey(*key),
                        toolkit::Number::withLong(toolkit::intValueOf(*key)));
  }
}

// A timer has no tag; it is found in the table by identity.
std::optional<std::string> QZ_Plist_State_Parser::keyOfTimer(const Timer& timer) const {
  const Timers timers = *objectIdTimers_;
  for (const auto& [key, pending] : timers->entries()) {
    if (pending == timer) return key;
  }
  return std::nullopt;
}
