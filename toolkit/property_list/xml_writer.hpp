// SPDX-License-Identifier: MIT
// Writes values as XML property lists.
#pragma once

#include <string>

#include "toolkit/property_list/value.hpp"

namespace toolkit {

/// The value as a whole XML file, in UTF-8, indented with tabs, that reads back as an equal value:
/// keys keep their order, a real of 32 bits becomes the same number with 64, and a date -0 seconds
/// from the reference date the same moment at 0.
///
/// Raises an invalid-argument exception, which says what and under which key or at which index, for
/// what no XML property list can carry: an absent value, null, a set, a key that is no string, half
/// of a surrogate pair, a date with a fraction of a second or further away than seconds are counted
/// exactly, a dictionary of nothing but an integer `CF$UID` (it reads back as a UID), and more than
/// 512 containers in one another. Control characters, which XML does not allow, are written as
/// character references, which every property-list reader takes.
std::string writeXmlPropertyList(const ValueRef<>& value);

}  // namespace toolkit
