// The command-list runner, through which every list runs, whoever starts it.

#include "QZ_Plist_State_Parser.hpp"
#include "engine/text_of.hpp"
#include "toolkit/uppercase.hpp"

bool QZ_Plist_State_Parser::processCommandArray(const Value& list, const ObjectId& forObject) {
  const auto self = shared_from_this();  // what runs may make the host let go of us
  const Parameters parameters = toolkit::Array::make();
  lastTagId_.set(forObject);
  // Outside of the guard: of a value that has no elements the caller hears.
  const auto count = static_cast<std::int32_t>(list->count());
  bool result = false;
  for (std::int32_t i = 0; i < count; ++i) {
    parameters->removeAllObjects();
    try {
      result = runElement(list->objectAtIndex(static_cast<std::size_t>(i)), parameters, forObject);
    } catch (const toolkit::Exception& exception) {
      toolkit_.log().write("Exception in processCommandArray: " + exception.reason());
    }
  }
  return result;
}

// An array is a compound command, whose name is matched in upper case; anything else is taken for a
// simple one, whose name is matched as written.
bool QZ_Plist_State_Parser::runElement(const Value& element, const Parameters& parameters,
                                       const ObjectId& id) {
  if (element->kind() != toolkit::Value::Kind::array) {
    // A copy keeps it: a list of the host's may lose it while it runs.
    return doSimpleCommand(textOf(Value(element)), parameters, id);
  }
  // Not by asArray, which counts the reference in and out again: this runs for every command.
  const auto& compound = static_cast<const toolkit::Array&>(*element);
  std::string raised;
  const auto name = toolkit::uppercased(textOf(compound.objectAtIndex(0)), raised);
  parameters->addObjects(compound.elements().subspan(1));
  return doCompoundCommand(name, parameters, id);
}
