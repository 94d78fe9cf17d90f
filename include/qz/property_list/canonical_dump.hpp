// SPDX-License-Identifier: MIT
// A value's complete content as one line of printable ASCII, for exact comparisons.
#pragma once

#include <string>

#include "qz/api.hpp"
#include "qz/property_list/value.hpp"

namespace qz::toolkit {

/// Returns JSON-like text: a string as "…", with the escapes of JSON for quotes and backslashes and
/// for each UTF-16 unit outside printable ASCII, true, false, {"int":"…"},
/// {"real":"%.17g","w":32|64},
/// {"date":"seconds"} (%.17g, since 2001-01-01), {"data":"hex"}, {"uid":n}, {"null":0}, [array],
/// {"set":[…]}, {"dict":[[key,value],…]}. Sets and dictionaries are sorted by the dump of the
/// element or key. Empty for an absent value.
QZ_API std::string canonicalDump(const Value& value);

}  // namespace qz::toolkit
