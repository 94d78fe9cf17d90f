// SPDX-License-Identifier: MIT
#include "tools/readable_dump.hpp"

#include <cstddef>
#include <ostream>
#include <string>
#include <string_view>

#include "qz/property_list/scalars.hpp"
#include "text/hexadecimal.hpp"
#include "text/utf8.hpp"
#include "toolkit/property_list/walk.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools {
namespace {

using toolkit::Value;

constexpr std::size_t bytesInGroup = 4;
constexpr std::size_t bytesInLine = 32;

/// The terminal's colour codes, by kind of value.
constexpr std::string_view keyPaint = "1";
constexpr std::string_view stringPaint = "32";
constexpr std::string_view numberPaint = "36";
constexpr std::string_view otherPaint = "35";

/// Returns the escape of a character that cannot appear as it is between quotation marks; empty for
/// any other. A tab and the separators are here because `oneLine` would not tell them from others.
std::string_view escapeFor(char32_t c) {
  switch (c) {
    case '"':
      return "\\\"";
    case '\\':
      return "\\\\";
    case '\t':
      return "\\t";
    case 0x2028:
      return "\\u{2028}";
    case 0x2029:
      return "\\u{2029}";
    default:
      return "";
  }
}

/// Returns the escape of half a surrogate pair, which no terminal can show.
std::string surrogateEscape(char32_t c) {
  std::string text = "\\u{";
  for (int shift = 12; shift >= 0; shift -= 4) {
    text += text::hexadecimalCharacter((c >> shift) & 15U);
  }
  return text + "}";
}

std::string quoted(std::string_view text) {
  std::string result = "\"";
  std::size_t plain = 0;  // where the text that is not yet in the result begins
  for (std::size_t at = 0; at < text.size();) {
    const std::size_t start = at;
    const char32_t c = text::nextCodePoint(text, at);
    const std::string escape =
        text::isSurrogate(c) ? surrogateEscape(c) : std::string(escapeFor(c));
    if (escape.empty()) continue;
    result += oneLine(text.substr(plain, start - plain)) + escape;
    plain = at;
  }
  return result + oneLine(text.substr(plain)) + '"';
}

std::string showNumber(const toolkit::Number& number) {
  if (number.type() == toolkit::Number::Type::boolean) return number.boolValue() ? "YES" : "NO";
  std::string text = number.description();
  if (!number.isReal()) return text;
  // A whole real would look like an integer.
  if (text.find_first_not_of("-0123456789") == std::string::npos) text += ".0";
  return number.type() == toolkit::Number::Type::real32 ? text + "f" : text;
}

std::string lineStart(std::size_t level) { return "\n" + std::string(4 * level, ' '); }

/// Shows bytes in groups. More than one line of them begins on a new line, indented one level
/// deeper than `level`.
std::string showData(std::string_view bytes, std::size_t level) {
  const bool isLong = bytes.size() > bytesInLine;
  std::string text = "<";
  for (std::size_t i = 0; i < bytes.size(); ++i) {
    if (isLong && i % bytesInLine == 0) {
      text += lineStart(level + 1);
    } else if (i > 0 && i % bytesInGroup == 0) {
      text += ' ';
    }
    text += text::hexadecimal(static_cast<unsigned char>(bytes[i]));
  }
  return text + (isLong ? lineStart(level) : "") + ">";
}

/// Writes value by value, so that a large file is never in memory as text.
class Writer {
 public:
  Writer(std::ostream& out, bool color) : out_(out), color_(color) {}

  void scalar(const Value& value) {
    switch (value.kind()) {
      case Value::Kind::string:
        return write(isKey_ ? keyPaint : stringPaint,
                     quoted(static_cast<const toolkit::String&>(value).text()));
      case Value::Kind::number:
        return write(numberPaint, showNumber(static_cast<const toolkit::Number&>(value)));
      case Value::Kind::date:
        return write(otherPaint, "date " + value.description());
      case Value::Kind::data:
        return write(otherPaint,
                     showData(static_cast<const toolkit::Data&>(value).bytes(), level_));
      case Value::Kind::uid:
        return write(otherPaint,
                     "uid " + std::to_string(static_cast<const toolkit::Uid&>(value).number()));
      default:
        return write(otherPaint, "null");
    }
  }

  void open(const Value& collection) {
    if (collection.kind() != Value::Kind::array) out_ << '{';
    if (collection.kind() != Value::Kind::dictionary) out_ << '(';
    ++level_;
  }

  void beforeChild(const Value& collection, std::size_t index) {
    const bool isDictionary = collection.kind() == Value::Kind::dictionary;
    isKey_ = isDictionary && index % 2 == 0;
    if (isDictionary && !isKey_) {
      out_ << " = ";
      return;
    }
    if (index > 0) out_ << (isDictionary ? ';' : ',');
    out_ << lineStart(level_);
  }

  void close(const Value& collection) {
    const bool isDictionary = collection.kind() == Value::Kind::dictionary;
    --level_;
    if (collection.count() > 0) out_ << (isDictionary ? ";" : "") << lineStart(level_);
    if (!isDictionary) out_ << ')';
    if (collection.kind() != Value::Kind::array) out_ << '}';
    isKey_ = false;
  }

 private:
  void write(std::string_view paint, const std::string& text) {
    if (color_) {
      out_ << "\x1b[" << paint << 'm' << text << "\x1b[0m";
    } else {
      out_ << text;
    }
  }

  std::ostream& out_;
  bool color_;
  bool isKey_ = false;
  std::size_t level_ = 0;
};

}  // namespace

void writeReadableDump(const Value& root, std::ostream& out, bool color) {
  Writer writer(out, color);
  walk(root, writer);
  out << '\n';
}

}  // namespace qz::tools
