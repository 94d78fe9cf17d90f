// SPDX-License-Identifier: MIT
#include "tools/check/check.hpp"

#include <algorithm>
#include <filesystem>

#include "tools/check/conclusions.hpp"
#include "tools/check/look_conclusions.hpp"
#include "tools/check/reading.hpp"
#include "tools/check/replay.hpp"
#include "tools/check/self_check.hpp"
#include "tools/support/drivers.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::check {
namespace {

std::vector<std::string> startKeysOf(const Script& script, const CheckOptions& options) {
  if (!options.startKeys.empty()) {
    for (const std::string& key : options.startKeys) {
      if (!script.listUnder(key)) {
        throw Failure(ExitStatus::badInput, "--start: the script has no list " + quote(key));
      }
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

constexpr std::size_t longestShownPath = 100;  // moves

/// Returns the allowances of the options, and of the file beside the script.
std::vector<Allowance> allowancesFor(const InputFile& file, const CheckOptions& options) {
  std::vector<Allowance> allowances = options.allowances;
  const auto beside = std::filesystem::path(file.path()).replace_filename("check.allow");
  if (!std::filesystem::exists(beside)) return allowances;
  const auto more = readAllowances(beside.string());
  allowances.insert(allowances.end(), more.begin(), more.end());
  return allowances;
}

/// Sorts by place in the script; what belongs to no place comes last.
void sortByPlace(std::vector<Finding>& findings, const InputFile& file) {
  const auto placeOf = [&](const Finding& finding) {
    const auto position = finding.where ? file.positionOf(finding.where) : std::nullopt;
    if (!position) return std::pair<std::size_t, std::size_t>(-1, -1);
    if (const auto* text = std::get_if<toolkit::TextPosition>(&*position)) {
      return std::pair(text->line, text->column);
    }
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
  if (const auto difference = selfCheck(exploration)) {
    throw Failure(ExitStatus::failed, file.path() + ": internal error: the exploration is wrong (" +
                                          *difference + "); please report this with the script");
  }
  auto found = conclude(exploration, verdict.findings, options.standIn, options.threads);
  std::move(found.begin(), found.end(), std::back_inserter(verdict.findings));
  if (!options.standIn) {
    found = concludeFromLooks(exploration, {options.wordsPerMinute, options.threads});
  } else {
    found.clear();
  }
  std::move(found.begin(), found.end(), std::back_inserter(verdict.findings));
  applyAllowances(verdict.findings, allowancesFor(file, options));
  sortByPlace(verdict.findings, file);
  for (Finding& finding : verdict.findings) {
    if (finding.path.size() <= longestShownPath) finding.played = playPath(setting, finding.path);
  }
  return verdict;
}

}  // namespace qz::tools::check
