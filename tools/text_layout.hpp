// SPDX-License-Identifier: MIT
// Text in the cells of a terminal: how wide it is, how it breaks into lines, and how to show text
// that comes from a script without letting it move the cursor.
//
// All text is UTF-8. Widths count terminal columns.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace tools {

/// The columns that `text` takes: two for an East Asian wide character or an emoji, none for a
/// combining mark.
std::size_t displayWidth(std::string_view text);

/// `text` with what would disturb a terminal written out: control and direction characters as
/// "\u{1b}", bytes that are no UTF-8 as U+FFFD, a tab as one space. Line ends stay; the line and
/// paragraph separators become line ends.
std::string printable(std::string_view text);

/// The same on one line: line ends are written "\n".
std::string oneLine(std::string_view text);

/// The same on one line between “ and ”.
std::string quote(std::string_view text);

/// `text` in lines of at most `width` columns (1 or more), broken at line ends, else at spaces,
/// else anywhere. At least one line.
std::vector<std::string> wrap(std::string_view text, std::size_t width);

/// `text` with spaces behind it, or in front of it, up to `width` columns.
std::string padRight(std::string_view text, std::size_t width);
std::string padLeft(std::string_view text, std::size_t width);

}  // namespace tools
