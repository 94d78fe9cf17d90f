// SPDX-License-Identifier: MIT
// Small text files with one statement on a line. A word is anything without blanks and commas, or
// is in double quotes; a comma is a word.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace qz::tools::check {

struct Line {
  std::size_t number = 0;  ///< from 1
  std::string text;        ///< without blanks around it and the comment
  std::vector<std::string> words;
  /// Where each word begins, and where the last one ends; in characters, from 1.
  std::vector<std::size_t> columns;
};

/// Returns the lines of a file that have words, without comments, which begin with a `#`. Throws a
/// Failure if the file cannot be read; `what` names what it should hold.
std::vector<Line> linesOf(const std::string& path, std::string_view what);

}  // namespace qz::tools::check
