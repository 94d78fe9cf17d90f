// SPDX-License-Identifier: MIT
// Writes values as binary property lists.
#pragma once

#include <string>

#include "qz/api.hpp"
#include "qz/property_list/value.hpp"

namespace qz::toolkit {

/// Returns the value as a complete binary file, version 00, that reads back as an equal value. The
/// same object is written only once, and so are equal strings.
///
/// Raises an invalid-argument exception for a value that no binary property list can hold: an
/// absent value, a collection as a key, a collection within itself, and more than 512 nested
/// levels.
QZ_API std::string writeBinaryPropertyList(const ValueRef<>& value);

}  // namespace qz::toolkit
