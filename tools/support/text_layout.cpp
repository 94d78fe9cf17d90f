// SPDX-License-Identifier: MIT
// Text in the cells of a terminal.
#include "tools/support/text_layout.hpp"

#include <algorithm>
#include <array>
#include <cstdio>

#include "text/utf8.hpp"

namespace qz::tools {
namespace {

constexpr char32_t replacement = 0xFFFD;

struct Character {
  char32_t code = replacement;
  std::size_t length = 1;  // bytes
};

struct Range {
  char32_t first;
  char32_t last;
};

/// Returns the first character of `text`, which must not be empty. Each byte of invalid UTF-8, or
/// of a surrogate (which no terminal can show), counts as one replacement character.
Character firstCharacter(std::string_view text) {
  constexpr std::size_t longest = 4;
  if (text::validUtf8Length(text.substr(0, longest)) == 0) return {};
  std::size_t length = 0;
  const char32_t code = text::nextCodePoint(text, length);
  return {code, length};
}

template <std::size_t N>
bool isIn(const std::array<Range, N>& ranges, char32_t code) {
  return std::any_of(ranges.begin(), ranges.end(),
                     [code](const Range& r) { return code >= r.first && code <= r.last; });
}

std::size_t characterWidth(char32_t code) {
  static constexpr std::array<Range, 6> none = {{{0x0300, 0x036F},
                                                 {0x200B, 0x200D},
                                                 {0x20D0, 0x20FF},
                                                 {0xFE00, 0xFE0F},
                                                 {0xFE20, 0xFE2F},
                                                 {0xFEFF, 0xFEFF}}};
  static constexpr std::array<Range, 9> wide = {{{0x1100, 0x115F},
                                                 {0x2E80, 0x303E},
                                                 {0x3041, 0xA4CF},
                                                 {0xAC00, 0xD7A3},
                                                 {0xF900, 0xFAFF},
                                                 {0xFE30, 0xFE6F},
                                                 {0xFF00, 0xFF60},
                                                 {0x1F300, 0x1F9FF},
                                                 {0x20000, 0x3FFFD}}};
  if (isIn(none, code)) return 0;
  return isIn(wide, code) ? 2 : 1;
}

/// Whether a terminal would act on the character or change the direction of the text that follows.
bool disturbs(char32_t code) {
  static constexpr std::array<Range, 5> disturbing = {
      {{0x00, 0x1F}, {0x7F, 0x9F}, {0x200E, 0x200F}, {0x202A, 0x202E}, {0x2066, 0x2069}}};
  return isIn(disturbing, code);
}

bool endsLine(char32_t code) { return code == '\n' || code == 0x2028 || code == 0x2029; }

std::string escaped(char32_t code) {
  std::array<char, 16> text{};
  std::snprintf(text.data(), text.size(), "\\u{%x}", static_cast<unsigned>(code));
  return text.data();
}

/// Returns where to cut `line`: after at most `width` columns, and after at least one character.
std::size_t cutOff(std::string_view line, std::size_t width) {
  std::size_t bytes = 0;
  std::size_t columns = 0;
  while (bytes < line.size()) {
    const Character character = firstCharacter(line.substr(bytes));
    columns += characterWidth(character.code);
    if (columns > width && bytes > 0) break;
    bytes += character.length;
  }
  return bytes;
}

void wrapLine(std::string_view line, std::size_t width, std::vector<std::string>& lines) {
  while (cutOff(line, width) < line.size()) {
    std::size_t end = cutOff(line, width);
    std::size_t next = end;
    // A space just after the last column still breaks the line there.
    if (const auto space = line.rfind(' ', end); space != std::string_view::npos && space > 0) {
      end = space;
      next = space + 1;
    }
    lines.emplace_back(line.substr(0, end));
    line.remove_prefix(next);
  }
  lines.emplace_back(line);
}

std::string padding(std::string_view text, std::size_t width) {
  const std::size_t taken = displayWidth(text);
  std::string spaces;
  spaces.resize(width > taken ? width - taken : 0, ' ');
  return spaces;
}

}  // namespace

std::size_t displayWidth(std::string_view text) {
  std::size_t width = 0;
  while (!text.empty()) {
    const Character character = firstCharacter(text);
    width += characterWidth(character.code);
    text.remove_prefix(character.length);
  }
  return width;
}

std::string printable(std::string_view text) {
  std::string shown;
  while (!text.empty()) {
    const auto [code, length] = firstCharacter(text);
    if (endsLine(code)) {
      shown += '\n';
    } else if (code == '\t') {
      shown += ' ';
    } else if (disturbs(code)) {
      shown += escaped(code);
    } else if (code == replacement) {
      shown += "\uFFFD";
    } else {
      shown += text.substr(0, length);
    }
    text.remove_prefix(length);
  }
  return shown;
}

std::string oneLine(std::string_view text) {
  std::string shown;
  for (const char c : printable(text)) {
    if (c == '\n') {
      shown += "\\n";
    } else {
      shown += c;
    }
  }
  return shown;
}

std::string quote(std::string_view text) { return "“" + oneLine(text) + "”"; }

std::string quoteStart(std::string_view text) {
  constexpr std::size_t longest = 60;
  const auto start = firstCharacters(text, longest);
  return quote(start.size() == text.size() ? std::string(text) : std::string(start) + "…");
}

std::string_view firstCharacters(std::string_view text, std::size_t count) {
  std::size_t end = 0;
  for (; count > 0 && end < text.size(); --count) end += firstCharacter(text.substr(end)).length;
  return text.substr(0, end);
}

std::vector<std::string> wrap(std::string_view text, std::size_t width) {
  std::vector<std::string> lines;
  for (std::size_t end = text.find('\n'); end != std::string_view::npos; end = text.find('\n')) {
    wrapLine(text.substr(0, end), width, lines);
    text.remove_prefix(end + 1);
  }
  wrapLine(text, width, lines);
  return lines;
}

std::string padRight(std::string_view text, std::size_t width) {
  return std::string(text) + padding(text, width);
}

std::string padLeft(std::string_view text, std::size_t width) {
  return padding(text, width) + std::string(text);
}

}  // namespace qz::tools
