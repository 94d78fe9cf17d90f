// SPDX-License-Identifier: MIT
// Compares two walk-throughs: what `qz-walkthrough diff` does once its command line is read.
#pragma once

#include <memory>
#include <vector>

#include "tools/comparison/behavior.hpp"
#include "tools/diff/changes.hpp"
#include "tools/diff/subject.hpp"

namespace qz::tools::diff {

/// What was found out of one of them.
struct Explored {
  std::unique_ptr<comparison::Behavior> behavior;
  check::Verdict verdict{};
};

/// What users would notice.
struct Diff {
  check::Looks looks;  ///< of both behaviours
  Both<Explored> explored;
  std::unique_ptr<JointControls> controls;
  std::vector<Change> changes;                 ///< by kind; of one kind, the nearest first
  Both<std::vector<check::Finding>> findings;  ///< that only one of them has
  bool isComplete = false;                     ///< NO if something was not explored or not compared
};

/// Returns what is known of a joint control: of the new one, if both windows have it; but a name
/// that only the old one has.
ControlFacts factsOf(const Diff& diff, std::size_t joint);

/// Compares. Throws a Failure if a file does not hold what it should.
std::unique_ptr<Diff> compareSubjects(const Both<Subject>& subjects,
                                      const check::ExplorationHooks& hooks);

}  // namespace qz::tools::diff
