// SPDX-License-Identifier: MIT
// Reports for continuous-integration services.
#include <gtest/gtest.h>

#include <string>

#include "tools/scenario/junit.hpp"

namespace qz::tools::scenario {
namespace {

Report report(Verdict verdict, const std::string& file, const std::string& title) {
  Report report;
  report.verdict = verdict;
  report.file = file;
  report.title = title;
  report.line = 3;
  report.seconds = 0.25;
  return report;
}

TEST(ScenarioJunit, ASuiteAFileAndACaseAScenario) {
  auto failed = report(Verdict::failed, "dir/a.b.walk", "fails");
  failed.failedLine = 7;
  failed.problem = "expected \"x\", got \"<y>\"";
  failed.statement = "expect label.text x";
  auto skipped = report(Verdict::skipped, "../c.walk", "skipped");
  skipped.problem = "only for qt";
  EXPECT_EQ(
      junitReport({report(Verdict::passed, "dir/a.b.walk", "passes"), failed, skipped}),
      "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
      "<testsuites name=\"qz-walkthrough\" tests=\"3\" failures=\"1\" errors=\"0\" skipped=\"1\" "
      "time=\"0.750000\">\n"
      "  <testsuite name=\"dir/a.b.walk\" tests=\"2\" failures=\"1\" errors=\"0\" skipped=\"0\" "
      "time=\"0.500000\">\n"
      "    <testcase name=\"passes\" classname=\"dir.a_b\" file=\"dir/a.b.walk\" line=\"3\" "
      "time=\"0.250000\"/>\n"
      "    <testcase name=\"fails\" classname=\"dir.a_b\" file=\"dir/a.b.walk\" line=\"3\" "
      "time=\"0.250000\">\n"
      "      <failure message=\"expected &quot;x&quot;, got &quot;&lt;y&gt;&quot;\" "
      "type=\"expectation\">dir/a.b.walk:7: expected &quot;x&quot;, got &quot;&lt;y&gt;&quot;&#10;"
      "expect label.text x</failure>\n"
      "    </testcase>\n"
      "  </testsuite>\n"
      "  <testsuite name=\"../c.walk\" tests=\"1\" failures=\"0\" errors=\"0\" skipped=\"1\" "
      "time=\"0.250000\">\n"
      "    <testcase name=\"skipped\" classname=\"c\" file=\"../c.walk\" line=\"3\" "
      "time=\"0.250000\">\n"
      "      <skipped message=\"only for qt\"/>\n"
      "    </testcase>\n"
      "  </testsuite>\n"
      "</testsuites>\n");
}

TEST(ScenarioJunit, WhatXmlCannotHoldIsReplaced) {
  const struct {
    const char* name;
    std::string title;
    const char* written;
  } cases[] = {
      {"markup", "<a href='b'>&</a>", "&lt;a href='b'&gt;&amp;&lt;/a&gt;"},
      {"white space", "a\tb\nc\rd", "a&#9;b&#10;c&#13;d"},
      {"control characters", std::string("a\0b\x1B", 4), "a\uFFFDb\uFFFD"},
      {"no characters",
       "a\xEF\xBF\xBE"
       "b",
       "a\uFFFDb"},
      {"a byte that is not valid UTF-8",
       "a\xFF"
       "b",
       "a\uFFFDb"},
      {"other letters", "grüße 😀", "grüße 😀"},
  };
  for (const auto& test : cases) {
    const auto xml = junitReport({report(Verdict::passed, "a.walk", test.title)});
    EXPECT_NE(xml.find(std::string("<testcase name=\"") + test.written + "\" "), std::string::npos)
        << test.name << "\n"
        << xml;
  }
}

TEST(ScenarioJunit, WithoutScenariosItIsEmpty) {
  EXPECT_EQ(junitReport({}),
            "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
            "<testsuites name=\"qz-walkthrough\" tests=\"0\" failures=\"0\" errors=\"0\" "
            "skipped=\"0\" time=\"0.000000\">\n"
            "</testsuites>\n");
}

}  // namespace
}  // namespace qz::tools::scenario
