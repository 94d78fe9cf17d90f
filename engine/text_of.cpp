// SPDX-License-Identifier: MIT
#include "engine/text_of.hpp"

#include <string>

#include "qz/toolkit/exception.hpp"

namespace qz {

void raiseNoString(const toolkit::Value& value) {
  // Not the description: a small file can make that larger than memory.
  throw toolkit::InvalidArgumentException("expected a string, got " +
                                          std::string(value.className()));
}

}  // namespace qz
