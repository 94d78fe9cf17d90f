// SPDX-License-Identifier: MIT
#include "tools/support/xml_text.hpp"

#include <algorithm>
#include <cstddef>

#include "text/utf8.hpp"

namespace qz::tools {
namespace {

/// Returns the reference for a character that cannot stand for itself; empty for any other. White
/// space in an attribute would be read as blanks.
std::string_view referenceTo(char c) {
  switch (c) {
    case '&':
      return "&amp;";
    case '<':
      return "&lt;";
    case '>':
      return "&gt;";
    case '"':
      return "&quot;";
    case '\n':
      return "&#10;";
    case '\r':
      return "&#13;";
    case '\t':
      return "&#9;";
    default:
      return {};
  }
}

/// Whether XML 1.0 allows the character. Strict UTF-8 has no surrogates, which it does not allow
/// either.
bool isXmlCharacter(std::string_view utf8) {
  if (utf8 == "\uFFFE" || utf8 == "\uFFFF") return false;
  const auto first = static_cast<unsigned char>(utf8.front());
  return first >= 0x20 || first == '\t' || first == '\n' || first == '\r';
}

}  // namespace

std::string xmlText(std::string_view text) {
  std::string xml;
  while (!text.empty()) {
    const std::size_t length = text::utf8Length(text, 0);
    const auto character = text.substr(0, std::max<std::size_t>(length, 1));
    if (length == 0 || !isXmlCharacter(character)) {
      xml += "\uFFFD";
    } else if (const auto reference = referenceTo(character.front()); !reference.empty()) {
      xml += reference;
    } else {
      xml += character;
    }
    text.remove_prefix(character.size());
  }
  return xml;
}

}  // namespace qz::tools
