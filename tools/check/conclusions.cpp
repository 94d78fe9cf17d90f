// SPDX-License-Identifier: MIT
// What the facts say of elements, lists and tags; place_conclusions.cpp says what follows from the
// graph of the places.
#include "tools/check/conclusions.hpp"

#include <algorithm>
#include <map>
#include <set>

#include "tools/check/place_conclusions.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::check {
namespace {

class Conclusions {
 public:
  Conclusions(Exploration& exploration, const std::vector<Finding>& read, bool isStandIn,
              unsigned threads)
      : exploration_(exploration),
        script_(exploration.setting().script),
        facts_(exploration.facts()),
        isStandIn_(isStandIn),
        threads_(threads) {
    for (const Finding& finding : read) {
      if (finding.severity == Severity::error && finding.list && finding.element) {
        read_.emplace(*finding.list, *finding.element);
      }
      if (finding.code == "useless-delay") useless_.emplace(*finding.list, *finding.element);
    }
  }

  std::vector<Finding> findings() {
    endlessChains();
    raised();
    if (exploration_.isComplete()) neverRuns();
    flashing();
    if (exploration_.isComplete()) neverFires();
    if (!isStandIn_) {
      targets();
      sharedTags();
      buttonsWithoutList();
      lostTimers();
    }
    auto more = concludeFromPlaces(exploration_, threads_);
    std::move(more.begin(), more.end(), std::back_inserter(findings_));
    return std::move(findings_);
  }

 private:
  void endlessChains() {
    for (const auto& [subject, entry] : facts_.all(FactKind::endlessChain)) {
      addForElement(subject, entry,
                    findingOf("endless-chain",
                              "here the lists run each other without end (" + entry.detail +
                                  "), so the program crashes",
                              "take out one PROCESS_COMMANDS_FOR_ID of the loop"));
    }
  }

  void raised() {
    for (const auto& [subject, entry] : facts_.all(FactKind::elementRaised)) {
      if (wasRead(subject) || isUnsuitedAlways(subject)) continue;
      addForElement(subject, entry,
                    findingOf("raises", nameOf(subject) + " fails here: " + entry.detail +
                                            "; the list goes on with its next element"));
    }
  }

  void neverRuns() {
    const auto ran = listsThatRan();
    for (const ScriptList& list : script_.lists()) {
      if (ran.contains(list.key) || !list.tag || !toolkit::asArray(list.value)) continue;
      Finding finding = findingOf(
          "never-runs",
          "nothing runs list " + quote(list.key) + ": no press, no timer and no list leads to it",
          "delete the list, or give a control its tag");
      finding.list = list.key;
      finding.where = list.keyValue;
      findings_.push_back(std::move(finding));
    }
  }

  std::set<std::string> listsThatRan() const {
    std::set<std::string> ran;
    for (const auto& [subject, entry] : facts_.all(FactKind::listRan)) {
      ran.insert(script_.lists()[static_cast<std::size_t>(subject)].key);
    }
    return ran;
  }

  void targets() {
    for (const auto& [subject, entry] : facts_.all(FactKind::targetMissed)) missed(subject, entry);
    for (const auto& [subject, entry] : facts_.all(FactKind::targetUnsuited)) {
      if (!isUnsuitedAlways(subject) || !exploration_.isComplete()) continue;
      addForElement(subject, entry,
                    findingOf("wrong-target",
                              nameOf(subject) + " has no effect: its control is a " + entry.detail +
                                  ", and the command needs " + neededBy(subject),
                              "correct the tag"));
    }
  }

