// SPDX-License-Identifier: MIT
// Reports in the XML that continuous-integration services read.

#include "tools/scenario/junit.hpp"

#include <algorithm>
#include <cstdio>
#include <filesystem>
#include <string_view>

#include "tools/support/xml_text.hpp"

namespace qz::tools::scenario {
namespace {

std::string attribute(std::string_view name, const std::string& value) {
  return " " + std::string(name) + "=\"" + xmlText(value) + "\"";
}

std::string seconds(double value) {
  char text[32];
  std::snprintf(text, sizeof text, "%.6f", value);
  return text;
}

/// Returns the counts and the time of some reports, as attributes.
std::string totals(const Report* first, const Report* last) {
  const auto count = [&](Verdict verdict) {
    return std::to_string(std::count_if(
        first, last, [&](const Report& report) { return report.verdict == verdict; }));
  };
  double time = 0;
  for (const auto* report = first; report != last; ++report) time += report->seconds;
  return attribute("tests", std::to_string(last - first)) +
         attribute("failures", count(Verdict::failed)) + attribute("errors", "0") +
         attribute("skipped", count(Verdict::skipped)) + attribute("time", seconds(time));
}

/// Turns "dir/intro.walk" into "dir.intro": services group test cases by the dots.
std::string className(const std::string& file) {
  auto name = std::filesystem::path(file).lexically_normal().replace_extension().generic_string();
  while (name.starts_with("/") || name.starts_with("../")) name.erase(0, name.find('/') + 1);
  std::replace(name.begin(), name.end(), '.', '_');
  std::replace(name.begin(), name.end(), '/', '.');
  return name;
}

std::string testCase(const Report& report) {
  const auto start =
      "    <testcase" + attribute("name", report.title) +
      attribute("classname", className(report.file)) + attribute("file", report.file) +
      attribute("line", std::to_string(report.line)) + attribute("time", seconds(report.seconds));
  switch (report.verdict) {
    case Verdict::passed:
      return start + "/>\n";
    case Verdict::skipped:
      return start + ">\n      <skipped" + attribute("message", report.problem) +
             "/>\n    </testcase>\n";
    case Verdict::failed:
      break;
  }
  const auto where = report.file + ":" + std::to_string(report.failedLine) + ": ";
  return start + ">\n      <failure" + attribute("message", report.problem) +
         attribute("type", "expectation") + ">" +
         xmlText(where + report.problem + "\n" + report.statement) +
         "</failure>\n    </testcase>\n";
}

/// Returns the suite of the reports on one file.
std::string testSuite(const Report* first, const Report* last) {
  std::string xml = "  <testsuite" + attribute("name", first->file) + totals(first, last) + ">\n";
  for (; first != last; ++first) xml += testCase(*first);
  return xml + "  </testsuite>\n";
}

}  // namespace

std::string junitReport(const std::vector<Report>& reports) {
  std::string xml = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<testsuites" +
                    attribute("name", "qz-walkthrough") +
                    totals(reports.data(), reports.data() + reports.size()) + ">\n";
  const auto* const end = reports.data() + reports.size();
  for (const auto* first = reports.data(); first != end;) {
    const auto* const last =
        std::find_if(first, end, [&](const Report& report) { return report.file != first->file; });
    xml += testSuite(first, last);
    first = last;
  }
  return xml + "</testsuites>\n";
}

}  // namespace qz::tools::scenario
