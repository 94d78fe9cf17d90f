// SPDX-License-Identifier: MIT
// A property list for people: one value a line, in the style of old-style property lists, with the
// types visible.
//
//   "text"  12  1.5  1.5f (32 bits)  YES  date 2001-01-01T00:00:00Z  <0a1b>  uid 5  null
//   ( array )   { key = value; }   {( set )}
#pragma once

#include <iosfwd>

#include "toolkit/property_list/value.hpp"

namespace tools {

/// Writes `root` with a line end behind it. Nothing in it can move a terminal's cursor: what would
/// is written out, as `\n`, `\t` or `\u{1b}`. `color` adds the escape sequences of a terminal.
void writeReadableDump(const toolkit::Value& root, std::ostream& out, bool color);

}  // namespace tools
