// SPDX-License-Identifier: MIT
// The text of a script value that must be a string.
#pragma once

#include <string_view>

#include "toolkit/property_list/scalars.hpp"

/// Raises: `value` is no string. Out of the way of `textOf`, which is part of every command.
[[noreturn]] void raiseNoString(const toolkit::Value& value);

/// The text of a string, valid as long as the value; empty for an absent one. Anything else raises.
inline std::string_view textOf(const toolkit::ValueRef<>& value) {
  if (!value) return {};
  if (value->kind() != toolkit::Value::Kind::string) raiseNoString(*value);
  return static_cast<const toolkit::String&>(*value).text();
}
