// SPDX-License-Identifier: MIT
// Tag keys: the decimal form of a tag, under which scripts and tables keep what belongs to it.
#pragma once

#include <string>

#include "toolkit/tag.hpp"

inline std::string tagKey(toolkit::Tag tag) { return std::to_string(tag); }
