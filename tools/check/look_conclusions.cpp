// SPDX-License-Identifier: MIT
#include "tools/check/look_conclusions.hpp"

#include <algorithm>
#include <cmath>
#include <optional>
#include <set>
#include <sstream>
#include <utility>

#include "tools/check/look_differences.hpp"
#include "tools/check/look_words.hpp"
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
                                if (canDiffer) {
                                  comparison.see(place, lastList, arrival.look, occasion);
                                }
                                if (canReplace) times.see(occasion, arrival, place);
                              });
    for (const LookDifference& difference : comparison.differences()) add(difference);
    for (const BriefText& text : times.briefTexts()) add(text);
  }

  void add(const LookDifference& difference) {
    const Tag tag = ownTag(difference.control);
    Finding finding = findingOf("looks-differ",
                                (setting_.plan.names.isEmpty() ? "after this list " : "here ") +
                                    nameOf(difference.control) + " shows " + difference.words +
                                    ", depending on how the user came here",
                                "let this list set what the control shows");
    finding.tag = tag;
    finding.path = exploration_.path(difference.second);
    finding.otherPath = exploration_.path(difference.first);
    add(std::move(finding), difference.list, difference.places);
  }

  void add(const BriefText& text) {
    Finding finding =
        findingOf("too-brief",
                  std::string("the ") +
                      (setting_.plan.names.isEmpty() ? "timer that this command starts" : "wait") +
                      " replaces the text " + quote(text.text) + " after " + inSeconds(text.shown) +
                      "; reading it takes " + inSeconds(text.needed),
                  "wait longer, or let the user press a button");
    finding.tag = ownTag(text.control);
    finding.path = text.path;
    addForElement(std::move(finding), text.element, text.places);
  }

  /// What an end leaves behind, one finding for each control and each list that ends.
  void ends() {
    if (setting_.plan.description) return;  // the engine's own window has no control of the host
    for (std::uint32_t number = 0; number < exploration_.visits().size(); ++number) {
      const Visit& visit = exploration_.visits()[number];
      if (!exploration_.format().isOver(exploration_.place(visit.place))) continue;
      for (std::size_t control = 0; control < setting_.ownTags.size(); ++control) {
        tagLeft(number, control);
        leftBehind(number, control);
      }
    }
  }

  void tagLeft(std::uint32_t number, std::size_t control) {
    const Visit& visit = exploration_.visits()[number];
    const Tag tag = exploration_.format().control(exploration_.place(visit.place), control).tag;
    const auto tagger = exploration_.taggerAt(visit, control);
    if (tag == ownTag(control) || !tagsLeft_.emplace(tagger, control).second) return;
    const bool isCut = tag == restoredTag(ownTag(control));
    Finding finding = findingOf(
        "tag-left",
        "after the end " + nameOf(control) + (isCut ? " has the tag " : " keeps the tag ") +
            std::to_string(tag) + ", so the host and the next walk-through do not find it",
        isCut ? "the end restores tags as 32-bit numbers; give the host's control a smaller tag"
              : "give the control the tag " + std::to_string(ownTag(control)) +
                    " again before the end");
    finding.tag = ownTag(control);
    finding.path = exploration_.path(number);
    if (tagger) {
      addForElement(std::move(finding), *tagger, 1);
    } else {
      add(std::move(finding), visit.lastList, 1);
    }
  }

  void leftBehind(std::uint32_t number, std::size_t control) {
    const Visit& visit = exploration_.visits()[number];
    const std::string changes = changesAt(visit, control);
    if (changes.empty() || !leftBehind_.emplace(visit.lastList, control).second) return;
    Finding finding =
        findingOf("left-behind", "the end leaves " + nameOf(control) + " " + changes,
                  "undo the change before TERMINATE_PARSER, if the host goes on using the control");
    finding.tag = ownTag(control);
    finding.path = exploration_.path(number);
    add(std::move(finding), visit.lastList, 1);
  }

  /// Returns how a control differs from what the host had, such as "hidden, with the text “A”
  /// instead of no text"; empty if it does not.
  std::string changesAt(const Visit& visit, std::size_t control) const {
    const auto state = exploration_.format().control(exploration_.place(visit.place), control);
    const SavedView& before = setting_.before[control];
    std::string changes;
    const auto note = [&](const std::string& change) {
      changes += (changes.empty() ? "" : ", ") + change;
    };
    if (state.hidden != before.hidden) note(state.hidden ? "hidden" : "shown");
    if (state.enabled != before.enabled) note(state.enabled ? "enabled" : "disabled");
    if (!looksElse(visit, control)) return changes;
    const LookValue value = looks_.parts(visit.look)[control];
    for (const LookWords& words : wordsFor(before, looks_.look(value).view)) {
      note("with " + words.instead);
    }
    return changes;
  }

  std::string nameOf(std::size_t control) const {
    return "the control " + setting_.plan.names.controlWords(ownTag(control));
  }

  bool looksElse(const Visit& visit, std::size_t part) const {
    const LookValue value = looks_.parts(visit.look)[part];
    const bool hasUsersState = looks_.look(value).hasUsersState;
    return value != looks_.valueOf({setting_.before[part], hasUsersState});
  }

  void addForElement(Finding finding, std::size_t number, std::size_t places) {
    const auto [list, element] = setting_.script.placeOf(number);
    finding.element = element;
    add(std::move(finding), static_cast<std::uint32_t>(list), places);
    findings_.back().where = setting_.script.lists()[list].elements[element].value;
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
  std::set<std::pair<std::optional<std::uint32_t>, std::size_t>> tagsLeft_;  // tagger, control
  std::set<std::pair<std::uint32_t, std::size_t>> leftBehind_;               // list, control
  std::vector<Finding> findings_;
};

}  // namespace

std::vector<Finding> concludeFromLooks(Exploration& exploration, const LookOptions& options) {
  return LookConclusions(exploration, options).findings();
}

}  // namespace qz::tools::check
