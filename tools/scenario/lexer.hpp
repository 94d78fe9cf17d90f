// SPDX-License-Identifier: MIT
// Splits the text of a scenario file into the words of its statements.
//
// A word is bare, "quoted", or JSON that begins with a bracket or a brace. A statement ends with
// its line, unless a bracket or brace is open. A `#` at the start of a word begins a comment,
// unless a whole number follows and then the end of the word or a dot, as in #5 or #-3.text: that
// names a control by its tag. Within JSON, every `#` outside a string begins a comment.
#pragma once

#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

#include "tools/scenario/json.hpp"

namespace qz::tools::scenario {

/// A place in a file. Both count from 1; columns count characters.
struct Position {
  int line = 1;
  int column = 1;

  friend bool operator==(const Position&, const Position&) = default;
};

/// Thrown if the text is not a scenario: says where, and what is wrong.
class SyntaxError : public std::runtime_error {
 public:
  SyntaxError(Position at, const std::string& message) : std::runtime_error(message), at_(at) {}
  Position at() const { return at_; }

 private:
  Position at_;
};

struct Word {
  enum class Kind { bare, quoted, json };

  Kind kind = Kind::bare;
  std::string text;  ///< quoted: without quotation marks and escapes; JSON: without comments
  Json value;        ///< only if the word is JSON
  Position at;

  bool isBare(std::string_view word) const { return kind == Kind::bare && text == word; }
};

struct Line {
  std::vector<Word> words;  ///< at least one
  Position end;             ///< right after the last word
  std::string source;       ///< the first line of the text, with an ellipsis if more follow
};

/// Deeper JSON is refused, as deeper property lists are.
inline constexpr int deepestNesting = 512;

/// Returns the words of `text`, which must be UTF-8, by statement. Throws a SyntaxError.
std::vector<Line> readWords(std::string_view text);

}  // namespace qz::tools::scenario
