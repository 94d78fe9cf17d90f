// SPDX-License-Identifier: MIT
// The tokens of XML property lists: tags, character data, and comments and instructions between
// them.
//
// This is not standard XML but the dialect of the platform's reader: a tag ends at the first `>`,
// attributes are skipped, and unused parts are not checked.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

#include "qz/property_list/refusal.hpp"
#include "text/words.hpp"
#include "toolkit/property_list/xml_tags.hpp"

namespace qz::toolkit {

struct XmlTag {
  XmlElement element;
  bool selfClosed;
  std::size_t offset;  ///< of its `<`
};

/// Reads a text from its start to its end. Refuses anything but the requested token.
class XmlTokens {
 public:
  /// `text` must outlive this. Its used parts must be UTF-8; unused parts, such as comments, need
  /// not.
  explicit XmlTokens(std::string_view text)
      : begin_(text.data()), at_(text.data()), end_(text.data() + text.size()) {}

  /// Skips the declaration, DOCTYPE and comments, and reads the opening tag of the root.
  XmlTag openRoot();
  /// Reads the opening tag of the next element; false before a closing tag.
  bool open(XmlTag& tag);
  /// Reads the closing tag of `element`.
  void close(XmlElement element);
  /// Reads character data up to the next tag, with entities and CDATA resolved, as valid UTF-8
  /// without a byte order mark at its start. Valid until the next call.
  std::string_view text();
  /// Reads the bytes up to the next `<`, unchanged.
  std::string_view rawText();

  std::size_t offset() const { return static_cast<std::size_t>(at_ - begin_); }
  /// Returns the offset of a character in a returned part of the text, such as that of `rawText`.
  std::size_t offsetOf(const char* place) const { return static_cast<std::size_t>(place - begin_); }
  [[noreturn]] void refuse(std::string reason) const {
    throw RefusedAt{offset(), std::move(reason)};
  }

 private:
  static bool isSpace(char c);
  std::size_t left() const { return static_cast<std::size_t>(end_ - at_); }
  std::string_view rest() const { return {at_, left()}; }
  bool isAt(std::string_view text) const { return rest().starts_with(text); }

  bool skipToMarkup();
  void skipPast(std::string_view mark, std::size_t start, std::string_view what);
  void skipDoctype();
  void skipBetweenElements();
  XmlTag openTag();
  XmlTag openUnusualTag();
  void closeUnusually(XmlElement element);
  bool skipPlainText();
  std::string_view unusualText(const char* start);
  std::string_view resolvedText(const char* start);
  void appendEntity();
  void appendCharacterReference();
  void appendCdata();
  [[noreturn]] void refuseNoMarkup(std::string_view expected) const;

  const char* begin_;
  const char* at_;
  const char* end_;
  std::string buffer_;  // for text that needs decoding
};

// The functions that run for each element of a file are defined here, so that they can be inlined.

inline bool XmlTokens::isSpace(char c) {
  constexpr std::uint64_t spaces = 1ULL << ' ' | 1ULL << '\t' | 1ULL << '\n' | 1ULL << '\r';
  const auto byte = static_cast<unsigned char>(c);
  return byte <= ' ' && (spaces >> byte & 1) != 0;
}

/// Skips white space. True if a `<` follows that is not the last character.
inline bool XmlTokens::skipToMarkup() {
  while (at_ < end_ && isSpace(*at_)) ++at_;
  return left() > 1 && *at_ == '<';
}

inline bool XmlTokens::open(XmlTag& tag) {
  while (true) {
    if (!skipToMarkup()) refuseNoMarkup("a tag");
    if (at_[1] == '/') return false;
    if (at_[1] != '!' && at_[1] != '?') break;
    skipBetweenElements();
  }
  tag = openTag();
  return true;
}

inline XmlTag XmlTokens::openTag() {
  if (left() > text::words::size) {
    const std::uint64_t word = text::words::load(at_ + 1);
    for (const PlainTag& plain : plainTags) {
      if (!plain.matches(word)) continue;
      const XmlTag tag{plain.element, plain.selfClosed, offset()};
      at_ += 1 + plain.size;
      return tag;
    }
  }
  return openUnusualTag();
}

inline void XmlTokens::close(XmlElement element) {
  const PlainTag& plain = plainClosingTags[static_cast<std::size_t>(element)];
  if (left() >= 2 + text::words::size && at_[0] == '<' && at_[1] == '/' &&
      plain.matches(text::words::load(at_ + 2))) {
    at_ += 2 + plain.size;
  } else {
    closeUnusually(element);
  }
}

/// Moves to the next `<`, `&` or the end. True only if everything skipped is certainly ASCII.
inline bool XmlTokens::skipPlainText() {
  std::uint64_t seen = 0;
  while (left() >= text::words::size) {
    const std::uint64_t word = text::words::load(at_);
    seen |= word;
    const std::uint64_t ends =
        text::words::bytesThatAre('<', word) | text::words::bytesThatAre('&', word);
    if (ends != 0) {
      at_ += text::words::charactersBefore(ends);
      return (seen & text::words::highBits) == 0;
    }
    at_ += text::words::size;
  }
  while (at_ < end_ && *at_ != '<' && *at_ != '&') ++at_;
  return false;
}

inline std::string_view XmlTokens::text() {
  const char* const start = at_;
  const bool isAscii = skipPlainText();
  if (isAscii && *at_ == '<' && left() > 1 && at_[1] != '!') {
    return {start, static_cast<std::size_t>(at_ - start)};
  }
  return unusualText(start);
}

}  // namespace qz::toolkit
