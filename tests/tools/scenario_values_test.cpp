// SPDX-License-Identifier: MIT
// How scenarios show values of every kind as JSON.
#include <gtest/gtest.h>

#include <limits>
#include <string>

#include "qz/property_list/scalars.hpp"
#include "tools/scenario/values.hpp"

namespace qz::tools::scenario {
namespace {

using namespace toolkit;

TEST(ScenarioValues, ShowEveryKindAsJson) {
  const struct {
    ValueRef<> value;
    const char* json;
  } cases[] = {
      {ValueRef<>(), "null"},
      {Null::make(), "null"},
      {String::make("text"), "\"text\""},
      {Number::withBool(true), "true"},
      {Number::withLong(-7), "-7"},
      {Number::withUnsignedLong(std::numeric_limits<std::uint64_t>::max()), "18446744073709551615"},
      {Number::withFloat(0.5F), "0.5"},
      {Number::withDouble(-std::numeric_limits<double>::infinity()), R"({"real":"-inf"})"},
      {Array::make({Number::withLong(1), String::make("2")}), R"([1,"2"])"},
      {Dictionary::make({{String::make("a"), Number::withLong(1)}}), R"({"a":1})"},
      {Set::make({String::make("one"), Number::withLong(2)}), R"({"set":["one",2]})"},
      {Data::make(std::string("\x00\x1f\xa0\xff", 4)), R"({"data":"001fa0ff"})"},
      {Data::make(""), R"({"data":""})"},
      {Uid::make(42), R"({"uid":42})"},
      {Date::make(0.5), R"({"date":0.5})"},
      {Date::make(std::numeric_limits<double>::quiet_NaN()), R"({"date":{"real":"nan"}})"},
  };
  for (const auto& test : cases) EXPECT_EQ(toJson(test.value).dump(), test.json);
}

}  // namespace
}  // namespace qz::tools::scenario
