// SPDX-License-Identifier: MIT
// The text of a script value that must be a string.
#pragma once

#include <string_view>

#include "qz/property_list/scalars.hpp"

namespace qz {

/// Raises because `value` is not a string. Separate from `textOf`, to keep that small: it is
/// inlined in every command.
[[noreturn]] void raiseNoString(const toolkit::Value& value);

/// Returns the text of a string, valid as long as the value; empty for an absent value. Anything
/// else raises.
inline std::string_view textOf(const toolkit::ValueRef<>& value) {
  if (!value) return {};
  if (value->kind() != toolkit::Value::Kind::string) raiseNoString(*value);
  return static_cast<const toolkit::String&>(*value).text();
}

}  // namespace qz
