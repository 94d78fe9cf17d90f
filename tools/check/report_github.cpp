// SPDX-License-Identifier: MIT
// The report as annotations of GitHub's workflows: one line for each finding, and
// one for each script that could not be checked.
#include <ostream>

#include "tools/check/report.hpp"

namespace qz::tools::check {
namespace {

/// Returns `text` with the escapes that workflow commands need; more of them in a property.
std::string escaped(const std::string& text, bool isProperty) {
  std::string result;
  for (const char c : text) {
    switch (c) {
      case '%':
        result += "%25";
        break;
      case '\r':
        result += "%0D";
        break;
      case '\n':
        result += "%0A";
        break;
      case ':':
        result += isProperty ? "%3A" : ":";
        break;
      case ',':
        result += isProperty ? "%2C" : ",";
        break;
      default:
        result += c;
    }
  }
  return result;
}

std::string_view commandOf(Severity severity) {
  return severity == Severity::note ? "notice" : nameOf(severity);
}

std::string propertiesOf(const Finding& finding, const Report& report) {
  std::string file = " file=" + escaped(pathOf(finding, report.file), true);
  if (finding.elsewhere) return file + ",line=" + std::to_string(finding.elsewhere->line);
  const auto position = positionOf(finding, report.file);
  if (!position) return file;
  return file + ",line=" + std::to_string(position->line) +
         ",col=" + std::to_string(position->column);
}

void writeFinding(const Finding& finding, const Report& report, std::ostream& out) {
  out << "::" << commandOf(finding.severity) << propertiesOf(finding, report)
      << ",title=" << escaped(finding.code, true) << "::" << escaped(finding.message, false);
  if (!finding.path.empty()) out << escaped("\n" + playCommand(report, finding.path), false);
  out << '\n';
}

void annotate(const Unchecked& unchecked, std::ostream& out) {
  out << "::error file=" << escaped(unchecked.script, true)
      << ",title=not checked::" << escaped(unchecked.message, false) << '\n';
}

}  // namespace

void writeGithub(const RunReport& run, bool, std::ostream& out) {
  for (const Report& report : run.scripts) {
    for (const Finding& finding : report.verdict.findings) writeFinding(finding, report, out);
  }
  for (const Unchecked& each : run.unchecked) annotate(each, out);
}

}  // namespace qz::tools::check
