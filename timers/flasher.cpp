// SPDX-License-Identifier: MIT
// Flashing: one half-second timer toggles the pressed-in look of every button whose tag flashes.

#include "QZ_Plist_State_Parser.hpp"
#include "engine/tag_key.hpp"
#include "toolkit/property_list/number_conversion.hpp"

using toolkit::asButton;

void QZ_Plist_State_Parser::flasherFired(Timer) {
  const auto kept = keepAlive();
  if (!flashing_) return;
  const Dictionary flashing = *flashingTagIds_;
  for (const std::string& key : flashing->allKeys()) {
    if (!flashing->objectForKey(key)->boolValue()) continue;
    const auto button = asButton(findObjectWithTag(toolkit::intValueOf(key)));
    button->highlight(!button->isHighlighted());
  }
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_ALLOW_FLASHING(bool allow) {
  const auto kept = keepAlive();
  flashing_ = allow;
  if (allow) return true;
  // Every button that has a list loses its highlight, whether it was flashing or not; a flashing
  // one without a list keeps what it has.
  const Dictionary script = plistDictionary_->copy(toolkit::Mutability::immutable);
  for (const auto& [key, list] : script->entries()) {
    asButton(findObjectWithTag(key->intValue()))->highlight(false);
  }
  return true;
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_FLASH_ID(ObjectId id, bool flashOn) {
  const auto kept = keepAlive();
  const std::string key = tagKey(id->longValue());
  // The first word on a tag is the last one: it is never changed again.
  if (flashingTagIds_->objectForKey(key)) return false;
  flashingTagIds_->setObject(toolkit::Number::withBool(flashOn), key);
  if (flashOn) return true;  // the next tick starts it
  const Control control = findObjectWithTag(id->longValue());
  control->highlight(false);  // of what is no button this raises
  control->needsDisplay();
  return true;
}

// Asks whether the *script's entry* under the id, which must be absent to get that far, is a
// button: so it highlights nothing, whatever the id. Scripts make a button flash instead.
bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_HIGHLIGHT_ID(ObjectId) { return false; }
