// SPDX-License-Identifier: MIT
// What a user would notice if one walk-through took the place of another.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

#include "tools/comparison/behavior.hpp"

namespace qz::tools::comparison {

/// Something that a user notices.
struct Difference {
  enum class Kind : std::uint8_t {
    look,  ///< a control, or the background, looks different
    wait,  ///< the time until something happens by itself
    end,   ///< one of them is over
    hang   ///< one of them runs lists without end
  };
  Kind kind = Kind::look;
  std::optional<std::size_t> control{};  ///< that looks different; absent: the background
  std::string words{};                   ///< such as "the text “B” instead of the text “A”"
  std::vector<Move> path{};              ///< the moves after the start that show it: a shortest one
  /// Where the path leads in each of them; absent: it runs lists without end.
  std::optional<SituationIndex> before{};
  std::optional<SituationIndex> after{};
};

/// Compares two walk-throughs at every pair of situations to which the same moves lead, from the
/// start with the first start key of each. Both must be complete, share a table of looks, and play
/// over the same controls. Returns the first difference at each pair, nearest first, and at most
/// `most`; none if users cannot tell one from the other.
std::vector<Difference> compare(const Behavior& before, const Behavior& after,
                                std::size_t most = 1);

/// Returns words such as "a wait of 5 s".
std::string waitWords(const std::optional<double>& seconds);

/// Returns the path of a difference in a walk-through, with the tags that its buttons have there.
check::Path pathIn(const Behavior& behavior, const std::vector<Move>& moves);

}  // namespace qz::tools::comparison
