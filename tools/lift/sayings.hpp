// SPDX-License-Identifier: MIT
// How a source says what a control looks like.
#pragma once

#include <map>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "tools/lift/stand.hpp"

namespace qz::tools::lift {

/// Properties of a control and their values, as texts that are not quoted yet.
using Properties = std::vector<std::pair<std::string, std::string>>;

class Sayings {
 public:
  /// `stand` and `script` must outlive it.
  Sayings(Stand& stand, const check::Script& script);

  /// Returns what a source says so that the control looks like this, but for its state; nothing
  /// needs to be said of what the host made. Absent if no words of the language make it look so.
  const std::optional<Properties>& of(ControlIndex control, LookValue look);

 private:
  struct Candidate {
    Properties properties{};
    steps::ControlWords words{};
  };
  using Candidates = std::vector<Candidate>;

  std::optional<Properties> find(ControlIndex control, LookValue look);
  Candidates contents(ControlIndex control, const check::SavedView& view) const;
  void addTexts(const std::string& property, const toolkit::AttributedString& text,
                Candidates& candidates) const;

  Stand& stand_;
  std::vector<std::string> fragments_;  // the HTML of the script
  std::map<std::pair<ControlIndex, LookValue>, std::optional<Properties>> known_;
};

}  // namespace qz::tools::lift
