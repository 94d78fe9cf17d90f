// "Did you mean": the known word that an unknown one was probably meant to be.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace tools::scenario {

/// The candidate that differs from `word` in the fewest letters (left out, added, replaced, or two
/// neighbours swapped), the first of equals; nothing when more than a third of it would differ.
std::optional<std::string> nearest(std::string_view word,
                                   const std::vector<std::string_view>& candidates);

/// `; did you mean "candidate"?`, or an empty text.
std::string didYouMean(std::string_view word, const std::vector<std::string_view>& candidates);

}  // namespace tools::scenario
