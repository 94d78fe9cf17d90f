// SPDX-License-Identifier: MIT
// What a toolkit does when its platform has nothing of its own for it.

#include "toolkit/toolkit.hpp"

#include "toolkit/styled_text/html_reader.hpp"

namespace toolkit {

std::optional<AttributedString> Toolkit::attributedStringWithHTML(std::string_view document) {
  return attributedStringFromHTML(document, fonts());
}

}  // namespace toolkit
