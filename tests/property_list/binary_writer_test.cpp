// SPDX-License-Identifier: MIT
// Writing binary property lists: they read back, and some values are refused.
#include "qz/property_list/binary_writer.hpp"

#include <gtest/gtest.h>

#include <cmath>
#include <string>

#include "qz/toolkit/exception.hpp"
#include "tests/property_list/random_values.hpp"
#include "tests/property_list/reading.hpp"

namespace qz::toolkit {
namespace {

using namespace std::string_literals;

std::string binaryRefusalOf(const ValueRef<>& value) {
  try {
    writeBinaryPropertyList(value);
  } catch (const InvalidArgumentException& exception) {
    return exception.reason();
  }
  return "";
}

TEST(BinaryWriter, WritesWhatOthersWrite) {
  const auto dictionary = Dictionary::make({{String::make("k"), Number::withLong(7)}});
  EXPECT_EQ(writeBinaryPropertyList(dictionary),
            "bplist00\xD1\x01\x02\x51k\x10\x07\x08\x0B\x0D"s + std::string(6, '\0') + "\x01\x01" +
                std::string(7, '\0') + "\x03" + std::string(15, '\0') + "\x0F");
}

TEST(BinaryWriter, WritesWhatReadsBackTheSame) {
  const ValueRef<> values[] = {
      String::make(""),
      String::make("\xED\xB8\x80\xED\xA0\xBD"),  // halves of a pair, in the wrong order
      String::make("\xEF\xBB\xBF"
                   "a\xF0\x9F\x98\x80"),
      String::make(std::string(70000, 'x')),
      Data::make(std::string(15, 'y')),
      Number::withUnsignedLong(UINT64_MAX),
      Number::withUnsignedLong(1ULL << 63),
      Number::withLong(INT64_MIN),
      Number::withLong(-1),
      Number::withLong(65536),
      Number::withFloat(0.1F),
      Number::withDouble(std::nan("")),
      Date::make(-0.25),
      Null::make(),
      Uid::make(0x10000),
      Set::make({Null::make(), Number::withLong(1)}),
      Dictionary::make({{Number::withLong(1), Null::make()}, {Data::make("k"), Array::make()}}),
      Dictionary::make({{String::make("CF$UID"), Number::withLong(1)}}),
  };
  for (const ValueRef<>& value : values) {
    EXPECT_EQ(dumpOf(writeBinaryPropertyList(value)), canonicalDump(*value));
  }
}

TEST(BinaryWriter, WritesRandomValuesThatReadBackTheSame) {
  for (std::uint32_t seed = 0; seed < 400; ++seed) {
    const ValueRef<> value = RandomValues(seed, false).value(5);
    ASSERT_EQ(dumpOf(writeBinaryPropertyList(value)), canonicalDump(*value)) << "seed " << seed;
  }
}

TEST(BinaryWriter, WritesManyObjects) {
  std::vector<ValueRef<>> elements;
  elements.reserve(70000);
  for (int i = 0; i < 70000; ++i) elements.emplace_back(Number::withLong(i));
  const auto array = Array::make(elements);
  EXPECT_EQ(dumpOf(writeBinaryPropertyList(array)), canonicalDump(*array));
}

TEST(BinaryWriter, WritesSharedValuesAndEqualStringsOnce) {
  const auto shared = Array::make({Number::withLong(1)});
  const std::string text(1000, 't');
  const auto array = Array::make({shared, shared, String::make(text), String::make(text)});
  const std::string bytes = writeBinaryPropertyList(array);
  EXPECT_LT(bytes.size(), 1100U);
  const ValueRef<> root = readPropertyList(bytes).value;
  EXPECT_EQ(canonicalDump(*root), canonicalDump(*array));
  EXPECT_TRUE(root->objectAtIndex(0) == root->objectAtIndex(1));
}

TEST(BinaryWriter, RefusesWhatBinaryCannotCarry) {
  const std::string start = "binary property lists cannot hold ";
  EXPECT_EQ(binaryRefusalOf(nullptr), start + "an absent value");
  EXPECT_EQ(binaryRefusalOf(Dictionary::make({{Array::make(), Null::make()}})),
            start + "a collection as a key");
  const auto endless = Array::make();
  endless->addObject(endless);
  EXPECT_EQ(binaryRefusalOf(endless), start + "a collection that holds itself");
  endless->removeAllObjects();
  ValueRef<> deep = Array::make();
  for (int i = 1; i < 513; ++i) deep = Array::make({deep});
  EXPECT_EQ(dumpOf(writeBinaryPropertyList(deep)), canonicalDump(*deep));
  EXPECT_EQ(binaryRefusalOf(Array::make({deep})), start + "more than 512 nested levels");
}

}  // namespace
}  // namespace qz::toolkit
