// SPDX-License-Identifier: MIT
// The report as one JSON object.
#include <nlohmann/json.hpp>

#include <ostream>

#include "tools/check/finding_json.hpp"

namespace qz::tools::check {
namespace {

using Json = nlohmann::ordered_json;

Json jsonOf(const Report& report) {
  const Explored& explored = report.verdict.explored;
  Json findings = Json::array();
  for (const Finding& finding : report.verdict.findings) {
    findings.push_back(jsonOf(finding, report.file));
  }
  Json json = {{"script", report.verdict.path},
               {"explored",
                {{"places", explored.places},
                 {"presses", explored.presses},
                 {"waits", explored.waits},
                 {"complete", explored.complete}}}};
  const ExpectationCounts& expected = report.verdict.expected;
  if (expected.hold + expected.fail + expected.open > 0) {
    json["expectations"] = {
        {"hold", expected.hold}, {"fail", expected.fail}, {"open", expected.open}};
  }
  json["findings"] = std::move(findings);
  return json;
}

Json jsonOf(const Unchecked& unchecked) {
  return {{"script", unchecked.script}, {"message", unchecked.message}};
}

}  // namespace

void writeJson(const RunReport& run, bool, std::ostream& out) {
  Json scripts = Json::array();
  for (const Report& report : run.scripts) scripts.push_back(jsonOf(report));
  Json unchecked = Json::array();
  for (const Unchecked& each : run.unchecked) unchecked.push_back(jsonOf(each));
  const Json json = {
      {"version", 1}, {"scripts", std::move(scripts)}, {"unchecked", std::move(unchecked)}};
  out << json.dump(2, ' ', false, Json::error_handler_t::replace) << '\n';
}

}  // namespace qz::tools::check
