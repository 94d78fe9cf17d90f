// SPDX-License-Identifier: MIT
// The defaults of a toolkit.

#include "toolkit/toolkit.hpp"

#include "toolkit/styled_text/html_reader.hpp"

namespace toolkit {

std::optional<AttributedString> Toolkit::attributedStringWithHTML(std::string_view document) {
  return attributedStringFromHTML(document, fonts());
}

}  // namespace toolkit
