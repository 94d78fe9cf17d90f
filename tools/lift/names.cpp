// SPDX-License-Identifier: MIT
#include "tools/lift/names.hpp"

#include <algorithm>
#include <cctype>
#include <map>
#include <optional>

#include "tools/steps/words.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::lift {
namespace {

using drivers::Caption;

constexpr std::size_t longestName = 40;     // characters
constexpr std::size_t longestHeading = 80;  // bytes

/// Returns the beginning of a text on one line, up to the end of a word.
std::string shortened(const std::string& text) {
  std::string line;
  for (const char c : text) line += static_cast<unsigned char>(c) < 0x20 ? ' ' : c;
  line = printable(line);
  const auto first = line.find_first_not_of(' ');
  if (first == std::string::npos) return "";
  line = line.substr(first, line.find_last_not_of(' ') + 1 - first);
  if (firstCharacters(line, longestName).size() == line.size()) return line;
  line = firstCharacters(line, longestName);
  const auto space = line.rfind(' ');
  return (space == std::string::npos ? line : line.substr(0, space)) + "…";
}

std::string lowerCase(std::string text) {
  for (char& c : text) c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
  return text;
}

class NameFinder {
 public:
  NameFinder(const Behavior& behavior, const Walk& walk,
             const std::vector<steps::Control>& controls)
      : behavior_(behavior), walk_(walk), controls_(controls) {}

  /// Returns what the control says at a step; empty if the user does not see it there.
  std::string textAt(StepIndex step, ControlIndex control) const {
    const auto& seen = situation(step).controls[control];
    if (!seen.isShown) return "";
    const auto& view = behavior_.looks().look(seen.look).view;
    const Caption caption = rowOf(controls_[control].kind).caption;
    if (caption == Caption::title) return view.title.string();
    return caption == Caption::text ? view.text.string() : "";
  }

  std::optional<ControlIndex> heading() const {
    std::optional<ControlIndex> best;
    std::vector<double> bestRank;
    for (ControlIndex i = 0; i < controls_.size(); ++i) {
      if (rowOf(controls_[i].kind).caption != Caption::text) continue;
      auto rank = rankOf(i);
      if (rank.empty() || (best && rank <= bestRank)) continue;
      best = i;
      bestRank = std::move(rank);
    }
    return best;
  }

  /// Returns longer names for a step: with texts that tell it from others of the same name.
  std::vector<std::string> tellingNames(StepIndex step,
                                        const std::vector<std::string>& names) const {
    std::vector<std::string> longer;
    for (ControlIndex i = 0; i < controls_.size(); ++i) {
      const std::string text = textAt(step, i);
      const bool isText = rowOf(controls_[i].kind).caption == Caption::text;
      if (!isText || text.empty() || shortened(text) == names[step]) continue;
      if (isTelling(i, step, names)) longer.push_back(names[step] + ": " + shortened(text));
    }
    return longer;
  }

  /// Returns the title that the button mostly has; empty if that changes all the time.
  std::string titleOf(ControlIndex control) const {
    const auto counts = textsOf(control);
    std::string own = controls_[control].caption.value_or("");
    if (counts.empty() || counts.contains(own)) return own;
    std::size_t all = 0;
    for (const auto& [title, count] : counts) all += count;
    const auto isRarer = [](const auto& a, const auto& b) { return a.second < b.second; };
    const auto& [title, count] = *std::max_element(counts.begin(), counts.end(), isRarer);
    return 2 * count > all ? title : "";
  }

 private:
  const comparison::Situation& situation(StepIndex step) const {
    return behavior_.situations()[walk_.steps[step].situation];
  }

  /// Whether the control says something else at an earlier step of the same name.
  bool isTelling(ControlIndex control, StepIndex step,
                 const std::vector<std::string>& names) const {
    const std::string text = textAt(step, control);
    for (StepIndex other = 0; other < step; ++other) {
      if (names[other] == names[step] && textAt(other, control) != text) return true;
    }
    return false;
  }

