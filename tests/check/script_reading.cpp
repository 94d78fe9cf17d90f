// SPDX-License-Identifier: MIT
// Reads single elements of a script.
#include "tests/check/script_reading.hpp"

#include <string>

#include "qz/property_list/scalars.hpp"
#include "qz/toolkit/exception.hpp"

namespace qz::naive {

namespace {

using toolkit::asArray;
using toolkit::asNumber;
using toolkit::asString;
using Value = toolkit::ValueRef<>;

bool raises(ParameterType type, const Value& value) {
  switch (type) {
    case ParameterType::anything:
    case ParameterType::html:      // shown as its description
    case ParameterType::fontName:  // another value counts as an unknown font
      return false;
    case ParameterType::text:
    case ParameterType::imageName:
    case ParameterType::colorName:
      return !asString(value);
    default:
      return !asString(value) && !asNumber(value);
  }
}

bool lacksParameter(const Command& command, std::size_t given) {
  if (command.extraParameters == ExtraParameters::preventTheCommand) return false;
  // A tooltip without any parameter gives NO instead of raising.
  if (command.constant == "QZ_PLIST_STATE_PARSER_SET_TOOL_TIP_FOR_ID") return false;
  return given < command.parameters.size() && !command.parameters[given].isOptional;
}

bool runsNoList(const Command& command, const toolkit::ValueRef<toolkit::Array>& element,
                const Script& script) {
  if (command.flow != CommandFlow::runsList) return false;
  const std::string key = std::to_string(element->objectAtIndex(1)->intValue());
  const Value list = script->objectForKey(key);
  return list && !asArray(list);
}

std::optional<std::size_t> tagPosition(const Command& command) {
  const auto position = command.positionOf(ParameterType::controlTag);
  return position ? position : command.positionOf(ParameterType::controlOrListTag);
}

std::optional<toolkit::Tag> namedTagOf(const Command& command,
                                       const toolkit::ValueRef<toolkit::Array>& element,
                                       toolkit::Tag own) {
  const auto position = tagPosition(command);
  if (!position) return std::nullopt;
  const std::size_t given = element->count() - 1;
  const auto extra = command.extraParameters;
  if (extra == ExtraParameters::preventTheCommand && given != command.parameters.size()) {
    return std::nullopt;
  }
  const bool overridden =
      extra == ExtraParameters::overrideTheTag && given > command.parameters.size();
  const bool isMissing = given <= *position && command.parameters[*position].isOptional;
  if (overridden || isMissing) return own;
  return element->objectAtIndex(*position + 1)->intValue();
}

}  // namespace

const Command* commandOf(const Value& element) {
  if (const auto simple = asString(element)) return simpleCommandNamed(simple->text());
  const auto compound = asArray(element);
  if (compound->count() == 0) return nullptr;
  const auto name = asString(compound->objectAtIndex(0));
  return name ? compoundCommandNamed(name->text()) : nullptr;
}

std::optional<toolkit::Tag> namedTag(const Value& element, toolkit::Tag own) {
  const Command* const command = commandOf(element);
  if (!command) return std::nullopt;
  if (asString(element)) {
    return command->target == TargetKind::none ? std::nullopt : std::optional(own);
  }
  try {
    return namedTagOf(*command, asArray(element), own);
  } catch (const toolkit::Exception&) {
    return std::nullopt;
  }
}

bool raisesBySight(const Value& element, const Script& script) {
  if (asString(element)) return false;
  const auto compound = asArray(element);
  if (compound->count() == 0 || !asString(compound->objectAtIndex(0))) return true;
  const Command* const command = commandOf(element);
  if (!command) return false;
  const std::size_t given = compound->count() - 1;
  if (lacksParameter(*command, given)) return true;
  for (std::size_t i = 0; i < command->parameters.size() && i < given; ++i) {
    if (raises(command->parameters[i].type, compound->objectAtIndex(i + 1))) return true;
  }
  return runsNoList(*command, compound, script);
}

bool suits(TargetKind target, drivers::ViewKind kind) {
  switch (target) {
    case TargetKind::anyControl:
      return rowOf(kind).isControl;
    case TargetKind::button:
      return rowOf(kind).isButton;
    case TargetKind::buttonWithState:
      return rowOf(kind).showsState;
    case TargetKind::imageView:
      return kind == drivers::ViewKind::imageView;
    case TargetKind::textField:
      return kind == drivers::ViewKind::textField;
    case TargetKind::none:
    case TargetKind::anyView:
      break;
  }
  return true;
}

}  // namespace qz::naive
