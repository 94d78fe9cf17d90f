// SPDX-License-Identifier: MIT
// The simple commands: names without parameters, which act on the control whose tag is the list's
// own id.

#include "engine/commands.hpp"
#include "engine/state.hpp"

namespace qz {

namespace {

using Engine = QZ_Plist_State_Parser;

struct SimpleCall {
  Engine& engine;
  const Engine::Control& control;  // absent if no control has the id
  const Engine::ObjectId& id;
};

bool terminate(const SimpleCall& call) {
  call.engine.QZ_Plist_State_Processor_TERMINATE_PARSER();
  return true;
}

template <bool enabled>
bool setEnabled(const SimpleCall& call) {
  call.control->setEnabled(enabled);
  return false;
}

template <bool hidden>
bool setHidden(const SimpleCall& call) {
  call.control->setHidden(hidden);
  return false;
}

bool idle(const SimpleCall&) { return true; }

// No limit, on purpose: a list with this command runs itself again from its first element.
bool processCommands(const SimpleCall& call) {
  return call.engine.QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID(call.id);
}

struct SimpleCommand {
  const std::string& name;  // refers to the constant: a host may rename the command at any time
  bool (*run)(const SimpleCall& call);
};

const SimpleCommand simpleCommands[] = {
    {QZ_PLIST_STATE_PARSER_TERMINATE_PARSER, terminate},
    {QZ_PLIST_STATE_PARSER_DISABLE_OBJECT_WITH_ID, setEnabled<false>},
    {QZ_PLIST_STATE_PARSER_ENABLE_OBJECT_WITH_ID, setEnabled<true>},
    {QZ_PLIST_STATE_PARSER_HIDE_OBJECT_WITH_ID, setHidden<true>},
    {QZ_PLIST_STATE_PARSER_SHOW_OBJECT_WITH_ID, setHidden<false>},
    {QZ_PLIST_STATE_PARSER_RETURN_TO_IDLE_LOOP, idle},
    {QZ_PLIST_STATE_PARSER_PROCESS_COMMANDS_FOR_ID, processCommands},
};

}  // namespace

bool commands::runSimple(Engine& engine, std::string_view name, const Engine::ObjectId& id) {
  const Engine::Control control = engine.findObjectWithTag(id->longValue());
  for (const SimpleCommand& command : simpleCommands) {
    if (name == command.name) return command.run({engine, control, id});
  }
  return false;
}

bool QZ_Plist_State_Parser::doSimpleCommand(std::string_view name, Parameters,
                                            ObjectId usingObject) {
  const auto kept = keepAlive();
  return commands::runSimple(*this, std::string(name), usingObject);
}

}  // namespace qz
