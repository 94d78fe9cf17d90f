// SPDX-License-Identifier: MIT
// Values as text for people.
#include <gtest/gtest.h>

#include <cstdint>
#include <limits>
#include <string>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"

namespace qz::toolkit {
namespace {

TEST(Description, OfScalars) {
  const struct {
    ValueRef<> value;
    const char* description;
  } cases[] = {
      {String::make("as \"it\" is\n"), "as \"it\" is\n"},
      {Number::withBool(true), "1"},
      {Number::withBool(false), "0"},
      {Number::withLong(INT64_MIN), "-9223372036854775808"},
      {Number::withUnsignedLong(UINT64_MAX), "18446744073709551615"},
      {Number::withDouble(0.1), "0.1"},
      {Number::withFloat(0.1F), "0.1"},
      {Number::withDouble(5), "5"},
      {Number::withDouble(-1e100), "-1e+100"},
      {Number::withDouble(std::numeric_limits<double>::infinity()), "inf"},
      {Date::make(0), "2001-01-01T00:00:00Z"},
      {Date::make(0.5), "2001-01-01T00:00:00.5Z"},
      {Date::make(-0.25), "2000-12-31T23:59:59.75Z"},
      {Date::make(-63113904000), "0001-01-01T00:00:00Z"},
      {Date::make(-63145526400), "0000-01-01T00:00:00Z"},
      {Date::make(-63145612800), "-0001-12-31T00:00:00Z"},
      {Date::make(1e300), "1e+300"},
      {Date::make(std::numeric_limits<double>::quiet_NaN()), "nan"},
      {Data::make(std::string_view("\0\xFFz", 3)), "<00ff7a>"},
      {Data::make(""), "<>"},
      {Null::make(), "<null>"},
      {Uid::make(7), "<uid 7>"},
  };
  for (const auto& [value, description] : cases) EXPECT_EQ(value->description(), description);
}

TEST(Description, OfCollections) {
  const auto number = Number::withLong(1);
  const struct {
    ValueRef<> value;
    const char* description;
  } cases[] = {
      {Array::make(), "( )"},
      {Dictionary::make(), "{ }"},
      {Set::make({number, String::make("b")}), "{( 1, b )}"},
      {Array::make({number, String::make("two words"), String::make("")}),
       "( 1, \"two words\", \"\" )"},
      {Array::make({String::make("q\"\\\n"), String::make("//"), String::make("a/b")}),
       "( \"q\\\"\\\\\\n\", \"//\", a/b )"},
      {Dictionary::make(
           {{String::make("k"), number}, {String::make("a b"), Array::make({number})}}),
       "{ k = 1; \"a b\" = ( 1 ); }"},
      {Dictionary::make({{String::make("k"), Dictionary::make()}}), "{ k = { }; }"},
  };
  for (const auto& [value, description] : cases) EXPECT_EQ(value->description(), description);
}

TEST(Description, AndEndOfValuesFarDeeperThanAnyFile) {
  constexpr int depth = 200'000;
  ValueRef<> value = String::make("x");
  for (int i = 0; i < depth; ++i) {
    if (i % 2 == 0) {
      value = Array::make({value});
    } else {
      value = Dictionary::make({{String::make("k"), value}});
    }
  }
  const std::string description = value->description();
  EXPECT_EQ(description.substr(0, 16), "{ k = ( { k = ( ");
  EXPECT_NE(description.find(" x "), std::string::npos);
}

}  // namespace
}  // namespace qz::toolkit
