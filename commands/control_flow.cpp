// SPDX-License-Identifier: MIT
// The commands that control a run: running another list, ending the walk-through, and the idle
// placeholder.

#include "engine/state.hpp"
#include "engine/tag_key.hpp"

namespace qz {

// No guard against a list that reaches itself again: it runs until the stack is exhausted.
bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID(ObjectId id) {
  const auto kept = keepAlive();
  Value list = state_->plistDictionary->objectForKey(tagKey(id->longValue()));
  return processCommandArray(std::move(list), std::move(id));
}

void QZ_Plist_State_Parser::QZ_Plist_State_Processor_TERMINATE_PARSER() {
  const auto kept = keepAlive();
  state_->terminating = true;
  terminateParser();
}

void QZ_Plist_State_Parser::QZ_Plist_State_Processor_RETURN_TO_IDLE_LOOP() {}

}  // namespace qz
