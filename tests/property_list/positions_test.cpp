// SPDX-License-Identifier: MIT
// The positions of refusals and of values.
#include <gtest/gtest.h>

#include <string>
#include <string_view>
#include <utility>
#include <vector>

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

struct RefusedCase {
  std::string bytes;
  std::string_view text;
};

/// Expects each file to be refused with its text, which is followed by the name of the format.
template <std::size_t count>
void expectRefusals(const RefusedCase (&cases)[count], std::string_view format) {
  for (const auto& [bytes, text] : cases) {
    const ReadResult result = readPropertyList(bytes);
    ASSERT_TRUE(result.refusal) << bytes;
    EXPECT_EQ(result.refusal->description(),
              std::string(text) + " (read as " + std::string(format) + ")");
  }
}

TEST(Refusals, OfXmlSayWhatIsWrongAroundTheRoot) {
  const RefusedCase cases[] = {
      {"<!ELEMENT a>", "line 1, column 1: <!DOCTYPE or a comment is expected after <!"},
      {"<!DOCTYPE plist", "line 1, column 1: the DOCTYPE is not closed"},
      {"<!DOCTYPE plist [<!ENTITY a \"b\">]><true/>",
       "line 1, column 17: a DOCTYPE with internal declarations is not supported"},
      {"<!-- c --\n<true/>", "line 1, column 1: the comment is not closed"},
      {"\n<!----><true/>", "line 2, column 1: the comment is not closed"},
      {"<?x <true/>", "line 1, column 1: the processing instruction is not closed"},
      {"<?x?>~~", "line 1, column 6: expected an element, found '~'"},
      {"<?x?>!!", "line 1, column 6: expected an element, found '!'"},
      {"<?x?>\x7F\x7F", "line 1, column 6: expected an element, found the byte 0x7F"},
      {"<?x?>\x1F\x1F", "line 1, column 6: expected an element, found the byte 0x1F"},
      {"<?x?>\xAB\xAB", "line 1, column 6: expected an element, found the byte 0xAB"},
      {"<?x?>\n", "line 2, column 1: expected an element, found the end of the file"},
      {"<?x?><", "line 1, column 6: expected an element, found the end of the file"},
      {"<true", "line 1, column 1: the tag is not closed"},
      {"<true a='1'", "line 1, column 1: the tag is not closed"},
      {"</>",
       "line 1, column 1: a tag without a name; the tags are <plist> <array> <dict> <key> <string> "
       "<integer> <real> <date> <data> <true> <false>"},
      {"<array>< ></array>",
       "line 1, column 8: a tag without a name; the tags are <plist> <array> <dict> <key> <string> "
       "<integer> <real> <date> <data> <true> <false>"},
      {"<plist/>", "line 1, column 1: <plist/> contains no value"},
      {"<plist> </plist>", "line 1, column 9: the <plist> contains no value"},
      {"<plist><true/><false/></plist>",
       "line 1, column 15: a <plist> holds one value only; expected </plist>"},
      {"<plist><true/></plist", "line 1, column 15: expected </plist>"},
  };
  expectRefusals(cases, "XML property list");
}