  void missed(Subject subject, const FactTable::Entry& entry) {
    const bool found = facts_.has(FactKind::targetFound, subject);
    if (!found && !exploration_.isComplete()) return;
    const auto tag = script_.element(static_cast<std::size_t>(subject)).target(ownIdOf(subject));
    const Command& command = *script_.element(static_cast<std::size_t>(subject)).command;
    const bool findsLists = command.positionOf(ParameterType::controlOrListTag).has_value();
    Finding finding =
        findingOf("no-target",
                  (found ? "in some runs " : "") + nameOf(subject) + " finds no control " +
                      (findsLists ? "and no list " : "") + "with the tag " +
                      std::to_string(tag.value_or(0)) + ", so nothing happens",
                  found ? "find out which list gave the control another tag" : "correct the tag");
    if (found) finding.severity = Severity::note;
    finding.tag = tag;
    addForElement(subject, entry, std::move(finding));
  }

  void flashing() {
    for (const auto& [subject, entry] : facts_.all(FactKind::flashRefused)) {
      if (facts_.has(FactKind::flashAccepted, subject) || !exploration_.isComplete()) continue;
      addForElement(
          subject, entry,
          findingOf("flash-decided",
                    nameOf(subject) + " is refused every time: an earlier one has decided "
                                      "whether the tag flashes",
                    "keep only the FLASH_ID that should count; ALLOW_FLASHING turns all "
                    "flashing on and off"));
    }
  }

  void neverFires() {
    for (const auto& [subject, entry] : facts_.all(FactKind::timerStarted)) {
      if (facts_.has(FactKind::timerFires, subject) ||
          !facts_.has(FactKind::timerBeaten, subject)) {
        continue;
      }
      const auto [list, element] = placeOf(subject);
      if (useless_.contains({list->key, element})) continue;
      addForElement(subject, entry,
                    findingOf("never-fires",
                              "the timer that " + nameOf(subject) +
                                  " starts never fires: another one fires or replaces it first",
                              "a press or a firing cancels all other timers; start them one after "
                              "the other"));
    }
  }

  void sharedTags() {
    for (const auto& [subject, entry] : facts_.all(FactKind::sharedTagUsed)) {
      Finding finding = findingOf("same-tag",
                                  "two controls have the tag that " + nameOf(subject) +
                                      " names; only the one that is farther back changes",
                                  "give each control its own tag");
      finding.tag = script_.element(static_cast<std::size_t>(subject)).target(ownIdOf(subject));
      addForElement(subject, entry, std::move(finding));
    }
    for (const auto& [subject, entry] : facts_.all(FactKind::sharedTagPressed)) {
      addForTag(subject, entry,
                findingOf("same-tag",
                          "the button " + names().controlWords(static_cast<Tag>(subject)) +
                              " can be pressed while another control has the same tag; commands "
                              "reach only the one that is farther back",
                          "give each control its own tag"));
    }
  }

  const walkthrough::Names& names() const { return exploration_.setting().plan.names; }

  void buttonsWithoutList() {
    for (const auto& [subject, entry] : facts_.all(FactKind::noListPressed)) {
      FactTable::Entry place = entry;
      place.isPlace = true;
      addForTag(subject, place,
                findingOf("no-list",
                          "a user can press the button " +
                              names().controlWords(static_cast<Tag>(subject)) +
                              ", but no list is under that tag: nothing happens, and the press "
                              "cancels every timer",
                          "add a list, or hide or disable the button"));
    }
  }

  void lostTimers() {
    std::map<std::pair<std::uint32_t, Tag>, Finding> found;
    for (const auto& [start, occasion] : exploration_.timerStarts()) {
      const auto [place, element] = start;
      for (const PressMove& press : pressesWithoutList(place)) {
        Path path = exploration_.path(occasion);
        path.emplace_back(press);
        Finding& finding = found[{element, press.tag}];
        ++finding.places;
        if (finding.places == 1 || path.size() < finding.path.size()) finding.path = path;
      }
    }
    for (auto& [cause, lost] : found) {
      const auto [list, element] = placeOf(cause.first);
      Finding finding = findingOf("timer-lost",
                                  "a press of the button " + names().controlWords(cause.second) +
                                      ", which has no list, cancels the timer that " +
                                      nameOf(cause.first) + " starts",
                                  "hide or disable the button while the timer runs");
      finding.list = list->key;
      finding.element = element;
      finding.where = list->elements[element].value;
      finding.tag = cause.second;
      finding.path = std::move(lost.path);
      finding.places = lost.places;
      findings_.push_back(std::move(finding));
    }
  }

