// SPDX-License-Identifier: MIT
// The report in SARIF 2.1.0, the format in which code hosts take the results of checkers.
#include <nlohmann/json.hpp>

#include <algorithm>
#include <ostream>

#include "tools/check/report.hpp"

namespace qz::tools::check {
namespace {

using Json = nlohmann::ordered_json;

// What the hosts of such reports show at most.
constexpr std::size_t mostResults = 5000;
constexpr std::size_t mostSteps = 1000;

Json messageOf(const std::string& text) { return {{"text", text}}; }

std::string percentEncoded(char c) {
  constexpr std::string_view digits = "0123456789ABCDEF";
  const auto byte = static_cast<unsigned char>(c);
  return {'%', digits[byte >> 4U], digits[byte & 0xfU]};
}

/// Returns a path as a URI reference.
std::string uriOf(const std::string& path) {
  constexpr std::string_view plain =
      "abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ0123456789-._~/";
  std::string uri;
  for (const char c : path) {
    const bool isPlain = plain.find(c) != std::string_view::npos;
    uri += isPlain ? std::string(1, c) : percentEncoded(c);
  }
  return uri;
}

/// Returns a file as a physical location.
Json physicalOf(const std::string& path) { return {{"artifactLocation", {{"uri", uriOf(path)}}}}; }

Json locationOf(const Report& report, const Finding* finding) {
  Json physical = physicalOf(finding ? pathOf(*finding, report.file) : report.verdict.path);
  const auto position = finding ? positionOf(*finding, report.file) : std::nullopt;
  if (finding && finding->elsewhere) {
    physical["region"] = {{"startLine", finding->elsewhere->line}};
  } else if (position) {
    physical["region"] = {{"startLine", position->line}, {"startColumn", position->column}};
  }
  return {{"physicalLocation", std::move(physical)}};
}

Json codeFlowOf(const Report& report, const Finding& finding) {
  Json locations = Json::array();
  const std::size_t shown = std::min(finding.path.size(), mostSteps);
  for (std::size_t i = 0; i < shown; ++i) {
    Json location = locationOf(report, nullptr);
    location["message"] = messageOf(playArguments({finding.path[i]}, report.verdict.names));
    locations.push_back({{"location", std::move(location)}});
  }
  return {{"threadFlows", Json::array({{{"locations", std::move(locations)}}})}};
}

/// Returns the message, and says if the path is too long to be shown in full.
std::string messageWithLength(const Finding& finding) {
  const std::size_t steps = finding.path.size();
  if (steps <= mostSteps) return finding.message;
  return finding.message + " (the path has " + std::to_string(steps) + " steps; the first " +
         std::to_string(mostSteps) + " are here)";
}

Json resultOf(const Report& report, const Finding& finding) {
  Json result = {{"ruleId", finding.code},
                 {"level", nameOf(finding.severity)},
                 {"message", messageOf(messageWithLength(finding))},
                 {"locations", Json::array({locationOf(report, &finding)})}};
  if (!finding.path.empty()) {
    result["codeFlows"] = Json::array({codeFlowOf(report, finding)});
  }
  return result;
}

Json rules() {
  Json rules = Json::array();
  for (const Code& code : codes()) {
    rules.push_back({{"id", code.name},
                     {"shortDescription", messageOf(std::string(code.summary))},
                     {"defaultConfiguration", {{"level", nameOf(code.severity)}}}});
  }
  return rules;
}

Json cutNotification(std::size_t total) {
  const std::string text = std::to_string(total) + " findings; the first " +
                           std::to_string(mostResults) +
                           " are in this report, because its readers show no more";
  return {{"level", "warning"}, {"message", messageOf(text)}};
}

Json uncheckedNotification(const Unchecked& unchecked) {
  return {{"level", "error"},
          {"message", messageOf(unchecked.message)},
          {"locations", Json::array({{{"physicalLocation", physicalOf(unchecked.script)}}})}};
}

/// Says how the run went; `total` is the number of findings.
Json invocationOf(const RunReport& run, std::size_t total) {
  Json invocation = {{"executionSuccessful", run.unchecked.empty()}};
  Json notifications = Json::array();
  for (const Unchecked& each : run.unchecked) notifications.push_back(uncheckedNotification(each));
  if (total > mostResults) notifications.push_back(cutNotification(total));
  if (!notifications.empty()) {
    invocation["toolExecutionNotifications"] = std::move(notifications);
  }
  return invocation;
}

}  // namespace

void writeSarif(const RunReport& run, bool, std::ostream& out) {
  Json results = Json::array();
  std::size_t total = 0;
  for (const Report& report : run.scripts) {
    for (const Finding& finding : report.verdict.findings) {
      if (++total <= mostResults) results.push_back(resultOf(report, finding));
    }
  }
  const Json only = {{"tool", {{"driver", {{"name", "qz-walkthrough check"}, {"rules", rules()}}}}},
                     {"columnKind", "unicodeCodePoints"},
                     {"invocations", Json::array({invocationOf(run, total)})},
                     {"results", std::move(results)}};
  const Json json = {
      {"$schema", "https://json.schemastore.org/sarif-2.1.0.json"},
      {"version", "2.1.0"},
      {"runs", Json::array({only})},
  };
  out << json.dump(2, ' ', false, Json::error_handler_t::replace) << '\n';
}

}  // namespace qz::tools::check
