// SPDX-License-Identifier: MIT
// The tokens of old-style property lists: `{ key = value; }`, `( a, b )`, `<hex>`, strings with and
// without quotes, comments.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <utility>

#include "toolkit/property_list/refusal.hpp"

namespace toolkit {

/// Whether a string without quotes may hold this character.
bool isBareCharacter(char c);

/// Reads from the start of a text to its end.
class OldStyleTokens {
 public:
  /// `text` is valid UTF-8 and must outlive this.
  explicit OldStyleTokens(std::string_view text) : text_(text) {}

  /// Skips white space and comments; whether anything is left.
  bool skipToToken();
  /// The same, and whether it is `c`, which it takes.
  bool take(char c);
  /// The character that the next token starts with; '\0' at the end.
  char peek() const { return at_ < text_.size() ? text_[at_] : '\0'; }
  /// Whether a string starts here.
  bool isAtString() const;
  /// The string that starts here, as generalized UTF-8. It holds until the next call.
  std::string_view string();
  /// The bytes written in hexadecimal between < and >, the first of which was taken already. They
  /// hold until the next call.
  std::string_view data();

  std::size_t offset() const { return at_; }
  void startAgain() { at_ = 0; }
  [[noreturn]] void refuse(std::string reason) const { throw RefusedAt{at_, std::move(reason)}; }
  /// Refuses what stands here; says what was `expected` in its place.
  [[noreturn]] void refuseUnexpected(std::string_view expected) const;

 private:
  std::size_t spaceLength() const;
  void skipLineComment();
  void skipBlockComment();
  std::string_view bareString();
  std::string_view quotedString();
  char16_t escapedUnit();
  unsigned digits(unsigned base, std::size_t most);

  std::string_view text_;
  std::size_t at_ = 0;
  std::string buffer_;  // of strings that do not stand in the file as they are, and of data
};

}  // namespace toolkit
