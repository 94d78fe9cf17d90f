// SPDX-License-Identifier: MIT
// Reads XML property lists: the meaning of their elements.
#include <algorithm>
#include <bit>
#include <cmath>
#include <limits>
#include <string>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/format_readers.hpp"
#include "qz/property_list/scalars.hpp"
#include "text/hexadecimal.hpp"
#include "text/number_conversion.hpp"
#include "toolkit/property_list/base64.hpp"
#include "toolkit/property_list/calendar.hpp"
#include "toolkit/property_list/pending_values.hpp"
#include "toolkit/property_list/xml_tokens.hpp"

namespace qz::toolkit {
namespace {

class XmlReader {
 public:
  XmlReader(std::string_view text, Document& document, ValueOffsets* offsets)
      : tokens_(text), document_(document), offsets_(offsets), pending_(document) {}

  Value* root() {
    const XmlTag tag = tokens_.openRoot();
    // Everything after the root is ignored.
    return tag.element == XmlElement::plist ? onlyValueIn(tag) : value(tag);
  }

 private:
  Value* value(const XmlTag& tag);
  Value* content(const XmlTag& tag);
  Value* filled(const XmlTag& tag);
  Value* string(const XmlTag& tag);
  Value* boolean(const XmlTag& tag);
  Value* integer();
  Value* real();
  Value* date();
  Value* data();
  Value* array(const XmlTag& tag);
  Value* dictionary(const XmlTag& tag);
  Value* onlyValueIn(const XmlTag& plist);
  void enterContainer();
  [[noreturn]] void refuseAt(const char* place, std::string reason) const {
    throw RefusedAt{tokens_.offsetOf(place), std::move(reason)};
  }

