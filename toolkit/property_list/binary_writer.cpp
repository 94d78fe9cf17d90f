// SPDX-License-Identifier: MIT
#include "qz/property_list/binary_writer.hpp"

#include <algorithm>
#include <bit>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "qz/property_list/format_readers.hpp"
#include "qz/property_list/scalars.hpp"
#include "qz/toolkit/exception.hpp"
#include "text/utf8.hpp"
#include "toolkit/property_list/binary_layout.hpp"
#include "toolkit/property_list/walk.hpp"

namespace qz::toolkit {
namespace {

using binary::Marker;

[[noreturn]] void refuse(const std::string& what) {
  throw InvalidArgumentException("binary property lists cannot hold " + what);
}

/// Returns the number of bytes that a number needs: 1, 2, 4 or 8.
std::size_t sizeOf(std::uint64_t number) {
  if (number <= UINT8_MAX) return 1;
  if (number <= UINT16_MAX) return 2;
  return number <= UINT32_MAX ? 4 : 8;
}

/// Numbers the objects of the file in the order of writing: the root first, and the content of a
/// collection after the collection.
class Objects {
 public:
  explicit Objects(const Value& root) { add(root); }

  const std::vector<const Value*>& all() const { return all_; }
  std::size_t indexOf(const Value& value) const;

 private:
  void add(const Value& value);
  void addChildren(const Value& collection);

  std::vector<const Value*> open_;  // the collections around the object that is being added
  std::vector<const Value*> all_;
  std::unordered_map<const Value*, std::size_t> indexes_;
  std::unordered_map<std::string_view, std::size_t> strings_;
};

std::size_t Objects::indexOf(const Value& value) const {
  if (value.kind() != Value::Kind::string) return indexes_.at(&value);
  return strings_.at(static_cast<const String&>(value).text());
}

void Objects::add(const Value& value) {
  if (open_.size() > deepestNesting) {
    refuse("more than " + std::to_string(deepestNesting) + " nested levels");
  }
  if (value.kind() == Value::Kind::nothing) refuse("an absent value");
  if (std::find(open_.begin(), open_.end(), &value) != open_.end()) {
    refuse("a collection that holds itself");
  }
  const std::size_t index = all_.size();
  const bool isNew = value.kind() == Value::Kind::string
                         ? strings_.emplace(static_cast<const String&>(value).text(), index).second
                         : indexes_.emplace(&value, index).second;
  if (!isNew) return;
  all_.push_back(&value);
  if (isCollection(value)) addChildren(value);
}

void Objects::addChildren(const Value& collection) {
  const bool isDictionary = collection.kind() == Value::Kind::dictionary;
  open_.push_back(&collection);
  for (std::size_t i = 0; i < childCount(collection); ++i) {
    const Value& child = childAt(collection, i);
    if (isDictionary && i % 2 == 0 && isCollection(child)) refuse("a collection as a key");
    add(child);
  }
  open_.pop_back();
}

class BinaryWriter {
 public:
  explicit BinaryWriter(const Value& root)
      : objects_(root), referenceSize_(sizeOf(objects_.all().size())) {}
  std::string result();

 private:
  void mark(Marker marker, std::size_t low) {
    bytes_ += static_cast<char>(static_cast<std::size_t>(marker) | low);
  }
  void markLong(Marker marker, std::size_t length);
  void object(const Value& value);
  void number(const Number& number);
  void integer(std::uint64_t bits, bool isNegative);
  void real(Marker marker, std::size_t low, double real);
  void string(std::string_view text);
  void uid(std::uint32_t number);
  void collection(Marker marker, const Value& collection);
  void dictionary(const Dictionary& dictionary);
  void reference(const Value& value) {
    binary::appendNumber(bytes_, objects_.indexOf(value), referenceSize_);
  }

