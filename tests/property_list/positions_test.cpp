// SPDX-License-Identifier: MIT
// The positions of refusals and of values.
#include <gtest/gtest.h>

#include <string>
#include <string_view>

#include "tests/property_list/binary_file.hpp"
#include "tests/property_list/reading.hpp"

namespace qz::toolkit {
namespace {

using namespace std::string_literals;

TEST(Refusals, SayWhatAndWhere) {
  const struct {
    std::string bytes;
    std::string_view description;
  } cases[] = {
      {"", "line 1, column 1: the file is empty (read as old-style property list)"},
      {"<plist>\n<dict>\n  <kay>a</kay>",
       "line 3, column 3: unknown tag <kay>; the tags are <plist> <array> <dict> <key> "
       "<string> <integer> <real> <date> <data> <true> <false> (read as XML property list)"},
      {"<plist>\r\n<array>\r  \xC3\xA9",
       "line 3, column 3: expected a tag, found the byte 0xC3 "
       "(read as XML property list)"},
      {"<array><string>caf\xC3\xA9 \xFF</string></array>",
       "line 1, column 21: the text is not valid UTF-8 (read as XML property list)"},
      {"<dict>\n<key>a</key>\n</dict>",
       "line 2, column 1: the key \"a\" has no value (read as XML property list)"},
      {"<dict><string>a</string></dict>",
       "line 1, column 7: expected <key> or </dict>, found <string> (read as XML property list)"},
      {"<array><integer> 12x</integer></array>",
       "line 1, column 20: expected a digit of the "
       "integer or </integer> (read as XML property list)"},
      {"<array><real>1,5</real></array>",
       "line 1, column 14: \"1,5\" is not a decimal number (read as XML property list)"},
      {"<array><data>AQ\x80</data></array>",
       "line 1, column 16: data is written in base64, in ASCII "
       "(read as XML property list)"},
      {"<array><true/>",
       "line 1, column 15: expected a tag, found the end of the file "
       "(read as XML property list)"},
      {"<array></dict>", "line 1, column 8: expected </array> (read as XML property list)"},
      {"<?xml encoding='bogus'?><true/>",
       "line 1, column 17: unknown encoding \"bogus\" (read as XML property list)"},
      {"{\n  a = b\n}",
       "line 3, column 1: expected ';', found '}' (read as old-style property list)"},
      {"{ a = \xC3\xA9; }",
       "line 1, column 7: expected a value, found '\xC3\xA9' (read as old-style property list)"},
      {"( a, \"b", "line 1, column 6: the string is not closed (read as old-style property list)"},
      {"<0b 1>",
       "line 1, column 6: expected the second hexadecimal digit of a byte, found '>' "
       "(read as old-style property list)"},
      {"bplist00 is this",
       "byte 16: the file is too short for a header, an object and a trailer "
       "(read as binary property list)"},
      {BinaryFile{.objects = {"\xA1\x01", "\x0F"}}.bytes(),
       "byte 10: unknown kind of object (read as binary property list)"},
      {BinaryFile{.objects = {"\xA1\x00"s}}.bytes(),
       "byte 8: the object holds itself (read as binary property list)"},
  };
  for (const auto& [bytes, description] : cases) {
    const ReadResult result = readPropertyList(bytes);
    ASSERT_TRUE(result.refusal) << bytes;
    EXPECT_EQ(result.refusal->description(), description);
    EXPECT_FALSE(result.value);
  }
}

TEST(Positions, OfTheRootOfAStringsFile) {
  for (const std::string_view file : {"a = b;", "a;", " /* nothing */ "}) {
    PositionTable positions;
    const ValueRef<> root = readPropertyList(std::string(file), &positions).value;
    ASSERT_TRUE(root) << file;
    EXPECT_EQ(std::get<TextPosition>(positions.of(*root).value()), (TextPosition{1, 1})) << file;
  }
}

TEST(Positions, OfXmlValuesAndKeys) {
  PositionTable positions;
  const std::string xml =
      "<plist>\n<dict>\n\t<key>\xC3\xA9</key>  <array><true/>\r\n<true/></array>\n</dict></plist>";
  const auto root = asDictionary(readPropertyList(xml, &positions).value);
  const Dictionary::Entry& entry = root->entries().front();
  const auto at = [&](const ValueRef<>& value) {
    return std::get<TextPosition>(positions.of(*value).value());
  };
  EXPECT_EQ(at(root), (TextPosition{2, 1}));
  EXPECT_EQ(at(entry.key), (TextPosition{3, 2}));
  EXPECT_EQ(at(entry.value), (TextPosition{3, 16}));
  EXPECT_EQ(at(entry.value->objectAtIndex(0)), (TextPosition{3, 23}));
  EXPECT_EQ(at(entry.value->objectAtIndex(1)), (TextPosition{4, 1}));
  EXPECT_FALSE(positions.of(*String::make("another")));
}

TEST(Positions, OfOldStyleValuesAndKeys) {
  PositionTable positions;
  const auto root = asDictionary(readPropertyList("// c\nkey = ( a,\n 'b' );\n", &positions).value);
  const Dictionary::Entry& entry = root->entries().front();
  const auto at = [&](const ValueRef<>& value) {
    return description(positions.of(*value).value());
  };
  EXPECT_EQ(at(entry.key), "line 2, column 1");
  EXPECT_EQ(at(entry.value), "line 2, column 7");
  EXPECT_EQ(at(entry.value->objectAtIndex(1)), "line 3, column 2");
}

TEST(Positions, OfConvertedTextsCountItsCharacters) {
  PositionTable positions;
  const std::string utf16 = "\xFE\xFF\0\n\0 \0a"s;
  const auto root = readPropertyList(utf16, &positions).value;
  EXPECT_EQ(description(positions.of(*root).value()), "line 2, column 2");
}

TEST(Positions, OfBinaryObjects) {
  PositionTable positions;
  const auto root =
      readPropertyList(BinaryFile{.objects = {"\xA1\x01", "\x51k"}}.bytes(), &positions).value;
  EXPECT_EQ(positions.of(*root), Position(BytePosition{8}));
  EXPECT_EQ(positions.of(*root->objectAtIndex(0)), Position(BytePosition{10}));
}

}  // namespace
}  // namespace qz::toolkit
