// SPDX-License-Identifier: MIT
// Finds the known word that is nearest to an unknown one, by their edit distance.

#include "tools/support/suggestions.hpp"

#include <algorithm>
#include <cstddef>
#include <numeric>

namespace qz::tools {
namespace {

// Computes the usual table of distances between prefixes row by row. `before` is the row before
// the last one; a swap of neighbours needs it.
std::size_t distance(std::string_view a, std::string_view b) {
  std::vector<std::size_t> before;
  std::vector<std::size_t> last(b.size() + 1);
  std::iota(last.begin(), last.end(), std::size_t{0});
  for (std::size_t i = 1; i <= a.size(); ++i) {
    std::vector<std::size_t> row(b.size() + 1, i);
    for (std::size_t j = 1; j <= b.size(); ++j) {
      const std::size_t replaced = last[j - 1] + (a[i - 1] == b[j - 1] ? 0 : 1);
      row[j] = std::min({last[j] + 1, row[j - 1] + 1, replaced});
      const bool swapped = i > 1 && j > 1 && a[i - 1] == b[j - 2] && a[i - 2] == b[j - 1];
      if (swapped) row[j] = std::min(row[j], before[j - 2] + 1);
    }
    before = std::move(last);
    last = std::move(row);
  }
  return last[b.size()];
}

// A word this long is much longer than any candidate, and measuring it would take long.
constexpr std::size_t longestWord = 100;

}  // namespace

std::string enumerate(const std::vector<std::string>& words) {
  std::string text;
  for (std::size_t i = 0; i < words.size(); ++i) {
    if (i > 0) text += i + 1 == words.size() ? " or " : ", ";
    text += words[i];
  }
  return text;
}

std::optional<std::string> nearest(std::string_view word,
                                   const std::vector<std::string_view>& candidates) {
  if (word.size() > longestWord) return std::nullopt;
  std::optional<std::string> nearest;
  std::size_t least = std::max<std::size_t>(1, word.size() / 3) + 1;
  for (const auto candidate : candidates) {
    const auto found = distance(word, candidate);
    if (found >= least || found >= word.size()) continue;  // every letter would differ
    least = found;
    nearest = std::string(candidate);
  }
  return nearest;
}

std::string didYouMean(std::string_view word, const std::vector<std::string_view>& candidates) {
  const auto candidate = nearest(word, candidates);
  return candidate ? "; did you mean \"" + *candidate + "\"?" : "";
}

}  // namespace qz::tools
