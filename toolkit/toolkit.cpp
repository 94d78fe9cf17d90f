// SPDX-License-Identifier: MIT
// The defaults of a toolkit.

#include "qz/toolkit/toolkit.hpp"

#include "qz/styled_text/html_reader.hpp"

namespace qz::toolkit {

std::optional<AttributedString> Toolkit::attributedStringWithHTML(std::string_view document) {
  return attributedStringFromHTML(document, fonts());
}

}  // namespace qz::toolkit
