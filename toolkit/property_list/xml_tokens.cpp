#include "toolkit/property_list/xml_tokens.hpp"

#include <algorithm>
#include <array>
#include <bit>
#include <utility>

#include "toolkit/property_list/utf8.hpp"

namespace toolkit {
namespace {

constexpr std::array<std::string_view, 11> tagNames = {
    "plist", "array", "dict", "key", "string", "integer", "real", "date", "data", "true", "false"};

/// A tag without attributes or spaces, from the name to the `>`: it fits in one word, so that one
/// comparison recognizes it. It is how tags are spelled nearly always.
struct PlainTag {
  std::uint64_t word = 0;
  std::uint64_t mask = 0;
  std::size_t size = 0;

  constexpr PlainTag() = default;
  constexpr PlainTag(std::string_view name, std::string_view end) : size(name.size() + end.size()) {
    std::array<char, sizeof word> bytes{};
    std::array<char, sizeof word> used{};
    for (std::size_t i = 0; i < size; ++i) {
      bytes[i] = i < name.size() ? name[i] : end[i - name.size()];
      used[i] = '\xFF';
    }
    word = std::bit_cast<std::uint64_t>(bytes);
    mask = std::bit_cast<std::uint64_t>(used);
  }
  bool matches(std::uint64_t text) const { return (text & mask) == word; }
};

struct PlainTags {
  std::array<PlainTag, tagNames.size()> tags;
  constexpr PlainTags() {
    for (std::size_t i = 0; i < tags.size(); ++i) tags[i] = PlainTag(tagNames[i], ">");
  }
  const PlainTag& operator[](XmlElement element) const {
    return tags[static_cast<std::size_t>(element)];
  }
};
constexpr PlainTags plainTags;

constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";
constexpr int mostReferenceDigits = 8;

constexpr std::array byFrequency = {XmlElement::string, XmlElement::integer,    XmlElement::array,
                                    XmlElement::key,    XmlElement::dictionary, XmlElement::real,
                                    XmlElement::data,   XmlElement::date,       XmlElement::plist};

bool isSpace(char c) { return c == ' ' || c == '\t' || c == '\n' || c == '\r'; }

// Eight bytes at once.
constexpr std::uint64_t ones = 0x0101010101010101;
constexpr std::uint64_t highBits = 0x80 * ones;

std::uint64_t loadWord(const char* at) {
  std::uint64_t word = 0;
  std::memcpy(&word, at, sizeof word);
  return word;
}

/// Sets the high bit of each byte that is zero, and nothing else.
std::uint64_t zeroBytes(std::uint64_t word) {
  constexpr std::uint64_t lowBits = ~highBits;
  return ~(((word & lowBits) + lowBits) | word | lowBits);
}

/// How many bytes stand before the first whose high bit is set.
std::size_t bytesBefore(std::uint64_t marks) {
  const bool firstIsLowest = std::endian::native == std::endian::little;
  return static_cast<std::size_t>(firstIsLowest ? std::countr_zero(marks)
                                                : std::countl_zero(marks)) /
         8;
}

std::string shown(char c) {
  const auto byte = static_cast<unsigned char>(c);
  if (byte > 0x20 && byte < 0x7F) return std::string("'") + c + "'";
  constexpr std::string_view digits = "0123456789ABCDEF";
  return std::string("the byte 0x") + digits[byte >> 4] + digits[byte & 15];
}

}  // namespace

std::string_view tagName(XmlElement element) { return tagNames[static_cast<std::size_t>(element)]; }

void XmlTokens::skipSpace() {
  while (at_ < end_ && isSpace(*at_)) ++at_;
}

void XmlTokens::skipPast(std::string_view mark, std::size_t start, std::string_view what) {
  const std::size_t found = rest().find(mark, start);
  if (found == std::string_view::npos) refuse(std::string(what) + " is not closed");
  at_ += found + mark.size();
}

void XmlTokens::skipDoctype() {
  if (!rest().starts_with("<!DOCTYPE")) refuse("<!DOCTYPE or a comment is expected after <!");
  const std::size_t end = rest().find_first_of("[>");
  if (end == std::string_view::npos) refuse("the DOCTYPE is not closed");
  at_ += end;
  if (*at_ == '[') refuse("a DOCTYPE with declarations of its own is not read");
  ++at_;
}

XmlTag XmlTokens::openRoot() {
  while (true) {
    skipSpace();
    if (at_ == end_) refuse("the file ends before its first element");
    if (*at_ != '<') refuse("expected '<', found " + shown(*at_));
    if (rest().starts_with("<!--")) {
      // Here, unlike between elements, the platform takes no empty comment.
      skipPast("-->", 5, "the comment");
    } else if (rest().starts_with("<!")) {
      skipDoctype();
    } else if (rest().starts_with("<?")) {
      skipPast("?>", 2, "the processing instruction");
    } else {
      return openTag();
    }
  }
}

bool XmlTokens::open(XmlTag& tag) {
  while (true) {
    skipSpace();
    if (at_ == end_) refuse("the file ends inside of an element");
    if (*at_ != '<') refuse("expected a tag, found " + shown(*at_));
    const char next = at_ + 1 < end_ ? at_[1] : '\0';
    if (next == '/') return false;
    if (next == '?') {
      skipPast("?>", 2, "the processing instruction");
    } else if (next == '!') {
      if (!rest().starts_with("<!--")) refuse("only comments may start with <! between elements");
      skipPast("-->", 4, "the comment");
    } else {
      tag = openTag();
      return true;
    }
  }
}

XmlTag XmlTokens::openTag() {
  if (static_cast<std::size_t>(end_ - at_) > sizeof(std::uint64_t)) {
    const std::uint64_t word = loadWord(at_ + 1);
    for (const XmlElement element : byFrequency) {
      if (!plainTags[element].matches(word)) continue;
      const XmlTag tag{element, false, offset()};
      at_ += 1 + plainTags[element].size;
      return tag;
    }
  }
  return openUnusualTag();
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
  const auto* const found = std::find(tagNames.begin(), tagNames.end(), name);
  if (found == tagNames.end()) {
    refuse(name.empty() ? "a tag without a name" : "unknown tag <" + std::string(name) + ">");
  }
  const XmlTag tag{static_cast<XmlElement>(found - tagNames.begin()), selfClosed, offset()};
  at_ = tagEnd + 1;
  return tag;
}

void XmlTokens::close(XmlElement element) {
  const PlainTag& plain = plainTags[element];
  const bool fits = static_cast<std::size_t>(end_ - at_) >= 2 + sizeof(std::uint64_t);
  if (fits && at_[0] == '<' && at_[1] == '/' && plain.matches(loadWord(at_ + 2))) {
    at_ += 2 + plain.size;
    return;
  }
  closeUnusually(element);
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

/// Moves on to a `<`, a `&` or the end; says whether all that it passed is ASCII for certain.
bool XmlTokens::skipPlainText() {
  std::uint64_t seen = 0;
  while (static_cast<std::size_t>(end_ - at_) >= sizeof seen) {
    const std::uint64_t word = loadWord(at_);
    seen |= word;
    const std::uint64_t marks = zeroBytes(word ^ (ones * '<')) | zeroBytes(word ^ (ones * '&'));
    if (marks != 0) {
      at_ += bytesBefore(marks);
      return (seen & highBits) == 0;
    }
    at_ += sizeof word;
  }
  while (at_ < end_ && *at_ != '<' && *at_ != '&') ++at_;
  return false;
}

std::string_view XmlTokens::text() {
  const char* const start = at_;
  const bool isAscii = skipPlainText();
  const bool isPlain = at_ < end_ && *at_ == '<' && !rest().starts_with("<!");
  if (isPlain && isAscii) return {start, static_cast<std::size_t>(at_ - start)};
  std::string_view text = isPlain ? std::string_view(start, static_cast<std::size_t>(at_ - start))
                                  : resolvedText(start);
  const std::size_t valid = validUtf8Length(text);
  if (valid != text.size()) {
    if (isPlain) at_ = start + valid;
    refuse("the text is not valid UTF-8");
  }
  if (text.starts_with(byteOrderMark)) text.remove_prefix(byteOrderMark.size());
  return text;
}

std::string_view XmlTokens::resolvedText(const char* start) {
  buffer_.assign(start, at_);
  while (true) {
    if (at_ == end_) refuse("the file ends inside of a text");
    if (*at_ == '&') {
      appendEntity();
    } else if (!rest().starts_with("<!")) {
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
  if (rest().starts_with("&#")) return appendCharacterReference();
  for (const auto& [name, character] : entities) {
    if (!rest().starts_with(name)) continue;
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
  if (isSurrogate(codePoint) || codePoint > 0x10FFFF) {
    refuse("the character reference names no character");
  }
  appendUtf8(buffer_, codePoint);
  at_ = digit + 1;
}

void XmlTokens::appendCdata() {
  constexpr std::string_view opening = "<![CDATA[";
  constexpr std::string_view closing = "]]>";
  if (!rest().starts_with(opening)) refuse("a text may hold CDATA, but no comment or declaration");
  const std::size_t end = rest().find(closing, opening.size());
  if (end == std::string_view::npos) refuse("the CDATA section is not closed");
  buffer_ += rest().substr(opening.size(), end - opening.size());
  at_ += end + closing.size();
}

}  // namespace toolkit
