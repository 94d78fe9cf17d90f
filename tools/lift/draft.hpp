// SPDX-License-Identifier: MIT
// The source of a walk: what is common to its steps is said once.
#pragma once

#include <map>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "tools/lift/sayings.hpp"
#include "tools/lift/unsayable.hpp"
#include "tools/lift/walk.hpp"

namespace qz::tools::lift {

class Draft {
 public:
  /// What is passed must outlive the draft. Throws an Unsayable.
  Draft(const Behavior& behavior, const Walk& walk, const Stand& stand, Sayings& sayings);

  /// Returns the source. `window` is its first line, which names the window.
  std::string text(const std::string& window) const;

 private:
  /// What a step says of a control that it shows: properties with values, in YAML.
  using Entries = std::vector<std::pair<std::string, std::string>>;

  const comparison::Situation& situation(StepIndex step) const;
  void readStep(StepIndex step);
  Entries entriesOf(StepIndex step, ControlIndex control);
  void refuse(StepIndex step, std::optional<ControlIndex> control, const std::string& what) const;
  void chooseNamed();
  void shareEntries(ControlIndex control);
  void shareProperty(ControlIndex control, bool (*isOf)(const std::string& property));
  void chooseHidden();

  bool hasOneBackground() const;
  bool isShown(StepIndex step, ControlIndex control) const;
  bool isShownUnsaid(StepIndex step, ControlIndex control) const;
  std::string lead(const Lead& lead) const;
  std::optional<std::pair<std::string, std::string>> waitWords(StepIndex step) const;
  std::vector<std::pair<std::string, std::string>> stepWords(StepIndex step) const;
  std::vector<std::pair<std::string, std::string>> everyStepWords() const;

  const Behavior& behavior_;
  const Walk& walk_;
  const std::vector<steps::Control>& controls_;
  Sayings& sayings_;
  std::vector<std::string> controlNames_;  // in YAML
  std::vector<std::string> stepNames_;
  std::vector<std::vector<Entries>> said_;  // of each control, at each step
  std::vector<Entries> everywhere_;         // of each control
  std::vector<bool> isNamed_;
  std::vector<bool> isHidden_;  // by every step
  std::vector<std::optional<std::string>> backgrounds_;
};

}  // namespace qz::tools::lift
