// SPDX-License-Identifier: MIT
// Tag keys: the decimal form of a tag, under which scripts and tables keep what belongs to it.
#pragma once

#include <string>

inline std::string tagKey(long tag) { return std::to_string(tag); }
