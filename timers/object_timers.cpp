// SPDX-License-Identifier: MIT
// Object timers: one-shot timers, one per tag key, that press the button of the tag or run its
// list.

#include "QZ_Plist_State_Parser.hpp"
#include "engine/tag_key.hpp"

void QZ_Plist_State_Parser::startTimerWithValue(std::uint64_t value,
                                                std::optional<std::string> forKey) {
  const auto kept = keepAlive();
  if (value == 0 || !forKey || forKey->empty()) return;
  // Seconds in single precision: above 16,777,216 the low digits are lost.
  const auto interval = static_cast<double>(static_cast<float>(value));
  const auto self = shared_from_this();
  // A replaced timer keeps running; when it fires, no key is found for it.
  objectIdTimers_->setObject(
      toolkit_.runLoop().schedule(interval, false,
                                  [self](const Timer& timer) { self->pseudoButtonPush(timer); }),
      *forKey);
  notify(&qz::Observer::timerSet, *forKey, interval);
}

void QZ_Plist_State_Parser::killAllTimers() {
  const auto kept = keepAlive();
  const Timers timers = *objectIdTimers_;
  const auto pending = timers->entries();  // a copy: releasing a timer may change the table
  for (const auto& [key, timer] : pending) {
    if (timer->isValid()) timer->invalidate();
    notify(&qz::Observer::timerCancelled, key);
  }
  timers->removeAllObjects();
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_TIMER(std::uint64_t value,
                                                               ObjectId forId) {
  const auto kept = keepAlive();
  const std::string key = tagKey(forId->integerValue());
  if (findObjectWithTag(forId->intValue())) {
    if (value != 0) {
      startTimerWithValue(value, key);
    } else {
      const Timer pending = objectIdTimers_->objectForKey(key);
      pending->invalidate();
      objectIdTimers_->removeObjectForKey(key);
      if (pending) notify(&qz::Observer::timerCancelled, key);
    }
  } else if (plistDictionary_->objectForKey(key)) {
    startTimerWithValue(value, key);  // here 0 does not cancel
  }
  return false;  // always, on purpose
}
