// SPDX-License-Identifier: MIT
// What places show, and what else of their history matters later.
#pragma once

#include <array>
#include <cstddef>
#include <map>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "tests/check/finding.hpp"
#include "tests/check/world.hpp"

namespace qz::naive {

/// Keeps every value of every aspect of a place, for each list that had the last word there.
///
/// What a move makes of an aspect (a control's text, say) depends on the place and on that aspect
/// alone. So a path is worth following only if it brings a value of some aspect that no path has
/// brought to its place before: then no combination of values is missed that any finding needs.
class Looks {
 public:
  /// Takes note of the world, which is at the place with this index, after a path of so many moves.
  /// Returns whether anything in it is new.
  bool note(std::size_t place, const World& world, std::size_t pathLength);

  /// Adds the controls that look different at one place.
  void report(Findings& findings) const;

 private:
  struct Seen {
    std::vector<std::array<std::set<std::string>, 5>> controls;
    std::vector<std::set<bool>> flashing;  // by control
    std::set<std::string> others;
  };

  bool noteControls(Seen& seen, const World& world, std::size_t pathLength);
  void noteDifference(const World& world, std::size_t control, std::size_t pathLength);

  std::map<std::pair<std::size_t, std::string>, Seen> seen_;
  TextNumbers numbers_;
  Findings differences_;
};

}  // namespace qz::naive
