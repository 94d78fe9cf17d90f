// SPDX-License-Identifier: MIT
#include "qz/script_problem.hpp"

#include <algorithm>

#include "engine/endless_chains.hpp"
#include "engine/tag_key.hpp"

namespace qz {

namespace {

bool isTag(const toolkit::Value& key) { return key.description() == tagKey(key.integerValue()); }

std::string enumeratedLoops(const EndlessChains& chains) {
  std::string text;
  for (const auto& loop : chains.loops) text += (text.empty() ? "" : ", ") + loop;
  return text;
}

}  // namespace

std::string problemOf(const toolkit::ValueRef<toolkit::Dictionary>& script) {
  const auto entries = script->entries();
  if (std::none_of(entries.begin(), entries.end(), [](const auto& e) { return isTag(*e.key); })) {
    return "no key is a tag (a whole decimal number)";
  }
  const std::string start = *smallestTagKey(*script);
  const auto first = script->objectForKey(start);
  if (first && !toolkit::asArray(first)) {
    return "the value under the smallest tag, " + start + ", is not a list";
  }
  const EndlessChains chains = endlessChains(script);
  if (!chains.loops.empty()) return "lists run each other endlessly: " + enumeratedLoops(chains);
  return {};
}

}  // namespace qz