TEST(Refusals, OfXmlSayWhatIsWrongInValues) {
  const std::string tooDeep = repeated("<array>", 513);
  const RefusedCase cases[] = {
      {"<array><? <true/>", "line 1, column 8: the processing instruction is not closed"},
      {"<array><!-- <true/>", "line 1, column 8: the comment is not closed"},
      {"<array><!x></array>", "line 1, column 8: only comments may start with <! between elements"},
      {"<array>\n<data/></array>", "line 2, column 1: <data/> must not be empty"},
      {tooDeep, "line 1, column 3592: more than 512 nested containers"},
      {repeated("<dict><key>k</key>", 513), "line 1, column 9223: more than 512 nested containers"},
      {"<string>a", "line 1, column 10: the file ends inside a text"},
      {"<string>a</key>", "line 1, column 10: expected </string>"},
      {"<string>\xC3\xA9\xFF&lt;</string>", "line 1, column 15: the text is not valid UTF-8"},
      {"<string>a&b</string>",
       "line 1, column 10: & is neither &lt; &gt; &amp; &apos; &quot; nor a character reference; "
       "a plain & is written &amp;"},
      {"<string>&#65 ;</string>",
       "line 1, column 9: a character reference is &#digits; or &#xdigits;"},
      {"<string>&#x4g;</string>",
       "line 1, column 9: a character reference is &#digits; or &#xdigits;"},
      {"<string>&#000000065;</string>",
       "line 1, column 9: a character reference has at most 8 digits"},
      {"<string>&#65", "line 1, column 9: the character reference is not closed"},
      {"<string>&#xD800;</string>", "line 1, column 9: the character reference names no character"},
      {"<string>&#x110000;</string>",
       "line 1, column 9: the character reference names no character"},
      {"<string>a<!-- c --></string>",
       "line 1, column 10: a text may hold CDATA, but no comment or declaration"},
      {"<string>a<![CDATA[b]]</string>", "line 1, column 10: the CDATA section is not closed"},
      {"<dict><key>a</key><integer/></dict>", "line 1, column 19: <integer/> must not be empty"},
      {"<integer> - </integer>", "line 1, column 13: an integer without digits"},
      {"<integer>0x</integer>", "line 1, column 12: an integer without digits"},
      {"<integer>0xG</integer>",
       "line 1, column 12: expected a digit of the integer or </integer>"},
      {"<integer>1:</integer>", "line 1, column 11: expected a digit of the integer or </integer>"},
      {"<integer>-9223372036854775809</integer>",
       "line 1, column 11: the integer does not fit in 64 bits"},
      {"<real> 1 </real>", "line 1, column 7: \" 1 \" is not a decimal number"},
      {"<date>\n2001-01-01</date>", "line 1, column 7: a date is written as YYYY-MM-DDThh:mm:ssZ"},
  };
  expectRefusals(cases, "XML property list");
}

TEST(Refusals, OfTextsInOtherEncodingsSayWhatIsWrong) {
  const RefusedCase cases[] = {
      {"\xFE\xFF\0<\0t\0>\xD8\x3D"s, "line 1, column 4: the text is not valid UTF-16"},
      {"\xFE\xFF\0<\0t\0>\xDE\0\xD8\x3D"s, "line 1, column 4: the text is not valid UTF-16"},
      {"\0\0\xFE\xFF\0\0\0<\0\0\0t\0\x11\0\0"s, "line 1, column 3: the text is not valid UTF-32"},
      {"\0\0\xFE\xFF\0\0\0<\0\0\0t\0\0\xDF\xFF"s, "line 1, column 3: the text is not valid UTF-32"},
      {"<?xml encoding='GB18030'?><string>\xFF</string>",
       "line 1, column 35: the text is not valid in the encoding GB18030"},
      {"<?xml encoding=''?><true/>", "line 1, column 17: unknown encoding \"\""},
  };
  expectRefusals(cases, "XML property list");
}

TEST(Refusals, OfOldStyleSayWhatIsWrong) {
  const RefusedCase cases[] = {
      {"( a b )", "line 1, column 5: expected ',' or ')', found 'b'"},
      {"( a,, )", "line 1, column 5: expected ',' or ')', found ','"},
      {"( a", "line 1, column 4: expected ',' or ')', found the end of the file"},
      {"{ a }", "line 1, column 5: expected '=' or ';' after the key, found '}'"},
      {"{ a = ; }", "line 1, column 7: expected a value, found ';'"},
      {"{ a = b; )", "line 1, column 10: expected a key or '}', found ')'"},
      {"{ a = b; /* open", "line 1, column 17: expected a key or '}', found the end of the file"},
      {"{ } x", "line 1, column 5: expected the end of the file, found 'x'"},
      {"<0",
       "line 1, column 3: expected the second hexadecimal digit of a byte, found the end of "
       "the file"},
      {"( <0x> )", "line 1, column 5: expected the second hexadecimal digit of a byte, found 'x'"},
      {"( <00 g> )", "line 1, column 7: expected two hexadecimal digits or '>', found 'g'"},
      {"=", "line 1, column 1: expected a value, found '='"},
      {"{ \"a\" = 'b; }", "line 1, column 9: the string is not closed"},
      {"'a\\", "line 1, column 1: the string is not closed"},
      {"( a, \xFF )", "line 1, column 6: the text is not valid UTF-8"},
      {repeated("(", 514), "line 1, column 514: more than 512 nested levels"},
      // The pair is one character, though two units.
      {"\xFE\xFF\xD8\x3D\xDE\0"s, "line 1, column 1: expected a value, found '\xF0\x9F\x98\x80'"},
      {"\xFE\xFF\xDE\0\xD8\x3D"s, "line 1, column 1: the text is not valid UTF-16"},
      {"\xFE\xFF\xD8\x3D\0'"s, "line 1, column 1: the text is not valid UTF-16"},
  };
  expectRefusals(cases, "old-style property list");
}

