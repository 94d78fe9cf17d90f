// SPDX-License-Identifier: MIT
// Reads what the user of an interactive walk-through asks for.
#include "tools/play/prompt.hpp"

#include "tools/support/text_layout.hpp"
#include "tools/walkthrough/parse_number.hpp"

namespace qz::tools::play {
namespace {

std::string_view trimmed(std::string_view text) {
  constexpr std::string_view blanks = " \t\r";
  const std::size_t first = text.find_first_not_of(blanks);
  if (first == std::string_view::npos) return "";
  return text.substr(first, text.find_last_not_of(blanks) - first + 1);
}

Request parseAdvance(std::string_view text) {
  if (const auto seconds = parseSeconds(trimmed(text))) return Advance{*seconds};
  return Unclear{"after + expected seconds from 0 to 86400, such as +2.5"};
}

}  // namespace

const std::string_view promptHelp =
    "  TAG       press the button with this tag, such as 3\n"
    "  +SECONDS  let time pass, such as +2.5; timers run and buttons flash\n"
    "  ?         this help\n"
    "  q         quit\n";

Request parseRequest(std::string_view line, bool hasNames) {
  const std::string_view text = trimmed(line);
  if (text == "?") return Help{};
  if (text == "q") return Quit{};
  if (text.starts_with('+')) return parseAdvance(text.substr(1));
  if (const auto tag = parseTag(text)) return Press{*tag, {}};
  if (hasNames && !text.empty()) return Press{0, std::string(text)};
  const std::string_view expected = hasNames ? "a control" : "a tag";
  const std::string found = text.empty() ? "an empty line" : quote(text);
  return Unclear{"expected " + std::string(expected) + ", +seconds, ? or q, found " + found};
}

std::optional<toolkit::Tag> parseTag(std::string_view text) {
  return parseNumber<toolkit::Tag>(text);
}

std::optional<double> parseSeconds(std::string_view text) {
  const auto seconds = parseNumber<double>(text);
  // Comparisons with "nan" are false: the opposite conditions would accept it.
  return seconds && *seconds >= 0 && *seconds <= longestAdvance ? seconds : std::nullopt;
}

}  // namespace qz::tools::play
