// SPDX-License-Identifier: MIT
// The command that sets the plain text of a control.

#include "engine/state.hpp"
#include "engine/text_of.hpp"

namespace qz {

// Sets the text of any control. YES if it reads back as given. A value that is not a string is
// shown as its description, and then raises in the comparison. NO for an absent text.
bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_TEXT(Value text, ObjectId forId) {
  if (const auto other =
          state_->overridden("QZ_Plist_State_Processor_SET_TEXT:forId:", text, forId)) {
    return other->yes;
  }
  const auto kept = keepAlive();
  const Control control = findObjectWithTag(forId->longValue());
  if (!control) return false;
  control->setStringValue(text->description());
  return text && control->stringValue() == textOf(text);
}

}  // namespace qz
