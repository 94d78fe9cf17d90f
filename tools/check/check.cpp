// SPDX-License-Identifier: MIT
#include "tools/check/check.hpp"

#include <algorithm>
#include <filesystem>

#include "tools/check/conclusions.hpp"
#include "tools/check/look_conclusions.hpp"
#include "tools/check/reading.hpp"
#include "tools/support/drivers.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::check {
namespace {

std::vector<std::string> startKeysOf(const Script& script, const CheckOptions& options) {
  if (!options.startKeys.empty()) {
    for (const std::string& key : options.startKeys) {
      if (!script.listUnder(key))
        throw Failure(ExitStatus::badInput, "--start: the script has no list " + quote(key));
    }
    return options.startKeys;
  }
  const ScriptList* smallest = nullptr;
  for (const ScriptList& list : script.lists()) {
    if (list.tag && (!smallest || *list.tag < *smallest->tag)) smallest = &list;
  }
  if (!smallest) return {};
  return {smallest->key};
}

/// Sorts by place in the script; what belongs to no place comes last.
void sortByPlace(std::vector<Finding>& findings, const InputFile& file) {
  const auto placeOf = [&](const Finding& finding) {
    const auto position = finding.where ? file.positionOf(finding.where) : std::nullopt;
    if (!position) return std::pair<std::size_t, std::size_t>(-1, -1);
    if (const auto* text = std::get_if<toolkit::TextPosition>(&*position))
      return std::pair(text->line, text->column);
    return std::pair(std::get<toolkit::BytePosition>(*position).offset, std::size_t{0});
  };
  std::stable_sort(findings.begin(), findings.end(), [&](const Finding& a, const Finding& b) {
    const auto one = placeOf(a);
    const auto other = placeOf(b);
    if (one != other) return one < other;
    if (a.severity != b.severity) return a.severity > b.severity;
    return a.tag < b.tag;
  });
}

}  // namespace

Verdict checkScript(const InputFile& file, const CheckOptions& options, const CheckHooks& hooks) {
  const Script script(file.dictionary());
  const auto folder = std::filesystem::absolute(file.path()).parent_path().string();
  const std::string resources = options.resources.value_or(folder);

  const auto driver = requireDriver(options.toolkit);
  driver->setResourcePath(resources);
  Verdict verdict{.path = file.path(), .isStandIn = options.standIn};
  verdict.findings = readScript(script, driver->toolkit());

  const auto plan = walkthrough::planStage(options.stage, script.dictionary(), file.path());
  const Setting setting = settingOf(script, plan, resources);
  Exploration exploration(setting, startKeysOf(script, options));
  exploration.run(options.limits, options.threads, hooks.report, hooks.isCancelled);
  verdict.explored = {exploration.places(), exploration.presses(), exploration.waits(),
                      exploration.isComplete()};
  auto found = conclude(exploration, verdict.findings, options.standIn);
  std::move(found.begin(), found.end(), std::back_inserter(verdict.findings));
  found = concludeFromLooks(exploration, {options.wordsPerMinute, options.threads});
  std::move(found.begin(), found.end(), std::back_inserter(verdict.findings));
  sortByPlace(verdict.findings, file);
  return verdict;
}

}  // namespace qz::tools::check
