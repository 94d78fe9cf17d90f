// SPDX-License-Identifier: MIT
// Text in the XML of reports.
#pragma once

#include <string>
#include <string_view>

namespace qz::tools {

/// Returns `text` as the content of an element or as an attribute's value in double quotes. Markup
/// and white space other than blanks become references. Characters that XML 1.0 does not allow, and
/// bytes that are not UTF-8, become U+FFFD.
std::string xmlText(std::string_view text);

}  // namespace qz::tools
