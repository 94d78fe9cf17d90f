// SPDX-License-Identifier: MIT
// Prints a property list for people to read: one value a line, in the style of old-style property
// lists, with the types visible.
//
//   "text"  12  1.5  1.5f (32 bits)  YES  date 2001-01-01T00:00:00Z  <0a1b>  uid 5  null
//   ( array )   { key = value; }   {( set )}
#pragma once

#include <iosfwd>

#include "qz/property_list/value.hpp"

namespace qz::tools {

/// Writes `root` and a line end. No text in it can move a terminal's cursor: control characters are
/// escaped, as in `\n`, `\t` or `\u{1b}`. `color` adds a terminal's escape sequences.
void writeReadableDump(const toolkit::Value& root, std::ostream& out, bool color);

}  // namespace qz::tools
