// SPDX-License-Identifier: MIT
// Tag keys: the decimal form of a tag, used as a key in scripts and tables.
#pragma once

#include <optional>
#include <string>

#include "qz/property_list/collections.hpp"
#include "qz/toolkit/tag.hpp"

namespace qz {

inline std::string tagKey(toolkit::Tag tag) { return std::to_string(tag); }

/// Returns the key of the list with which a script starts by default: its smallest key, with each
/// key read as a 32-bit integer. A key that is not a number counts as 0, and "007" as 7, so the
/// result need not be a key of the script. Absent for an empty script.
std::optional<std::string> smallestTagKey(const toolkit::Dictionary& script);

}  // namespace qz
