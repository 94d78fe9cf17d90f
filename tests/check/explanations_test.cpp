// SPDX-License-Identifier: MIT
// The explanations of the codes: entries of the documentation's page, for a terminal.

#include "tools/check/explanations.hpp"

#include <gtest/gtest.h>

#include <string>

#include "tools/check/checking_page.hpp"
#include "tools/check/finding.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools::check {
namespace {

TEST(Explanations, ComeFromThePage) {
  EXPECT_EQ(checkingPage(), *wholeFile(std::string(QZ_SOURCE_DIR) + "/docs/checking.md"));
}

TEST(Explanations, AreThereForEveryCode) {
  for (const Code& code : codes()) {
    const auto text = explanationOf(code.name);
    ASSERT_TRUE(text) << code.name;
    EXPECT_TRUE(text->starts_with(std::string(code.name) + "\n\nSeverity: ")) << *text;
    EXPECT_NE(text->find("\nTo mend it: "), std::string::npos) << *text;
    EXPECT_NE(text->find("\nThe script, mended:\n\n    {\n"), std::string::npos) << *text;
  }
}

TEST(Explanations, EndBeforeTheNextEntry) {
  for (const Code& code : codes()) {
    EXPECT_EQ(explanationOf(code.name)->find("###"), std::string::npos) << code.name;
  }
}

TEST(Explanations, HaveNoMarkup) {
  for (const Code& code : codes()) {
    const auto text = explanationOf(code.name);
    EXPECT_EQ(text->find("```"), std::string::npos) << *text;
    EXPECT_EQ(text->find("]("), std::string::npos) << *text;
  }
}

TEST(Explanations, ShowTheWindowBeforeTheScript) {
  const auto text = explanationOf("no-list");
  ASSERT_TRUE(text);
  const auto window = text->find("\nThe window:\n\n    (\n");
  const auto script = text->find("\nThe script:\n\n    {\n");
  EXPECT_NE(window, std::string::npos) << *text;
  EXPECT_NE(script, std::string::npos) << *text;
  EXPECT_LT(window, script);
}

TEST(Explanations, AreAbsentForAnyOtherName) {
  for (const char* const name :
       {"", "dead", "Dead-end", "dead-end`", "Found by reading", "sarif"}) {
    EXPECT_FALSE(explanationOf(name)) << name;
  }
}

}  // namespace
}  // namespace qz::tools::check
