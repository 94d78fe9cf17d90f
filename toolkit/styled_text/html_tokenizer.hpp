// SPDX-License-Identifier: MIT
// Splits a document into tags and the text between them, in one pass.
//
// As in a browser, drops comments, document types, processing instructions, marked sections, the
// content of scripts, style sheets and titles, and a tag that the end of the document cuts off. A
// "<" that begins none of these is text.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>

#include "toolkit/styled_text/html_tags.hpp"

namespace qz::toolkit::html {

struct Token {
  enum class Kind : std::uint8_t { text, startTag, endTag };

  Kind kind = Kind::text;
  std::string_view text;  ///< as written; for a text
  Tag tag = Tag::unknown;
  Attributes attributes;  ///< for a start tag
};

class Tokenizer {
 public:
  /// `document` must outlive the tokenizer and its tokens.
  explicit Tokenizer(std::string_view document) : rest_(document) {}

  /// Reads the next token into `token`; false at the document's end.
  bool next(Token& token);

 private:
  bool beginsTag() const;
  bool beginsDeclaration() const;
  void readText(Token& token);
  bool readTag(Token& token);
  void readAttribute(Attributes& attributes);
  void skipDeclaration();
  void skipComment();
  void skipContent(Tag element);
  template <bool (*taken)(char)>
  std::string_view takeWhile(std::size_t from = 0);
  std::string_view takeValue();
  char peek(std::size_t offset = 0) const { return offset < rest_.size() ? rest_[offset] : '\0'; }

  std::string_view rest_;  // not yet read
};

}  // namespace qz::toolkit::html
