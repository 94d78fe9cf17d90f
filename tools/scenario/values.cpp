// SPDX-License-Identifier: MIT
// Converts JSON to property-list values, and back.

#include "tools/scenario/values.hpp"

#include <cassert>
#include <cmath>
#include <cstdint>
#include <limits>
#include <span>
#include <string>
#include <utility>
#include <vector>

#include "qz/property_list/scalars.hpp"
#include "text/hexadecimal.hpp"

namespace qz::tools::scenario {
namespace {

using toolkit::Number;
using toolkit::ValueRef;

ValueRef<> toNumber(const Json& json) {
  if (json.is_number_float()) return Number::withDouble(json.get<double>());
  constexpr auto largest = std::uint64_t{std::numeric_limits<std::int64_t>::max()};
  if (json.is_number_unsigned() && json.get<std::uint64_t>() > largest) {
    return Number::withUnsignedLong(json.get<std::uint64_t>());
  }
  return Number::withLong(json.get<std::int64_t>());
}

Json fromReal(double real) {
  if (std::isfinite(real)) return real;
  return {{"real", std::isnan(real) ? "nan" : real > 0 ? "inf" : "-inf"}};
}

Json fromNumber(const Number& number) {
  switch (number.type()) {
    case Number::Type::boolean:
      return number.boolValue();
    case Number::Type::unsignedInteger:
      return number.bits();
    case Number::Type::signedInteger:
      return number.integerValue();
    case Number::Type::real32:
    case Number::Type::real64:
      break;
  }
  return fromReal(number.doubleValue());
}

Json fromElements(std::span<const ValueRef<>> elements) {
  auto json = Json::array();
  for (const auto& element : elements) json.push_back(toJson(element));
  return json;
}

// Strings first, which are unique; the description of another kind of key may equal one of them.
Json fromDictionary(const toolkit::Dictionary& dictionary) {
  const auto isString = [](const ValueRef<>& key) {
    return key->kind() == toolkit::Value::Kind::string;
  };
  auto json = Json::object();
  for (const auto& [key, value] : dictionary.entries()) {
    if (isString(key)) addMember(json, key->description(), toJson(value));
  }
  for (const auto& [key, value] : dictionary.entries()) {
    if (!isString(key)) json[key->description()] = toJson(value);
  }
  return json;
}

}  // namespace

ValueRef<> toValue(const Json& json) {
  if (json.is_string()) return toolkit::String::make(json.get_ref<const std::string&>());
  if (json.is_boolean()) return Number::withBool(json.get<bool>());
  if (json.is_number()) return toNumber(json);
  if (json.is_object()) return toDictionary(json);
  assert(json.is_array());
  std::vector<ValueRef<>> elements;
  for (const auto& element : json) elements.push_back(toValue(element));
  return toolkit::Array::make(std::move(elements));
}

ValueRef<toolkit::Dictionary> toDictionary(const Json& object) {
  std::vector<toolkit::Dictionary::Entry> entries;
  for (const auto& [key, value] : object.items()) {
    entries.push_back({toolkit::String::make(key), toValue(value)});
  }
  return toolkit::Dictionary::make(std::move(entries));
}

Json toJson(const ValueRef<>& value) {
  using Kind = toolkit::Value::Kind;
  switch (value->kind()) {
    case Kind::nothing:
    case Kind::null:
      break;
    case Kind::string:
      return std::string(static_cast<const toolkit::String&>(*value).text());
    case Kind::number:
      return fromNumber(static_cast<const Number&>(*value));
    case Kind::array:
      return fromElements(static_cast<const toolkit::Array&>(*value).elements());
    case Kind::dictionary:
      return fromDictionary(static_cast<const toolkit::Dictionary&>(*value));
    case Kind::set:
      return {{"set", fromElements(static_cast<const toolkit::Set&>(*value).elements())}};
    case Kind::data:
      return {{"data", text::hexadecimal(static_cast<const toolkit::Data&>(*value).bytes())}};
    case Kind::uid:
      return {{"uid", static_cast<const toolkit::Uid&>(*value).number()}};
    case Kind::date:
      return {{"date",
               fromReal(static_cast<const toolkit::Date&>(*value).secondsSinceReferenceDate())}};
  }
  return nullptr;
}

}  // namespace qz::tools::scenario
