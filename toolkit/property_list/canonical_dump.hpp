// SPDX-License-Identifier: MIT
// A value's whole content in one line of printable ASCII, for comparing values to the letter.
#pragma once

#include <string>

#include "toolkit/property_list/value.hpp"

namespace toolkit {

/// JSON-like text: a string as "…" with \uXXXX for each UTF-16 unit outside of printable ASCII (and
/// \" and \\), true, false, {"int":"…"}, {"real":"%.17g","w":32|64}, {"date":"seconds"} (%.17g,
/// since 2001-01-01), {"data":"hex"}, {"uid":n}, {"null":0}, [array], {"set":[…]},
/// {"dict":[[key,value],…]}. Sets and dictionaries are sorted, by the dump of the element or key.
/// Nothing at all for an absent value.
std::string canonicalDump(const Value& value);

}  // namespace toolkit
