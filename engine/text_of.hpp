// The text of a script value that must be a string.
#pragma once

#include <string>
#include <string_view>

#include "toolkit/exception.hpp"
#include "toolkit/property_list/scalars.hpp"

/// The text of a string, valid as long as the value; empty for an absent one. Anything else raises.
inline std::string_view textOf(const toolkit::ValueRef<>& value) {
  if (!value) return {};
  if (value->kind() != toolkit::Value::Kind::string) {
    // Not its description, which a small file can make longer than memory.
    throw toolkit::InvalidArgumentException("expected a string, got " +
                                            std::string(value->className()));
  }
  return static_cast<const toolkit::String&>(*value).text();
}
