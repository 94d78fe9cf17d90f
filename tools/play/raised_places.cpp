// SPDX-License-Identifier: MIT
// Reports the place in the script of each command that raises.
#include "tools/play/raised_places.hpp"

#include <ostream>

#include "tools/support/text_layout.hpp"

namespace qz::tools::play {
namespace {

/// Returns the key under which the script holds this very list; absent if it does not hold it.
std::optional<std::string> keyOf(const QZ_Plist_State_Parser::Dictionary& script,
                                 const toolkit::ValueRef<>& list) {
  for (const std::string& key : script->allKeys()) {
    if (script->objectForKey(key) == list) return key;
  }
  return std::nullopt;
}

/// Returns a text such as ": SET_TEXT_FOR_OBJECT_ID"; empty if the element names no command.
std::string nameWords(const toolkit::ValueRef<>& element) {
  const auto array = toolkit::asArray(element);
  if (array && array->count() == 0) return "";
  const auto name = array ? array->objectAtIndex(0) : element;
  if (!toolkit::asString(name)) return "";
  return ": " + printable(name->description());
}

}  // namespace

void RaisedPlaces::listWillRun(const Value& list, const ObjectId&) {
  running_.push_back(keyOf(engine_.plistDictionary(), list));
}

void RaisedPlaces::listDidRun(const Value&, const ObjectId&) { running_.pop_back(); }

void RaisedPlaces::commandRaised(const Value&, std::size_t index, const toolkit::Exception&) {
  const auto& key = running_.back();
  if (!key) return;
  const auto list = toolkit::asArray(script_.dictionary()->objectForKey(*key));
  if (!list || index >= list->count()) return;
  const auto element = list->objectAtIndex(index);
  log_ << "  " << script_.placeOf(element) << ": list " << printable(*key) << ", command "
       << index + 1 << nameWords(element) << std::endl;
}

}  // namespace qz::tools::play