  /// Returns what the control says, and at how many steps.
  std::map<std::string, std::size_t> textsOf(ControlIndex control) const {
    std::map<std::string, std::size_t> counts;
    for (StepIndex step = 0; step < walk_.steps.size(); ++step) {
      ++counts[textAt(step, control)];
    }
    counts.erase("");
    return counts;
  }

  /// Of headings: they say something else at many steps, in large letters, and are short. Empty if
  /// the text field says the same at all steps.
  std::vector<double> rankOf(ControlIndex control) const {
    std::set<std::string> texts;
    double points = 0;
    double length = 0;
    for (StepIndex step = 0; step < walk_.steps.size(); ++step) {
      const std::string text = textAt(step, control);
      if (text.empty() || text.size() > longestHeading) continue;
      if (texts.insert(text).second) length += static_cast<double>(text.size());
      points = std::max(points, pointsAt(step, control));
    }
    if (texts.empty()) return {};
    const auto count = static_cast<double>(texts.size());
    const bool isTelling = 3 * texts.size() > walk_.steps.size();
    return {isTelling ? 1.0 : 0.0, points, count, -length / count};
  }

  double pointsAt(StepIndex step, ControlIndex control) const {
    const auto& view = behavior_.looks().look(situation(step).controls[control].look).view;
    const auto& runs = view.text.runs();
    const auto& font = runs.empty() ? std::nullopt : runs.front().attributes.font;
    return font ? font->size : 0;
  }

  const Behavior& behavior_;
  const Walk& walk_;
  const std::vector<steps::Control>& controls_;
};

}  // namespace

std::string NameGiver::give(const std::string& wish, const std::vector<std::string>& others) {
  if (taken_.insert(wish).second) return wish;
  for (const std::string& other : others) {
    if (taken_.insert(other).second) return other;
  }
  for (std::size_t number = 2;; ++number) {
    std::string name = wish + " " + std::to_string(number);
    if (taken_.insert(name).second) return name;
  }
}

std::vector<std::string> controlNames(const Behavior& behavior, const Walk& walk,
                                      const std::vector<steps::Control>& controls) {
  const NameFinder finder(behavior, walk, controls);
  const auto heading = finder.heading();
  NameGiver giver({"show", "hide", "enable", "disable", "flash", "font", "align", "background",
                   "like", "use", "back passes over"});
  std::vector<std::string> names;
  for (ControlIndex i = 0; i < controls.size(); ++i) {
    const drivers::ViewKindRow& row = rowOf(controls[i].kind);
    std::string wish(row.word);
    if (row.caption == Caption::text) wish = heading == i ? "heading" : "text";
    if (row.caption == Caption::imageName) wish = "picture";
    if (row.showsState) wish = "check box";
    const std::string title = lowerCase(shortened(finder.titleOf(i)));
    if (row.isButton && !title.empty() && !title.starts_with("after ")) wish = title;
    names.push_back(giver.give(wish));
  }
  return names;
}

std::vector<std::string> stepNames(const Behavior& behavior, const Walk& walk,
                                   const std::vector<steps::Control>& controls) {
  const NameFinder finder(behavior, walk, controls);
  const auto heading = finder.heading();
  std::vector<std::string> wishes;
  for (StepIndex step = 0; step < walk.steps.size(); ++step) {
    std::string wish = heading ? shortened(finder.textAt(step, *heading)) : "";
    for (ControlIndex i = 0; wish.empty() && i < controls.size(); ++i) {
      if (rowOf(controls[i].kind).caption == Caption::text)
        wish = shortened(finder.textAt(step, i));
    }
    wishes.push_back(wish.empty() ? "step" : wish);
  }
  NameGiver giver({"back", "end", "nothing"});
  std::vector<std::string> names;
  for (StepIndex step = 0; step < walk.steps.size(); ++step) {
    names.push_back(giver.give(wishes[step], finder.tellingNames(step, wishes)));
  }
  return names;
}

}  // namespace qz::tools::lift
