// SPDX-License-Identifier: MIT
// What differs between two looks of a control, property by property.
#pragma once

#include <string>
#include <vector>

#include "toolkit/memory/saved_view.hpp"
#include "tools/diff/both.hpp"

namespace qz::tools::diff {

/// The values of properties that a control has or has not, such as "enabled".
inline constexpr const char* yes = "yes";
inline constexpr const char* no = "no";

/// One property of which a user sees another value.
struct PropertyChange {
  std::string property;        ///< such as "text"
  Both<std::string> values{};  ///< in words, such as "“Hello”"; never empty
  bool isWords = false;        ///< only the words that a user reads are others

  friend auto operator<=>(const PropertyChange&, const PropertyChange&) = default;
};

/// Returns what a user sees differ between two looks of a control that is shown; something, if the
/// looks are not equal.
std::vector<PropertyChange> propertyChanges(const toolkit::memory::SavedView& before,
                                            const toolkit::memory::SavedView& after);

}  // namespace qz::tools::diff
