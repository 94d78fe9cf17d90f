// SPDX-License-Identifier: MIT
// Patterns for log lines.

#include "tools/scenario/wildcard.hpp"

#include <cstddef>
#include <string>
#include <vector>

namespace qz::tools::scenario {
namespace {

/// Returns the texts between the pattern's stars: one more than there are stars.
std::vector<std::string> piecesOf(std::string_view pattern) {
  std::vector<std::string> pieces(1);
  for (std::size_t i = 0; i < pattern.size(); ++i) {
    if (pattern[i] == '*') {
      pieces.emplace_back();
    } else {
      const bool escaped = pattern.substr(i, 2) == "\\*";
      pieces.back() += escaped ? pattern[++i] : pattern[i];
    }
  }
  return pieces;
}

}  // namespace

bool matchesPattern(std::string_view pattern, std::string_view text) {
  const auto pieces = piecesOf(pattern);
  if (pieces.size() == 1) return text == pieces.front();
  if (!text.starts_with(pieces.front())) return false;
  text.remove_prefix(pieces.front().size());
  // Finding each piece at its first place leaves the most text for the later ones.
  for (std::size_t i = 1; i + 1 < pieces.size(); ++i) {
    const auto found = text.find(pieces[i]);
    if (found == std::string_view::npos) return false;
    text.remove_prefix(found + pieces[i].size());
  }
  return text.ends_with(pieces.back());
}

}  // namespace qz::tools::scenario
