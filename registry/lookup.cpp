// SPDX-License-Identifier: MIT
// Finds a control by its current tag.

#include "engine/state.hpp"

namespace qz {

namespace {

toolkit::Ref<toolkit::View> viewIn(const toolkit::Ref<toolkit::View>& content, toolkit::Tag tag) {
  for (const auto& view : content->subviews()) {
    if (view->tag() == tag) return view;
  }
  return {};
}

}  // namespace

// Scans the live window at every call, never the records: a re-tagged control is found only under
// its new tag. If several controls have the tag, the back-most is found.
QZ_Plist_State_Parser::Control QZ_Plist_State_Parser::findObjectWithTag(toolkit::Tag tag) const {
  if (const auto other = state_->overridden("findObjectWithTag:", tag)) return other->control;
  const Window window = state_->tutorialWindow.ask(&toolkit::StoredRef<toolkit::Window>::get);
  Control found = viewIn(window->contentView(), tag);
  state_->notify(&Observer::controlSought, tag, found);
  return found;
}

}  // namespace qz
