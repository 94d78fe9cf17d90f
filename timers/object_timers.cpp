// SPDX-License-Identifier: MIT
// Object timers: one-shot timers, one per tag key, that press the button of the tag or run its
// list.

#include "engine/state.hpp"
#include "engine/tag_key.hpp"

namespace qz {

void QZ_Plist_State_Parser::startTimerWithValue(std::uint64_t value,
                                                std::optional<std::string> forKey) {
  if (state_->overridden("startTimerWithValue:forKey:", value, forKey)) return;
  const auto kept = keepAlive();
  if (value == 0 || !forKey || forKey->empty()) return;
  // Seconds in single precision: above 16,777,216 the low digits are lost.
  const auto interval = static_cast<double>(static_cast<float>(value));
  const auto self = state_->forTimers(shared_from_this());
  // A replaced timer keeps running; when it fires, no key is found for it.
  state_->objectIdTimers->setObject(
      state_->toolkit.runLoop().schedule(
          interval, false, [self](const Timer& timer) { self->pseudoButtonPush(timer); }),
      *forKey);
  state_->notify(&Observer::timerSet, *forKey, interval);
}

void QZ_Plist_State_Parser::killAllTimers() {
  if (state_->overridden("killAllTimers")) return;
  const auto kept = keepAlive();
  cancelTimers();
}

void QZ_Plist_State_Parser::cancelTimers() {
  const Timers timers = *state_->objectIdTimers;
  const auto pending = timers->entries();  // a copy: releasing a timer may change the table
  for (const auto& [key, timer] : pending) {
    if (timer->isValid()) timer->invalidate();
    state_->notify(&Observer::timerCancelled, key);
  }
  timers->removeAllObjects();
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_TIMER(std::uint64_t value,
                                                               ObjectId forId) {
  if (const auto other =
          state_->overridden("QZ_Plist_State_Processor_SET_TIMER:forId:", value, forId)) {
    return other->yes;
  }
  const auto kept = keepAlive();
  const std::string key = tagKey(forId->integerValue());
  if (findObjectWithTag(forId->intValue())) {
    if (value != 0) {
      startTimerWithValue(value, key);
    } else {
      const Timer pending = state_->objectIdTimers->objectForKey(key);
      pending->invalidate();
      state_->objectIdTimers->removeObjectForKey(key);
      if (pending) state_->notify(&Observer::timerCancelled, key);
    }
  } else if (state_->plistDictionary->objectForKey(key)) {
    startTimerWithValue(value, key);  // here 0 does not cancel
  }
  return false;  // always, on purpose
}

}  // namespace qz
