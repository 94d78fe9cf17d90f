// SPDX-License-Identifier: MIT
// Looks: what the controls of a walk-through show, and what the engine has noted about flashing.
//
// A look consists of parts that do not depend on each other: one for each control, one for the
// background, one for whether flashing is allowed, and one for each tag that the script can make
// flash. A command changes a part by what that part was before and by nothing else, so the parts
// can be followed separately.
#pragma once

#include <cstdint>
#include <deque>
#include <map>
#include <mutex>
#include <string>
#include <unordered_map>
#include <vector>

#include "toolkit/memory/saved_view.hpp"

namespace qz::tools::check {

using toolkit::memory::SavedView;

/// The number of what a part shows.
using LookValue = std::uint32_t;

/// The parts that are a note of the engine, not a view.
inline constexpr LookValue notedNothing = 0;
inline constexpr LookValue notedNo = 1;
inline constexpr LookValue notedYes = 2;
/// Added to the note about a tag's flashing while all flashing is allowed. The two are one part:
/// only together do they say whether a button flashes.
inline constexpr LookValue flashingAllowed = 3;

/// What a view shows, and whether its state is what the user made of it: such a state is the user's
/// own and tells nothing about the script.
struct ViewLook {
  SavedView view;
  bool hasUsersState = false;
};

/// Gives numbers to what parts show, and to whole looks. Equal ones have equal numbers. Any number
/// of threads may use it.
class Looks {
 public:
  Looks();

  LookValue valueOf(const ViewLook& look);
  const ViewLook& look(LookValue value) const;

  using Parts = std::vector<LookValue>;
  std::uint32_t numberOf(const Parts& parts);
  const Parts& parts(std::uint32_t number) const;
  /// Returns the number of whole looks.
  std::size_t count() const;

 private:
  mutable std::mutex mutex_;
  std::unordered_map<std::string, LookValue> values_;
  std::deque<ViewLook> looks_;
  std::map<Parts, std::uint32_t> numbers_;
  std::deque<const Parts*> wholes_;
};

}  // namespace qz::tools::check
