// SPDX-License-Identifier: MIT
// What the check and the second opinion say of one script, in the same words.
#pragma once

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <memory>
#include <optional>
#include <set>
#include <sstream>
#include <string>
#include <vector>

#include "tests/check/naive_explorer.hpp"
#include "tests/check/staged_scripts.hpp"
#include "tools/check/conclusions.hpp"
#include "tools/check/look_conclusions.hpp"
#include "tools/check/reading.hpp"
#include "tools/check/self_check.hpp"
#include "tools/walkthrough/parse_number.hpp"

namespace qz::tools::check::opinions {

using Findings = std::vector<naive::Finding>;

/// Returns the number in an environment variable; absent if the variable is not set.
inline std::optional<std::uint64_t> numberInEnvironment(const char* name) {
  const char* const text = std::getenv(name);
  return text ? std::optional<std::uint64_t>(std::strtoull(text, nullptr, 10)) : std::nullopt;
}

/// Returns the key with the smallest tag; empty if no press and no timer finds any list.
inline std::string startKeyOf(const Script& script) {
  const ScriptList* smallest = nullptr;
  for (const ScriptList& list : script.lists()) {
    if (list.tag && (!smallest || *list.tag < *smallest->tag)) smallest = &list;
  }
  return smallest ? smallest->key : "";
}

/// Sorts the findings and keeps one of each cause, with the shortest path: several controls may
/// have had the same tag before the start.
inline void keepCauses(Findings& findings) {
  std::sort(findings.begin(), findings.end());
  const auto sameCause = [](naive::Finding one, const naive::Finding& other) {
    one.pathLength = other.pathLength;
    return one == other;
  };
  findings.erase(std::unique(findings.begin(), findings.end(), sameCause), findings.end());
}

inline Findings inTheSameWords(const std::vector<Finding>& found) {
  Findings findings;
  for (const Finding& each : found) {
    findings.push_back(
        {each.code, each.list.value_or(""), each.element, each.tag, each.path.size()});
  }
  keepCauses(findings);
  return findings;
}

/// A script that was explored by the check.
class CheckedScript {
 public:
  CheckedScript(const naive::StagedScript& staged, std::size_t placeLimit)
      : script_(staged.script),
        plan_(planOf(staged)),
        setting_(settingOf(script_, plan_, staged.resources)),
        explored_(
            explore(setting_, {startKeyOf(script_)}, {.places = placeLimit, .seconds = {}}, 1, {})),
        exploration_(*explored_) {}

  const Exploration& exploration() const { return exploration_; }
  std::string startKey() const { return startKeyOf(script_); }

  /// Returns every place as the second opinion writes it.
  std::set<std::string> places() const {
    std::set<std::string> places;
    for (std::uint32_t i = 0; i < exploration_.places(); ++i) places.insert(placeText(i));
    return places;
  }

  /// Returns the findings that are read off the script.
  std::vector<Finding> readFindings() const {
    drivers::MemoryDriver driver;
    driver.setResourcePath(setting_.resources);
    return readScript(script_, driver.toolkit());
  }
  /// Returns the findings that need exploring.
  std::vector<Finding> exploredFindings() {
    auto found = conclude(exploration_, readFindings(), false, 1);
    auto looks = concludeFromLooks(exploration_, {});
    std::move(looks.begin(), looks.end(), std::back_inserter(found));
    return found;
  }

 private:
  static walkthrough::StagePlan planOf(const naive::StagedScript& staged) {
    walkthrough::StagePlan plan;
    plan.host = staged.host;
    return plan;
  }

  std::string controlText(std::uint32_t place, std::size_t control) const {
    const ControlState state = exploration_.format().control(exploration_.place(place), control);
    return std::string(drivers::rowOf(setting_.kinds[control]).name) + ":" +
           std::to_string(state.tag) + (state.hidden ? ":hidden" : ":shown") +
           (state.enabled ? ":enabled;" : ":disabled;");
  }

