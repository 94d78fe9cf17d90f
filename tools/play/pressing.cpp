// SPDX-License-Identifier: MIT
// What a user can press, and how the walk-through can continue.
#include "tools/play/pressing.hpp"

#include <vector>

#include "tools/play/words.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::play {
namespace {

std::string pressableWords(const StepPicture& picture) {
  std::vector<std::string> buttons;
  for (const ControlPicture& control : picture.controls) {
    if (canBePressed(control)) buttons.push_back(pressWords(picture, control.view.tag));
  }
  return buttons.empty() ? "; no button can be pressed" : "; press " + enumerate(buttons);
}

std::string wayOf(const TimerPicture& timer) {
  return (timer.step.empty() ? "list " + timer.key + " to run "
                             : "the step " + quote(timer.step) + " ") +
         whenWords(timer.timeLeft);
}

/// Returns what can happen next: presses that run a list, and timers.
std::vector<std::string> waysOn(const StepPicture& picture) {
  std::vector<std::string> ways;
  std::vector<std::string> buttons;
  for (const ControlPicture& control : picture.controls) {
    const bool moves = control.hasList && canBePressed(control);
    if (moves) buttons.push_back(pressWords(picture, control.view.tag));
  }
  if (!buttons.empty()) ways.push_back("a press of " + enumerate(buttons));
  for (const TimerPicture& timer : picture.timers) ways.push_back(wayOf(timer));
  return ways;
}

std::string nameOf(const ControlPicture* control, toolkit::Tag tag) {
  return control && !control->name.empty() ? control->name : std::to_string(tag);
}

}  // namespace

std::optional<toolkit::Tag> tagOf(const StepPicture& picture, const Press& press) {
  if (press.name.empty()) return press.tag;
  for (const ControlPicture& control : picture.controls) {
    if (control.name == press.name) return control.view.tag;
  }
  return std::nullopt;
}

std::string noSuchName(const StepPicture& picture, const std::string& name) {
  std::vector<std::string_view> known;
  for (const ControlPicture& control : picture.controls) {
    if (!control.name.empty()) known.push_back(control.name);
  }
  const std::string suggestion = didYouMean(name, known);
  return "no control is called " + quote(name) +
         (suggestion.empty() ? pressableWords(picture) : suggestion);
}

std::string pressWords(const StepPicture& picture, toolkit::Tag tag) {
  const ControlPicture* control = controlWithTag(picture, tag);
  std::string words = nameOf(control, tag);
  if (!control || !isButton(control->view.kind)) return words;
  const std::string title = contentOf(*control);
  const std::string firstLine = title.substr(0, title.find('\n'));
  return firstLine.empty() ? words : words + " (" + firstLine + ")";
}

std::optional<std::string> whyNotPress(const StepPicture& picture, toolkit::Tag tag) {
  if (picture.ended) return "the walk-through has ended";
  if (!picture.window || !picture.window->visible) return "the window is not on the screen";
  const ControlPicture* control = controlWithTag(picture, tag);
  const std::string name = nameOf(control, tag);
  if (!control) return "no control has the tag " + name + pressableWords(picture);
  if (canBePressed(*control)) return std::nullopt;
  const auto is = [&](std::string_view what) {
    return "control " + name + " is " + std::string(what) + pressableWords(picture);
  };
  if (!isButton(control->view.kind)) return is("not a button");
  return is(control->view.hidden ? "hidden" : "disabled");
}

std::optional<std::string> whyNoWayOn(const StepPicture& picture) {
  if (picture.ended || !waysOn(picture).empty()) return std::nullopt;
  return "no timer is pending, and no button that can be pressed has a list";
}

std::string standing(const StepPicture& picture) {
  if (picture.ended) return "The walk-through ended.";
  if (const auto reason = whyNoWayOn(picture)) {
    return "The walk-through is stuck: " + *reason + ".";
  }
  return "The walk-through waits for " + enumerate(waysOn(picture)) + ".";
}

}  // namespace qz::tools::play
