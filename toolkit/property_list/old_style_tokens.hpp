// SPDX-License-Identifier: MIT
// The tokens of old-style property lists: `{ key = value; }`, `( a, b )`, `<hex>`, strings with and
// without quotes, comments.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <utility>

#include "qz/property_list/refusal.hpp"

namespace qz::toolkit {

/// Whether a string without quotes may hold this character.
bool isBareCharacter(char c);

/// Reads a text from its start to its end.
class OldStyleTokens {
 public:
  /// `text` is valid UTF-8 and must outlive this.
  explicit OldStyleTokens(std::string_view text) : text_(text) {}

  /// Skips white space and comments. True if anything is left.
  bool skipToToken();
  /// The same; then reads `c`, if it comes next. True if it does.
  bool take(char c);
  /// Returns the character at the current position; '\0' at the end.
  char peek() const { return at_ < text_.size() ? text_[at_] : '\0'; }
  /// Whether a string starts here.
  bool isAtString() const;
  /// Reads the string that starts here, as generalised UTF-8. Valid until the next call.
  std::string_view string();
  /// Reads bytes in hexadecimal up to >; the < has been read already. Valid until the next call.
  std::string_view data();

  std::size_t offset() const { return at_; }
  void startAgain() { at_ = 0; }
  [[noreturn]] void refuse(std::string reason) const { throw RefusedAt{at_, std::move(reason)}; }
  /// Refuses the character here; the reason names what was `expected` instead.
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
  std::string buffer_;  // for strings that need decoding, and for data
};

}  // namespace qz::toolkit
