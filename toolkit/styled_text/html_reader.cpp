// SPDX-License-Identifier: MIT
// The HTML reader: passes the tokenizer's tokens to the builder one by one.
#include "qz/styled_text/html_reader.hpp"

#include "toolkit/styled_text/html_builder.hpp"
#include "toolkit/styled_text/html_tokenizer.hpp"

namespace qz::toolkit {

std::optional<AttributedString> attributedStringFromHTML(std::string_view bytes,
                                                         const Fonts& fonts) {
  if (bytes.empty()) return std::nullopt;
  html::Tokenizer tokenizer(bytes);
  html::Builder builder(fonts);
  for (html::Token token; tokenizer.next(token);) {
    switch (token.kind) {
      case html::Token::Kind::text:
        builder.addText(token.text);
        break;
      case html::Token::Kind::startTag:
        builder.startTag(token.tag, token.attributes);
        break;
      case html::Token::Kind::endTag:
        builder.endTag(token.tag);
        break;
    }
  }
  return builder.finish();
}

}  // namespace qz::toolkit