TEST(Refusals, OfBinaryFilesSayWhatIsWrong) {
  const std::string huge = "\x4F\x13\x7F\xFF\xFF\xFF\xFF\xFF\xFF\xFF";
  const auto withObjects = [](std::vector<std::string> objects) {
    return BinaryFile{.objects = std::move(objects)}.bytes();
  };
  const auto withTrailer = [](std::size_t at, char byte) {
    std::string bytes = BinaryFile{.objects = {"\x09"}}.bytes();  // the trailer starts at 11
    bytes[at] = byte;
    return bytes;
  };
  BinaryFile deep{.objects = {}, .referenceSize = 2};
  for (std::size_t i = 1; i <= 514; ++i) {
    deep.objects.emplace_back("\xA1");
    binary::appendNumber(deep.objects.back(), i, 2);
  }
  const RefusedCase cases[] = {
      {std::string(binary::magic) + std::string(33, '\0'),
       "byte 40: the file is too short for a header, an object and a trailer"},
      {withTrailer(17, 0), "byte 17: the offsets' size is not from 1 to 16"},
      {withTrailer(17, 17), "byte 17: the offsets' size is not from 1 to 16"},
      {withTrailer(18, 0), "byte 18: the references' size is not from 1 to 16"},
      {withTrailer(18, 17), "byte 18: the references' size is not from 1 to 16"},
      {withTrailer(26, 0), "byte 19: there is no object"},
      {withTrailer(34, 1), "byte 27: the top object does not exist"},
      {withTrailer(42, 8),
       "byte 35: the offset table does not lie between the header and the trailer"},
      {withTrailer(42, 11),
       "byte 35: the offset table does not lie between the header and the trailer"},
      {withTrailer(26, 2), "byte 19: the offset table does not fill the space up to the trailer"},
      {withTrailer(42, 10), "byte 19: the offset table does not fill the space up to the trailer"},
      {withObjects(std::vector<std::string>(256, "\x09")),
       "byte 783: the references are too small for the number of objects"},
      {BinaryFile{.objects = {std::string(248, '\x09')}, .offsetSize = 1}.bytes(),
       "byte 263: the offsets are too small for the objects' space"},
      {BinaryFile{.objects = {"\x09", "\x08"}, .offsets = {8, 10}}.bytes(),
       "byte 12: the offset does not lead to before the offset table"},
      {BinaryFile{.objects = {"\x09"}, .offsets = {7}}.bytes(),
       "byte 7: an object cannot lie in the header"},
      {withObjects({"\xA1\x01", "\xA1\x00"s}), "byte 8: the object holds itself"},
      {deep.bytes(), "byte 1547: more than 512 nested levels"},
      {withObjects({"\x01"}), "byte 8: unknown kind of object"},
      {withObjects({"\x30\x00"s}), "byte 8: unknown kind of object"},
      {withObjects({huge}), "byte 18: the object reaches beyond the objects' space"},
      {withObjects({"\x42z"}), "byte 9: the object reaches beyond the objects' space"},
      {withObjects({"\x4F"}), "byte 9: expected the object's length, an integer"},
      {withObjects({"\x4F\x23"}), "byte 9: expected the object's length, an integer"},
      {withObjects({"\x15" + std::string(32, '\0')}), "byte 8: an integer of more than 16 bytes"},
      {withObjects({"\x21\x00\x00"s}), "byte 8: a real of neither 4 nor 8 bytes"},
      {withObjects({"\x84\x01\x00\x00\x00\x00"s}), "byte 8: a UID of more than 32 bits"},
      {withObjects({"\x60"}), "byte 8: a UTF-16 string of no characters"},
      {withObjects({"\xA2\x01\x02", "\x09"}), "byte 10: the object referred to does not exist"},
      {withObjects({"\xD1\x01\x02", "\xA0", "\x09"}),
       "byte 8: a collection as the key of a dictionary"},
  };
  expectRefusals(cases, "binary property list");
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
