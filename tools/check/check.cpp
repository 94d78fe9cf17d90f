// SPDX-License-Identifier: MIT
#include "tools/check/check.hpp"

#include <algorithm>
#include <filesystem>
#include <set>
#include <tuple>

#include "engine/tag_key.hpp"
#include "tools/check/conclusions.hpp"
#include "tools/check/look_conclusions.hpp"
#include "tools/check/reading.hpp"
#include "tools/check/replay.hpp"
#include "tools/check/self_check.hpp"
#include "tools/check/source_words.hpp"
#include "tools/support/drivers.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::check {
namespace {

[[noreturn]] void wrongStartKey(const InputFile& file, const Script& script,
                                const std::string& key) {
  const std::string problem = "no list under the start key " + quote(key) + "; ";
  if (script.lists().empty()) file.fail(file.root(), problem + "the script has no lists");
  std::vector<std::string> keys;
  for (const ScriptList& list : script.lists()) keys.push_back(list.key);
  throw Failure(ExitStatus::badInput,
                file.path() + ": " + problem + "expected one of " + enumerate(keys));
}

constexpr std::size_t longestShownPath = 100;  // moves

/// Returns the path of a file beside the script, if there is one.
std::optional<std::string> pathBeside(const InputFile& file, const char* name) {
  auto path = std::filesystem::path(file.path()).replace_filename(name);
  return std::filesystem::exists(path) ? std::optional(path.string()) : std::nullopt;
}

/// Returns the allowances of the options, and of the file beside the script.
std::vector<Allowance> allowancesFor(const InputFile& file, const CheckOptions& options) {
  std::vector<Allowance> allowances = options.allowances;
  if (const auto path = pathBeside(file, "check.allow")) {
    const auto more = readAllowances(*path);
    allowances.insert(allowances.end(), more.begin(), more.end());
  }
  return allowances;
}

std::vector<Expectation> expectationsFor(const InputFile& file, const Script& script,
                                         const CheckOptions& options) {
  const auto path = options.expectations ? options.expectations : pathBeside(file, "check.expect");
  return path ? readExpectations(*path, script, options.stage.names) : std::vector<Expectation>();
}

/// Throws a Failure for a tag that no control ever has: such an expectation says nothing.
void requireTags(const std::vector<Expectation>& expectations, const Setting& setting) {
  std::set<Tag> tags(setting.ownTags.begin(), setting.ownTags.end());
  const auto given = setting.script.newTags();
  tags.insert(given.begin(), given.end());
  const auto require = [&](const Condition& condition, const Expectation& expectation) {
    const bool isTag = isAboutControl(condition) && condition.name.empty();
    if (!isTag || tags.contains(condition.tag)) return;
    throw Failure(ExitStatus::badInput, expectation.place.text(condition.column) +
                                            ": no control ever has the tag " +
                                            std::to_string(condition.tag));
  };
  for (const Expectation& each : expectations) {
    require(each.condition, each);
    if (each.consequence) require(*each.consequence, each);
  }
}

void watchLists(const Condition& condition, Setting& setting) {
  if (condition.kind != Condition::Kind::listRan) return;
  setting.watchedLists.resize(setting.script.lists().size());
  for (const std::string& key : condition.keys) {
    setting.watchedLists[*setting.script.listUnder(key)] = true;
  }
}

/// Lets the exploration keep what the expectations need.
void watchFor(const std::vector<Expectation>& expectations, Setting& setting) {
  setting.wholeLooks = compareLooks(expectations);
  for (const Expectation& expectation : expectations) {
    watchLists(expectation.condition, setting);
    if (expectation.consequence) watchLists(*expectation.consequence, setting);
  }
}

std::vector<Finding> checkExpectations(Exploration& exploration,
                                       const std::vector<Expectation>& expectations,
                                       unsigned threads, ExpectationCounts& counts) {
  if (expectations.empty()) return {};
  ExpectationCheck check(exploration, expectations);
  exploration.makeAllMoves(threads,
                           [&](const Occasion& occasion, const Arrival& arrival, std::uint32_t,
                               std::uint32_t place) { check.see(occasion, arrival, place); });
  auto findings = check.findings();
  counts = check.counts();
  return findings;
}

Explored exploredBy(const Exploration& exploration) {
  return {.places = exploration.places(),
          .presses = exploration.presses(),
          .waits = exploration.waits(),
          .complete = exploration.isComplete(),
          .stop = exploration.stop(),
          .frontier = exploration.places() - exploration.expandedPlaces()};
}

void append(std::vector<Finding>& findings, std::vector<Finding> more) {
  std::move(more.begin(), more.end(), std::back_inserter(findings));
}

/// Sorts by place in the script; what belongs to no place comes last.
void sortByPlace(std::vector<Finding>& findings, const InputFile& file) {
  const auto placeOf = [&](const Finding& finding) {
    using Place = std::tuple<bool, std::string_view, std::size_t, std::size_t>;
    const auto position = finding.where ? file.positionOf(finding.where) : std::nullopt;
    if (!position) return Place(true, {}, 0, 0);
    const std::string& path = file.pathOf(finding.where);
    const std::string_view included = path == file.path() ? std::string_view() : path;
    if (const auto* text = std::get_if<toolkit::TextPosition>(&*position)) {
      return Place(false, included, text->line, text->column);
    }
    return Place(false, included, std::get<toolkit::BytePosition>(*position).offset, 0);
  };
  std::stable_sort(findings.begin(), findings.end(), [&](const Finding& a, const Finding& b) {
    const auto one = placeOf(a);
    const auto other = placeOf(b);
    if (one != other) return one < other;
    if (a.severity != b.severity) return a.severity > b.severity;
    return a.tag < b.tag;
  });
}

/// Adds what each move of the paths changes. Findings at one place have one path, which is played
/// once.
void playPaths(std::vector<Finding>& findings, const Setting& setting) {
  const Finding* before = nullptr;
  for (Finding& finding : findings) {
    if (finding.path.empty() || finding.path.size() > longestShownPath) continue;
    finding.played =
        before && before->path == finding.path ? before->played : playPath(setting, finding.path);
    before = &finding;
  }
}

}  // namespace

