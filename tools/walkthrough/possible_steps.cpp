// SPDX-License-Identifier: MIT
// What can happen next in a walk-through.
#include "tools/walkthrough/possible_steps.hpp"

#include <algorithm>

#include "qz/drivers/view_kinds.hpp"

namespace qz::tools::walkthrough {

const ControlPicture* controlWithTag(const StepPicture& picture, toolkit::Tag tag) {
  const auto found =
      std::find_if(picture.controls.begin(), picture.controls.end(),
                   [tag](const ControlPicture& control) { return control.view.tag == tag; });
  return found == picture.controls.end() ? nullptr : &*found;
}

bool canBePressed(const ControlPicture& control) {
  return drivers::isButton(control.view.kind) && !control.view.hidden && control.view.enabled &&
         !control.shadowed;
}

bool acceptsPresses(const StepPicture& picture) {
  return !picture.ended && picture.window && picture.window->visible;
}

std::vector<toolkit::Tag> pressableTags(const StepPicture& picture) {
  std::vector<toolkit::Tag> tags;
  if (!acceptsPresses(picture)) return tags;
  for (const ControlPicture& control : picture.controls) {
    if (canBePressed(control)) tags.push_back(control.view.tag);
  }
  return tags;
}

bool canContinue(const StepPicture& picture) {
  if (picture.ended) return false;
  const auto tags = pressableTags(picture);
  return !picture.timers.empty() || std::any_of(tags.begin(), tags.end(), [&](toolkit::Tag tag) {
    return controlWithTag(picture, tag)->hasList;
  });
}

}  // namespace qz::tools::walkthrough
