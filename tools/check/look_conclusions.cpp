// SPDX-License-Identifier: MIT
#include "tools/check/look_conclusions.hpp"

#include <algorithm>
#include <cmath>
#include <set>
#include <sstream>

#include "tools/check/look_differences.hpp"
#include "tools/check/reading_times.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::check {
namespace {

/// Returns a time in seconds with at most one digit behind the point.
std::string inSeconds(double seconds) {
  std::ostringstream text;
  text << std::round(seconds * 10) / 10 << " s";
  return text.str();
}

class LookConclusions {
 public:
  LookConclusions(Exploration& exploration, const LookOptions& options)
      : exploration_(exploration),
        setting_(exploration.setting()),
        looks_(exploration.looks()),
        options_(options) {}

  std::vector<Finding> findings() {
    differencesAndTimes();
    ends();
    return std::move(findings_);
  }

 private:
  Tag ownTag(std::size_t part) const { return setting_.ownTags[part]; }

  // The two need every move once more, so they share the work.
  void differencesAndTimes() {
    const bool canDiffer = exploration_.hasSeveralLooks();
    const bool canReplace = exploration_.waits() > 0;
    if (!canDiffer && !canReplace) return;
    LookComparison comparison(exploration_);
    ReadingTimes times(exploration_, options_.wordsPerMinute);
    exploration_.makeAllMoves(options_.threads,
                              [&](const Occasion& occasion, const Arrival& arrival,
                                  std::uint32_t lastList, std::uint32_t place) {
                                if (canDiffer)
                                  comparison.see(place, lastList, arrival.look, occasion);
                                if (canReplace) times.see(occasion, arrival, place);
                              });
    for (const LookDifference& difference : comparison.differences()) add(difference);
    for (const BriefText& text : times.briefTexts()) add(text);
  }

  void add(const LookDifference& difference) {
    const Tag tag = ownTag(difference.control);
    Finding finding =
        findingOf("looks-differ",
                  "after this list the control with the tag " + std::to_string(tag) +
                      " shows one thing or another, depending on how the user came here",
                  "let the list set everything that it shows");
    finding.tag = tag;
    finding.path = exploration_.path(difference.second);
    finding.otherPath = exploration_.path(difference.first);
    add(std::move(finding), difference.list, difference.places);
  }

  void add(const BriefText& text) {
    Finding finding = findingOf("too-brief",
                                "the timer that this command starts replaces the text " +
                                    quote(text.text) + " after " + inSeconds(text.shown) +
                                    "; reading it takes " + inSeconds(text.needed),
                                "wait longer, or let the user press a button");
    const auto [list, element] = setting_.script.placeOf(text.element);
    finding.element = element;
    finding.tag = ownTag(text.control);
    finding.path = text.path;
    add(std::move(finding), static_cast<std::uint32_t>(list), text.places);
    findings_.back().where = setting_.script.lists()[list].elements[element].value;
  }

  /// What an end leaves behind, one finding for each list that ends and each control.
  void ends() {
    std::set<std::tuple<std::string, std::uint32_t, std::size_t>> reported;
    for (std::uint32_t number = 0; number < exploration_.visits().size(); ++number) {
      const Visit& visit = exploration_.visits()[number];
      const std::uint8_t* const place = exploration_.place(visit.place);
      if (!exploration_.format().isOver(place)) continue;
      for (std::size_t part = 0; part < setting_.ownTags.size(); ++part) {
        for (Finding& finding : leftOf(visit, part)) {
          if (!reported.insert({finding.code, visit.lastList, part}).second) continue;
          finding.tag = ownTag(part);
          finding.path = exploration_.path(number);
          add(std::move(finding), visit.lastList, 1);
        }
      }
    }
  }

  std::vector<Finding> leftOf(const Visit& visit, std::size_t part) const {
    std::vector<Finding> found;
    const ControlState state = exploration_.format().control(exploration_.place(visit.place), part);
    const SavedView& before = setting_.before[part];
    const std::string control = "the control with the tag " + std::to_string(ownTag(part));
    if (state.tag != ownTag(part)) {
      found.push_back(findingOf(
          "tag-left", "after the end " + control + " has the tag " + std::to_string(state.tag)));
    }
    std::string what;
    if (state.hidden != before.hidden) what = state.hidden ? "hidden" : "shown";
    if (state.enabled != before.enabled) {
      what += std::string(what.empty() ? "" : ", ") + (state.enabled ? "enabled" : "disabled");
    }
    if (looksElse(visit, part))
      what += std::string(what.empty() ? "" : ", ") + "changed in its look";
    if (!what.empty()) {
      found.push_back(findingOf("left-behind", "the end leaves " + control + " " + what));
    }
    return found;
  }

  bool looksElse(const Visit& visit, std::size_t part) const {
    const LookValue value = looks_.parts(visit.look)[part];
    const bool hasUsersState = looks_.look(value).hasUsersState;
    return value != looks_.valueOf({setting_.before[part], hasUsersState});
  }

  void add(Finding finding, std::uint32_t list, std::size_t places) {
    if (list != noList) {
      const ScriptList& cause = setting_.script.lists()[list];
      finding.list = cause.key;
      finding.where = cause.keyValue;
    }
    finding.places = places;
    findings_.push_back(std::move(finding));
  }

  Exploration& exploration_;
  const Setting& setting_;
  Looks& looks_;
  const LookOptions& options_;
  std::vector<Finding> findings_;
};

}  // namespace

std::vector<Finding> concludeFromLooks(Exploration& exploration, const LookOptions& options) {
  return LookConclusions(exploration, options).findings();
}

}  // namespace qz::tools::check
