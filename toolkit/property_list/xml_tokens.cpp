// SPDX-License-Identifier: MIT
#include "toolkit/property_list/xml_tokens.hpp"

#include <algorithm>
#include <array>
#include <utility>

#include "text/utf8.hpp"

namespace qz::toolkit {
namespace {

constexpr int mostReferenceDigits = 8;

std::string shown(char c) {
  const auto byte = static_cast<unsigned char>(c);
  if (byte > 0x20 && byte < 0x7F) return std::string("'") + c + "'";
  constexpr std::string_view digits = "0123456789ABCDEF";
  return std::string("the byte 0x") + digits[byte >> 4] + digits[byte & 15];
}

std::string knownTags() {
  std::string list;
  for (const std::string_view name : xmlTagNames) list.append(" <").append(name).append(">");
  return list;
}

}  // namespace

void XmlTokens::skipPast(std::string_view mark, std::size_t start, std::string_view what) {
  const std::size_t found = rest().find(mark, start);
  if (found == std::string_view::npos) refuse(std::string(what) + " is not closed");
  at_ += found + mark.size();
}

void XmlTokens::skipDoctype() {
  if (!isAt("<!DOCTYPE")) refuse("<!DOCTYPE or a comment is expected after <!");
  const std::size_t end = rest().find_first_of("[>");
  if (end == std::string_view::npos) refuse("the DOCTYPE is not closed");
  at_ += end;
  if (*at_ == '[') refuse("a DOCTYPE with internal declarations is not supported");
  ++at_;
}

void XmlTokens::refuseNoMarkup(std::string_view expected) const {
  if (left() < 2) refuse("expected " + std::string(expected) + ", found the end of the file");
  refuse("expected " + std::string(expected) + ", found " + shown(*at_));
}

XmlTag XmlTokens::openRoot() {
  while (true) {
    if (!skipToMarkup()) refuseNoMarkup("an element");
    if (isAt("<!--")) {
      // Here, unlike between elements, the platform does not accept an empty comment.
      skipPast("-->", 5, "the comment");
    } else if (isAt("<!")) {
      skipDoctype();
    } else if (isAt("<?")) {
      skipPast("?>", 2, "the processing instruction");
    } else {
      return openTag();
    }
  }
}

void XmlTokens::skipBetweenElements() {
  // The platform accepts `<?>` as a complete instruction here, but not before the root.
  if (isAt("<?")) return skipPast("?>", 1, "the processing instruction");
  if (!isAt("<!--")) refuse("only comments may start with <! between elements");
  skipPast("-->", 4, "the comment");
}

XmlTag XmlTokens::openUnusualTag() {
  const char* const start = at_ + 1;
  const char* nameEnd = start;
  while (nameEnd < end_ && *nameEnd != '>' && !isSpace(*nameEnd)) ++nameEnd;
  const char* const tagEnd = std::find(nameEnd, end_, '>');
  if (tagEnd == end_) refuse("the tag is not closed");
  const bool selfClosed = tagEnd > start && tagEnd[-1] == '/';
  if (selfClosed && nameEnd == tagEnd) --nameEnd;
  const std::string_view name(start, static_cast<std::size_t>(nameEnd - start));
  const auto* const found = std::find(xmlTagNames.begin(), xmlTagNames.end(), name);
  if (found == xmlTagNames.end()) {
    refuse((name.empty() ? "a tag without a name" : "unknown tag <" + std::string(name) + ">") +
           "; the tags are" + knownTags());
  }
  const XmlTag tag{static_cast<XmlElement>(found - xmlTagNames.begin()), selfClosed, offset()};
  at_ = tagEnd + 1;
  return tag;
}

void XmlTokens::closeUnusually(XmlElement element) {
  const std::string_view name = tagName(element);
  const std::string_view text = rest();
  const bool isNamed = text.starts_with("</") && text.substr(2).starts_with(name);
  const char* at = at_ + (isNamed ? 2 + name.size() : 0);
  while (at < end_ && isSpace(*at)) ++at;
  if (!isNamed || at == end_ || *at != '>') refuse("expected </" + std::string(name) + ">");
  at_ = at + 1;
}

std::string_view XmlTokens::rawText() {
  const std::size_t size = std::min(rest().find('<'), rest().size());
  const std::string_view raw(at_, size);
  at_ += size;
  return raw;
}

/// Returns the text from `start` on. There may be non-ASCII characters before the current position,
/// and entities or CDATA at it.
std::string_view XmlTokens::unusualText(const char* start) {
  const bool isPlain = at_ < end_ && *at_ == '<' && !isAt("<!");
  std::string_view text = isPlain ? std::string_view(start, static_cast<std::size_t>(at_ - start))
                                  : resolvedText(start);
  const std::size_t valid = text::validUtf8Length(text);
  if (valid != text.size()) {
    if (isPlain) at_ = start + valid;
    refuse("the text is not valid UTF-8");
  }
  if (text.starts_with(text::byteOrderMark)) text.remove_prefix(text::byteOrderMark.size());
  return text;
}

std::string_view XmlTokens::resolvedText(const char* start) {
  buffer_.assign(start, at_);
  while (true) {
    if (at_ == end_) refuse("the file ends inside a text");
    if (*at_ == '&') {
      appendEntity();
    } else if (!isAt("<!")) {
      return buffer_;
    } else {
      appendCdata();
    }
    const char* const plain = at_;
    skipPlainText();
    buffer_.append(plain, at_);
  }
}

void XmlTokens::appendEntity() {
  constexpr std::array<std::pair<std::string_view, char>, 5> entities = {
      {{"&lt;", '<'}, {"&gt;", '>'}, {"&amp;", '&'}, {"&apos;", '\''}, {"&quot;", '"'}}};
  if (isAt("&#")) return appendCharacterReference();
  for (const auto& [name, character] : entities) {
    if (!isAt(name)) continue;
    buffer_ += character;
    at_ += name.size();
    return;
  }
  refuse(
      "& is neither &lt; &gt; &amp; &apos; &quot; nor a character reference; "
      "a plain & is written &amp;");
}

void XmlTokens::appendCharacterReference() {
  const char* digit = at_ + 2;
  const bool isHexadecimal = digit < end_ && *digit == 'x';
  if (isHexadecimal) ++digit;
  char32_t codePoint = 0;
  for (int count = 0; digit < end_ && *digit != ';'; ++digit, ++count) {
    const char c = *digit;
    const char lower = static_cast<char>(c | 0x20);
    char32_t value = 0;
    if (c >= '0' && c <= '9') {
      value = static_cast<char32_t>(c - '0');
    } else if (isHexadecimal && lower >= 'a' && lower <= 'f') {
      value = static_cast<char32_t>(lower - 'a' + 10);
    } else {
      refuse("a character reference is &#digits; or &#xdigits;");
    }
    if (count == mostReferenceDigits) refuse("a character reference has at most 8 digits");
    codePoint = codePoint * (isHexadecimal ? 16 : 10) + value;
  }
  if (digit == end_) refuse("the character reference is not closed");
  if (text::isSurrogate(codePoint) || codePoint > 0x10FFFF) {
    refuse("the character reference names no character");
  }
  text::appendUtf8(buffer_, codePoint);
  at_ = digit + 1;
}

void XmlTokens::appendCdata() {
  constexpr std::string_view opening = "<![CDATA[";
  constexpr std::string_view closing = "]]>";
  if (!isAt(opening)) refuse("a text may hold CDATA, but no comment or declaration");
  const std::size_t end = rest().find(closing, opening.size());
  if (end == std::string_view::npos) refuse("the CDATA section is not closed");
  buffer_ += rest().substr(opening.size(), end - opening.size());
  at_ += end + closing.size();
}

}  // namespace qz::toolkit
