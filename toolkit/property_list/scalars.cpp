// SPDX-License-Identifier: MIT
#include "qz/property_list/scalars.hpp"

#include <cstring>

#include "text/number_conversion.hpp"

namespace qz::toolkit {
namespace {

void copyBehind(void* object, std::size_t size, std::string_view bytes) {
  if (!bytes.empty()) std::memcpy(static_cast<char*>(object) + size, bytes.data(), bytes.size());
}

}  // namespace

String& String::nothing() { return nothingAs<String>(); }

String::String(std::string_view text) : Value(Kind::string), size_(text.size()) {
  copyBehind(this, sizeof *this, text);
}

ValueRef<String> String::make(std::string_view text) {
  return makeAlone<String>(text.size(), text);
}

String* String::make(Document& document, std::string_view text) {
  return makeIn<String>(document, text.size(), text);
}

std::int32_t String::intValue() const { return text::intValueOf(text()); }
std::int64_t String::integerValue() const { return text::integerValueOf(text()); }
std::int64_t String::longValue() const { return integerValue(); }
float String::floatValue() const { return static_cast<float>(doubleValue()); }
double String::doubleValue() const { return text::doubleValueOf(text()); }
bool String::boolValue() const { return text::boolValueOf(text()); }

Number& Number::nothing() { return nothingAs<Number>(); }

/// The numbers from 0 to 255, which live until the end of the program, like the object behind
/// absent numbers.
class Number::Small {
 public:
  static constexpr std::int64_t count = 256;

  Small() {
    for (std::int64_t i = 0; i < count; ++i) {
      makeForever<Number>(at(i), Type::signedInteger, static_cast<std::uint64_t>(i));
    }
  }
  Number* at(std::int64_t value) { return reinterpret_cast<Number*>(storage_) + value; }

 private:
  alignas(Number) std::byte storage_[count * sizeof(Number)];
};

ValueRef<Number> Number::withBool(bool value) {
  return makeAlone<Number>(0, Type::boolean, std::uint64_t{value});
}
ValueRef<Number> Number::withLong(std::int64_t value) {
  // Every command makes a number from a tag. Small numbers, which most tags are, are made only
  // once.
  static Small small;
  if (value >= 0 && value < Small::count) return Counted<Number>::adopt(small.at(value));
  return makeAlone<Number>(0, Type::signedInteger, static_cast<std::uint64_t>(value));
}
ValueRef<Number> Number::withUnsignedLong(std::uint64_t value) {
  return makeAlone<Number>(0, Type::unsignedInteger, value);
}
ValueRef<Number> Number::withFloat(float value) {
  return makeAlone<Number>(0, Type::real32, std::bit_cast<std::uint64_t>(double{value}));
}
ValueRef<Number> Number::withDouble(double value) {
  return makeAlone<Number>(0, Type::real64, std::bit_cast<std::uint64_t>(value));
}
Number* Number::make(Document& document, Type type, std::uint64_t bits) {
  return makeIn<Number>(document, 0, type, bits);
}

std::uint64_t Number::bits() const {
  return isReal() ? static_cast<std::uint64_t>(integerValue()) : bits_;
}

std::int32_t Number::intValue() const {
  return isReal() ? text::truncatedToInt(real()) : static_cast<std::int32_t>(bits_);
}

std::int64_t Number::integerValue() const {
  return isReal() ? text::truncatedToInteger(real()) : static_cast<std::int64_t>(bits_);
}

std::int64_t Number::longValue() const { return integerValue(); }
float Number::floatValue() const { return static_cast<float>(doubleValue()); }

double Number::doubleValue() const {
  if (isReal()) return real();
  if (type_ == Type::unsignedInteger) return static_cast<double>(bits_);
  return static_cast<double>(static_cast<std::int64_t>(bits_));
}

bool Number::boolValue() const { return isReal() ? real() != 0 : bits_ != 0; }

Date& Date::nothing() { return nothingAs<Date>(); }

ValueRef<Date> Date::make(double secondsSinceReferenceDate) {
  return makeAlone<Date>(0, secondsSinceReferenceDate);
}
Date* Date::make(Document& document, double secondsSinceReferenceDate) {
  return makeIn<Date>(document, 0, secondsSinceReferenceDate);
}

Data& Data::nothing() { return nothingAs<Data>(); }

Data::Data(std::string_view bytes) : Value(Kind::data), size_(bytes.size()) {
  copyBehind(this, sizeof *this, bytes);
}

ValueRef<Data> Data::make(std::string_view bytes) { return makeAlone<Data>(bytes.size(), bytes); }
Data* Data::make(Document& document, std::string_view bytes) {
  return makeIn<Data>(document, bytes.size(), bytes);
}

Null& Null::nothing() { return nothingAs<Null>(); }
ValueRef<Null> Null::make() { return makeAlone<Null>(0, Kind::null); }
Null* Null::make(Document& document) { return makeIn<Null>(document, 0, Kind::null); }

Uid& Uid::nothing() { return nothingAs<Uid>(); }
ValueRef<Uid> Uid::make(std::uint32_t number) { return makeAlone<Uid>(0, number); }
Uid* Uid::make(Document& document, std::uint32_t number) {
  return makeIn<Uid>(document, 0, number);
}

namespace {

template <class T>
ValueRef<T> asKind(const ValueRef<>& value, Value::Kind kind) {
  if (value->kind() != kind) return nullptr;
  return Counted<T>::share(static_cast<T*>(value.pointer().get()));
}

}  // namespace

ValueRef<String> asString(const ValueRef<>& value) {
  return asKind<String>(value, Value::Kind::string);
}

ValueRef<Number> asNumber(const ValueRef<>& value) {
  return asKind<Number>(value, Value::Kind::number);
}

}  // namespace qz::toolkit
