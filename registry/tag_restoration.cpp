// SPDX-License-Identifier: MIT
// Restores the tags that controls had at their discovery.

#include "QZ_Plist_State_Parser.hpp"
#include "engine/tag_key.hpp"

void QZ_Plist_State_Parser::restoreOriginalTagValues() {
  const auto kept = keepAlive();
  if (!*guiAssets_) return;
  const Dictionary tags = originalTagValues_->copy(toolkit::Mutability::immutable);
  for (const auto& [key, value] : tags->entries()) {
    const std::string name = key->description();
    const toolkit::Tag recorded = value->intValue();
    const Control control = guiAssets_->objectForKey(name).control.get();
    // Logged even if nothing changes; a destroyed control has the tag 0 and no class.
    toolkit_.log().write(
        "Restoring tag value from: " + tagKey(control->tag()) + " to " + tagKey(recorded) +
        " for object: " + (control ? control->className() : "(null)") + " with Key: " + name);
    if (control->tag() != recorded) control->setTag(recorded);
  }
}