  /// Returns the presses at a place that run nothing.
  std::vector<PressMove> pressesWithoutList(std::uint32_t place) const {
    std::vector<PressMove> presses;
    const auto& format = exploration_.format();
    const auto* const bytes = exploration_.place(place);
    if (format.isOver(bytes)) return presses;
    for (std::size_t i = 0; i < format.controls(); ++i) {
      const ControlState state = format.control(bytes, i);
      const bool isPressable = !state.hidden && state.enabled && isButton(i);
      if (!isPressable || script_.listOfTag(state.tag)) continue;
      presses.push_back({.tag = state.tag, .control = i});
    }
    return presses;
  }

  bool isButton(std::size_t control) const {
    return drivers::isButton(exploration_.setting().kinds[control]);
  }

  bool wasRead(Subject subject) const {
    const auto [list, element] = placeOf(subject);
    return read_.contains({list->key, element});
  }
  bool isUnsuitedAlways(Subject subject) const {
    return facts_.has(FactKind::targetUnsuited, subject) &&
           !facts_.has(FactKind::targetSuited, subject);
  }

  std::pair<const ScriptList*, std::size_t> placeOf(Subject subject) const {
    const auto [list, element] = script_.placeOf(static_cast<std::size_t>(subject));
    return {&script_.lists()[list], element};
  }

  Tag ownIdOf(Subject subject) const { return placeOf(subject).first->tag.value_or(0); }

  std::string neededBy(Subject subject) const {
    switch (script_.element(static_cast<std::size_t>(subject)).command->target) {
      case TargetKind::button:
        return "a button";
      case TargetKind::buttonWithState:
        return "a check box";
      case TargetKind::imageView:
        return "an image view";
      case TargetKind::textField:
        return "a text field";
      case TargetKind::anyControl:
        return "a button, a text field or an image view";
      case TargetKind::none:
      case TargetKind::anyView:
        break;
    }
    return "another kind of control";
  }

  std::string nameOf(Subject subject) const {
    const Element& element = script_.element(static_cast<std::size_t>(subject));
    return element.command ? element.command->name : "the element";
  }

  void addForElement(Subject subject, const FactTable::Entry& entry, Finding finding) {
    const auto [list, element] = placeOf(subject);
    finding.list = list->key;
    finding.element = element;
    finding.where = list->elements[element].value;
    if (!finding.tag) finding.tag = list->elements[element].target(list->tag.value_or(0));
    add(entry, std::move(finding));
  }
  void addForTag(Subject subject, const FactTable::Entry& entry, Finding finding) {
    finding.tag = subject;
    add(entry, std::move(finding));
  }
  void add(const FactTable::Entry& entry, Finding finding) {
    finding.path =
        entry.isPlace ? exploration_.path(entry.first.visit) : exploration_.path(entry.first);
    finding.places = std::max<std::size_t>(entry.places, 1);
    findings_.push_back(std::move(finding));
  }

  Exploration& exploration_;
  const Script& script_;
  const FactTable& facts_;
  bool isStandIn_;
  unsigned threads_;
  std::set<std::pair<std::string, std::size_t>> read_;     // what reading calls an error
  std::set<std::pair<std::string, std::size_t>> useless_;  // elements with a useless delay
  std::vector<Finding> findings_;
};

}  // namespace

std::vector<Finding> conclude(Exploration& exploration, const std::vector<Finding>& read,
                              bool isStandIn, unsigned threads) {
  return Conclusions(exploration, read, isStandIn, threads).findings();
}

}  // namespace qz::tools::check
