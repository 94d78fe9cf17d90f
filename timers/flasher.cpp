// SPDX-License-Identifier: MIT
// Flashing: one half-second timer toggles the pressed-in look of every button whose tag flashes.

#include "engine/state.hpp"
#include "engine/tag_key.hpp"
#include "text/number_conversion.hpp"

namespace qz {

using toolkit::asButton;

void QZ_Plist_State_Parser::flasherFired(Timer timer) {
  if (state_->overridden("flasherFired:", timer)) return;
  const auto kept = keepAlive();
  if (!state_->flashing) return;
  const Dictionary flashing = *state_->flashingTagIds;
  for (const std::string& key : flashing->allKeys()) {
    if (!flashing->objectForKey(key)->boolValue()) continue;
    const auto button = asButton(findObjectWithTag(text::intValueOf(key)));
    button->highlight(!button->isHighlighted());
  }
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_ALLOW_FLASHING(bool allow) {
  if (const auto other = state_->overridden("QZ_Plist_State_Processor_ALLOW_FLASHING:", allow)) {
    return other->yes;
  }
  const auto kept = keepAlive();
  state_->flashing = allow;
  if (allow) return true;
  // Every button that has a list loses its highlight, even if it was not flashing; a flashing
  // button without a list keeps its look.
  const Dictionary script = state_->plistDictionary->copy(toolkit::Mutability::immutable);
  for (const auto& [key, list] : script->entries()) {
    asButton(findObjectWithTag(key->intValue()))->highlight(false);
  }
  return true;
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_FLASH_ID(ObjectId id, bool flashOn) {
  if (const auto other =
          state_->overridden("QZ_Plist_State_Processor_FLASH_ID:flashOn:", id, flashOn)) {
    return other->yes;
  }
  const auto kept = keepAlive();
  const std::string key = tagKey(id->longValue());
  // The first FLASH_ID for a tag wins; later ones are ignored.
  if (state_->flashingTagIds->objectForKey(key)) return false;
  state_->flashingTagIds->setObject(toolkit::Number::withBool(flashOn), key);
  if (flashOn) return true;  // the next tick starts it
  const Control control = findObjectWithTag(id->longValue());
  control->highlight(false);  // raises if the control is not a button
  control->needsDisplay();
  return true;
}

// Never highlights anything, on purpose: it tests whether the *script's entry* under the id is a
// button, and gets that far only if the entry is absent. Scripts make a button flash instead.
bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_HIGHLIGHT_ID(ObjectId) { return false; }

}  // namespace qz