  std::string placeText(std::uint32_t place) const {
    std::string text;
    for (std::size_t i = 0; i < exploration_.format().controls(); ++i) {
      text += controlText(place, i);
    }
    const bool isOver = exploration_.format().isOver(exploration_.place(place));
    text += isOver ? "window:gone:free;timers:" : "window:shown:free;timers:";
    const char* separator = "";
    for (const PendingTimer& timer : exploration_.timers(place)) {
      char seconds[64];
      std::snprintf(seconds, sizeof seconds, "%.6f", timer.seconds);
      text += separator + timer.key + "@" + seconds;
      separator = ",";
    }
    return text + (isOver ? ";script:no;ended:yes" : ";script:yes;ended:no");
  }

  Script script_;
  walkthrough::StagePlan plan_;
  Setting setting_;
  std::unique_ptr<Exploration> explored_;
  Exploration& exploration_;
};

/// Returns the findings of the second opinion that the check reports as well. The check reports one
/// cause once: it does not say that a list with an odd key never runs, and not that an element
/// raises which always has the wrong target.
inline Findings comparable(const Findings& theirs) {
  Findings findings = theirs;
  const auto isWrongTarget = [&](const naive::Finding& finding) {
    return std::any_of(theirs.begin(), theirs.end(), [&](const naive::Finding& each) {
      return each.code == "wrong-target" && each.list == finding.list &&
             each.element == finding.element;
    });
  };
  const auto hasOddKey = [](const naive::Finding& finding) {
    const auto tag = walkthrough::parseNumber<toolkit::Tag>(finding.list);
    return !tag || std::to_string(*tag) != finding.list;
  };
  std::erase_if(findings, [&](const naive::Finding& finding) {
    if (finding.code == "never-runs") return hasOddKey(finding);
    return finding.code == "raises" && isWrongTarget(finding);
  });
  keepCauses(findings);
  return findings;
}

inline std::string wordsOf(const Findings& findings) {
  std::ostringstream words;
  for (const naive::Finding& finding : findings) {
    words << "  " << finding.code << ", list " << finding.list << ", element "
          << (finding.element ? std::to_string(*finding.element) : "-") << ", tag "
          << (finding.tag ? std::to_string(*finding.tag) : "-") << ": " << finding.pathLength
          << " moves\n";
  }
  return words.str();
}

struct BothOpinions {
  CheckedScript checked;
  Findings explored;  // the check's findings that need exploring
  Findings all;       // and with those that are read off the script
  naive::Exploration theirs;
  Findings others;  // those of the second opinion that the check reports as well

  /// Explores a script of at most `mostPlaces` places; with more, `theirs` is not complete.
  BothOpinions(const naive::StagedScript& staged, std::size_t mostPlaces)
      : checked(staged, mostPlaces + 1),  // at its limit an exploration is not complete
        explored(inTheSameWords(checked.exploredFindings())),
        all(inTheSameWords(checked.readFindings())),
        theirs(naive::explore(staged.script, staged.host, {checked.startKey()}, mostPlaces,
                              staged.resources)),
        others(comparable(theirs.findings)) {
    all.insert(all.end(), explored.begin(), explored.end());
  }

  bool agree() const {
    return selfCheck(checked.exploration()) == std::nullopt && checked.places() == theirs.places &&
           checked.exploration().presses() == theirs.presses &&
           checked.exploration().waits() == theirs.waits && explored == others;
  }
  std::string words() const {
    const auto& exploration = checked.exploration();
    return "check: " + std::to_string(exploration.places()) + " places, " +
           std::to_string(exploration.presses()) + " presses, " +
           std::to_string(exploration.waits()) + " waits; " +
           selfCheck(exploration).value_or("self-check passed") + "\n" + wordsOf(explored) +
           "second opinion: " + std::to_string(theirs.places.size()) + " places, " +
           std::to_string(theirs.presses) + " presses, " + std::to_string(theirs.waits) +
           " waits\n" + wordsOf(others);
  }
};

}  // namespace qz::tools::check::opinions
