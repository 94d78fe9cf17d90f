// SPDX-License-Identifier: MIT
// Writes values as XML property lists.
#pragma once

#include <string>

#include "qz/api.hpp"
#include "qz/property_list/value.hpp"

namespace qz::toolkit {

/// Returns the value as a complete XML file, in UTF-8 and indented with tabs, that reads back as an
/// equal value. Keys keep their order, a 32-bit real becomes a 64-bit one of the same value, and a
/// date of -0 seconds becomes one of 0 seconds.
///
/// Raises an invalid-argument exception, which names the problem and its key or index, for a value
/// that no XML property list can hold: an absent value, null, a set, a key that is not a string,
/// half a surrogate pair, a date with a fraction of a second or too far away for exact seconds,
/// a dictionary with only a number `CF$UID` (it reads back as a UID), and more than 512 nested
/// containers. Control characters, which XML does not allow, are written as character references,
/// which every property-list reader accepts.
QZ_API std::string writeXmlPropertyList(const ValueRef<>& value);

}  // namespace qz::toolkit
