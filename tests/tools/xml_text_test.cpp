// SPDX-License-Identifier: MIT
// Text in the XML of reports: every character is one that XML 1.0 allows.

#include "tools/support/xml_text.hpp"

#include <gtest/gtest.h>

#include <string>

#include "text/utf8.hpp"

namespace qz::tools {
namespace {

/// Whether the production Char of XML 1.0 has the code point.
bool isAllowed(char32_t code) {
  return code == 0x9 || code == 0xA || code == 0xD || (code >= 0x20 && code <= 0xD7FF) ||
         (code >= 0xE000 && code <= 0xFFFD) || code >= 0x10000;
}

bool isReferenced(char32_t code) {
  return std::u32string_view(U"&<>\"\t\n\r").find(code) != std::u32string_view::npos;
}

TEST(XmlText, HasOnlyCharactersThatXmlAllows) {
  constexpr char32_t last = 0x10FFFF;
  for (char32_t code = 0; code <= last; ++code) {
    if (isReferenced(code)) continue;
    std::string text;
    text::appendUtf8(text, code);
    const std::string xml = xmlText(text);
    if (isAllowed(code)) {
      ASSERT_EQ(xml, text) << static_cast<unsigned>(code);
    } else {
      ASSERT_TRUE(xml.starts_with("\uFFFD")) << static_cast<unsigned>(code);
      ASSERT_EQ(xml.find_first_not_of("\uFFFD"), std::string::npos) << static_cast<unsigned>(code);
    }
  }
}

TEST(XmlText, ReplacesEachByteThatIsNotUtf8) {
  const std::pair<const char*, const char*> cases[] = {
      {"a\xFF!", "a\uFFFD!"},       {"\xC3", "\uFFFD"},
      {"\xC0\xAF", "\uFFFD\uFFFD"}, {"\xED\xA0\x80", "\uFFFD\uFFFD\uFFFD"},
      {"\xEF\xBF", "\uFFFD\uFFFD"}, {"\xF4\x90\x80\x80", "\uFFFD\uFFFD\uFFFD\uFFFD"},
  };
  for (const auto& [text, xml] : cases) EXPECT_EQ(xmlText(text), xml);
}

TEST(XmlText, RefersToMarkupAndWhiteSpace) {
  EXPECT_EQ(xmlText("<a b=\"c'd\"> & ]]>\t\r\n"),
            "&lt;a b=&quot;c'd&quot;&gt; &amp; ]]&gt;&#9;&#13;&#10;");
  EXPECT_EQ(xmlText(std::string_view("\0", 1)), "\uFFFD");
  EXPECT_EQ(xmlText(""), "");
}

}  // namespace
}  // namespace qz::tools
