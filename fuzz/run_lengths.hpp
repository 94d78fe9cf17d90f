// SPDX-License-Identifier: MIT
// Tells scripts whose lists run very long, or chain very deep, from others.
#pragma once

#include <algorithm>
#include <cstddef>
#include <map>
#include <string>
#include <utility>

#include "engine/endless_chains.hpp"
#include "engine/tag_key.hpp"
#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"

namespace qz::fuzz {

/// Counts the elements that a list executes, including the lists that it chains to.
class RunLengths {
 public:
  explicit RunLengths(toolkit::ValueRef<toolkit::Dictionary> script) : script_(std::move(script)) {}

  /// True if no list runs long or chains deep. A list that never ends does both.
  bool areSmall() { return areSmallExcept({}); }

  /// The same, for a player that does not run the lists of these endless chains.
  bool areSmallExcept(const EndlessChains& chains) {
    for (const auto& [key, list] : script_->entries()) {
      const auto tag = toolkit::asString(key);
      if (!tag || chains.loopOf.contains(tag->text())) continue;
      // A list runs under the number of its key and chains to itself by that number: "07" under 7.
      if (ofElements(list, tagKey(tag->intValue()), 0) > mostElements) return false;
    }
    return true;
  }

 private:
  static constexpr std::size_t mostElements = 2'000;
  static constexpr std::size_t deepestChain = 100;

  std::size_t ofList(const std::string& key, std::size_t depth) {
    if (depth > deepestChain) return mostElements + 1;
    const auto known = lengths_.find(key);
    if (known != lengths_.end()) return known->second;
    return lengths_[key] = ofElements(script_->objectForKey(key), key, depth);
  }

  std::size_t ofElements(const toolkit::ValueRef<>& list, const std::string& own,
                         std::size_t depth) {
    std::size_t length = 1;
    const auto elements = toolkit::asArray(list);
    for (const auto& element : elements->elements()) {
      const auto next = chainTarget(element, own);
      length += next ? ofList(*next, depth + 1) : 1;
      if (length > mostElements) break;
    }
    return std::min(length, mostElements + 1);
  }

  toolkit::ValueRef<toolkit::Dictionary> script_;
  std::map<std::string, std::size_t> lengths_;
};

}  // namespace qz::fuzz
