// SPDX-License-Identifier: MIT
// The report as one JSON object.
#include <nlohmann/json.hpp>

#include <ostream>

#include "tools/check/report.hpp"

namespace qz::tools::check {
namespace {

using Json = nlohmann::ordered_json;

Json jsonOf(const Step& step) {
  if (const auto* start = std::get_if<StartMove>(&step)) return {{"start", start->key}};
  if (const auto* wait = std::get_if<WaitMove>(&step)) return {{"wait", wait->seconds}};
  const auto& press = std::get<PressMove>(step);
  Json json = {{"press", press.tag}};
  if (press.isShadowed) json["index"] = press.control;
  return json;
}

Json jsonOf(const Path& path) {
  Json json = Json::array();
  for (const Step& step : path) json.push_back(jsonOf(step));
  return json;
}

Json jsonOf(const Finding& finding, const InputFile& file) {
  Json json = {
      {"code", finding.code}, {"severity", nameOf(finding.severity)}, {"message", finding.message}};
  if (finding.list) json["list"] = *finding.list;
  if (finding.element) json["element"] = *finding.element;
  if (finding.elsewhere) {
    json["file"] = finding.elsewhere->path;
    json["line"] = finding.elsewhere->line;
  } else if (const auto position = positionOf(finding, file)) {
    if (const auto& path = pathOf(finding, file); path != file.path()) json["file"] = path;
    json["line"] = position->line;
    json["column"] = position->column;
  }
  if (finding.tag) json["tag"] = *finding.tag;
  if (!finding.path.empty()) json["path"] = jsonOf(finding.path);
  if (!finding.otherPath.empty()) json["otherPath"] = jsonOf(finding.otherPath);
  if (finding.places > 0) json["places"] = finding.places;
  return json;
}

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
