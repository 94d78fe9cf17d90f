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
  // Every button that has a list loses its highlight, even if it was not flashing; a flashing
  // button without a list keeps its look.
  const Dictionary script = plistDictionary_->copy(toolkit::Mutability::immutable);
  for (const auto& [key, list] : script->entries()) {
    asButton(findObjectWithTag(key->intValue()))->highlight(false);
  }
  return true;
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_FLASH_ID(ObjectId id, bool flashOn) {
  const auto kept = keepAlive();
  const std::string key = tagKey(id->longValue());
  // The first FLASH_ID for a tag wins; later ones are ignored.
  if (flashingTagIds_->objectForKey(key)) return false;
  flashingTagIds_->setObject(toolkit::Number::withBool(flashOn), key);
  if (flashOn) return true;  // the next tick starts it
  const Control control = findObjectWithTag(id->longValue());
  control->highlight(false);  // raises if the control is not a button
  control->needsDisplay();
  return true;
}

// Never highlights anything, on purpose: it tests whether the *script's entry* under the id is a
// button, and gets that far only if the entry is absent. Scripts make a button flash instead.
bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_HIGHLIGHT_ID(ObjectId) { return false; }
