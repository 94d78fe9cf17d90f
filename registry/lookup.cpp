// SPDX-License-Identifier: MIT
// Finds a control by its current tag.

#include "QZ_Plist_State_Parser.hpp"

// Scans the live window at every call, never the records: a re-tagged control is found only under
// its new tag. If several controls have the tag, the back-most is found.
QZ_Plist_State_Parser::Control QZ_Plist_State_Parser::findObjectWithTag(toolkit::Tag tag) const {
  const Control content = tutorialWindow()->contentView();
  for (const Control& view : content->subviews()) {
    if (view->tag() != tag) continue;
    const Control found = view;
    notify(&qz::Observer::controlSought, tag, found);
    return found;
  }
  notify(&qz::Observer::controlSought, tag, Control());
  return {};
}
