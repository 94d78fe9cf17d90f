// SPDX-License-Identifier: MIT
// Reading and writing when memory runs out: std::bad_alloc is thrown, and nothing leaks.
#include <gtest/gtest.h>

#include <cstddef>
#include <new>
#include <string>

#include "qz/property_list/binary_writer.hpp"
#include "qz/property_list/xml_writer.hpp"
#include "tests/failing_allocations.hpp"
#include "tests/property_list/binary_file.hpp"
#include "tests/property_list/reading.hpp"

namespace qz::toolkit {
namespace {

using namespace failing_allocations;
using namespace std::string_literals;

std::string manyKeys() {
  std::string xml;
  for (int i = 0; i < 300; ++i) {
    xml +=
        "<key>key " + std::to_string(i % 250) + "</key><array><true/><integer>7</integer></array>";
  }
  return xml;
}

TEST(AllocationFailures, EndReading) {
  const std::string files[] = {
      plist("<dict>" + manyKeys() + "<key>a&amp;b</key><string>&lt;<![CDATA[x]]></string>" +
            "<key>data</key><data>AQID</data><key>long</key><string>" + std::string(9000, 'l') +
            "</string><key>uid</key><dict><key>CF$UID</key><integer>1</integer></dict></dict>"),
      "{ a = ( b, \"c\\n" + std::string(100, 'd') + "\" ); e = <0102>; }",
      "a = b; \"" + std::string(100, 'c') + "\" = d;",
      "\xFE\xFF\0{\0a\0=\0b\0;\0}"s,
      "<?xml encoding='GB18030'?><string>" + repeated("\xC3\xA9", 50) + "</string>",
      BinaryFile{.objects = {"\xD2\x01\x02\x03\x04", "\x51k", "\x10\x07", "\xC2\x01\x02",
                             "\x62\x26\x3A\xD8\x00"s}}
          .bytes(),
      "<array><string>not closed",
      "{ a = b",
      BinaryFile{.objects = {"\xA1\x00"s}}.bytes(),
  };
  for (const std::string& file : files) {
    EXPECT_GT(failuresOf([&] { readPropertyList(file); }), 1) << file;
    EXPECT_GT(failuresOf([&] { dictionaryFromPropertyList(file); }), 1) << file;
    EXPECT_GT(failuresOf([&] {
                PositionTable fresh;
                readPropertyList(file, &fresh);
              }),
              1)
        << file;
  }
}

TEST(AllocationFailures, EndWriting) {
  const ValueRef<> root = readPropertyList(plist("<dict>" + manyKeys() + "</dict>")).value;
  EXPECT_GT(failuresOf([&] { writeXmlPropertyList(root); }), 1);
  EXPECT_GT(failuresOf([&] { writeBinaryPropertyList(root); }), 1);
  EXPECT_GT(failuresOf([&] { canonicalDump(*root); }), 1);
  EXPECT_GT(failuresOf([&] { root->description(); }), 1);
}

TEST(AllocationFailures, LeaveACollectionAsItWas) {
  const auto dictionary = Dictionary::make();
  for (int i = 0; i < 200; ++i) {
    const std::string key = "a key that is too long to be held in place " + std::to_string(i);
    for (std::size_t failing = 0; dictionary->count() == static_cast<std::size_t>(i); ++failing) {
      allocationsLeft = failing;
      try {
        dictionary->setObject(Number::withLong(i), key);
      } catch (const std::bad_alloc&) {
        allocationsLeft = never;
        ASSERT_FALSE(dictionary->objectForKey(key));
      }
      allocationsLeft = never;
    }
    ASSERT_EQ(dictionary->objectForKey(key)->intValue(), i);
  }
  EXPECT_EQ(dictionary->allKeys().size(), 200U);
}

}  // namespace
}  // namespace qz::toolkit
