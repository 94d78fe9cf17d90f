// SPDX-License-Identifier: MIT
// Numbers of seven digits, by the hash FNV-1a, which is the same on every machine.
#include "tools/steps/numbers.hpp"

#include <cstdint>

namespace qz::tools::steps {
namespace {

constexpr std::uint64_t leastNumber = 1000000;
constexpr std::uint64_t numberCount = 9000000;

std::uint64_t hashOf(const std::string& name) {
  std::uint64_t hash = 14695981039346656037U;
  for (const char c : name) hash = (hash ^ static_cast<unsigned char>(c)) * 1099511628211U;
  return hash;
}

}  // namespace

toolkit::Tag Numbers::of(const std::string& name) {
  const auto known = numbers_.find(name);
  if (known != numbers_.end()) return known->second;
  std::uint64_t hash = hashOf(name);
  while (true) {
    const auto number = static_cast<toolkit::Tag>(leastNumber + hash++ % numberCount);
    if (used_.insert(number).second) return numbers_[name] = number;
  }
}

}  // namespace qz::tools::steps
