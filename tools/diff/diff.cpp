// SPDX-License-Identifier: MIT
#include "tools/diff/diff.hpp"

#include <utility>

#include "tools/diff/comparer.hpp"
#include "tools/diff/findings.hpp"
#include "tools/walkthrough/stand_in.hpp"

namespace qz::tools::diff {
namespace {

using toolkit::Dictionary;
using toolkit::ValueRef;

/// Returns a script with the lists of both, from which a window is made that fits both.
ValueRef<Dictionary> lists(const Both<Subject>& subjects) {
  const auto all = Dictionary::make({}, toolkit::Mutability::changeable);
  for (const Side side : bothSides) {
    const auto script = subjects[side].file.dictionary();
    for (const auto& [key, value] : script->entries()) {
      const auto known = toolkit::asArray(all->objectForKey(key->description()));
      const auto more = toolkit::asArray(value)->elements();
      std::vector<ValueRef<>> elements(known->elements().begin(), known->elements().end());
      elements.insert(elements.end(), more.begin(), more.end());
      all->setObject(toolkit::Array::make(elements, toolkit::Mutability::immutable),
                     key->description());
    }
  }
  return all;
}

comparison::Played played(const Subject& subject, const walkthrough::HostWindow& standIn) {
  const auto script = subject.file.dictionary();
  const auto& options = subject.options;
  auto plan = walkthrough::planStage(options.stage, script, subject.file.path());
  if (options.standIn) plan.host = standIn;
  return {.script = script,
          .plan = std::move(plan),
          .resources = check::resourcesFor(subject.file, options),
          .startKeys = check::startKeysOf(subject.file, check::Script(script), options)};
}

/// A window and a script, or scripts of which only one has a window, have nothing in common.
void requireSame(const Both<Subject>& subjects) {
  const auto& [before, after] = subjects;
  if (before.isWindow != after.isWindow) {
    const Subject& script = before.isWindow ? after : before;
    throw Failure(ExitStatus::badInput, script.file.path() +
                                            ": expected a window, as the other "
                                            "file is one, found a script");
  }
  if (before.options.standIn == after.options.standIn) return;
  const Subject& without = before.options.standIn ? before : after;
  throw Failure(ExitStatus::badInput,
                without.file.path() +
                    ": expected its window, as the other script has one; name it "
                    "with --window or --assets, that of the old script alone "
                    "with --old-window or --old-assets");
}

}  // namespace

ControlFacts factsOf(const Diff& diff, std::size_t joint) {
  ControlFacts facts;
  for (const Side side : bothSides) {
    const auto control = (*diff.controls)[joint][side];
    if (!control) continue;
    const std::string name = std::move(facts.name);
    facts = factsOf(diff.explored[side].behavior->exploration().setting(), *control);
    if (facts.name.empty()) facts.name = name;
  }
  return facts;
}

std::unique_ptr<Diff> compareSubjects(const Both<Subject>& subjects,
                                      const check::ExplorationHooks& hooks) {
  auto diff = std::make_unique<Diff>();
  requireSame(subjects);
  const auto standIn = subjects.before.options.standIn ? walkthrough::standInWindow(lists(subjects))
                                                       : walkthrough::HostWindow();
  Both<std::vector<check::Finding>> findings;
  for (const Side side : bothSides) {
    const Subject& subject = subjects[side];
    Explored& explored = diff->explored[side];
    explored.behavior = std::make_unique<comparison::Behavior>(played(subject, standIn),
                                                               diff->looks, subject.options.limits,
                                                               subject.options.threads, hooks);
    explored.verdict = check::checkScript(subject.file, subject.options, hooks);
    if (!subject.isWindow) findings[side] = explored.verdict.findings;
  }
  const Behaviors behaviors{diff->explored.before.behavior.get(),
                            diff->explored.after.behavior.get()};
  diff->controls = std::make_unique<JointControls>(behaviors.before->exploration().setting(),
                                                   behaviors.after->exploration().setting());
  auto found = compare(behaviors, *diff->controls, subjects.before.options.limits.places);
  diff->changes = std::move(found.changes);
  diff->isComplete = found.isComplete;
  diff->findings = findingsOfOne(findings);
  return diff;
}

}  // namespace qz::tools::diff
