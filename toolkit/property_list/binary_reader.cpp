// SPDX-License-Identifier: MIT
// Reads binary property lists.
#include <bit>
#include <string>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/format_readers.hpp"
#include "qz/property_list/key_index.hpp"
#include "qz/property_list/scalars.hpp"
#include "text/utf8.hpp"
#include "toolkit/property_list/binary_layout.hpp"
#include "toolkit/property_list/pending_values.hpp"
#include "toolkit/property_list/walk.hpp"

namespace qz::toolkit {
namespace {

using binary::Marker;
using binary::Trailer;

constexpr std::size_t largestSize = 16;  // of an offset or a reference

// Objects may overlap, so the objects of a small file can be huge in total. A regular file needs no
// more than its own size. The reader accepts this multiple of it, plus a fixed amount for tiny
// files.
constexpr std::size_t mostOverlap = 2;
constexpr std::size_t overlapForFree = std::size_t{64} * 1024;

[[noreturn]] void refuse(std::size_t offset, std::string reason) {
  throw RefusedAt{offset, std::move(reason)};
}

Trailer readTrailer(std::string_view bytes) {
  const std::size_t start = bytes.size() - Trailer::size;
  const std::string_view trailer = bytes.substr(start);
  return {static_cast<std::uint8_t>(trailer[6]), static_cast<std::uint8_t>(trailer[7]),
          binary::number(trailer.substr(8, 8)), binary::number(trailer.substr(16, 8)),
          binary::number(trailer.substr(24, 8))};
}

/// Whether `greatest` fits in `size` bytes.
bool reaches(std::size_t size, std::uint64_t greatest) {
  return size >= sizeof greatest || greatest < std::uint64_t{1} << (8 * size);
}

Trailer checkedTrailer(std::string_view bytes) {
  const Trailer trailer = readTrailer(bytes);
  const std::size_t start = bytes.size() - Trailer::size;
  const auto check = [&](bool holds, std::size_t field, const char* reason) {
    if (!holds) refuse(start + field, reason);
  };
  check(trailer.offsetSize >= 1 && trailer.offsetSize <= largestSize, 6,
        "the offsets' size is not from 1 to 16");
  check(trailer.referenceSize >= 1 && trailer.referenceSize <= largestSize, 7,
        "the references' size is not from 1 to 16");
  check(trailer.objectCount >= 1, 8, "there is no object");
  check(trailer.topObject < trailer.objectCount, 16, "the top object does not exist");
  check(trailer.tableOffset > binary::headerSize && trailer.tableOffset < start, 24,
        "the offset table does not lie between the header and the trailer");
  const std::uint64_t tableSize = start - trailer.tableOffset;
  check(
      tableSize % trailer.offsetSize == 0 && tableSize / trailer.offsetSize == trailer.objectCount,
      8, "the offset table does not fill the space up to the trailer");
  check(reaches(trailer.referenceSize, trailer.objectCount), 7,
        "the references are too small for the number of objects");
  check(reaches(trailer.offsetSize, trailer.tableOffset), 6,
        "the offsets are too small for the objects' space");
  return trailer;
}

class BinaryReader {
 public:
  BinaryReader(std::string_view bytes, Document& document, ValueOffsets* offsets)
      : trailer_(checkedTrailer(bytes)),
        table_(trailer_.offsetSize),
        references_(trailer_.referenceSize),
        objects_(bytes.substr(0, static_cast<std::size_t>(trailer_.tableOffset))),
        document_(document),
        offsets_(offsets),
        budget_(mostOverlap * bytes.size() + overlapForFree),
        pending_(document) {}

  Value* root();

 private:
  std::uint64_t offsetOf(std::size_t index) const {
    return table_.at(objects_.data() + objects_.size(), index);
  }
  void checkTable() const;
  Value* object(std::size_t index, std::size_t depth);
  Value* newObject(std::size_t index, std::size_t depth);
  Value* content(std::size_t offset, std::size_t depth);
  Value* constant(std::size_t offset);
  Value* integer(std::size_t offset);
  Value* real(std::size_t offset);
  Value* date(std::size_t offset);
  Value* uid(std::size_t offset);
  Value* ascii(std::size_t offset);
  Value* utf16(std::size_t offset);
  Value* array(std::size_t offset, std::size_t depth);
  Value* set(std::size_t offset, std::size_t depth);
  Value* dictionary(std::size_t offset, std::size_t depth);

  unsigned low(std::size_t offset) const {
    return static_cast<unsigned char>(objects_[offset]) & 15;
  }
  std::string_view contentOf(std::size_t offset, std::size_t unitSize);
  std::string_view take(std::size_t at, std::uint64_t count, std::size_t unitSize);
  Value* reference(const char* references, std::size_t index, std::size_t depth);

