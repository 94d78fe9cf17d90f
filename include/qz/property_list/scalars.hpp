// SPDX-License-Identifier: MIT
// Values that hold no other values: strings, numbers, dates, data, null, UIDs.
//
// Invariant: scalars never change.
#pragma once

#include <bit>
#include <cstdint>
#include <string>
#include <string_view>

#include "qz/api.hpp"
#include "qz/property_list/value.hpp"

namespace qz::toolkit {

/// Text in generalised UTF-8: an unpaired surrogate is encoded like any other code point, so that
/// every string of UTF-16 units has exactly one encoding.
class QZ_API String final : public Value {
 public:
  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static String& nothing();
  /// Makes a string of the UTF-8 text.
  static ValueRef<String> make(std::string_view text);
  /// Makes a string in `document`; the caller gets no count.
  static String* make(Document& document, std::string_view text);

  /// Returns the text in UTF-8; valid as long as the string.
  std::string_view text() const { return {reinterpret_cast<const char*>(this + 1), size_}; }

  /// Returns the number that the text begins with; see number_conversion.hpp.
  std::int32_t intValue() const override;
  /// The same, of 64 bits.
  std::int64_t integerValue() const override;
  std::int64_t longValue() const override;
  /// The same, as a real.
  float floatValue() const override;
  /// The same, as a real of 64 bits.
  double doubleValue() const override;
  bool boolValue() const override;

 private:
  friend class Value;
  explicit String(Kind kind) : Value(kind) {}
  explicit String(std::string_view text);

  std::size_t size_ = 0;  // of the text, which directly follows this object
};

/// A boolean, a signed or unsigned 64-bit integer, or a real.
class QZ_API Number final : public Value {
 public:
  /// How a number is stored.
  enum class Type : std::uint8_t { boolean, signedInteger, unsignedInteger, real32, real64 };

  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static Number& nothing();
  /// Makes a boolean.
  static ValueRef<Number> withBool(bool value);
  /// Makes a signed integer.
  static ValueRef<Number> withLong(std::int64_t value);
  /// Makes an unsigned integer.
  static ValueRef<Number> withUnsignedLong(std::uint64_t value);
  /// Makes a real of 32 bits.
  static ValueRef<Number> withFloat(float value);
  /// Makes a real of 64 bits.
  static ValueRef<Number> withDouble(double value);
  /// Makes a number in `document`; the caller gets no count. `bits` are those of the integer, or of
  /// a double for a real of either width.
  static Number* make(Document& document, Type type, std::uint64_t bits);

  /// Returns how the number is stored.
  Type type() const { return type_; }
  /// Whether the number is a real of 32 or 64 bits.
  bool isReal() const { return type_ == Type::real32 || type_ == Type::real64; }
  /// Returns the bits of the integer; 0 or 1 for a boolean; the bits of `integerValue` for a real.
  std::uint64_t bits() const;

  /// Returns the number; one out of range keeps its low bits, a real is truncated.
  std::int32_t intValue() const override;
  /// The same, of 64 bits.
  std::int64_t integerValue() const override;
  std::int64_t longValue() const override;
  /// Returns the nearest real of 32 bits.
  float floatValue() const override;
  /// Returns the nearest real of 64 bits.
  double doubleValue() const override;
  bool boolValue() const override;

 private:
  friend class Value;
  class Small;
  explicit Number(Kind kind) : Value(kind) {}
  Number(Type type, std::uint64_t bits) : Value(Kind::number), type_(type), bits_(bits) {}
  double real() const { return std::bit_cast<double>(bits_); }

  Type type_ = Type::signedInteger;
  std::uint64_t bits_ = 0;  // for a real of either width, the bits of the double
};

/// A point in time, in seconds since 2001-01-01 00:00:00 UTC.
class QZ_API Date final : public Value {
 public:
  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static Date& nothing();
  /// Makes a date from seconds since the beginning of 2001, UTC.
  static ValueRef<Date> make(double secondsSinceReferenceDate);
  /// The same in a document, which owns it.
  static Date* make(Document& document, double secondsSinceReferenceDate);
  /// Returns the seconds since the beginning of 2001, UTC.
  double secondsSinceReferenceDate() const { return seconds_; }

 private:
  friend class Value;
  explicit Date(Kind kind) : Value(kind) {}
  explicit Date(double seconds) : Value(Kind::date), seconds_(seconds) {}

  double seconds_ = 0;
};

/// Binary data.
class QZ_API Data final : public Value {
 public:
  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static Data& nothing();
  /// Makes a value with a copy of the bytes.
  static ValueRef<Data> make(std::string_view bytes);
  /// The same in a document, which owns it.
  static Data* make(Document& document, std::string_view bytes);
  /// Returns the bytes; valid as long as this object.
  std::string_view bytes() const { return {reinterpret_cast<const char*>(this + 1), size_}; }

 private:
  friend class Value;
  explicit Data(Kind kind) : Value(kind) {}
  explicit Data(std::string_view bytes);

  std::size_t size_ = 0;  // of the bytes, which directly follow this object
};

/// The null of binary property lists.
class QZ_API Null final : public Value {
 public:
  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static Null& nothing();
  /// Returns the null value.
  static ValueRef<Null> make();
  /// The same in a document, which owns it.
  static Null* make(Document& document);

 private:
  friend class Value;
  explicit Null(Kind kind) : Value(kind) {}
};

/// The reference number of keyed archives.
class QZ_API Uid final : public Value {
 public:
  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static Uid& nothing();
  /// Makes a UID, which archives use to refer to their objects.
  static ValueRef<Uid> make(std::uint32_t number);
  /// The same in a document, which owns it.
  static Uid* make(Document& document, std::uint32_t number);
  /// Returns the number of the UID.
  std::uint32_t number() const { return number_; }

 private:
  friend class Value;
  explicit Uid(Kind kind) : Value(kind) {}
  explicit Uid(std::uint32_t number) : Value(Kind::uid), number_(number) {}

  std::uint32_t number_ = 0;
};

/// Returns `value` as a string; absent if it is absent or of another kind.
QZ_API ValueRef<String> asString(const ValueRef<>& value);
/// Returns `value` as a number; absent if it is absent or of another kind.
QZ_API ValueRef<Number> asNumber(const ValueRef<>& value);

}  // namespace qz::toolkit
