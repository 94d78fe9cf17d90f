// SPDX-License-Identifier: MIT
// The encodings of XML and old-style property lists: by mark, by guess, by declaration.
#include <gtest/gtest.h>

#include <bit>
#include <string>
#include <string_view>

#include "tests/property_list/reading.hpp"

namespace qz::toolkit {
namespace {

using namespace std::string_literals;

constexpr std::u32string_view smiling = U"<string>caf\u00E9 \u263A \U0001F600</string>";
constexpr std::string_view smilingDump = "\"caf\\u00e9 \\u263a \\ud83d\\ude00\"";

/// Returns `text` in units of `size` bytes.
std::string encoded(std::u32string_view text, std::size_t size, std::endian order) {
  std::string bytes;
  const auto unit = [&](char32_t value) {
    for (std::size_t i = 0; i < size; ++i) {
      const std::size_t shift = 8 * (order == std::endian::big ? size - 1 - i : i);
      bytes += static_cast<char>(value >> shift);
    }
  };
  for (const char32_t c : text) {
    if (size == 4 || c < 0x10000) {
      unit(c);
    } else {
      unit(0xD7C0 + (c >> 10));
      unit(0xDC00 + (c & 0x3FF));
    }
  }
  return bytes;
}

TEST(Encodings, MarkedOnesAreRead) {
  for (const std::size_t size : {2U, 4U}) {
    for (const std::endian order : {std::endian::little, std::endian::big}) {
      EXPECT_EQ(dumpOf(encoded(U"\uFEFF" + std::u32string(smiling), size, order)), smilingDump);
      EXPECT_EQ(dumpOf(encoded(U"\uFEFF{\u2028a='\U0001F600';}", size, order)),
                "{\"dict\":[[\"a\",\"\\ud83d\\ude00\"]]}");
    }
  }
  EXPECT_EQ(dumpOf("\xEF\xBB\xBF<?xml encoding='bogus'?><true/>"), "true");
  EXPECT_EQ(dumpOf("\xEF\xBB\xBF"
                   "a=b;"),
            "{\"dict\":[[\"a\",\"b\"]]}");
  EXPECT_EQ(dumpOf("\xEF\xBB\xBF "), "{\"dict\":[]}");
  EXPECT_EQ(dumpOf("\xEF\xBB\xBF"), refused);
  EXPECT_EQ(dumpOf("\xFF\xFE"), refused);
  EXPECT_EQ(dumpOf("\xFE\xFF"), refused);
  EXPECT_EQ(dumpOf("\xFF\xFE\0\0"s), refused);
}

TEST(Encodings, MarkedOnesMustHoldCharacters) {
  const auto little = std::endian::little;
  EXPECT_EQ(dumpOf("\xFF\xFE" + encoded(U"'a", 2, little) + "\x3D\xD8'\0"s), refused);
  EXPECT_EQ(dumpOf("\xFF\xFE" + encoded(U"'a", 2, little) + "\0\xDE'\0"s), refused);
  EXPECT_EQ(dumpOf("\xFF\xFE" + encoded(U"'a", 2, little) + "\x3D\xD8"), refused);
  EXPECT_EQ(dumpOf("\xFF\xFE\0\0"s + encoded(U"'a\xD800'", 4, little)), refused);
  EXPECT_EQ(dumpOf("\xFF\xFE\0\0"s + encoded(U"'a'", 4, little) + "\xFF\xFF\xFF\xFF"), refused);
  // Bytes at the end that do not fill a unit are ignored.
  EXPECT_EQ(dumpOf("\xFF\xFE" + encoded(U"'a'", 2, little) + "x"), "\"a\"");
}

TEST(Encodings, AZeroAmongTheFirstTwoBytesIsUtf16WithoutItsFirstCharacter) {
  const auto native = [](std::u32string_view text) {
    return dumpOf(encoded(text, 2, std::endian::native));
  };
  EXPECT_EQ(native(smiling), refused);
  EXPECT_EQ(native(U" " + std::u32string(smiling)), smilingDump);
  EXPECT_EQ(native(U"{ k = v; }"), "{\"dict\":[[\"k\",\"v\"]]}");
  EXPECT_EQ(native(U"{}"), refused);
  EXPECT_EQ(dumpOf("\0 "s), refused);
  EXPECT_EQ(dumpOf("a\0b"s), refused);
  EXPECT_EQ(dumpOf("\0\0\0<"s), refused);
}

TEST(Encodings, DeclarationsCountWhereThePlatformLooks) {
  const std::string body = "?><string>caf\xE9</string>";
  constexpr std::string_view cafe = "\"caf\\u00e9\"";
  const struct {
    std::string_view declaration;
    std::string_view dump;
  } cases[] = {
      {"<?xml version='1.0' encoding=\"ISO-8859-1\"", cafe},
      {"<?xml version='1.0' encoding='iso-8859-1'", cafe},
      {"<?xmlencoding='latin1'", cafe},
      {"<?xml encoding='ISO-8859-1' encoding='bogus'", cafe},
      {"<?xml eencoding='ISO-8859-1'", cafe},
      {"<?xml encoding='US-ASCII'", cafe},
      {"<?xml encoding='windows-1252'", cafe},
      {"<?xml encoding='macintosh'", refused},
      {"<?xml encoding='mac'", refused},
      {"<?xml encoding='KOI8-R'", "\"caf\\u0418\""},
      {"<?xml encoding='UTF-8'", refused},
      {"<?xml encoding='utf-8'", refused},
      {"<?xml encoding = 'ISO-8859-1'", refused},
      {"<?xml encoding= 'ISO-8859-1'", refused},
      {"<?xml encoding=ISO-8859-1", refused},
      {"<?xml encoding='ISO-8859-1\"", refused},
      {"<?xml Encoding='ISO-8859-1'", refused},
      {"<?xml a='>' encoding='ISO-8859-1'", refused},
      {" <?xml encoding='ISO-8859-1'", refused},
      {"<?XML encoding='ISO-8859-1'", refused},
      {"<?xml encoding=''", refused},
      {"<?xml encoding=' ISO-8859-1 x'", refused},
      {"<?xml encoding='bogus'", refused},
      {"<?xml encoding='UTF-16'", refused},
      {"<?xml encoding='UTF-16LE'", refused},
      {"<?xml encoding='UTF-32'", refused},
  };
  for (const auto& [declaration, dump] : cases) {
    EXPECT_EQ(dumpOf(std::string(declaration) + body), dump) << declaration;
  }
}

TEST(Encodings, OlderThanUnicodeAreRead) {
  const struct {
    const char* name;
    std::string text;
    std::string_view dump;
  } cases[] = {
      {"ISO-8859-15", "\xA4\xE9", "\"\\u20ac\\u00e9\""},
      {"ISO-8859-2", "\xB1", "\"\\u0105\""},
      {"ISO-8859-7", "\xE1\xD2", refused},  // D2 is unassigned
      {"windows-1251", "\xCF\xF0", "\"\\u041f\\u0440\""},
      {"IBM850", "\x82", "\"\\u00e9\""},
      {"GB18030", "\xC3\xA9\x81\x40", "\"\\u8305\\u4e02\""},
      {"GB18030", "\x81\x30\x81\x30", "\"\\u0080\""},
      {"GB18030", "\x84\x31\xA4\x39", "\"\\uffff\""},
      {"GB18030", "\x84\x31\xA5\x30", refused},
      {"GB18030", "\x90\x30\x81\x30\xE3\x32\x9A\x35", "\"\\ud800\\udc00\\udbff\\udfff\""},
      {"GB18030", "\xE3\x32\x9A\x36", refused},
      {"GB18030", "\xE9", refused},
      {"gb2312", "\xD6\xD0", "\"\\u4e2d\""},
      {"Shift_JIS", "\xC3\xA9\x83\x65", "\"\\uff83\\uff69\\u30c6\""},
      {"Shift_JIS", "\xE9\x3C", refused},
      {"Shift_JIS", "\x88\x9F\xEA\xA4", "\"\\u4e9c\\u7199\""},
      {"EUC-JP", "\xB0\xA1\x8E\xB1\x8F\xB0\xA1", "\"\\u4e9c\\uff71\\u4e02\""},
      {"EUC-JP", "\xE9<", refused},
      {"EUC-JP", "\x8E\x20", refused},
      {"Big5", "\xA4\xA4", "\"\\u4e2d\""},
      {"Big5", "\xA4\x80", refused},
      {"EUC-KR", "\xC7\xD1\x81\x41", "\"\\ud55c\\uac02\""},
      {"EUC-KR", "\x80\x41", refused},
  };
  for (const auto& [name, text, dump] : cases) {
    const std::string declaration = "<?xml encoding=\"" + std::string(name) + "\"?>";
    EXPECT_EQ(dumpOf(declaration + "<string>" + text + "</string>"), dump) << name;
  }
}

}  // namespace
}  // namespace qz::toolkit
