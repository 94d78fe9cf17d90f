// SPDX-License-Identifier: MIT
// The values that hold no other values: strings, numbers, dates, data, null, UIDs.
//
// Invariant: none of them ever changes.
#pragma once

#include <bit>
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
  /// As a part of `document`; the caller gets no count.
  static String* make(Document& document, std::string_view text);

  /// The UTF-8; valid as long as the string is.
  std::string_view text() const { return {reinterpret_cast<const char*>(this + 1), size_}; }

  std::int32_t intValue() const override;
  std::int64_t integerValue() const override;
  std::int64_t longValue() const override;
  float floatValue() const override;
  double doubleValue() const override;
  bool boolValue() const override;

 private:
  friend class Value;
  explicit String(Kind kind) : Value(kind) {}
  explicit String(std::string_view text);

  std::size_t size_ = 0;  // of the text, which stands right behind
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
  /// As a part of `document`; the caller gets no count. `bits` are the integer's, or those of a
  /// double for a real of either width.
  static Number* make(Document& document, Type type, std::uint64_t bits);

  Type type() const { return type_; }
  bool isReal() const { return type_ == Type::real32 || type_ == Type::real64; }
  /// The integer's bits; 0 or 1 of a boolean. Of a real: as `integerValue`.
  std::uint64_t bits() const;

  std::int32_t intValue() const override;
  std::int64_t integerValue() const override;
  std::int64_t longValue() const override;
  float floatValue() const override;
  double doubleValue() const override;
  bool boolValue() const override;

 private:
  friend class Value;
  class Small;
  explicit Number(Kind kind) : Value(kind) {}
  Number(Type type, std::uint64_t bits) : Value(Kind::number), type_(type), bits_(bits) {}
  double real() const { return std::bit_cast<double>(bits_); }

  Type type_ = Type::signedInteger;
  std::uint64_t bits_ = 0;  // of a real of either width: the bits of the double
};

/// A moment: seconds since 2001-01-01 00:00:00 UTC.
class Date final : public Value {
 public:
  static Date& nothing();
  static ValueRef<Date> make(double secondsSinceReferenceDate);
  static Date* make(Document& document, double secondsSinceReferenceDate);
  double secondsSinceReferenceDate() const { return seconds_; }

 private:
  friend class Value;
  explicit Date(Kind kind) : Value(kind) {}
  explicit Date(double seconds) : Value(Kind::date), seconds_(seconds) {}

  double seconds_ = 0;
};

/// Bytes.
class Data final : public Value {
 public:
  static Data& nothing();
  static ValueRef<Data> make(std::string_view bytes);
  static Data* make(Document& document, std::string_view bytes);
  /// The bytes; valid as long as the data is.
  std::string_view bytes() const { return {reinterpret_cast<const char*>(this + 1), size_}; }

 private:
  friend class Value;
  explicit Data(Kind kind) : Value(kind) {}
  explicit Data(std::string_view bytes);

  std::size_t size_ = 0;  // of the bytes, which stand right behind
};

/// The null of binary property lists.
class Null final : public Value {
 public:
  static Null& nothing();
  static ValueRef<Null> make();
  static Null* make(Document& document);

 private:
  friend class Value;
  explicit Null(Kind kind) : Value(kind) {}
};

/// The reference number of keyed archives.
class Uid final : public Value {
 public:
  static Uid& nothing();
  static ValueRef<Uid> make(std::uint32_t number);
  static Uid* make(Document& document, std::uint32_t number);
  std::uint32_t number() const { return number_; }

 private:
  friend class Value;
  explicit Uid(Kind kind) : Value(kind) {}
  explicit Uid(std::uint32_t number) : Value(Kind::uid), number_(number) {}

  std::uint32_t number_ = 0;
};

/// `value` as the kind named, or absent when it is absent or of another kind.
ValueRef<String> asString(const ValueRef<>& value);
ValueRef<Number> asNumber(const ValueRef<>& value);

}  // namespace toolkit
