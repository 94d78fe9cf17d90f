// SPDX-License-Identifier: MIT
// Scripts and windows made at random, for tests that compare explorers.
#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "qz/property_list/collections.hpp"
#include "tools/walkthrough/host_window.hpp"

namespace qz::naive {

struct Generated {
  toolkit::ValueRef<toolkit::Dictionary> script;  ///< immutable; starts at its smallest tag
  tools::walkthrough::HostWindow host;
  std::optional<std::string> planted;  ///< the code of a defect that the script surely has
};

/// The codes of the defects that can be planted: those that reading finds, then those that
/// exploring finds.
std::span<const std::string_view> codesFoundByReading();
std::span<const std::string_view> codesFoundByExploring();

/// Returns the script of the seed, the same on every platform: one to six controls and one to eight
/// lists of any commands. Every odd seed plants a defect, each code in turn.
Generated generate(std::uint64_t seed);

}  // namespace qz::naive
