// SPDX-License-Identifier: MIT
// Suggestions for messages about an unknown word: the known words, and the one that was probably
// meant.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace qz::tools {

/// Returns `a, b or c`.
std::string enumerate(const std::vector<std::string>& words);

/// Returns the candidate that differs from `word` in the fewest letters (left out, added, replaced,
/// or two neighbours swapped), the first of equals. Absent if more than a third of the letters, and
/// more than one, or all of them would differ.
std::optional<std::string> nearest(std::string_view word,
                                   const std::vector<std::string_view>& candidates);

/// Returns `; did you mean "candidate"?` with the nearest candidate, or an empty text.
std::string didYouMean(std::string_view word, const std::vector<std::string_view>& candidates);

}  // namespace qz::tools
