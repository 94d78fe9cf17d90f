// SPDX-License-Identifier: MIT
// Every function only moves forward, so reading takes linear time.
#include "toolkit/styled_text/html_tokenizer.hpp"

#include <algorithm>

#include "toolkit/styled_text/html_words.hpp"

namespace qz::toolkit::html {
namespace {

/// Elements whose content is neither markup nor visible text.
constexpr TagSet dropped{Tag::script, Tag::style, Tag::title};

constexpr bool endsTagName(char c) { return isSpace(c) || c == '/' || c == '>'; }
constexpr bool isTagName(char c) { return !endsTagName(c); }
constexpr bool isAttributeName(char c) { return !endsTagName(c) && c != '='; }
constexpr bool isUnquotedValue(char c) { return !isSpace(c) && c != '>'; }
constexpr bool isBetweenAttributes(char c) { return isSpace(c) || c == '/'; }

}  // namespace

template <bool (*taken)(char)>
std::string_view Tokenizer::takeWhile(std::size_t from) {
  std::size_t end = std::min(from, rest_.size());
  while (end < rest_.size() && taken(rest_[end])) ++end;
  const std::string_view part = rest_.substr(0, end);
  rest_.remove_prefix(end);
  return part;
}

bool Tokenizer::next(Token& token) {
  while (!rest_.empty()) {
    if (beginsTag()) {
      if (!readTag(token)) return false;
      const bool content = token.kind == Token::Kind::startTag && dropped.contains(token.tag);
      if (!content) return true;
      skipContent(token.tag);
    } else if (beginsDeclaration()) {
      skipDeclaration();
    } else {
      readText(token);
      return true;
    }
  }
  return false;
}

bool Tokenizer::beginsTag() const {
  return peek() == '<' && (isLetter(peek(1)) || (peek(1) == '/' && isLetter(peek(2))));
}

bool Tokenizer::beginsDeclaration() const {
  return peek() == '<' &&
         (peek(1) == '!' || peek(1) == '?' || (peek(1) == '/' && rest_.size() > 2));
}

void Tokenizer::readText(Token& token) {
  // The first character is text, even if it is a "<".
  const std::size_t end = std::min(rest_.find('<', 1), rest_.size());
  token.kind = Token::Kind::text;
  token.text = rest_.substr(0, end);
  rest_.remove_prefix(end);
}

/// Returns false if the document ends before the tag does.
bool Tokenizer::readTag(Token& token) {
  const bool end = peek(1) == '/';
  rest_.remove_prefix(end ? 2 : 1);
  token.kind = end ? Token::Kind::endTag : Token::Kind::startTag;
  token.tag = tagNamed(takeWhile<isTagName>());
  token.attributes.clear();
  for (takeWhile<isBetweenAttributes>(); peek() != '>'; takeWhile<isBetweenAttributes>()) {
    if (rest_.empty()) return false;
    readAttribute(token.attributes);
  }
  rest_.remove_prefix(1);
  return true;
}

void Tokenizer::readAttribute(Attributes& attributes) {
  // A leading "=" is part of the name, as in browsers, so every call moves forward.
  const Attribute name = attributeNamed(takeWhile<isAttributeName>(1));
  takeWhile<isSpace>();
  std::string_view value;
  if (peek() == '=') {
    rest_.remove_prefix(1);
    takeWhile<isSpace>();
    value = takeValue();
  }
  attributes.add(name, value);
}

std::string_view Tokenizer::takeValue() {
  const char quote = peek();
  if (quote != '"' && quote != '\'') return takeWhile<isUnquotedValue>();
  rest_.remove_prefix(1);
  return takeUntil(rest_, quote);
}

void Tokenizer::skipDeclaration() {
  if (rest_.starts_with("<!--")) {
    skipComment();
  } else {
    takeUntil(rest_, '>');
  }
}

void Tokenizer::skipComment() {
  rest_.remove_prefix(4);
  for (const std::string_view empty : {">", "->"}) {
    if (rest_.starts_with(empty)) return rest_.remove_prefix(empty.size());
  }
  for (std::size_t at = rest_.find("--"); at < rest_.size(); at = rest_.find("--", at + 1)) {
    for (const std::string_view end : {"-->", "--!>"}) {
      if (rest_.substr(at).starts_with(end)) return rest_.remove_prefix(at + end.size());
    }
  }
  rest_ = {};
}

/// Moves to the end tag of `element` or, without one, to the document's end.
void Tokenizer::skipContent(Tag element) {
  for (std::size_t at = rest_.find("</"); at < rest_.size(); at = rest_.find("</", at + 1)) {
    std::string_view name = rest_.substr(at + 2);
    name = name.substr(0, static_cast<std::size_t>(
                              std::find_if(name.begin(), name.end(), endsTagName) - name.begin()));
    if (tagNamed(name) == element) return rest_.remove_prefix(at);
  }
  rest_ = {};
}

}  // namespace qz::toolkit::html
