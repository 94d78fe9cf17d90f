// SPDX-License-Identifier: MIT
// The numbers that texts convert to, and numbers converted to other types.
#include "text/number_conversion.hpp"

#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <fstream>
#include <limits>
#include <sstream>
#include <string>

#include "qz/property_list/scalars.hpp"
#include "text/utf8.hpp"

namespace qz::toolkit {
namespace {

constexpr double infinity = std::numeric_limits<double>::infinity();
const double notANumber = std::numeric_limits<double>::quiet_NaN();

/// Returns `text` with every `\uXXXX` resolved.
std::string unescaped(const std::string& text) {
  std::string result;
  for (std::size_t at = 0; at < text.size(); ++at) {
    if (text.compare(at, 2, "\\u") != 0) {
      result += text[at];
      continue;
    }
    text::appendUtf8(result,
                     static_cast<char32_t>(std::stoul(text.substr(at + 2, 4), nullptr, 16)));
    at += 5;
  }
  return result;
}

TEST(NumberConversion, AgreesWithThePlatform) {
  std::ifstream file(std::string(QZ_TEST_DATA) + "/number-strings.tsv");
  std::string line;
  std::getline(file, line);  // the names of the columns
  int rows = 0;
  for (; std::getline(file, line); ++rows) {
    // The first column may contain tabs; the last three are numbers.
    std::string columns[3];
    for (int i = 2; i >= 0; --i) {
      columns[i] = line.substr(line.rfind('\t') + 1);
      line.resize(line.rfind('\t'));
    }
    const auto string = String::make(unescaped(line));
    EXPECT_EQ(std::to_string(string->intValue()), columns[0]) << line;
    EXPECT_EQ(std::to_string(string->integerValue()), columns[1]) << line;
    EXPECT_EQ(string->longValue(), string->integerValue()) << line;
    EXPECT_EQ(string->doubleValue(), std::strtod(columns[2].c_str(), nullptr)) << line;
    EXPECT_EQ(string->floatValue(), static_cast<float>(string->doubleValue())) << line;
  }
  EXPECT_EQ(rows, 51);
}

TEST(NumberConversion, OfStringsToIntegers) {
  const struct {
    std::string_view text;
    std::int32_t intValue;
    std::int64_t integerValue;
  } cases[] = {
      {"", 0, 0},
      {std::string_view("\0\0 7", 4), 7, 7},
      {"\x7F\xC2\x80\xC2\xA0"
       "5",
       5, 5},
      {"\xC2\xA1"
       "5",
       0, 0},  // U+00A1 is the first that is not skipped
      {"\xE2\x80\x80\xE2\x80\x8B"
       "5",
       5, 5},  // U+2000, U+200B
      {"\xE2\x80\x8C"
       "5",
       0, 0},              // U+200C
      {"\xE2\x80", 0, 0},  // cut off
      {"- 1", 0, 0},
      {"-0", 0, 0},
      {"+", 0, 0},
      {"2147483648", INT32_MAX, 2147483648},
      {"-2147483648x", INT32_MIN, -2147483648},
      {"-2147483649", INT32_MIN, -2147483649},
      {"9223372036854775807", INT32_MAX, INT64_MAX},
      {"9223372036854775808", INT32_MAX, INT64_MAX},
      {"-9223372036854775808", INT32_MIN, INT64_MIN},
      {"-99999999999999999999999999", INT32_MIN, INT64_MIN},
      {"00000000000000000000000000012", 12, 12},
  };
  for (const auto& [text, intValue, integerValue] : cases) {
    EXPECT_EQ(text::intValueOf(text), intValue) << text;
    EXPECT_EQ(text::integerValueOf(text), integerValue) << text;
  }
}

TEST(NumberConversion, OfStringsToReals) {
  const struct {
    std::string_view text;
    double value;
  } cases[] = {
      {"", 0},
      {".", 0},
      {"-", 0},
      {"-.", 0},
      {".e5", 0},
      {"5.", 5},
      {"-.5e1", -5},
      {"1e5e5", 1e5},
      {"1.5.5", 1.5},
      {"1E+2", 100},
      {"1e-", 1},
      {"  +2.5kg", 2.5},
      {"-inf", 0},
      {"0.1", 0.1},
      {"4.9e-324", 4.9e-324},
      {"2.2250738585072011e-308", 2.2250738585072011e-308},
      {"1.7976931348623157e308", 1.7976931348623157e308},
      {"1.7976931348623159e308", infinity},
      {"-1e99999999999999999999", -infinity},
      {"1e-99999999999999999999", 0},
      {"0e99999999999999999999", 0},
      {"0.000000000000000000000000000001e330", 1e300},
  };
  for (const auto& [text, value] : cases) EXPECT_EQ(text::doubleValueOf(text), value) << text;
  EXPECT_TRUE(std::signbit(text::doubleValueOf("-0")));
  // More digits before the point than the exponent removes.
  EXPECT_EQ(text::doubleValueOf("1" + std::string(400, '0') + "e-10"), infinity);
  EXPECT_EQ(text::doubleValueOf("1" + std::string(400, '0') + "e-400"), 1);
  EXPECT_EQ(text::doubleValueOf("0." + std::string(400, '0') + "1e10"), 0);
}

TEST(NumberConversion, OfStringsToBooleans) {
  for (const char* yes : {"Y",  "y",  "T",  "t",    "YES", "true",   "Tomorrow", "1",
                          "9x", "-1", "+2", "0007", " y",  "\t 3",   "-001",     "\xC2\xA0Y",
                          "+y", "+Y", "-t", "0Y",   "0t",  "00true", " +00Yes"}) {
    EXPECT_TRUE(text::boolValueOf(yes)) << yes;
  }
  for (const char* no : {"",    " ",  "0",   "N",        "no", "x1",  "000", "-0",  "--1", "- 1",
                         "0x1", ".5", "0.5", "\xC3\xA9", "+",  "+-Y", "- Y", "0 Y", "0+Y", "0N"}) {
    EXPECT_FALSE(text::boolValueOf(no)) << no;
  }
}

TEST(NumberConversion, OfNumbersToIntegers) {
  const struct {
    ValueRef<Number> number;
    std::int32_t intValue;
    std::int64_t integerValue;
  } cases[] = {
      {Number::withBool(true), 1, 1},
      {Number::withLong(-5), -5, -5},
      {Number::withLong(0x1'2345'6789), 0x2345'6789, 0x1'2345'6789},  // the low 32 bits
      {Number::withLong(0x8000'0000), INT32_MIN, 0x8000'0000},
      {Number::withUnsignedLong(UINT64_MAX), -1, -1},
      {Number::withDouble(2.9), 2, 2},
      {Number::withDouble(-2.9), -2, -2},
      {Number::withFloat(-0.5F), 0, 0},
      {Number::withDouble(3e9), INT32_MAX, 3000000000},
      {Number::withDouble(-2147483648.5), INT32_MIN, -2147483648},
      {Number::withDouble(-2147483649), INT32_MIN, -2147483649},
      {Number::withDouble(9.3e18), INT32_MAX, INT64_MAX},
      {Number::withDouble(0x1p63), INT32_MAX, INT64_MAX},
      {Number::withDouble(-0x1p63), INT32_MIN, INT64_MIN},
      {Number::withDouble(-infinity), INT32_MIN, INT64_MIN},
      {Number::withDouble(infinity), INT32_MAX, INT64_MAX},
      {Number::withDouble(notANumber), 0, 0},
  };
  for (const auto& [number, intValue, integerValue] : cases) {
    EXPECT_EQ(number->intValue(), intValue) << number->description();
    EXPECT_EQ(number->integerValue(), integerValue) << number->description();
    EXPECT_EQ(number->longValue(), integerValue) << number->description();
  }
}

TEST(NumberConversion, OfNumbersToRealsAndBooleans) {
  EXPECT_EQ(Number::withUnsignedLong(UINT64_MAX)->doubleValue(), 0x1p64);
  EXPECT_EQ(Number::withLong(-1)->doubleValue(), -1);
  EXPECT_EQ(Number::withBool(true)->floatValue(), 1.0F);
  EXPECT_EQ(Number::withDouble(1e300)->floatValue(), std::numeric_limits<float>::infinity());
  EXPECT_EQ(Number::withFloat(0.1F)->doubleValue(), double{0.1F});
  EXPECT_TRUE(Number::withLong(256)->boolValue());
  EXPECT_TRUE(Number::withDouble(0.25)->boolValue());
  EXPECT_TRUE(Number::withDouble(notANumber)->boolValue());
  EXPECT_FALSE(Number::withDouble(-0.0)->boolValue());
  EXPECT_FALSE(Number::withUnsignedLong(0)->boolValue());
}

TEST(NumberConversion, KeepsTheBits) {
  EXPECT_EQ(Number::withBool(true)->bits(), 1U);
  EXPECT_EQ(Number::withLong(-1)->bits(), UINT64_MAX);
  EXPECT_EQ(Number::withUnsignedLong(UINT64_MAX)->bits(), UINT64_MAX);
  EXPECT_EQ(Number::withDouble(-2.5)->bits(), static_cast<std::uint64_t>(-2));
}

}  // namespace
}  // namespace qz::toolkit
