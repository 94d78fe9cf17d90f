// SPDX-License-Identifier: MIT
// Markdown, as commands take it.

#include "tools/steps/markup.hpp"

#include <gtest/gtest.h>

namespace qz::tools::steps {
namespace {

TEST(Markdown, StaysPlainWithoutMarks) {
  for (const char* const text : {"Hello", "a < b & c > d \"e\"", "Grüße…", "1 + 1 = 2"}) {
    const Markup read = readMarkdown(text);
    EXPECT_TRUE(read.isPlain) << text;
    EXPECT_EQ(read.text, text);
  }
  EXPECT_EQ(readMarkdown("not \\*this\\*").text, "not *this*");
}

TEST(Markdown, BecomesHtmlInAscii) {
  struct MarkdownCase {
    const char* markdown;
    const char* html;
  };
  for (const MarkdownCase& each :
       std::initializer_list<MarkdownCase>{{"a **b** *c*", "a <strong>b</strong> <em>c</em>"},
                                           {"**Grün**", "<strong>Gr&#252;n</strong>"},
                                           {"[x](https://example.org/?a=1&b=2)",
                                            "<a href=\"https://example.org/?a=1&amp;b=2\">x</a>"},
                                           {"- a\n- b", "<ul>\n<li>a</li>\n<li>b</li>\n</ul>\n"},
                                           {"# Title", "<h1>Title</h1>\n"},
                                           {"a  \nb", "a<br>\nb"},
                                           {"*a* <b>", "<em>a</em> &lt;b&gt;"}}) {
    const Markup read = readMarkdown(each.markdown);
    EXPECT_FALSE(read.isPlain) << each.markdown;
    EXPECT_EQ(read.text, each.html);
  }
}

TEST(Markdown, PlainTextBecomesHtml) {
  EXPECT_EQ(asHtml("a < b & ü\nc"), "a &lt; b &amp; &#252;<br>c");
  EXPECT_EQ(inAscii("<b>日本 😀</b>"), "<b>&#26085;&#26412; &#128512;</b>");
}

}  // namespace
}  // namespace qz::tools::steps