std::vector<std::string> startKeysOf(const InputFile& file, const Script& script,
                                     const CheckOptions& options) {
  for (const std::string& key : options.startKeys) {
    if (!script.listUnder(key)) wrongStartKey(file, script, key);
  }
  if (!options.startKeys.empty()) return options.startKeys;
  const auto smallest = smallestTagKey(*script.dictionary());
  return smallest ? std::vector{*smallest} : std::vector<std::string>();
}

std::string resourcesFor(const InputFile& file, const CheckOptions& options) {
  return options.resources.value_or(std::filesystem::absolute(file.path()).parent_path().string());
}

Verdict checkScript(const InputFile& file, const CheckOptions& options,
                    const ExplorationHooks& hooks) {
  const Script script(file.dictionary());
  const std::string resources = resourcesFor(file, options);
  const auto expectations = expectationsFor(file, script, options);
  const auto allowances = allowancesFor(file, options);

  const auto driver = requireDriver(options.toolkit);
  driver->setResourcePath(resources);
  Verdict verdict{.path = file.path(), .isStandIn = options.standIn, .names = options.stage.names};
  verdict.findings = readScript(script, driver->toolkit());

  const auto plan = walkthrough::planStage(options.stage, script.dictionary(), file.path());
  Setting setting = settingOf(script, plan, resources);
  requireTags(expectations, setting);
  watchFor(expectations, setting);
  const auto explored =
      explore(setting, startKeysOf(file, script, options), options.limits, options.threads, hooks);
  Exploration& exploration = *explored;
  verdict.explored = exploredBy(exploration);
  if (const auto difference = selfCheck(exploration)) {
    throw Failure(ExitStatus::failed, file.path() + ": internal error: the exploration is wrong (" +
                                          *difference + "); please report this with the script");
  }
  auto& findings = verdict.findings;
  append(findings, conclude(exploration, findings, options.standIn, options.threads));
  if (!options.standIn) {
    append(findings, concludeFromLooks(exploration, {options.wordsPerMinute, options.threads}));
  }
  append(findings, checkExpectations(exploration, expectations, options.threads, verdict.expected));
  if (!verdict.names.isEmpty()) speakOfSteps(findings);
  // A code that was not looked for, or not everywhere, says nothing about its allowances.
  const bool canTell = verdict.explored.complete && !options.standIn;
  auto unneeded = canTell ? unneededAllowances(findings, allowances) : std::vector<Finding>();
  applyAllowances(findings, allowances);
  append(findings, std::move(unneeded));
  sortByPlace(findings, file);
  playPaths(findings, setting);
  return verdict;
}

}  // namespace qz::tools::check
