// SPDX-License-Identifier: MIT
#include "qz/property_list/canonical_dump.hpp"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdio>
#include <string_view>
#include <utility>
#include <vector>

#include "qz/property_list/scalars.hpp"
#include "text/utf8.hpp"
#include "toolkit/property_list/walk.hpp"

namespace qz::toolkit {
namespace {

template <class... Arguments>
std::string formatted(const char* format, Arguments... arguments) {
  std::array<char, 64> text{};
  const int size = std::snprintf(text.data(), text.size(), format, arguments...);
  return {text.data(), static_cast<std::size_t>(size)};
}

std::string dumpReal(double real) {
  // printf would show the sign of a NaN.
  return std::isnan(real) ? "nan" : formatted("%.17g", real);
}

std::string dumpString(std::string_view text) {
  std::string dump = "\"";
  for (std::size_t at = 0; at < text.size();) {
    const char32_t c = text::nextCodePoint(text, at);
    if (c == '"' || c == '\\') dump += '\\';
    if (c >= 0x20 && c < 0x7F) {
      dump += static_cast<char>(c);
      continue;
    }
    std::u16string units;
    text::appendUtf16(units, c);
    for (const char16_t unit : units) dump += formatted("\\u%04x", unsigned{unit});
  }
  return dump + '"';
}

std::string dumpNumber(const Number& number) {
  switch (number.type()) {
    case Number::Type::boolean:
      return number.boolValue() ? "true" : "false";
    case Number::Type::real32:
      return "{\"real\":\"" + dumpReal(number.doubleValue()) + "\",\"w\":32}";
    case Number::Type::real64:
      return "{\"real\":\"" + dumpReal(number.doubleValue()) + "\",\"w\":64}";
    default:
      return "{\"int\":\"" + number.description() + "\"}";
  }
}

std::string dumpData(std::string_view bytes) {
  std::string dump = "{\"data\":\"";
  for (const char byte : bytes) dump += formatted("%02x", static_cast<unsigned char>(byte));
  return dump + "\"}";
}

std::string dumpScalar(const Value& value) {
  switch (value.kind()) {
    case Value::Kind::string:
      return dumpString(static_cast<const String&>(value).text());
    case Value::Kind::number:
      return dumpNumber(static_cast<const Number&>(value));
    case Value::Kind::date: {
      const double seconds = static_cast<const Date&>(value).secondsSinceReferenceDate();
      return "{\"date\":\"" + dumpReal(seconds) + "\"}";
    }
    case Value::Kind::data:
      return dumpData(static_cast<const Data&>(value).bytes());
    case Value::Kind::uid:
      return formatted("{\"uid\":%u}", static_cast<const Uid&>(value).number());
    case Value::Kind::null:
      return "{\"null\":0}";
    default:
      return "";
  }
}

std::string joined(const std::vector<std::string>& parts) {
  std::string text = "[";
  for (const std::string& part : parts) text += (text.size() == 1 ? "" : ",") + part;
  return text + "]";
}

/// Joins each key and its value to an entry; the entries are sorted by key.
std::vector<std::string> paired(const std::vector<std::string>& keysAndValues) {
  std::vector<std::pair<std::string, std::string>> entries;
  for (std::size_t i = 0; i < keysAndValues.size(); i += 2) {
    entries.emplace_back(keysAndValues[i], keysAndValues[i + 1]);
  }
  std::sort(entries.begin(), entries.end());
  std::vector<std::string> dumps;
  dumps.reserve(entries.size());
  for (const auto& [key, value] : entries) dumps.push_back("[" + key + "," + value + "]");
  return dumps;
}

std::string dumpCollection(const Value& collection, std::vector<std::string> parts) {
  switch (collection.kind()) {
    case Value::Kind::dictionary:
      return "{\"dict\":" + joined(paired(parts)) + "}";
    case Value::Kind::set:
      std::sort(parts.begin(), parts.end());
      return "{\"set\":" + joined(parts) + "}";
    default:
      return joined(parts);
  }
}

/// Composes the dump of a collection after its content has been dumped.
class Dumper {
 public:
  void scalar(const Value& value) { parts_.back().push_back(dumpScalar(value)); }
  void open(const Value&) { parts_.emplace_back(); }
  void beforeChild(const Value&, std::size_t) {}
  void close(const Value& collection) {
    std::string dump = dumpCollection(collection, std::move(parts_.back()));
    parts_.pop_back();
    parts_.back().push_back(std::move(dump));
  }
  std::string result() { return std::move(parts_.front().front()); }

 private:
  std::vector<std::vector<std::string>> parts_{1};  // the root, then the open collections
};

}  // namespace

std::string canonicalDump(const Value& value) {
  Dumper dumper;
  walk(value, dumper);
  return dumper.result();
}

}  // namespace qz::toolkit
