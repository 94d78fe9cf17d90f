// SPDX-License-Identifier: MIT
// Tag keys: the decimal form of a tag, under which scripts and tables keep what belongs to it.
#pragma once

#include <optional>
#include <string>

#include "toolkit/property_list/collections.hpp"
#include "toolkit/tag.hpp"

inline std::string tagKey(toolkit::Tag tag) { return std::to_string(tag); }

/// The key of the list with which a script starts by itself: the smallest of its keys, each read as
/// a 32-bit integer. One that is not a number counts as 0, and "007" as 7, under which nothing need
/// be stored. Absent for an empty script.
std::optional<std::string> smallestTagKey(const toolkit::Dictionary& script);