  Trailer trailer_;
  binary::Numbers table_;  // of the objects' offsets; directly follows the objects
  binary::Numbers references_;
  std::string_view objects_;  // with the header in front of them
  Document& document_;
  ValueOffsets* offsets_;
  std::size_t budget_;                          // bytes of content that may still be read
  std::vector<Value*> values_;                  // by index; null until read
  Value* const beingRead_ = &Value::nothing();  // placeholder for an object that is being read
  PendingValues pending_;
  std::string buffer_;  // for strings that need decoding
};

/// Every offset must lie before the table, even if it is not used.
void BinaryReader::checkTable() const {
  for (std::size_t index = 0; index < trailer_.objectCount; ++index) {
    if (offsetOf(index) >= objects_.size()) {
      refuse(objects_.size() + index * trailer_.offsetSize,
             "the offset does not lead to before the offset table");
    }
  }
}

Value* BinaryReader::root() {
  checkTable();
  values_.resize(static_cast<std::size_t>(trailer_.objectCount));
  return object(static_cast<std::size_t>(trailer_.topObject), 0);
}

inline Value* BinaryReader::object(std::size_t index, std::size_t depth) {
  Value* const value = values_[index];
  return value && value != beingRead_ ? value : newObject(index, depth);
}

Value* BinaryReader::newObject(std::size_t index, std::size_t depth) {
  const auto offset = static_cast<std::size_t>(offsetOf(index));
  if (values_[index] == beingRead_) refuse(offset, "the object holds itself");
  if (offset < binary::headerSize) refuse(offset, "an object cannot lie in the header");
  if (depth > deepestNesting) {
    refuse(offset, "more than " + std::to_string(deepestNesting) + " nested levels");
  }
  values_[index] = beingRead_;
  Value* value = content(offset, depth);
  if (offsets_) offsets_->emplace_back(value, offset);
  return values_[index] = value;
}

Value* BinaryReader::content(std::size_t offset, std::size_t depth) {
  const auto marker = static_cast<unsigned char>(objects_[offset]);
  if (marker == static_cast<unsigned char>(Marker::date)) return date(offset);
  switch (Marker{static_cast<std::uint8_t>(marker & 0xF0U)}) {
    case Marker::null:
      return constant(offset);
    case Marker::integer:
      return integer(offset);
    case Marker::real:
      return real(offset);
    case Marker::data:
      return Data::make(document_, contentOf(offset, 1));
    case Marker::ascii:
      return ascii(offset);
    case Marker::utf16:
      return utf16(offset);
    case Marker::uid:
      return uid(offset);
    case Marker::array:
      return array(offset, depth);
    case Marker::set:
      return set(offset, depth);
    case Marker::dictionary:
      return dictionary(offset, depth);
    default:
      refuse(offset, "unknown kind of object");
  }
}

/// Returns `count` units of content from `at` on, which must lie before the offset table.
std::string_view BinaryReader::take(std::size_t at, std::uint64_t count, std::size_t unitSize) {
  const std::size_t space = objects_.size() - at;
  const std::uint64_t size = count * unitSize;
  // If count ≤ space, count × unitSize cannot overflow 64 bits.
  if (count > space || size > space) refuse(at, "the object reaches beyond the objects' space");
  if (size > budget_) refuse(at, "the objects overlap too often");
  budget_ -= static_cast<std::size_t>(size);
  return objects_.substr(at, static_cast<std::size_t>(size));
}

/// Returns the content of an object whose marker gives its length in units.
std::string_view BinaryReader::contentOf(std::size_t offset, std::size_t unitSize) {
  if (low(offset) != binary::longLength) return take(offset + 1, low(offset), unitSize);
  const std::size_t length = offset + 1;
  if (length == objects_.size() || (static_cast<unsigned char>(objects_[length]) & 0xF0) != 0x10) {
    refuse(length, "expected the object's length, an integer");
  }
  const std::string_view digits = take(length + 1, std::uint64_t{1} << low(length), 1);
  return take(length + 1 + digits.size(), binary::number(digits), unitSize);
}

Value* BinaryReader::constant(std::size_t offset) {
  switch (Marker{static_cast<std::uint8_t>(objects_[offset])}) {
    case Marker::null:
      return Null::make(document_);
    case Marker::no:
      return Number::make(document_, Number::Type::boolean, 0);
    case Marker::yes:
      return Number::make(document_, Number::Type::boolean, 1);
    default:
      refuse(offset, "unknown kind of object");
  }
}

Value* BinaryReader::integer(std::size_t offset) {
  const std::size_t size = std::size_t{1} << low(offset);
  if (size > 16) refuse(offset, "an integer of more than 16 bytes");
  const std::uint64_t bits = binary::number(take(offset + 1, size, 1));
  // Eight bytes are signed; integers that need the highest bit are written in sixteen bytes.
  const bool isUnsigned = size == 16 && bits > std::uint64_t{INT64_MAX};
  return Number::make(
      document_, isUnsigned ? Number::Type::unsignedInteger : Number::Type::signedInteger, bits);
}

Value* BinaryReader::real(std::size_t offset) {
  const std::size_t size = std::size_t{1} << low(offset);
  if (size != 4 && size != 8) refuse(offset, "a real of neither 4 nor 8 bytes");
  const std::uint64_t bits = binary::number(take(offset + 1, size, 1));
  if (size == 8) return Number::make(document_, Number::Type::real64, bits);
  const double real{std::bit_cast<float>(static_cast<std::uint32_t>(bits))};
  return Number::make(document_, Number::Type::real32, std::bit_cast<std::uint64_t>(real));
}

Value* BinaryReader::date(std::size_t offset) {
  return Date::make(document_, std::bit_cast<double>(binary::number(take(offset + 1, 8, 1))));
}

Value* BinaryReader::uid(std::size_t offset) {
  const std::uint64_t number = binary::number(take(offset + 1, low(offset) + 1, 1));
  if (number > UINT32_MAX) refuse(offset, "a UID of more than 32 bits");
  return Uid::make(document_, static_cast<std::uint32_t>(number));
}

/// Bytes from 0x80 are not ASCII; they are read as Latin-1.
Value* BinaryReader::ascii(std::size_t offset) {
  const std::string_view bytes = contentOf(offset, 1);
  if (text::isAscii(bytes)) return String::make(document_, bytes);
  buffer_.clear();
  for (const char byte : bytes) text::appendUtf8(buffer_, static_cast<unsigned char>(byte));
  return String::make(document_, buffer_);
}

Value* BinaryReader::utf16(std::size_t offset) {
  const std::string_view bytes = contentOf(offset, 2);
  if (bytes.empty()) refuse(offset, "a UTF-16 string of no characters");
  buffer_.clear();
  text::Utf16Appender appender(buffer_);
  for (std::size_t at = 0; at < bytes.size(); at += 2) {
    appender.append(static_cast<char16_t>(binary::number(bytes.substr(at, 2))));
  }
  return String::make(document_, buffer_);
}

inline Value* BinaryReader::reference(const char* references, std::size_t index,
                                      std::size_t depth) {
  const std::uint64_t object = references_.at(references, index);
  if (object >= trailer_.objectCount) {
    const auto first = static_cast<std::size_t>(references - objects_.data());
    refuse(first + index * references_.size(), "the object referred to does not exist");
  }
  return this->object(static_cast<std::size_t>(object), depth);
}

Value* BinaryReader::array(std::size_t offset, std::size_t depth) {
  const std::string_view references = contentOf(offset, references_.size());
  const std::size_t count = references.size() / references_.size();
  const auto array = pending_.open();
  for (std::size_t i = 0; i < count; ++i) pending_.add(reference(references.data(), i, depth + 1));
  return pending_.closeArray(array);
}

Value* BinaryReader::set(std::size_t offset, std::size_t depth) {
  const std::string_view references = contentOf(offset, references_.size());
  const std::size_t count = references.size() / references_.size();
  const auto set = pending_.open();
  KeyIndex index(count, std::pmr::new_delete_resource());
  for (std::size_t i = 0; i < count; ++i) {
    Value* element = reference(references.data(), i, depth + 1);
    const std::uint64_t hash = hashOfKey(*element);
    const auto isElement = [&](std::size_t at) { return sameKey(*pending_.in(set)[at], *element); };
    if (index.find(hash, isElement) != KeyIndex::none) continue;
    index.append(hash);
    pending_.add(element);
  }
  return pending_.closeSet(set);
}

Value* BinaryReader::dictionary(std::size_t offset, std::size_t depth) {
  // All keys come first, then all values.
  const std::string_view references = contentOf(offset, 2 * references_.size());
  const std::size_t count = references.size() / references_.size() / 2;
  const auto entries = pending_.open();
  for (std::size_t i = 0; i < count; ++i) {
    Value* key = reference(references.data(), i, depth + 1);
    if (isCollection(*key)) refuse(offset, "a collection as the key of a dictionary");
    pending_.addKey(key, entries);
    pending_.add(reference(references.data(), count + i, depth + 1));
  }
  return pending_.closeDictionary(entries, Dictionary::Duplicates::firstWins);
}

}  // namespace

bool looksLikeBinary(std::string_view bytes) { return bytes.starts_with(binary::magic); }

Value* readBinary(std::string_view bytes, Document& document, ValueOffsets* offsets) {
  if (!looksLikeBinary(bytes)) refuse(0, "the file does not start with \"bplist0\"");
  if (bytes.size() <= binary::headerSize + Trailer::size) {
    refuse(bytes.size(), "the file is too short for a header, an object and a trailer");
  }
  return BinaryReader(bytes, document, offsets).root();
}

}  // namespace qz::toolkit
