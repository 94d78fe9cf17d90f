// SPDX-License-Identifier: MIT
// Gives a control another tag, optionally with a timer for the new tag.

#include "engine/state.hpp"
#include "engine/tag_key.hpp"
#include "text/number_conversion.hpp"

namespace qz {

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_TAG(ObjectId newTag, ObjectId forId) {
  if (const auto other =
          state_->overridden("QZ_Plist_State_Processor_SET_TAG:forId:", newTag, forId)) {
    return other->yes;
  }
  return retag(newTag, forId, nullptr);
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_TAG(ObjectId newTag, ObjectId forId,
                                                             Value withTimerValue) {
  if (const auto other =
          state_->overridden("QZ_Plist_State_Processor_SET_TAG:forId:withTimerValue:", newTag,
                             forId, withTimerValue)) {
    return other->yes;
  }
  return retag(newTag, forId, withTimerValue);
}

bool QZ_Plist_State_Parser::retag(const ObjectId& newTag, const ObjectId& id,
                                  const Value& timerValue) {
  const auto kept = keepAlive();
  const Control control = findObjectWithTag(id->longValue());
  if (!control) return false;
  control->setTag(newTag->integerValue());
  if (timerValue) {
    // On purpose: the seconds are the address of the parameter, not its number, so the delay is
    // very long. A script that needs a real delay sets a separate timer.
    startTimerWithValue(reinterpret_cast<std::uintptr_t>(timerValue.pointer().get()),
                        tagKey(newTag->longValue()));
  }
  rewriteFlashingEntry(id);
  return true;
}

// Rewrites the entry under the old id instead of moving it to the new tag: flashing follows the id
// that FLASH_ID named.
void QZ_Plist_State_Parser::rewriteFlashingEntry(const ObjectId& id) {
  const Dictionary flashing = *state_->flashingTagIds;
  for (const std::string& key : flashing->allKeys()) {
    if (text::intValueOf(key) != id->intValue()) continue;
    const std::string ownKey = tagKey(id->longValue());
    const bool flag = flashing->objectForKey(ownKey)->boolValue();
    flashing->setObject(toolkit::Number::withBool(flag), ownKey);
    return;
  }
}

}  // namespace qz
