// SPDX-License-Identifier: MIT
// Finding a control by the tag that it carries now.

#include "QZ_Plist_State_Parser.hpp"

// A scan of the live window at every call, never of the records: a re-tagged control is found under
// its new tag only, and of several with one tag the back-most.
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
