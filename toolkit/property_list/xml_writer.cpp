// SPDX-License-Identifier: MIT
#include "qz/property_list/xml_writer.hpp"

#include <cmath>
#include <string_view>
#include <vector>

#include "qz/property_list/format_readers.hpp"
#include "qz/property_list/scalars.hpp"
#include "qz/toolkit/exception.hpp"
#include "text/decimal.hpp"
#include "text/utf8.hpp"
#include "toolkit/property_list/base64.hpp"
#include "toolkit/property_list/calendar.hpp"
#include "toolkit/property_list/walk.hpp"

namespace qz::toolkit {
namespace {

constexpr std::string_view header =
    "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
    "<!DOCTYPE plist PUBLIC \"-//Apple//DTD PLIST 1.0//EN\" "
    "\"http://www.apple.com/DTDs/PropertyList-1.0.dtd\">\n"
    "<plist version=\"1.0\">\n";
constexpr std::string_view uidKey = "CF$UID";

bool isArchiverUid(const Dictionary& dictionary) {
  const ValueRef<Number> number = asNumber(dictionary.objectForKey(uidKey));
  return dictionary.count() == 1 && number && number->type() != Number::Type::boolean;
}

/// Visits the values in order and appends each.
class XmlWriter {
 public:
  XmlWriter() : text_(header) {}

  void scalar(const Value& value);
  void open(const Value& collection);
  void beforeChild(const Value&, std::size_t index) { levels_.back().child = index; }
  void close(const Value& collection);
  std::string result() { return std::move(text_.append("</plist>\n")); }

 private:
  struct Level {
    const Value* collection;
    std::size_t child;
  };

  bool isAtKey() const {
    return !levels_.empty() && levels_.back().collection->kind() == Value::Kind::dictionary &&
           levels_.back().child % 2 == 0;
  }
  [[noreturn]] void refuse(std::string_view what) const;
  void checkNesting(std::size_t more) const;
  void indent() { text_.append(levels_.size(), '\t'); }
  void element(std::string_view name, std::string_view content);
  void string(std::string_view name, std::string_view text);
  void character(char32_t c);
  void number(const Number& number);
  void date(double seconds);
  void data(std::string_view bytes);
  void uid(std::uint32_t number);

  std::string text_;
  std::vector<Level> levels_;  // the open collections, the root first
};

void XmlWriter::refuse(std::string_view what) const {
  std::string path;
  for (const Level& level : levels_) {
    if (level.collection->kind() == Value::Kind::dictionary) {
      path += "/" + childAt(*level.collection, level.child / 2 * 2).description();
    } else {
      path += "/" + std::to_string(level.child);
    }
  }
  throw InvalidArgumentException("XML property lists cannot hold " + std::string(what) + " (at " +
                                 (path.empty() ? "the root" : path) + ")");
}

void XmlWriter::checkNesting(std::size_t more) const {
  if (levels_.size() + more > deepestNesting) {
    refuse("more than " + std::to_string(deepestNesting) + " nested containers");
  }
}

void XmlWriter::element(std::string_view name, std::string_view content) {
  text_.append("<").append(name).append(">").append(content);
  text_.append("</").append(name).append(">\n");
}

void XmlWriter::character(char32_t c) {
  const bool isControl = c < 0x20 && c != '\t' && c != '\n';
  switch (c) {
    case '<':
      text_ += "&lt;";
      return;
    case '>':
      text_ += "&gt;";
      return;
    case '&':
      text_ += "&amp;";
      return;
    default:
      break;
  }
  // A carriage return is legal, but other readers of XML turn it into a line feed.
  if (isControl || c == 0xFFFE || c == 0xFFFF) {
    text_ += "&#" + text::decimal(static_cast<std::uint32_t>(c)) + ";";
  } else {
    text::appendUtf8(text_, c);
  }
}

void XmlWriter::string(std::string_view name, std::string_view text) {
  text_.append("<").append(name).append(">");
  // Readers drop a byte order mark at the start, so write an extra one.
  if (text.starts_with(text::byteOrderMark)) text_ += text::byteOrderMark;
  for (std::size_t at = 0; at < text.size();) {
    const char32_t c = text::nextCodePoint(text, at);
    if (text::isSurrogate(c)) refuse("half a surrogate pair");
    character(c);
  }
  text_.append("</").append(name).append(">\n");
}

void XmlWriter::number(const Number& number) {
  if (number.type() == Number::Type::boolean) {
    text_ += number.boolValue() ? "<true/>\n" : "<false/>\n";
  } else if (!number.isReal()) {
    element("integer", number.description());
  } else if (std::isnan(number.doubleValue())) {
    element("real", "nan");
  } else {
    element("real", text::decimal(number.doubleValue()));
  }
}

void XmlWriter::date(double seconds) {
  const std::string text = iso8601(seconds);
  if (secondsOfDate(text) != seconds) {
    refuse("a date with a fraction of a second, or too far away to count its seconds");
  }
  element("date", text);
}

void XmlWriter::data(std::string_view bytes) {
  const std::string lineStart(levels_.size(), '\t');
  text_ += "<data>\n";
  encodeBase64(bytes, lineStart, text_);
  if (!bytes.empty()) text_ += '\n';
  indent();
  text_ += "</data>\n";
}

void XmlWriter::uid(std::uint32_t number) {
  checkNesting(1);
  text_ += "<dict>\n";
  indent();
  text_.append("\t<key>").append(uidKey).append("</key>\n");
  indent();
  text_ += '\t';
  element("integer", text::decimal(number));
  indent();
  text_ += "</dict>\n";
}

void XmlWriter::scalar(const Value& value) {
  indent();
  if (isAtKey()) {
    if (value.kind() != Value::Kind::string) refuse("a key that is not a string");
    return string("key", static_cast<const String&>(value).text());
  }
  switch (value.kind()) {
    case Value::Kind::string:
      return string("string", static_cast<const String&>(value).text());
    case Value::Kind::number:
      return number(static_cast<const Number&>(value));
    case Value::Kind::date:
      return date(static_cast<const Date&>(value).secondsSinceReferenceDate());
    case Value::Kind::data:
      return data(static_cast<const Data&>(value).bytes());
    case Value::Kind::uid:
      return uid(static_cast<const Uid&>(value).number());
    case Value::Kind::null:
      refuse("null");
    default:
      refuse("an absent value");
  }
}

std::string_view tagOf(const Value& collection) {
  return collection.kind() == Value::Kind::array ? "array" : "dict";
}

void XmlWriter::open(const Value& collection) {
  if (isAtKey()) refuse("a key that is not a string");
  if (collection.kind() == Value::Kind::set) refuse("a set");
  if (collection.kind() == Value::Kind::dictionary &&
      isArchiverUid(static_cast<const Dictionary&>(collection))) {
    refuse("a dictionary of nothing but a number CF$UID, which reads back as a UID");
  }
  checkNesting(1);
  indent();
  text_.append("<").append(tagOf(collection));
  text_ += collection.count() == 0 ? "/>\n" : ">\n";
  levels_.push_back({&collection, 0});
}

void XmlWriter::close(const Value& collection) {
  levels_.pop_back();
  if (collection.count() == 0) return;
  indent();
  text_.append("</").append(tagOf(collection)).append(">\n");
}

}  // namespace

std::string writeXmlPropertyList(const ValueRef<>& value) {
  XmlWriter writer;
  walk(*value, writer);
  return writer.result();
}

}  // namespace qz::toolkit
