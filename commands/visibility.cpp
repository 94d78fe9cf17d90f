// SPDX-License-Identifier: MIT
// The commands that hide, show, enable and disable a control. Their simple and their compound forms
// differ in their results, and in what they do without a control.

#include "engine/command_calls.hpp"

namespace qz {

namespace {

using Engine = QZ_Plist_State_Parser;
using commands::CompoundCall;
using commands::SimpleCall;

// Returns the target of a compound command: the tag that is its only parameter, or otherwise the
// list's own id.
toolkit::Tag targetTag(const CompoundCall& call) {
  return call.parameters->count() == 1 ? call.at(0)->intValue() : call.id->longValue();
}

bool setHidden(const SimpleCall& call, bool hidden) {
  call.control->setHidden(hidden);
  return false;
}

// Looks the control up again after every test of its class, so that changes of the window meanwhile
// take effect. A control of any class is hidden or shown.
bool setHidden(const CompoundCall& call, bool hidden) {
  const toolkit::Tag tag = targetTag(call);
  const auto find = [&] { return call.engine.findObjectWithTag(tag); };
  const auto change = [hidden](const Engine::Control& control) {
    control->setHidden(hidden);
    control->needsDisplay();
    return true;
  };
  const bool isButton = static_cast<bool>(toolkit::asButton(find()));
  Engine::Control control = find();
  if (isButton) return control ? change(control) : false;
  const bool isTextField = static_cast<bool>(toolkit::asTextField(control));
  control = find();
  if (isTextField) return change(control);
  const bool isImageView = static_cast<bool>(toolkit::asImageView(control));
  control = find();
  control->setHidden(hidden);
  (isImageView ? control : find())->needsDisplay();
  return true;
}

bool setEnabled(const SimpleCall& call, bool enabled) {
  call.control->setEnabled(enabled);
  return false;
}

bool setEnabled(const Engine::Control& control, bool enabled) {
  control->setEnabled(enabled);
  control->needsDisplay();
  return true;
}

}  // namespace

bool commands::hide(const CompoundCall& call) { return setHidden(call, true); }
bool commands::hide(const SimpleCall& call) { return setHidden(call, true); }
bool commands::show(const CompoundCall& call) { return setHidden(call, false); }
bool commands::show(const SimpleCall& call) { return setHidden(call, false); }

bool commands::enable(const CompoundCall& call) {
  const auto control = call.engine.findObjectWithTag(targetTag(call));
  return control ? setEnabled(control, true) : false;
}

bool commands::disable(const CompoundCall& call) {
  const auto control = call.engine.findObjectWithTag(targetTag(call));
  // Unlike enabling, this succeeds if the control of a parameter does not exist.
  return control ? setEnabled(control, false) : call.parameters->count() == 1;
}

bool commands::enable(const SimpleCall& call) { return setEnabled(call, true); }
bool commands::disable(const SimpleCall& call) { return setEnabled(call, false); }

}  // namespace qz
