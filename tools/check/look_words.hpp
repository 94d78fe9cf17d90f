// SPDX-License-Identifier: MIT
// What differs between two looks of a control, in words for messages.
#pragma once

#include <string>
#include <vector>

#include "toolkit/memory/saved_view.hpp"

namespace qz::tools::check {

/// One difference.
struct LookWords {
  std::string either;   ///< such as "the text “A” or the text “B”"
  std::string instead;  ///< such as "the text “B” instead of the text “A”"
};

/// Returns what a user sees differ between two looks of a control; nothing if that is nothing.
std::vector<LookWords> wordsFor(const toolkit::memory::SavedView& before,
                                const toolkit::memory::SavedView& after);

}  // namespace qz::tools::check
