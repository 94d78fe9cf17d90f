// SPDX-License-Identifier: MIT
// Reads old-style property lists, and strings files, which are dictionaries without braces.
#include <string>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/format_readers.hpp"
#include "qz/property_list/scalars.hpp"
#include "text/utf8.hpp"
#include "toolkit/property_list/old_style_tokens.hpp"
#include "toolkit/property_list/pending_values.hpp"

namespace qz::toolkit {
namespace {

class OldStyleReader {
 public:
  OldStyleReader(std::string_view text, Document& document, ValueOffsets* offsets)
      : tokens_(text), document_(document), offsets_(offsets), pending_(document) {}

  Value* root();

 private:
  bool isAtValue() const;
  Value* value(std::size_t depth);
  Value* content(std::size_t depth);
  Value* string();
  Value* array(std::size_t depth);
  Value* entries(std::size_t depth);
  Value* noted(Value* value, std::size_t offset);

  OldStyleTokens tokens_;
  Document& document_;
  ValueOffsets* offsets_;
  PendingValues pending_;
};

Value* OldStyleReader::root() {
  // A file with only white space and comments is a strings file without strings.
  if (!tokens_.skipToToken()) return noted(entries(0), 0);
  Value* result = value(0);
  if (!tokens_.skipToToken()) return result;
  if (result->kind() != Value::Kind::string) tokens_.refuseUnexpected("the end of the file");
  // More than one string: a strings file. Text after its last pair that cannot begin a key is
  // ignored.
  tokens_.startAgain();
  if (offsets_) offsets_->clear();
  return noted(entries(0), 0);
}

bool OldStyleReader::isAtValue() const {
  const char c = tokens_.peek();
  return tokens_.isAtString() || c == '{' || c == '(' || c == '<';
}

Value* OldStyleReader::noted(Value* value, std::size_t offset) {
  if (offsets_) offsets_->emplace_back(value, offset);
  return value;
}

Value* OldStyleReader::value(std::size_t depth) {
  if (!tokens_.skipToToken() || !isAtValue()) tokens_.refuseUnexpected("a value");
  if (depth > deepestNesting) {
    tokens_.refuse("more than " + std::to_string(deepestNesting) + " nested levels");
  }
  const std::size_t offset = tokens_.offset();
  return noted(content(depth), offset);
}

Value* OldStyleReader::content(std::size_t depth) {
  if (tokens_.isAtString()) return string();
  if (tokens_.take('<')) return Data::make(document_, tokens_.data());
  if (tokens_.take('(')) return array(depth);
  tokens_.take('{');
  Value* dictionary = entries(depth);
  if (!tokens_.take('}')) tokens_.refuseUnexpected("a key or '}'");
  return dictionary;
}

Value* OldStyleReader::string() { return String::make(document_, tokens_.string()); }

Value* OldStyleReader::array(std::size_t depth) {
  const auto array = pending_.open();
  do {
    // A comma may be the last token.
    if (!tokens_.skipToToken() || !isAtValue()) break;
    pending_.add(value(depth + 1));
  } while (tokens_.take(','));
  if (!tokens_.take(')')) tokens_.refuseUnexpected("',' or ')'");
  return pending_.closeArray(array);
}

/// Reads `key = value;` and `key;` (whose value is the key itself) while keys follow.
Value* OldStyleReader::entries(std::size_t depth) {
  const auto dictionary = pending_.open();
  while (tokens_.skipToToken() && tokens_.isAtString()) {
    const std::size_t offset = tokens_.offset();
    Value* key = noted(string(), offset);
    pending_.addKey(key, dictionary);
    tokens_.skipToToken();
    if (tokens_.take('=')) {
      pending_.add(value(depth + 1));
    } else if (tokens_.peek() == ';') {
      pending_.add(key);
    } else {
      tokens_.refuseUnexpected("'=' or ';' after the key");
    }
    if (!tokens_.take(';')) tokens_.refuseUnexpected("';'");
  }
  return pending_.closeDictionary(dictionary, Dictionary::Duplicates::lastWins);
}

}  // namespace

bool looksLikeOldStyle(std::string_view /*text*/) { return true; }

Value* readOldStyle(std::string_view text, Document& document, ValueOffsets* offsets) {
  const std::size_t valid = text::validUtf8Length(text);
  if (valid != text.size()) throw RefusedAt{valid, "the text is not valid UTF-8"};
  return OldStyleReader(text, document, offsets).root();
}

}  // namespace qz::toolkit
