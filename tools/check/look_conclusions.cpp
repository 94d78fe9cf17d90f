// SPDX-License-Identifier: MIT
#include "tools/check/look_conclusions.hpp"

#include <algorithm>
#include <cmath>
#include <map>
#include <set>
#include <sstream>

#include "tools/support/text_layout.hpp"

namespace qz::tools::check {
namespace {

constexpr double briefest = 2;  // seconds that every text needs, however short

std::size_t wordsIn(const std::string& text) {
  std::istringstream words(text);
  std::string word;
  std::size_t count = 0;
  while (words >> word) ++count;
  return count;
}

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
    lookDifferences();
    briefTexts();
    ends();
    return std::move(findings_);
  }

 private:
  Tag ownTag(std::size_t part) const { return setting_.ownTags[part]; }

  void lookDifferences() {
    for (const LookDifference& difference : exploration_.lookDifferences(options_.threads)) {
      const Tag tag = ownTag(difference.part);
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
  }

  void briefTexts() {
    std::map<std::pair<std::uint32_t, std::size_t>, Finding> byCause;
    for (const ReplacedText& text : exploration_.replacedTexts()) {
      const double shown = exploration_.timers(text.place).front().seconds;
      const double words = static_cast<double>(wordsIn(textOf(looks_.look(text.value).view)));
      const double needed = std::max(briefest, words * 60 / options_.wordsPerMinute);
      if (words == 0 || shown >= needed) continue;
      Path path = exploration_.path(text.shown);
      path.push_back(WaitMove{shown});
      auto& finding = byCause[{text.list, text.part}];
      ++finding.places;
      if (finding.places > 1 && finding.path.size() <= path.size()) continue;
      const std::size_t places = finding.places;
      finding = briefText(text, shown, needed);
      finding.places = places;
      finding.path = std::move(path);
    }
    for (auto& [cause, finding] : byCause) {
      const std::size_t places = finding.places;
      add(std::move(finding), cause.first, places);
    }
  }

  Finding briefText(const ReplacedText& text, double shown, double needed) const {
    Finding finding =
        findingOf("too-brief",
                  "a timer replaces the text " + quote(textOf(looks_.look(text.value).view)) +
                      " after " + inSeconds(shown) + "; reading it takes " + inSeconds(needed),
                  "wait longer, or let the user press a button");
    finding.tag = ownTag(text.part);
    return finding;
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
