// SPDX-License-Identifier: MIT
// Implements `Value::description`.
#include <algorithm>
#include <string>
#include <string_view>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"
#include "text/decimal.hpp"
#include "text/hexadecimal.hpp"
#include "toolkit/property_list/calendar.hpp"
#include "toolkit/property_list/old_style_tokens.hpp"
#include "toolkit/property_list/walk.hpp"

namespace qz::toolkit {
namespace {

std::string describe(const Number& number) {
  switch (number.type()) {
    case Number::Type::boolean:
      return number.boolValue() ? "1" : "0";
    case Number::Type::signedInteger:
      return text::decimal(number.integerValue());
    case Number::Type::unsignedInteger:
      return text::decimal(number.bits());
    case Number::Type::real32:
      return text::decimal(number.floatValue());
    case Number::Type::real64:
      return text::decimal(number.doubleValue());
  }
  return {};
}

std::string hex(std::string_view bytes) { return "<" + text::hexadecimal(bytes) + ">"; }

/// Whether the old style writes a text without quotes.
bool isBare(std::string_view text) {
  return !text.empty() && !text.starts_with("//") && !text.starts_with("/*") &&
         std::all_of(text.begin(), text.end(), isBareCharacter);
}

std::string quotedForOldStyle(std::string_view text) {
  if (isBare(text)) return std::string(text);
  std::string result = "\"";
  for (const char c : text) {
    if (c == '"' || c == '\\') result += '\\';
    if (c == '\n') {
      result += "\\n";
    } else {
      result += c;
    }
  }
  return result + '"';
}

std::string describeScalar(const Value& value) {
  switch (value.kind()) {
    case Value::Kind::string:
      return std::string(static_cast<const String&>(value).text());
    case Value::Kind::number:
      return describe(static_cast<const Number&>(value));
    case Value::Kind::date:
      return iso8601(static_cast<const Date&>(value).secondsSinceReferenceDate());
    case Value::Kind::data:
      return hex(static_cast<const Data&>(value).bytes());
    case Value::Kind::null:
      return "<null>";
    case Value::Kind::uid:
      return "<uid " + text::decimal(static_cast<const Uid&>(value).number()) + ">";
    default:
      return {};
  }
}

/// Writes collections in the old style, on one line.
struct Describer {
  std::string text;

  void scalar(const Value& value) {
    const std::string description = describeScalar(value);
    text += value.kind() == Value::Kind::string ? quotedForOldStyle(description) : description;
  }

  void open(const Value& collection) {
    if (collection.kind() != Value::Kind::array) text += '{';
    if (collection.kind() != Value::Kind::dictionary) text += '(';
  }

  void beforeChild(const Value& collection, std::size_t index) {
    if (collection.kind() != Value::Kind::dictionary) {
      text += index == 0 ? " " : ", ";
    } else if (index % 2 == 0) {
      text += index == 0 ? " " : "; ";
    } else {
      text += " = ";
    }
  }

  void close(const Value& collection) {
    const bool isDictionary = collection.kind() == Value::Kind::dictionary;
    if (isDictionary && collection.count() != 0) text += ';';
    text += ' ';
    if (!isDictionary) text += ')';
    if (collection.kind() != Value::Kind::array) text += '}';
  }
};

}  // namespace

std::string Value::description() const {
  if (!isCollection(*this)) return describeScalar(*this);
  Describer describer;
  walk(*this, describer);
  return std::move(describer.text);
}

}  // namespace qz::toolkit
