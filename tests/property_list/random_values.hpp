// SPDX-License-Identifier: MIT
// Random values; the same seed gives the same values.
#pragma once

#include <bit>
#include <cstdint>
#include <random>
#include <string>
#include <vector>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"
#include "text/utf8.hpp"

namespace qz::toolkit {

class RandomValues {
 public:
  /// `isForXml` restricts the values to those that an XML property list can hold.
  RandomValues(std::uint32_t seed, bool isForXml) : random_(seed), isForXml_(isForXml) {}

  ValueRef<> value(int depth) {
    switch (random_() % (depth > 0 ? 9 : 7)) {
      case 0:
        return Number::withBool(random_() % 2 == 0);
      case 1:
        return integer();
      case 2:
        return real();
      case 3:
        return date();
      case 4:
        return Data::make(bytes());
      case 5:
        return special();
      case 6:
        return String::make(text());
      case 7:
        return array(depth);
      default:
        return dictionary(depth);
    }
  }

 private:
  std::uint64_t word() { return (std::uint64_t{random_()} << 32 | random_()) >> random_() % 64; }

  ValueRef<> integer() {
    const std::uint64_t bits = word();
    if (random_() % 2 == 0) return Number::withUnsignedLong(bits);
    return Number::withLong(static_cast<std::int64_t>(0 - bits));
  }

  ValueRef<> real() {
    const auto real = std::bit_cast<double>(word() << random_() % 2 * 52);
    if (!isForXml_ && random_() % 2 == 0) return Number::withFloat(static_cast<float>(real));
    return Number::withDouble(real);
  }

  ValueRef<> date() {
    const auto seconds = static_cast<double>(static_cast<std::int64_t>(word() >> 11));
    return Date::make((random_() % 2 == 0 ? seconds : -seconds) + (isForXml_ ? 0 : 0.5));
  }

  ValueRef<> special() {
    if (isForXml_ || random_() % 2 == 0) return Uid::make(static_cast<std::uint32_t>(random_()));
    if (random_() % 2 == 0) return Null::make();
    return Set::make({String::make(text()), integer()});
  }

  ValueRef<> array(int depth) {
    std::vector<ValueRef<>> elements(random_() % 6);
    for (ValueRef<>& element : elements) element = value(depth - 1);
    return Array::make(elements);
  }

  ValueRef<> dictionary(int depth) {
    std::vector<Dictionary::Entry> entries(random_() % 14);
    for (auto& [key, element] : entries) {
      key = isForXml_ || random_() % 4 != 0 ? String::make(text()) : integer();
      element = value(depth - 1);
    }
    return Dictionary::make(entries);
  }

  std::string bytes() {
    std::string bytes(random_() % 130, '\0');
    for (char& byte : bytes) byte = static_cast<char>(random_());
    return bytes;
  }

  std::string text() {
    std::string text;
    const bool isAscii = random_() % 2 == 0;
    for (std::size_t left = random_() % 40; left > 0; --left) {
      auto c = static_cast<char32_t>(isAscii ? random_() % 0x80
                                             : random_() % 0x110000 >> random_() % 21);
      if (isForXml_ && text::isSurrogate(c)) c = 0xFEFF;
      text::appendUtf8(text, c);
    }
    return isForXml_ ? text : joined(text);
  }

  /// Returns `text` with adjacent halves of a surrogate pair joined to the character that they
  /// form.
  static std::string joined(const std::string& text) {
    std::string result;
    text::Utf16Appender appender(result);
    for (std::size_t at = 0; at < text.size();) {
      std::u16string units;
      text::appendUtf16(units, text::nextCodePoint(text, at));
      for (const char16_t unit : units) appender.append(unit);
    }
    return result;
  }

  std::mt19937 random_;
  bool isForXml_;
};

}  // namespace qz::toolkit
