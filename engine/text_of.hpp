// The text of a script value that must be a string.
#pragma once

#include <string>
#include <string_view>

#include "toolkit/exception.hpp"
#include "toolkit/property_list/scalars.hpp"

/// The text of a string, valid as long as the value; empty for an absent one. Anything else raises.
inline std::string_view textOf(const toolkit::ValueRef<>& value) {
  if (!value) return {};
  const auto string = toolkit::asString(value);
  if (!string) {
    // Not its description, which a small file can make longer than memory.
    throw toolkit::InvalidArgumentException("expected a string, got " +
                                            std::string(value->className()));
  }
  return string->text();
}
