// SPDX-License-Identifier: MIT
// What changed from one picture of a walk-through to the next.
//
// Each thing in a picture becomes a list of facts, always the same facts in the same order. Two
// lists are then compared fact by fact.
#include "tools/play/picture_diff.hpp"

#include <algorithm>
#include <cstddef>
#include <map>
#include <utility>

#include "tools/play/words.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::play {
namespace {

struct Fact {
  std::string what;
  std::string value;
};

using Facts = std::vector<Fact>;

std::string yesOrNo(bool value) { return value ? "yes" : "no"; }

std::string quotedOrNone(const std::optional<std::string>& text) {
  return text ? quote(*text) : "none";
}

std::string rectWords(const toolkit::Rect& rect) {
  return numberWords(rect.width) + " × " + numberWords(rect.height) + " at " + numberWords(rect.x) +
         ", " + numberWords(rect.y);
}

Facts factsOf(const ControlPicture& control) {
  const drivers::ViewPicture& view = control.view;
  // The tags of controls with names are not the author's.
  return {{"tag", control.name.empty() ? std::to_string(view.tag) : control.name},
          {"frame", rectWords(view.frame)},
          {"title", quote(view.title.string())},
          {"text", quote(view.text.string())},
          {"image", quotedOrNone(view.image)},
          {"hidden", yesOrNo(view.hidden)},
          {"enabled", yesOrNo(view.enabled)},
          {"state", std::string(stateWord(view.state))},
          {"flashing", yesOrNo(control.flashing)},
          {"highlighted", yesOrNo(view.highlighted)},
          {"background", view.background ? colorWords(*view.background) : "none"},
          {"tooltip", view.toolTip.empty() ? "none" : quote(view.toolTip)}};
}

Facts factsOf(const std::optional<drivers::WindowPicture>& window) {
  const drivers::WindowPicture shown = window.value_or(drivers::WindowPicture{});
  return {{"window", window ? "there" : "none"},
          {"rectangle", rectWords(shown.content)},
          {"on the screen", yesOrNo(shown.visible)},
          {"times closed", std::to_string(shown.closes)},
          {"sheet", yesOrNo(static_cast<bool>(shown.sheetOf))},
          {"background", colorWords(shown.background)},
          {"background image", quotedOrNone(shown.layerImage)}};
}

Facts factsOf(const StepPicture& picture) {
  return {picture.step.empty() ? Fact{"list started last", picture.lastList.value_or("none")}
                               : Fact{"step", quote(picture.step)},
          {"flashing allowed", yesOrNo(picture.flashingAllowed)},
          {"walk-through ended", yesOrNo(picture.ended)}};
}

std::vector<Change> compare(const Facts& before, const Facts& now) {
  std::vector<Change> changes;
  for (std::size_t i = 0; i < now.size(); ++i) {
    if (before[i].value == now[i].value) continue;
    changes.push_back({now[i].what, before[i].value, now[i].value});
  }
  return changes;
}

/// Returns the attributes of each piece of a text; an empty text counts as one plain piece.
std::vector<toolkit::TextAttributes> attributesOf(const toolkit::AttributedString& text) {
  if (text.runs().empty()) return {toolkit::TextAttributes{}};
  std::vector<toolkit::TextAttributes> attributes;
  for (const auto& run : text.runs()) attributes.push_back(run.attributes);
  return attributes;
}

/// Says how a text is styled, piece by piece if it has several styles.
std::string stylesWords(const toolkit::AttributedString& text) {
  if (text.runs().empty()) return "plain";
  if (text.runs().size() == 1) return styleWords(text.runs().front().attributes);
  std::string words;
  for (const auto& [range, attributes] : text.runs()) {
    words.append(words.empty() ? "" : "; ")
        .append(quote(text.string().substr(range.location, range.length)))
        .append(" ")
        .append(styleWords(attributes));
  }
  return words;
}

/// The same in short, for a text whose pieces the pictures list anyway.
std::string stylesInShort(const toolkit::AttributedString& text) {
  return text.runs().size() < 2 ? stylesWords(text)
                                : std::to_string(text.runs().size()) + " pieces";
}

void compareStyles(const toolkit::AttributedString& before, const toolkit::AttributedString& now,
                   std::vector<Change>& changes) {
  const bool sameText = before.string() == now.string();
  if (sameText ? before == now : attributesOf(before) == attributesOf(now)) return;
  const auto words = sameText ? stylesWords : stylesInShort;
  const std::string was = words(before);
  const std::string is = words(now);
  changes.push_back({"style", was, is == was ? "other " + is : is});
}

const ControlPicture* find(const ControlPicture& control, const StepPicture& picture) {
  const auto found =
      std::find_if(picture.controls.begin(), picture.controls.end(),
                   [&control](const ControlPicture& c) { return c.identity == control.identity; });
  return found == picture.controls.end() ? nullptr : &*found;
}

ControlChanges compareControl(const ControlPicture* before, const ControlPicture& now) {
  if (before == nullptr) return {true, {}};
  ControlChanges result{false, compare(factsOf(*before), factsOf(now))};
  compareStyles(before->view.title, now.view.title, result.changes);
  compareStyles(before->view.text, now.view.text, result.changes);
  return result;
}

/// Pairs the timers of both pictures by key: before and now.
auto pairUp(const StepPicture& before, const StepPicture& now) {
  std::map<std::string, std::pair<const TimerPicture*, const TimerPicture*>> pairs;
  for (const TimerPicture& timer : before.timers) pairs[timer.key].first = &timer;
  for (const TimerPicture& timer : now.timers) pairs[timer.key].second = &timer;
  return pairs;
}

std::string firingWords(const TimerPicture* timer) {
  return timer ? "fires " + whenWords(timer->timeLeft) : "none";
}

void compareTimers(const StepPicture& before, const StepPicture& now,
                   std::vector<Change>& changes) {
  for (const auto& [key, pair] : pairUp(before, now)) {
    const auto [old, current] = pair;
    if (old && current && old->identity == current->identity) continue;
    const std::string anew = old && current ? "armed again, " : "";
    const std::string& step = (current ? current : old)->step;
    const std::string what = step.empty() ? "timer of list " + key : "wait for " + quote(step);
    changes.push_back({what, firingWords(old), anew + firingWords(current)});
  }
}

}  // namespace

bool PictureChanges::none() const {
  return window.empty() && gone.empty() && engine.empty() &&
         std::none_of(controls.begin(), controls.end(), [](const ControlChanges& control) {
           return control.isNew || !control.changes.empty();
         });
}

PictureChanges diffPictures(const StepPicture& before, const StepPicture& now) {
  PictureChanges changes;
  changes.window = compare(factsOf(before.window), factsOf(now.window));
  for (const ControlPicture& control : now.controls) {
    changes.controls.push_back(compareControl(find(control, before), control));
  }
  for (const ControlPicture& control : before.controls) {
    if (!find(control, now)) changes.gone.push_back(control);
  }
  changes.engine = compare(factsOf(before), factsOf(now));
  compareTimers(before, now, changes.engine);
  return changes;
}

}  // namespace qz::tools::play
