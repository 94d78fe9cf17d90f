// SPDX-License-Identifier: MIT
// Names for what has none in a script: controls and steps.
#pragma once

#include <set>
#include <string>
#include <vector>

#include "tools/lift/stand.hpp"
#include "tools/lift/walk.hpp"

namespace qz::tools::lift {

/// Gives names once.
class NameGiver {
 public:
  /// `taken` names mean something else.
  explicit NameGiver(std::set<std::string> taken) : taken_(std::move(taken)) {}
  /// Returns the wish, or if it is taken the first of the others that is not, or with a number.
  std::string give(const std::string& wish, const std::vector<std::string>& others = {});

 private:
  std::set<std::string> taken_;
};

/// Returns a name for each control: of buttons by their titles, of others by what they are. The
/// text field that says at most steps what they are about is the heading.
std::vector<std::string> controlNames(const Behavior& behavior, const Walk& walk,
                                      const std::vector<steps::Control>& controls);

/// Returns a name for each step: its heading, or else another text.
std::vector<std::string> stepNames(const Behavior& behavior, const Walk& walk,
                                   const std::vector<steps::Control>& controls);

}  // namespace qz::tools::lift
