// SPDX-License-Identifier: MIT
// Scripts that would harm a host. The engine itself plays them, on purpose.
#pragma once

#include <string>

#include "toolkit/property_list/collections.hpp"

/// Why a host had better not play the script from its list with the smallest tag, as a sentence
/// without its full stop: no key is a tag, the value under the smallest tag is not a list, or lists
/// run each other without end. Empty where the script is fine.
std::string problemOf(const toolkit::ValueRef<toolkit::Dictionary>& script);
