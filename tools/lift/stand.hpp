// SPDX-License-Identifier: MIT
// A window in which one control after the other shows what a source would say of it.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "tools/exploration/looks.hpp"
#include "tools/exploration/script.hpp"
#include "tools/steps/looks.hpp"
#include "tools/walkthrough/stage.hpp"

namespace qz::tools::lift {

using check::LookValue;
using steps::ControlIndex;

class Stand {
 public:
  /// `looks` is the table of what controls look like, and must outlive the stand.
  Stand(const walkthrough::StagePlan& plan, const std::string& resources, check::Looks& looks);

  const std::vector<steps::Control>& controls() const { return controls_; }
  /// Returns what the control looks like after these words, but for its state.
  LookValue show(ControlIndex control, const steps::ControlWords& words);
  /// Returns what it looks like after a command of a script that acts on controls, whichever it
  /// names. A command that does not suit the control shows nothing.
  LookValue run(ControlIndex control, const check::Element& element);
  /// Returns a look without the state of the button.
  LookValue withoutState(LookValue look) { return looks_.valueOf({looks_.look(look).view, true}); }
  const check::SavedView& view(LookValue look) const { return looks_.look(look).view; }

 private:
  using List = std::vector<toolkit::ValueRef<>>;
  LookValue play(ControlIndex control, const List& list);

  check::Looks& looks_;
  std::vector<steps::Control> controls_;
  std::unique_ptr<drivers::MemoryDriver> driver_;
  std::unique_ptr<walkthrough::Stage> stage_;
};

}  // namespace qz::tools::lift
