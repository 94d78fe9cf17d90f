// SPDX-License-Identifier: MIT
// The commands that steer a run: another tag's list, the end, and the idle placeholder.

#include "QZ_Plist_State_Parser.hpp"
#include "engine/tag_key.hpp"

// Nothing guards against a list that reaches itself again: it runs until the stack is exhausted.
bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID(const ObjectId& id) {
  return processCommandArray(plistDictionary_->objectForKey(tagKey(id->longValue())), id);
}

void QZ_Plist_State_Parser::QZ_Plist_State_Processor_TERMINATE_PARSER() {
  terminating_ = true;
  terminateParser();
}

void QZ_Plist_State_Parser::QZ_Plist_State_Processor_RETURN_TO_IDLE_LOOP() {}
