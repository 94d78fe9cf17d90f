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
  static String& nothing();
  static ValueRef<String> make(std::string_view text);
  /// Makes a string in `document`; the caller gets no count.
  static String* make(Document& document, std::string_view text);

  /// Returns the text in UTF-8; valid as long as the string.
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

  std::size_t size_ = 0;  // of the text, which directly follows this object
};

/// A boolean, a signed or unsigned 64-bit integer, or a real.
class QZ_API Number final : public Value {
 public:
  enum class Type : std::uint8_t { boolean, signedInteger, unsignedInteger, real32, real64 };

  static Number& nothing();
  static ValueRef<Number> withBool(bool value);
  static ValueRef<Number> withLong(std::int64_t value);
  static ValueRef<Number> withUnsignedLong(std::uint64_t value);
  static ValueRef<Number> withFloat(float value);
  static ValueRef<Number> withDouble(double value);
  /// Makes a number in `document`; the caller gets no count. `bits` are those of the integer, or of
  /// a double for a real of either width.
  static Number* make(Document& document, Type type, std::uint64_t bits);

  Type type() const { return type_; }
  bool isReal() const { return type_ == Type::real32 || type_ == Type::real64; }
  /// Returns the bits of the integer; 0 or 1 for a boolean; the bits of `integerValue` for a real.
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
  std::uint64_t bits_ = 0;  // for a real of either width, the bits of the double
};

/// A point in time, in seconds since 2001-01-01 00:00:00 UTC.
class QZ_API Date final : public Value {
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

/// Binary data.
class QZ_API Data final : public Value {
 public:
  static Data& nothing();
  static ValueRef<Data> make(std::string_view bytes);
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
  static Null& nothing();
  static ValueRef<Null> make();
  static Null* make(Document& document);

 private:
  friend class Value;
  explicit Null(Kind kind) : Value(kind) {}
};

/// The reference number of keyed archives.
class QZ_API Uid final : public Value {
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

/// Return `value` as the named kind; absent if it is absent or of another kind.
QZ_API ValueRef<String> asString(const ValueRef<>& value);
QZ_API ValueRef<Number> asNumber(const ValueRef<>& value);

}  // namespace qz::toolkit
