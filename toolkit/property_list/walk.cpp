// SPDX-License-Identifier: MIT
#include "toolkit/property_list/walk.hpp"

#include <limits>
#include <unordered_map>

namespace qz::toolkit {
namespace {

std::size_t saturatedSum(std::size_t a, std::size_t b) {
  const std::size_t room = std::numeric_limits<std::size_t>::max() - a;
  return b > room ? std::numeric_limits<std::size_t>::max() : a + b;
}

}  // namespace

std::size_t visitsInWalk(const Value& root) {
  struct Level {
    const Value* collection;
    std::size_t next = 0;
    std::size_t visits = 1;
  };
  std::unordered_map<const Value*, std::size_t> counted;  // collections only
  std::vector<Level> levels;
  std::size_t visits = 1;  // of the value counted last
  const auto count = [&](const Value& value) {
    visits = 1;
    if (!isCollection(value)) return true;
    const auto known = counted.find(&value);
    if (known != counted.end()) visits = known->second;
    if (known == counted.end()) levels.push_back({&value});
    return known != counted.end();
  };
  count(root);
  while (!levels.empty()) {
    Level& level = levels.back();
    if (level.next < childCount(*level.collection)) {
      const Value& child = childAt(*level.collection, level.next++);
      if (count(child)) level.visits = saturatedSum(level.visits, visits);
      continue;
    }
    visits = counted[level.collection] = level.visits;
    levels.pop_back();
    if (!levels.empty()) levels.back().visits = saturatedSum(levels.back().visits, visits);
  }
  return visits;
}

}  // namespace qz::toolkit
