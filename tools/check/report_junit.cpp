// SPDX-License-Identifier: MIT
// The report in JUnit's XML: one test suite for each script, one test case for each finding, one
// that passes where there is none, and one with an error for a script that could not be checked.
#include <algorithm>
#include <ostream>

#include "tools/check/report.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/support/xml_text.hpp"

namespace qz::tools::check {
namespace {

std::string xmlLine(const std::string& text) { return xmlText(oneLine(text)); }

std::string attribute(const std::string& name, const std::string& value) {
  return " " + name + "=\"" + xmlLine(value) + "\"";
}

std::string suiteOf(const std::string& script, std::size_t tests, std::size_t failures,
                    std::size_t errors) {
  return "  <testsuite" + attribute("name", script) + attribute("tests", std::to_string(tests)) +
         attribute("failures", std::to_string(failures)) +
         attribute("errors", std::to_string(errors)) + ">\n";
}

bool isFailure(const Report& report, const Finding& finding) {
  return finding.severity >= report.failOn;
}

void writeCase(const Report& report, const Finding& finding, std::ostream& out) {
  out << "    <testcase" << attribute("classname", report.verdict.path)
      << attribute("name", finding.code + ": " + finding.message) << ">\n";
  if (isFailure(report, finding)) {
    std::string details = placeOf(finding, report.file);
    if (!finding.path.empty()) details += ": " + playCommand(report, finding.path);
    out << "      <failure" << attribute("type", std::string(nameOf(finding.severity)))
        << attribute("message", finding.message) << ">" << xmlLine(details) << "</failure>\n";
  }
  out << "    </testcase>\n";
}

std::size_t failuresIn(const Report& report) {
  const auto& findings = report.verdict.findings;
  return static_cast<std::size_t>(
      std::count_if(findings.begin(), findings.end(),
                    [&](const Finding& finding) { return isFailure(report, finding); }));
}

void writeSuite(const Report& report, std::ostream& out) {
  const auto& findings = report.verdict.findings;
  out << suiteOf(report.verdict.path, std::max<std::size_t>(findings.size(), 1), failuresIn(report),
                 0);
  for (const Finding& finding : findings) writeCase(report, finding, out);
  if (findings.empty()) {
    out << "    <testcase" << attribute("classname", report.verdict.path)
        << attribute("name", "nothing is wrong") << "/>\n";
  }
  out << "  </testsuite>\n";
}

void writeSuite(const Unchecked& unchecked, std::ostream& out) {
  out << suiteOf(unchecked.script, 1, 0, 1) << "    <testcase"
      << attribute("classname", unchecked.script) << attribute("name", "the script is checked")
      << ">\n      <error" << attribute("type", "not checked")
      << attribute("message", unchecked.message) << ">" << xmlLine(unchecked.message)
      << "</error>\n    </testcase>\n  </testsuite>\n";
}

}  // namespace

void writeJunit(const RunReport& run, bool, std::ostream& out) {
  out << "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<testsuites>\n";
  for (const Report& report : run.scripts) writeSuite(report, out);
  for (const Unchecked& each : run.unchecked) writeSuite(each, out);
  out << "</testsuites>\n";
}

}  // namespace qz::tools::check
