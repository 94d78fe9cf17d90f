// The tokens of XML property lists: tags, character data, and what may stand between them.
//
// This is not XML as its standard has it but what the platform's reader takes for it: a tag ends at
// the first `>`, attributes are skipped, and nothing is checked that is not used.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string>
#include <string_view>

#include "toolkit/property_list/refusal.hpp"

namespace toolkit {

enum class XmlElement : std::uint8_t {
  plist,
  array,
  dictionary,
  key,
  string,
  integer,
  real,
  date,
  data,
  yes,
  no
};

/// The name in tags, such as "dict".
std::string_view tagName(XmlElement element);

struct XmlTag {
  XmlElement element;
  bool selfClosed;
  std::size_t offset;  ///< of its `<`
};

/// Reads from the start of a text to its end; what is none of the tokens asked for is refused.
class XmlTokens {
 public:
  /// `text` is UTF-8 but for what nobody looks at, such as comments; it must outlive this.
  explicit XmlTokens(std::string_view text)
      : begin_(text.data()), at_(text.data()), end_(text.data() + text.size()) {}

  /// Skips declaration, DOCTYPE, comments; the tag that opens the root.
  XmlTag openRoot();
  /// The tag that opens the next element, or false before a closing tag.
  bool open(XmlTag& tag);
  /// The tag that closes `element`.
  void close(XmlElement element);
  /// Character data up to the next tag, entities and CDATA resolved, valid UTF-8, without a byte
  /// order mark at its start. It holds until the next call.
  std::string_view text();
  /// The bytes up to the next `<`, as they stand.
  std::string_view rawText();

  std::size_t offset() const { return static_cast<std::size_t>(at_ - begin_); }
  /// The offset of a character in something that this has returned from the text.
  std::size_t offsetOf(const char* place) const { return static_cast<std::size_t>(place - begin_); }
  [[noreturn]] void refuse(std::string reason) const { throw RefusedAt{offset(), reason}; }

 private:
  std::string_view rest() const { return {at_, static_cast<std::size_t>(end_ - at_)}; }
  void skipSpace();
  void skipPast(std::string_view mark, std::size_t start, std::string_view what);
  void skipDoctype();
  XmlTag openTag();
  XmlTag openUnusualTag();
  void closeUnusually(XmlElement element);
  std::string_view resolvedText(const char* start);
  bool skipPlainText();
  void appendEntity();
  void appendCharacterReference();
  void appendCdata();

  const char* begin_;
  const char* at_;
  const char* end_;
  std::string buffer_;  // of text that does not stand in the file as it is
};

}  // namespace toolkit
