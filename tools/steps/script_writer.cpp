// SPDX-License-Identifier: MIT
// Writes the lists of a script.
#include "tools/steps/script_writer.hpp"

#include "qz/property_list/scalars.hpp"

namespace qz::tools::steps {
namespace {

using toolkit::Array;
using toolkit::Dictionary;
using toolkit::Number;
using toolkit::String;
using toolkit::ValueRef;

// The marks around a command and around each of its parameters.
constexpr std::size_t sizeOfMarks = 15;

ValueRef<> valueOf(const Parameter& parameter) {
  if (const auto* text = std::get_if<std::string>(&parameter)) return String::make(*text);
  if (const auto* number = std::get_if<int>(&parameter)) return Number::withLong(*number);
  return Number::withBool(std::get<bool>(parameter));
}

}  // namespace

std::size_t sizeOf(const List& list) {
  std::size_t size = 0;
  for (const auto& [command, tag] : list) {
    size += command.name.size() + 2 * sizeOfMarks;
    for (const auto& parameter : command.parameters) {
      const auto* text = std::get_if<std::string>(&parameter);
      size += sizeOfMarks + (text ? text->size() : 1);
    }
  }
  return size;
}

ValueRef<> ScriptWriter::make(const TaggedCommand& element) {
  const auto& [command, tag] = element;
  const bool isSimple = command.parameters.empty() && !tag;
  ValueRef<> value;
  if (isSimple) {
    value = String::make(command.name);
  } else {
    std::vector<ValueRef<>> parts = {String::make(command.name)};
    for (const auto& parameter : command.parameters) parts.push_back(valueOf(parameter));
    if (tag) parts.emplace_back(Number::withLong(*tag));
    for (const auto& part : parts) offsets_.emplace_back(&*part, command.place);
    value = Array::make(std::move(parts));
  }
  offsets_.emplace_back(&*value, command.place);
  return value;
}

void ScriptWriter::add(toolkit::Tag key, Place place, const List& list) {
  std::vector<ValueRef<>> elements;
  for (const TaggedCommand& element : list) elements.push_back(make(element));
  const ValueRef<> name = String::make(std::to_string(key));
  const ValueRef<> value = Array::make(std::move(elements));
  offsets_.emplace_back(&*name, place);
  offsets_.emplace_back(&*value, place);
  entries_.push_back({name, value});
}

ValueRef<Dictionary> ScriptWriter::script() const { return Dictionary::make(entries_); }

}  // namespace qz::tools::steps
