// SPDX-License-Identifier: MIT
// Plain text.

#include "QZ_Plist_State_Parser.hpp"
#include "engine/text_of.hpp"

// Any control takes the text; the result says whether it reads back as it was given. What is no
// text is shown as a person would read it, and raises when it is compared; nothing equals an absent
// text.
bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_TEXT(Value text, ObjectId forId) {
  const auto kept = keepAlive();
  const Control control = findObjectWithTag(forId->longValue());
  if (!control) return false;
  control->setStringValue(text->description());
  return text && control->stringValue() == textOf(text);
}
