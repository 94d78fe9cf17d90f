// SPDX-License-Identifier: MIT
// What a walk-through leaves behind in the host's window.
#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "tests/check/finding.hpp"
#include "tests/check/world.hpp"

namespace qz::naive {

class Endings {
 public:
  /// `resources` is the directory of the images; if it is empty, the toolkit's own.
  Endings(const Script& script, const HostWindow& host, const std::string& resources);

  /// Takes note of a world that has ended after a path of so many moves.
  void note(const World& world, std::size_t pathLength);
  void report(Findings& findings) const;

 private:
  using Controls = std::vector<drivers::ViewPicture>;

  bool isChanged(const World& world, const drivers::ViewPicture& control, std::size_t index);

  TextNumbers numbers_;
  Controls before_;
  std::vector<ControlLook> looksBefore_;
  std::vector<Findings> left_;  // by control, because two may have the same tag
  Findings tags_;
};

}  // namespace qz::naive
