// SPDX-License-Identifier: MIT
// Text in the cells of a terminal: measures it, breaks it into lines, and shows text from a script
// without letting that move the cursor.
//
// All text is UTF-8. Widths count terminal columns.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace qz::tools {

/// Returns the columns that `text` takes: two for an East Asian wide character or an emoji, none
/// for a combining mark.
std::size_t displayWidth(std::string_view text);

/// Returns `text` without anything that would disturb a terminal: control and direction characters
/// become escapes such as "\u{1b}", bytes that are not UTF-8 become U+FFFD, a tab becomes one
/// space. Line ends stay; the line and paragraph separators become line ends.
std::string printable(std::string_view text);

/// The same on one line: line ends become "\n".
std::string oneLine(std::string_view text);

/// The same on one line, between “ and ”.
std::string quote(std::string_view text);

/// The same; only the beginning of a text with more than 60 characters, and an ellipsis.
std::string quoteStart(std::string_view text);

/// Returns the beginning of `text`: at most `count` characters. Each byte of invalid UTF-8 counts
/// as one.
std::string_view firstCharacters(std::string_view text, std::size_t count);

/// Breaks `text` into lines of at most `width` columns (1 or more): at line ends, else at spaces,
/// else anywhere. Returns at least one line.
std::vector<std::string> wrap(std::string_view text, std::size_t width);

/// Fills `text` up to `width` columns with spaces after it, or before it.
std::string padRight(std::string_view text, std::size_t width);
std::string padLeft(std::string_view text, std::size_t width);

}  // namespace qz::tools
