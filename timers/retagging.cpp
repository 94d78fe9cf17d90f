// SPDX-License-Identifier: MIT
// Giving a control another tag, with a timer for the new one or without.

#include "QZ_Plist_State_Parser.hpp"
#include "engine/tag_key.hpp"
#include "toolkit/property_list/number_conversion.hpp"

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_TAG(ObjectId newTag, ObjectId forId) {
  return QZ_Plist_State_Processor_SET_TAG(std::move(newTag), std::move(forId), nullptr);
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_TAG(ObjectId newTag, ObjectId forId,
                                                             Value withTimerValue) {
  const auto kept = keepAlive();
  const Control control = findObjectWithTag(forId->longValue());
  if (!control) return false;
  control->setTag(newTag->integerValue());
  if (withTimerValue) {
    // The parameter itself, not the number it holds, is the count of seconds: a very long time. A
    // script that wants a real delay sets a timer of its own.
    startTimerWithValue(reinterpret_cast<std::uintptr_t>(withTimerValue.pointer().get()),
                        tagKey(newTag->longValue()));
  }
  rewriteFlashingEntry(forId);
  return true;
}

// The entry is written anew under the old id, not moved to the new tag: flashing follows the id
// that it was asked for.
void QZ_Plist_State_Parser::rewriteFlashingEntry(const ObjectId& id) {
  const Dictionary flashing = *flashingTagIds_;
  for (const std::string& key : flashing->allKeys()) {
    if (toolkit::intValueOf(key) != id->intValue()) continue;
    const std::string ownKey = tagKey(id->longValue());
    const bool flag = flashing->objectForKey(ownKey)->boolValue();
    flashing->setObject(toolkit::Number::withBool(flag), ownKey);
    return;
  }
}
