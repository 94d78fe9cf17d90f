// The values that hold no other values: strings, numbers, dates, data, null, UIDs.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

#include "toolkit/property_list/value.hpp"

namespace toolkit {

/// Text: UTF-8, in which a surrogate that lacks its partner is encoded like any other code point
/// (generalized UTF-8), so that every string of UTF-16 units has exactly one encoding.
class String final : public Value {
 public:
  static String& nothing();
  static ValueRef<String> make(std::string_view text);

  std::string_view text() const;
  // ... the conversions of Value
};

/// A boolean, a 64-bit integer with or without sign, or a real.
class Number final : public Value {
 public:
  enum class Type : std::uint8_t { boolean, signedInteger, unsignedInteger, real32, real64 };

  static Number& nothing();
  static ValueRef<Number> withBool(bool value);
  static ValueRef<Number> withLong(std::int64_t value);
  static ValueRef<Number> withUnsignedLong(std::uint64_t value);
  static ValueRef<Number> withFloat(float value);
  static ValueRef<Number> withDouble(double value);

  Type type() const;
  /// The integer's bits; 0 or 1 of a boolean. Of a real: as `integerValue`.
  std::uint64_t bits() const;
};

/// A moment: seconds since 2001-01-01 00:00:00 UTC.
class Date final : public Value {
 public:
  static ValueRef<Date> make(double secondsSinceReferenceDate);
  double secondsSinceReferenceDate() const;
};

/// Bytes.
class Data final : public Value {
 public:
  static ValueRef<Data> make(std::string_view bytes);
  std::string_view bytes() const;
};

/// The null of binary property lists.
class Null final : public Value {
 public:
  static ValueRef<Null> make();
};

/// The reference number of keyed archives.
class Uid final : public Value {
 public:
  static ValueRef<Uid> make(std::uint32_t number);
  std::uint32_t number() const;
};

/// `value` as the kind named, or absent when it is absent or of another kind.
ValueRef<String> asString(const ValueRef<>& value);
ValueRef<Number> asNumber(const ValueRef<>& value);

}  // namespace toolkit
