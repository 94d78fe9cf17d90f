// SPDX-License-Identifier: MIT
// Which buttons flash.
#pragma once

#include <cstdint>
#include <optional>
#include <unordered_map>

#include "tools/exploration/exploration.hpp"

namespace qz::tools::check {

class Flashing {
 public:
  /// `exploration` must outlive it.
  explicit Flashing(const Exploration& exploration);

  /// Returns the part of a look that says whether the tag of a control flashes; absent if the
  /// script can never make it flash.
  std::optional<std::size_t> partOf(std::uint32_t place, std::size_t control) const;
  /// Whether a control flashes at a place, with a look of these parts.
  bool flashes(std::uint32_t place, std::size_t control, const Looks::Parts& parts) const;

 private:
  const Exploration& exploration_;
  std::unordered_map<Tag, std::size_t> parts_;  // by the tag that flashes
};

}  // namespace qz::tools::check
