// SPDX-License-Identifier: MIT
// The commands that control a run: running another list, ending the walk-through, and the idle
// placeholder.

#include "engine/command_calls.hpp"
#include "engine/state.hpp"
#include "engine/tag_key.hpp"

namespace qz {

// No guard against a list that reaches itself again: it runs until the stack is exhausted.
bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID(ObjectId id) {
  if (const auto other =
          state_->overridden("QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID:", id)) {
    return other->yes;
  }
  const auto kept = keepAlive();
  Value list = state_->plistDictionary->objectForKey(tagKey(id->longValue()));
  return processCommandArray(std::move(list), std::move(id));
}

// No limit, on purpose: a list with this command runs itself again from its first element.
bool commands::processCommands(const SimpleCall& call) {
  return call.engine.QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID(call.id);
}

void QZ_Plist_State_Parser::QZ_Plist_State_Processor_TERMINATE_PARSER() {
  if (state_->overridden("QZ_Plist_State_Processor_TERMINATE_PARSER")) return;
  const auto kept = keepAlive();
  state_->terminating = true;
  terminateParser();
}

bool commands::terminate(const SimpleCall& call) {
  call.engine.QZ_Plist_State_Processor_TERMINATE_PARSER();
  return true;
}

void QZ_Plist_State_Parser::QZ_Plist_State_Processor_RETURN_TO_IDLE_LOOP() {}

bool commands::idle(const SimpleCall&) { return true; }

}  // namespace qz
