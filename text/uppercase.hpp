// SPDX-License-Identifier: MIT
// Conversion of text to upper case by Unicode's rules.
#pragma once

#include <string>
#include <string_view>

namespace qz::text {

/// Returns `text` (UTF-8) in upper case by Unicode's full mappings, independent of language. One
/// character may become several: "ß" becomes "SS", the ligature "ﬁ" becomes "FI". Bytes that are
/// not UTF-8 stay as they are.
std::string uppercased(std::string_view text);
/// The same, but avoids the copy if a quick check shows that `text` is in upper case: then returns
/// `text` itself. Otherwise the result is in `storage`.
std::string_view uppercased(std::string_view text, std::string& storage);

}  // namespace qz::text
