// SPDX-License-Identifier: MIT
// The report as one JSON object.
#include <nlohmann/json.hpp>

#include <ostream>

#include "tools/check/finding_json.hpp"
#include "tools/diff/report.hpp"

namespace qz::tools::diff {
namespace {

using Json = nlohmann::ordered_json;

constexpr Both<const char*> sideNames{"old", "new"};

class JsonReport {
 public:
  explicit JsonReport(const Report& report) : report_(report) {}

  Json json() const {
    Json behavior = Json::array();
    Json words = Json::array();
    for (const Change& change : report_.diff.changes) {
      (change.isWords() ? words : behavior).push_back(jsonOf(change));
    }
    return {{"version", 1},
            {"old", jsonOf(Side::before)},
            {"new", jsonOf(Side::after)},
            {"same", report_.diff.changes.empty()},
            {"complete", report_.diff.isComplete},
            {"behavior", std::move(behavior)},
            {"words", std::move(words)},
            {"findings", {{"went", findings(Side::before)}, {"came", findings(Side::after)}}}};
  }

 private:
  Json jsonOf(Side side) const {
    const auto& explored = report_.diff.explored[side].verdict.explored;
    return {{"script", report_.name[side]},
            {"explored",
             {{"places", explored.places},
              {"presses", explored.presses},
              {"waits", explored.waits},
              {"complete", explored.complete}}}};
  }

  Json jsonOf(const Change& change) const {
    Json json = {{"kind", nameOf(change.kind)}};
    const bool isStep =
        change.kind == Change::Kind::newStep || change.kind == Change::Kind::goneStep;
    if (change.kind == Change::Kind::look) {
      json.update(jsonOf(change.controls.front()));
    } else if (change.kind == Change::Kind::wait) {
      json.update(seconds(change.seconds));
    } else if (change.kind == Change::Kind::move) {
      addMove(change, json);
    }
    if (!change.isStart) json["step"] = isStep ? Json(stepOfOne(change)) : names(change.step);
    json["path"] = paths(change.path);
    json["steps"] = change.steps;
    return json;
  }

  static std::string stepOfOne(const Change& change) {
    return change.step.before.words() + change.step.after.words();  // one is empty
  }

  void addMove(const Change& change, Json& json) const {
    json["move"] = change.isStart ? "start" : change.pressed ? "press" : "wait";
    if (change.pressed) json["control"] = control(*change.pressed);
    json["leadsTo"] = names(change.target);
    json["differs"] = Json::array();
    for (const ControlChange& each : change.controls) json["differs"].push_back(jsonOf(each));
  }

  Json jsonOf(const ControlChange& change) const {
    Json json = Json::object();
    if (change.control) json["control"] = control(*change.control);
    json["property"] = change.property.property;
    json.update(values(change.property.values));
    return json;
  }

  Json control(std::size_t joint) const {
    const ControlFacts facts = factsOf(report_.diff, joint);
    Json json = {{"kind", drivers::rowOf(facts.kind).name}, {"tag", facts.tag}};
    if (!facts.name.empty()) json["name"] = facts.name;
    json["index"] = joint;
    return json;
  }

  static Json values(const Both<std::string>& values) {
    Json json = Json::object();
    for (const Side side : bothSides) json[sideNames[side]] = values[side];
    return json;
  }

  static Json names(const Both<StepName>& names) {
    return values({names.before.words(), names.after.words()});
  }

  static Json seconds(const Both<std::optional<double>>& seconds) {
    Json json = Json::object();
    for (const Side side : bothSides) {
      json[sideNames[side]] = seconds[side] ? Json(*seconds[side]) : Json();
    }
    return json;
  }

  static Json paths(const Both<check::Path>& paths) {
    Json json = Json::object();
    for (const Side side : bothSides) {
      if (!paths[side].empty()) json[sideNames[side]] = check::jsonOf(paths[side]);
    }
    return json;
  }

  Json findings(Side side) const {
    Json json = Json::array();
    for (const auto& finding : report_.diff.findings[side]) {
      json.push_back(check::jsonOf(finding, report_.subjects[side].file));
    }
    return json;
  }

  const Report& report_;
};

}  // namespace

void writeJson(const Report& report, bool, std::ostream& out) {
  out << JsonReport(report).json().dump(2, ' ', false, Json::error_handler_t::replace) << '\n';
}

}  // namespace qz::tools::diff
