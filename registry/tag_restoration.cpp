// SPDX-License-Identifier: MIT
// Restores the tags that controls had at their discovery.

#include "engine/state.hpp"
#include "engine/tag_key.hpp"

namespace qz {

void QZ_Plist_State_Parser::restoreOriginalTagValues() {
  if (state_->overridden("restoreOriginalTagValues")) return;
  const auto kept = keepAlive();
  if (!*state_->guiAssets) return;
  const Dictionary tags = state_->originalTagValues->copy(toolkit::Mutability::immutable);
  for (const auto& [key, value] : tags->entries()) {
    const std::string name = key->description();
    const toolkit::Tag recorded = value->intValue();
    const Control control = state_->guiAssets->objectForKey(name).control.get();
    // Logged even if nothing changes; a destroyed control has the tag 0 and no class.
    state_->toolkit.log().write(
        "Restoring tag value from: " + tagKey(control->tag()) + " to " + tagKey(recorded) +
        " for object: " + (control ? control->className() : "(null)") + " with Key: " + name);
    if (control->tag() != recorded) control->setTag(recorded);
  }
}

}  // namespace qz
