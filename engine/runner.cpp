// SPDX-License-Identifier: MIT
// The command-list runner: every list runs through it.

#include "engine/command_calls.hpp"
#include "engine/state.hpp"
#include "engine/text_of.hpp"
#include "text/uppercase.hpp"

namespace qz {

namespace {

using Engine = QZ_Plist_State_Parser;

/// What the elements of a list share.
struct Run {
  Engine& engine;
  toolkit::Toolkit& toolkit;
  const Engine::Parameters& parameters;
  const Engine::ObjectId& id;
  bool isFixed;         ///< whether nobody can change the list meanwhile
  bool isByOperations;  ///< whether a subclass may override what runs a command
};

// Runs an array as a compound command, whose name is compared in upper case, and anything else as a
// simple command, whose name is compared as written. An element that is not fixed may change while
// it runs, so it is kept alive or copied.
bool runElement(const Run& run, const Engine::Value& element) {
  if (element->kind() != toolkit::Value::Kind::array) {
    run.parameters->removeAllObjects();
    const Engine::Value kept = element;  // NOLINT(performance-unnecessary-copy-initialization)
    return run.isByOperations ? run.engine.doSimpleCommand(textOf(kept), run.parameters, run.id)
                              : commands::runSimple(textOf(kept), run.engine, run.id);
  }
  // Not asArray, which would count a reference: this runs for every command.
  const auto& compound = static_cast<const toolkit::Array&>(*element);
  std::string raised;
  const auto name = text::uppercased(textOf(compound.objectAtIndex(0)), raised);
  const auto given = compound.elements().subspan(1);
  run.isFixed ? run.parameters->borrowElements(given) : run.parameters->setElements(given);
  if (run.isByOperations) {
    return run.engine.doCompoundCommand(name, commands::ownList(run.parameters), run.id);
  }
  return commands::runCompound(name, {run.engine, run.parameters, run.id, run.toolkit});
}

}  // namespace

bool QZ_Plist_State_Parser::processCommandArray(Value list, ObjectId forObject) {
  if (const auto other = state_->overridden("processCommandArray:ForObject:", list, forObject)) {
    return other->yes;
  }
  const auto kept = keepAlive();
  const Parameters parameters = toolkit::Array::make();
  state_->lastTagId.set(forObject);
  // Outside the try block: a value without elements raises to the caller.
  const auto count = static_cast<std::int32_t>(list->count());
  state_->notify(&Observer::listWillRun, list, forObject);
  const Run run{.engine = *this,
                .toolkit = state_->toolkit,
                .parameters = parameters,
                .id = forObject,
                .isFixed = list->isFixed(),
                .isByOperations = state_->subclass != nullptr};
  bool result = false;
  for (std::int32_t i = 0; i < count; ++i) {
    const auto index = static_cast<std::size_t>(i);
    try {
      const Value& element = list->objectAtIndex(index);
      state_->notify(&Observer::commandWillRun, list, index);
      result = runElement(run, element);
      state_->notify(&Observer::commandDidRun, list, index, result);
    } catch (const toolkit::Exception& exception) {
      state_->toolkit.log().write("Exception in processCommandArray: " + exception.reason());
      state_->notify(&Observer::commandRaised, list, index, exception);
    }
  }
  state_->notify(&Observer::listDidRun, list, forObject);
  return result;
}

}  // namespace qz
