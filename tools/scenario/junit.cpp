// SPDX-License-Identifier: MIT
// Reports in the XML that continuous-integration services read.

#include "tools/scenario/junit.hpp"

#include <algorithm>
#include <cstdio>
#include <filesystem>
#include <string_view>

namespace qz::tools::scenario {
namespace {

constexpr std::string_view replacement = "\xEF\xBF\xBD";

/// Returns `text` as UTF-8 that XML allows. Logged text may hold anything, even lone surrogates.
std::string allowed(const std::string& text) {
  // The JSON library replaces bytes that are not UTF-8; parsing undoes its escapes.
  const auto valid = Json::parse(Json(text).dump(-1, ' ', false, Json::error_handler_t::replace))
                         .get<std::string>();
  std::string result;
  for (std::size_t i = 0; i < valid.size(); ++i) {
    const auto c = static_cast<unsigned char>(valid[i]);
    const auto three = std::string_view(valid).substr(i, 3);
    if (c < 0x20 && c != '\t' && c != '\n' && c != '\r') {
      result += replacement;
    } else if (three == "\xEF\xBF\xBE" || three == "\xEF\xBF\xBF") {
      result += replacement;  // U+FFFE and U+FFFF
      i += 2;
    } else {
      result += valid[i];
    }
  }
  return result;
}

std::string escaped(const std::string& text) {
  std::string result;
  for (const char c : allowed(text)) {
    switch (c) {
      case '&':
        result += "&amp;";
        break;
      case '<':
        result += "&lt;";
        break;
      case '>':
        result += "&gt;";
        break;
      case '"':
        result += "&quot;";
        break;
      // Unescaped, these would be read as blanks in an attribute.
      case '\n':
        result += "&#10;";
        break;
      case '\r':
        result += "&#13;";
        break;
      case '\t':
        result += "&#9;";
        break;
      default:
        result += c;
    }
  }
  return result;
}

std::string attribute(std::string_view name, const std::string& value) {
  return " " + std::string(name) + "=\"" + escaped(value) + "\"";
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
         escaped(where + report.problem + "\n" + report.statement) +
         "</failure>\n    </testcase>\n";
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
    xml += "  <testsuite" + attribute("name", first->file) + totals(first, last) + ">\n";
    for (; first != last; ++first) xml += testCase(*first);
    xml += "  </testsuite>\n";
  }
  return xml + "</testsuites>\n";
}

}  // namespace qz::tools::scenario
