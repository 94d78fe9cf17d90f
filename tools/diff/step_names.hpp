// SPDX-License-Identifier: MIT
// How people call the steps of a walk-through.
#pragma once

#include <compare>
#include <string>

#include "tools/comparison/behavior.hpp"

namespace qz::tools::diff {

/// What people call a step.
struct StepName {
  std::string name{};  ///< such as `the step “copying”`, or without a source `the step of list “4”`
  std::string text{};  ///< what the user reads first there; empty if the source has a name for it

  bool isThere() const { return !name.empty(); }
  /// Returns such as `the step of list “4” (“Done”)`.
  std::string words() const;

  friend auto operator<=>(const StepName&, const StepName&) = default;
};

/// Names the steps of a walk-through.
class StepNames {
 public:
  explicit StepNames(const comparison::Behavior& behavior);

  StepName of(comparison::SituationIndex situationIndex) const;

 private:
  std::string sourceName(std::uint32_t visit) const;
  std::string listKey(std::uint32_t list) const;
  std::string firstText(const comparison::Situation& situation) const;

  const comparison::Behavior& behavior_;
};

}  // namespace qz::tools::diff