  XmlTokens tokens_;
  Document& document_;
  ValueOffsets* offsets_;
  PendingValues pending_;
  std::size_t depth_ = 0;
};

Value* XmlReader::value(const XmlTag& tag) {
  Value* result = content(tag);
  if (offsets_) offsets_->emplace_back(result, tag.offset);
  return result;
}

Value* XmlReader::content(const XmlTag& tag) {
  switch (tag.element) {
    case XmlElement::key:
    case XmlElement::string:
      return string(tag);
    case XmlElement::array:
      return array(tag);
    case XmlElement::dictionary:
      return dictionary(tag);
    case XmlElement::yes:
    case XmlElement::no:
      return boolean(tag);
    default:
      return filled(tag);
  }
}

/// Reads the elements that must not be self-closed.
Value* XmlReader::filled(const XmlTag& tag) {
  if (tag.selfClosed) {
    throw RefusedAt{tag.offset, "<" + std::string(tagName(tag.element)) + "/> must not be empty"};
  }
  Value* result = nullptr;
  switch (tag.element) {
    case XmlElement::integer:
      result = integer();
      break;
    case XmlElement::real:
      result = real();
      break;
    case XmlElement::date:
      result = date();
      break;
    case XmlElement::data:
      result = data();
      break;
    default:
      enterContainer();
      result = onlyValueIn(tag);
      --depth_;
      return result;
  }
  tokens_.close(tag.element);
  return result;
}

void XmlReader::enterContainer() {
  if (depth_ == deepestNesting) {
    tokens_.refuse("more than " + std::to_string(deepestNesting) + " nested containers");
  }
  ++depth_;
}

Value* XmlReader::string(const XmlTag& tag) {
  if (tag.selfClosed) return String::make(document_, "");
  Value* result = String::make(document_, tokens_.text());
  tokens_.close(tag.element);
  return result;
}

Value* XmlReader::boolean(const XmlTag& tag) {
  if (!tag.selfClosed) tokens_.close(tag.element);
  return Number::make(document_, Number::Type::boolean, tag.element == XmlElement::yes ? 1 : 0);
}

Value* XmlReader::array(const XmlTag& tag) {
  const auto array = pending_.open();
  if (tag.selfClosed) return pending_.closeArray(array);
  enterContainer();
  XmlTag element;
  while (tokens_.open(element)) pending_.add(value(element));
  tokens_.close(XmlElement::array);
  --depth_;
  return pending_.closeArray(array);
}

/// Returns the number of a keyed archive's reference, which in XML is a dictionary with only a
/// number `CF$UID`; null otherwise.
const Number* archiverUid(const Dictionary& dictionary) {
  if (dictionary.count() != 1) return nullptr;
  const Dictionary::Entry& entry = dictionary.entries().front();
  if (static_cast<const String&>(*entry.key).text() != "CF$UID") return nullptr;
  if (entry.value->kind() != Value::Kind::number) return nullptr;
  const auto& number = static_cast<const Number&>(*entry.value);
  return number.type() == Number::Type::boolean ? nullptr : &number;
}

/// Truncates a real to a signed 32-bit integer as the platform's processor does: a value that does
/// not fit, or NaN, becomes the lowest integer.
std::int32_t cutToInt(double real) {
  constexpr auto lowest = std::numeric_limits<std::int32_t>::min();
  const double whole = std::trunc(real);
  const bool fits = whole >= lowest && whole <= std::numeric_limits<std::int32_t>::max();
  return fits ? static_cast<std::int32_t>(whole) : lowest;
}

std::uint32_t uidNumber(const Number& number) {
  if (number.isReal()) return static_cast<std::uint32_t>(cutToInt(number.doubleValue()));
  return static_cast<std::uint32_t>(number.bits());
}

Value* XmlReader::dictionary(const XmlTag& tag) {
  constexpr auto duplicates = Dictionary::Duplicates::lastWins;
  const auto entries = pending_.open();
  if (tag.selfClosed) return pending_.closeDictionary(entries, duplicates);
  enterContainer();
  XmlTag element;
  while (tokens_.open(element)) {
    if (element.element != XmlElement::key) {
      throw RefusedAt{element.offset, "expected <key> or </dict>, found <" +
                                          std::string(tagName(element.element)) + ">"};
    }
    Value* key = value(element);
    pending_.addKey(key, entries);
    if (!tokens_.open(element)) {
      throw RefusedAt{element.offset, "the key \"" + key->description() + "\" has no value"};
    }
    pending_.add(value(element));
  }
  tokens_.close(XmlElement::dictionary);
  --depth_;
  Dictionary* result = pending_.closeDictionary(entries, duplicates);
  const Number* uid = archiverUid(*result);
  if (!uid) return result;
  return Uid::make(document_, uidNumber(*uid));
}

Value* XmlReader::onlyValueIn(const XmlTag& plist) {
  if (plist.selfClosed) throw RefusedAt{plist.offset, "<plist/> contains no value"};
  XmlTag element;
  if (!tokens_.open(element)) tokens_.refuse("the <plist> contains no value");
  Value* result = value(element);
  if (tokens_.open(element)) {
    throw RefusedAt{element.offset, "a <plist> holds one value only; expected </plist>"};
  }
  tokens_.close(XmlElement::plist);
  return result;
}

Value* XmlReader::integer() {
  std::string_view text = text::withoutLeadingAsciiSpace(tokens_.rawText());
  const bool negative = text.starts_with('-');
  if (negative || text.starts_with('+')) text = text::withoutLeadingAsciiSpace(text.substr(1));
  const bool isHexadecimal = text.starts_with("0x") || text.starts_with("0X");
  if (isHexadecimal) text.remove_prefix(2);
  if (text.empty()) refuseAt(text.data(), "an integer without digits");
  const unsigned base = isHexadecimal ? 16 : 10;
  const std::uint64_t greatest =
      negative ? std::uint64_t{1} << 63 : std::numeric_limits<std::uint64_t>::max();
  std::uint64_t magnitude = 0;
  for (const char& c : text) {
    const int digit = text::hexadecimalDigit(c);
    if (digit < 0 || static_cast<unsigned>(digit) >= base) {
      refuseAt(&c, "expected a digit of the integer or </integer>");
    }
    if (magnitude > (greatest - static_cast<unsigned>(digit)) / base) {
      refuseAt(text.data(), "the integer does not fit in 64 bits");
    }
    magnitude = magnitude * base + static_cast<unsigned>(digit);
  }
  const bool isSigned = negative || magnitude <= std::uint64_t{INT64_MAX};
  return Number::make(document_,
                      isSigned ? Number::Type::signedInteger : Number::Type::unsignedInteger,
                      negative ? 0 - magnitude : magnitude);
}

Value* XmlReader::real() {
  const std::size_t start = tokens_.offset();
  const std::string_view text = tokens_.text();
  const std::string_view decimal = text::withoutLeadingSpace(text);
  std::optional<double> number;
  if (!decimal.empty() && text::decimalLength(decimal) == decimal.size()) {
    number = text::decimalValue(decimal);
  } else {
    number = text::namedReal(text);
  }
  if (!number) {
    throw RefusedAt{start, "\"" + std::string(text) + "\" is not a decimal number"};
  }
  return Number::make(document_, Number::Type::real64, std::bit_cast<std::uint64_t>(*number));
}

Value* XmlReader::date() {
  const std::string_view text = tokens_.rawText();
  const auto seconds = secondsOfDate(text);
  if (!seconds) refuseAt(text.data(), "a date is written as YYYY-MM-DDThh:mm:ssZ");
  return Date::make(document_, *seconds);
}

Value* XmlReader::data() {
  const std::string_view text = tokens_.rawText();
  std::string bytes;
  const std::size_t end = decodeBase64(text, bytes);
  if (end != text.size()) refuseAt(text.data() + end, "data is written in base64, in ASCII");
  return Data::make(document_, bytes);
}

}  // namespace

// Old-style data in < > is not XML.
bool looksLikeXml(std::string_view text) {
  const std::size_t start = text.find_first_not_of(" \t\r\n");
  if (start == std::string_view::npos || text[start] != '<') return false;
  const std::string_view tag = text.substr(start + 1);
  return !tag.empty() && tag.front() != '>' && tag.front() != '*' && tag.front() != '[' &&
         !std::all_of(tag.begin(), std::find(tag.begin(), tag.end(), '>'),
                      [](char c) { return c == ' ' || text::hexadecimalDigit(c) >= 0; });
}

Value* readXml(std::string_view text, Document& document, ValueOffsets* offsets) {
  return XmlReader(text, document, offsets).root();
}

}  // namespace qz::toolkit
