// SPDX-License-Identifier: MIT
#include "tools/check/finding_json.hpp"

namespace qz::tools::check {
namespace {

using Json = nlohmann::ordered_json;

Json jsonOfStep(const Step& step) {
  if (const auto* start = std::get_if<StartMove>(&step)) return {{"start", start->key}};
  if (const auto* wait = std::get_if<WaitMove>(&step)) return {{"wait", wait->seconds}};
  const auto& press = std::get<PressMove>(step);
  Json json = {{"press", press.tag}};
  if (press.isShadowed) json["index"] = press.control;
  return json;
}

}  // namespace

Json jsonOf(const Path& path) {
  Json json = Json::array();
  for (const Step& step : path) json.push_back(jsonOfStep(step));
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

}  // namespace qz::tools::check
