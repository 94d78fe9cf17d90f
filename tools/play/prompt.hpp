// SPDX-License-Identifier: MIT
// Reads what the user of an interactive walk-through asks for, a line at a time.
#pragma once

#include <string>
#include <string_view>
#include <variant>

#include "tools/play/play.hpp"

namespace qz::tools::play {

using namespace walkthrough;

struct Help {};
struct Quit {};
/// A line that is not a known request; the hint says what was expected.
struct Unclear {
  std::string hint;
};

using Request = std::variant<Press, Advance, Help, Quit, Unclear>;

/// Returns what a line asks for: a tag, "+SECONDS", "?", or "q". Ignores spaces around it.
Request parseRequest(std::string_view line, bool hasNames = false);

/// Printed before each line is read.
inline constexpr std::string_view promptText = "tag, +seconds, ? or q: ";

/// The answer to Help; ends with a line end.
extern const std::string_view promptHelp;

/// Reads a tag as a user writes it: a whole number, nothing around it.
std::optional<toolkit::Tag> parseTag(std::string_view text);
/// Reads a number of seconds from 0 to `longestAdvance`, nothing around it.
std::optional<double> parseSeconds(std::string_view text);

}  // namespace qz::tools::play
