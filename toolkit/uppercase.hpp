// SPDX-License-Identifier: MIT
// Upper case of text by Unicode's rules.
#pragma once

#include <string>
#include <string_view>

namespace toolkit {

/// `text` (UTF-8) in upper case by Unicode's full mappings, in no particular language. One
/// character may become several: "ß" becomes "SS", the ligature "ﬁ" becomes "FI". What is no UTF-8
/// stays.
std::string uppercased(std::string_view text);
/// The same without a copy where `text` is in upper case at first sight: then it is `text` itself,
/// or else what is then in `storage`.
std::string_view uppercased(std::string_view text, std::string& storage);

}  // namespace toolkit
