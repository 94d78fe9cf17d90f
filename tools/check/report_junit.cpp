// SPDX-License-Identifier: MIT
// The report in JUnit's XML: one test suite for each script, one test case for each finding, and
// one that passes where there is none.
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

}  // namespace

void writeJunit(const std::vector<Report>& reports, bool, std::ostream& out) {
  out << "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<testsuites>\n";
  for (const Report& report : reports) {
    const auto& findings = report.verdict.findings;
    const auto failures =
        std::count_if(findings.begin(), findings.end(),
                      [&](const Finding& finding) { return isFailure(report, finding); });
    const std::size_t count = std::max<std::size_t>(findings.size(), 1);
    out << "  <testsuite" << attribute("name", report.verdict.path)
        << attribute("tests", std::to_string(count))
        << attribute("failures", std::to_string(failures)) << attribute("errors", "0") << ">\n";
    for (const Finding& finding : findings) writeCase(report, finding, out);
    if (findings.empty()) {
      out << "    <testcase" << attribute("classname", report.verdict.path)
          << attribute("name", "nothing is wrong") << "/>\n";
    }
    out << "  </testsuite>\n";
  }
  out << "</testsuites>\n";
}

}  // namespace qz::tools::check
