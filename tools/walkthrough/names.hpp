// SPDX-License-Identifier: MIT
// Names of controls and steps, for a script that was built of a source with names.
#pragma once

#include <map>
#include <string>

#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::walkthrough {

/// What the numbers of a script stand for.
struct Names {
  std::map<toolkit::Tag, std::string> controls{};  ///< by every tag that a control can have
  std::map<std::string, std::string> steps{};      ///< by the key of each list that leads to a step

  bool isEmpty() const { return controls.empty(); }
  /// Returns the name of the control that has the tag, between “ and ”; the tag if it has no name.
  std::string controlWords(toolkit::Tag tag) const;
  /// Returns the name of the step to which the list leads; empty if it leads to none.
  std::string stepOf(const std::string& key) const;
};

/// Puts names into pictures. Pictures must come in the order in which they were taken: a list that
/// leads nowhere leaves the step as it is.
class Naming {
 public:
  explicit Naming(Names names) : names_(std::move(names)) {}
  bool hasNames() const { return !names_.isEmpty(); }
  /// Returns the name of the control with a tag, or the tag if there is none.
  std::string controlName(const std::string& tag) const;
  /// Names the controls, the step and the steps to which timers lead.
  void apply(StepPicture& picture);

 private:
  Names names_;
  std::string step_;
};

}  // namespace qz::tools::walkthrough
