// SPDX-License-Identifier: MIT
// The command-list runner, through which every list runs, whoever starts it.

#include "QZ_Plist_State_Parser.hpp"
#include "engine/commands.hpp"
#include "engine/text_of.hpp"
#include "toolkit/uppercase.hpp"

namespace {

using Engine = QZ_Plist_State_Parser;

// An array is a compound command, whose name is matched in upper case; anything else is taken for a
// simple one, whose name is matched as written. What is not fixed may change while it runs: it is
// kept, or copied.
bool runElement(Engine& engine, toolkit::Toolkit& toolkit, const Engine::Value& element,
                bool isFixed, const Engine::Parameters& parameters, const Engine::ObjectId& id) {
  if (element->kind() != toolkit::Value::Kind::array) {
    parameters->removeAllObjects();
    return commands::runSimple(engine, textOf(Engine::Value(element)), id);
  }
  // Not by asArray, which counts the reference in and out again: this runs for every command.
  const auto& compound = static_cast<const toolkit::Array&>(*element);
  std::string raised;
  const auto name = toolkit::uppercased(textOf(compound.objectAtIndex(0)), raised);
  const auto given = compound.elements().subspan(1);
  isFixed ? parameters->borrowElements(given) : parameters->setElements(given);
  return commands::runCompound(engine, toolkit, name, parameters, id);
}

}  // namespace

bool QZ_Plist_State_Parser::processCommandArray(Value list, ObjectId forObject) {
  const auto kept = keepAlive();
  const Parameters parameters = toolkit::Array::make();
  lastTagId_.set(forObject);
  // Outside of the guard: of a value that has no elements the caller hears.
  const auto count = static_cast<std::int32_t>(list->count());
  notify(&qz::Observer::listWillRun, list, forObject);
  bool result = false;
  for (std::int32_t i = 0; i < count; ++i) {
    const auto index = static_cast<std::size_t>(i);
    try {
      const Value& element = list->objectAtIndex(index);
      notify(&qz::Observer::commandWillRun, list, index);
      result = runElement(*this, toolkit_, element, list->isFixed(), parameters, forObject);
      notify(&qz::Observer::commandDidRun, list, index, result);
    } catch (const toolkit::Exception& exception) {
      toolkit_.log().write("Exception in processCommandArray: " + exception.reason());
      notify(&qz::Observer::commandRaised, list, index, exception);
    }
  }
  notify(&qz::Observer::listDidRun, list, forObject);
  return result;
}
