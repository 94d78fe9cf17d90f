// SPDX-License-Identifier: MIT
// Writes values as binary property lists.
#pragma once

#include <string>

#include "toolkit/property_list/value.hpp"

namespace toolkit {

/// The value as a whole binary file, version 00, that reads back as an equal value. Values that are
/// the same object are written once, and so are equal strings.
///
/// Raises an invalid-argument exception for what no binary property list can carry: an absent
/// value, a collection as a key or within itself, and more than 512 levels in one another.
std::string writeBinaryPropertyList(const ValueRef<>& value);

}  // namespace toolkit
