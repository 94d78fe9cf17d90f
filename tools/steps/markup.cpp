// SPDX-License-Identifier: MIT
// Markdown becomes HTML, and HTML becomes ASCII.
#include "tools/steps/markup.hpp"

#include <md4c-html.h>

#include "tools/support/text_layout.hpp"

namespace qz::tools::steps {
namespace {

constexpr std::string_view paragraphStart = "<p>";
constexpr std::string_view paragraphEnd = "</p>\n";

void append(const MD_CHAR* text, MD_SIZE size, void* output) {
  static_cast<std::string*>(output)->append(text, size);
}

std::string render(std::string_view markdown) {
  std::string html;
  md_html(markdown.data(), static_cast<MD_SIZE>(markdown.size()), append, &html,
          MD_FLAG_NOHTML | MD_FLAG_NOINDENTEDCODEBLOCKS, 0);
  return html;
}

/// Removes the paragraph around a text that is nothing but one: the reader of HTML would add a
/// line.
std::string withoutOnlyParagraph(std::string html) {
  const bool isOne = html.starts_with(paragraphStart) && html.ends_with(paragraphEnd) &&
                     html.find(paragraphStart, 1) == std::string::npos;
  if (!isOne) return html;
  return html.substr(paragraphStart.size(),
                     html.size() - paragraphStart.size() - paragraphEnd.size());
}

/// Returns the text of HTML without tags; md4c writes only these references.
std::string unescape(const std::string& html) {
  static constexpr std::pair<std::string_view, char> references[] = {
      {"&lt;", '<'}, {"&gt;", '>'}, {"&quot;", '"'}, {"&amp;", '&'}};
  std::string text;
  for (std::size_t i = 0; i < html.size();) {
    bool isReference = false;
    for (const auto& [name, character] : references) {
      if (!std::string_view(html).substr(i).starts_with(name)) continue;
      text += character;
      i += name.size();
      isReference = true;
      break;
    }
    if (!isReference) text += html[i++];
  }
  return text;
}

/// Returns the code point at the beginning of a character, whose bytes are valid UTF-8.
unsigned long codePoint(std::string_view character) {
  const auto first = static_cast<unsigned char>(character.front());
  unsigned long code = character.size() == 1   ? first
                       : character.size() == 2 ? first & 0x1FU
                       : character.size() == 3 ? first & 0x0FU
                                               : first & 0x07U;
  for (const char c : character.substr(1))
    code = code << 6U | (static_cast<unsigned char>(c) & 0x3FU);
  return code;
}

}  // namespace

std::string inAscii(std::string_view html) {
  std::string ascii;
  while (!html.empty()) {
    const std::string_view character = firstCharacters(html, 1);
    html.remove_prefix(character.size());
    const bool isAscii = character.size() == 1 && static_cast<unsigned char>(character[0]) < 0x80;
    ascii += isAscii ? std::string(character) : "&#" + std::to_string(codePoint(character)) + ";";
  }
  return ascii;
}

std::string asHtml(std::string_view plain) {
  std::string html;
  for (const char c : plain) {
    switch (c) {
      case '<':
        html += "&lt;";
        break;
      case '>':
        html += "&gt;";
        break;
      case '&':
        html += "&amp;";
        break;
      case '\n':
        html += "<br>";
        break;
      default:
        html += c;
    }
  }
  return inAscii(html);
}

Markup readMarkdown(std::string_view text) {
  const std::string html = withoutOnlyParagraph(render(text));
  const bool isPlain = html.find('<') == std::string::npos;
  return isPlain ? Markup{true, unescape(html)} : Markup{false, inAscii(html)};
}

}  // namespace qz::tools::steps
