// SPDX-License-Identifier: MIT
// What a message about a word that nobody knows offers instead: the words that are known, and the
// one that was probably meant.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace tools {

/// `a, b or c`.
std::string enumerate(const std::vector<std::string>& words);

/// The candidate that differs from `word` in the fewest letters (left out, added, replaced, or two
/// neighbours swapped), the first of equals; nothing when more than a third of it would differ.
std::optional<std::string> nearest(std::string_view word,
                                   const std::vector<std::string_view>& candidates);

/// `; did you mean "candidate"?`, or an empty text.
std::string didYouMean(std::string_view word, const std::vector<std::string_view>& candidates);

}  // namespace tools