  Objects objects_;
  std::size_t referenceSize_;
  std::string bytes_;
};

void BinaryWriter::markLong(Marker marker, std::size_t length) {
  mark(marker, std::min(length, std::size_t{binary::longLength}));
  if (length >= binary::longLength) integer(length, false);
}

void BinaryWriter::integer(std::uint64_t bits, bool isNegative) {
  // Integers of fewer than eight bytes are unsigned; those of eight bytes are signed.
  std::size_t size = isNegative ? 8 : sizeOf(bits);
  if (!isNegative && bits > std::uint64_t{INT64_MAX}) size = 16;
  mark(Marker::integer, static_cast<std::size_t>(std::countr_zero(size)));
  binary::appendNumber(bytes_, bits, size);
}

void BinaryWriter::real(Marker marker, std::size_t low, double real) {
  mark(marker, low);
  binary::appendNumber(bytes_, std::bit_cast<std::uint64_t>(real), sizeof real);
}

void BinaryWriter::number(const Number& number) {
  switch (number.type()) {
    case Number::Type::boolean:
      return mark(number.boolValue() ? Marker::yes : Marker::no, 0);
    case Number::Type::signedInteger:
      return integer(number.bits(), number.integerValue() < 0);
    case Number::Type::unsignedInteger:
      return integer(number.bits(), false);
    case Number::Type::real64:
      return real(Marker::real, 3, number.doubleValue());
    case Number::Type::real32:
      break;
  }
  mark(Marker::real, 2);
  binary::appendNumber(bytes_, std::bit_cast<std::uint32_t>(number.floatValue()), sizeof(float));
}

void BinaryWriter::string(std::string_view text) {
  if (text::isAscii(text)) {
    markLong(Marker::ascii, text.size());
    bytes_ += text;
    return;
  }
  std::u16string units;
  for (std::size_t at = 0; at < text.size();) {
    text::appendUtf16(units, text::nextCodePoint(text, at));
  }
  markLong(Marker::utf16, units.size());
  for (const char16_t unit : units) binary::appendNumber(bytes_, unit, sizeof unit);
}

void BinaryWriter::uid(std::uint32_t number) {
  const std::size_t size = sizeOf(number);
  mark(Marker::uid, size - 1);
  binary::appendNumber(bytes_, number, size);
}

void BinaryWriter::collection(Marker marker, const Value& collection) {
  markLong(marker, collection.count());
  for (std::size_t i = 0; i < childCount(collection); ++i) reference(childAt(collection, i));
}

void BinaryWriter::dictionary(const Dictionary& dictionary) {
  markLong(Marker::dictionary, dictionary.count());
  for (const Dictionary::Entry& entry : dictionary.entries()) reference(*entry.key);
  for (const Dictionary::Entry& entry : dictionary.entries()) reference(*entry.value);
}

void BinaryWriter::object(const Value& value) {
  switch (value.kind()) {
    case Value::Kind::string:
      return string(static_cast<const String&>(value).text());
    case Value::Kind::number:
      return number(static_cast<const Number&>(value));
    case Value::Kind::uid:
      return uid(static_cast<const Uid&>(value).number());
    case Value::Kind::array:
      return collection(Marker::array, value);
    case Value::Kind::set:
      return collection(Marker::set, value);
    case Value::Kind::dictionary:
      return dictionary(static_cast<const Dictionary&>(value));
    case Value::Kind::date:
      return real(Marker::date, 0, static_cast<const Date&>(value).secondsSinceReferenceDate());
    case Value::Kind::data: {
      const std::string_view data = static_cast<const Data&>(value).bytes();
      markLong(Marker::data, data.size());
      bytes_ += data;
      return;
    }
    default:
      return mark(Marker::null, 0);
  }
}

std::string BinaryWriter::result() {
  bytes_ = std::string(binary::magic) + '0';
  std::vector<std::size_t> offsets;
  for (const Value* value : objects_.all()) {
    offsets.push_back(bytes_.size());
    object(*value);
  }
  const std::size_t table = bytes_.size();
  const std::size_t offsetSize = sizeOf(table);
  for (const std::size_t offset : offsets) binary::appendNumber(bytes_, offset, offsetSize);
  bytes_.append(6, '\0');
  bytes_ += static_cast<char>(offsetSize);
  bytes_ += static_cast<char>(referenceSize_);
  binary::appendNumber(bytes_, offsets.size(), 8);
  binary::appendNumber(bytes_, 0, 8);  // the root
  binary::appendNumber(bytes_, table, 8);
  return std::move(bytes_);
}

}  // namespace

std::string writeBinaryPropertyList(const ValueRef<>& value) {
  return BinaryWriter(*value).result();
}

}  // namespace qz::toolkit
