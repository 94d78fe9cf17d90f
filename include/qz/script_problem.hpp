// SPDX-License-Identifier: MIT
// Detects scripts that would harm a host. The engine itself plays them, on purpose.
#pragma once

#include <string>

#include "qz/api.hpp"
#include "qz/property_list/collections.hpp"

namespace qz {

/// Returns why a host should not play the script from the list with its smallest tag, as a sentence
/// without a full stop: no key is a tag, the value under the smallest tag is not a list, or lists
/// run each other endlessly. Empty if there is no problem.
QZ_API std::string problemOf(const toolkit::ValueRef<toolkit::Dictionary>& script);

}  // namespace qz
