// SPDX-License-Identifier: MIT
#include "tools/storyboard/markup.hpp"

#include <charconv>

#include "tools/support/text_layout.hpp"
#include "tools/support/xml_text.hpp"

namespace qz::tools::storyboard {
namespace {

constexpr std::size_t longestText = 20'000;  // bytes; nobody reads more in a picture

}  // namespace

std::string html(std::string_view text) {
  const std::string_view begin = firstCharacters(text.substr(0, longestText), longestText);
  const std::size_t missing = text.size() - begin.size();
  const std::string shown = xmlText(printable(begin));
  return missing == 0 ? shown : shown + "… (" + std::to_string(missing) + " more bytes)";
}

std::string fromHex(std::string_view digits) {
  std::string bytes;
  for (std::size_t i = 0; i + 1 < digits.size(); i += 2) {
    unsigned byte = 0;
    std::from_chars(digits.data() + i, digits.data() + i + 2, byte, 16);
    bytes += static_cast<char>(byte);
  }
  return bytes;
}

}  // namespace qz::tools::storyboard
