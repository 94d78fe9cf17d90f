// SPDX-License-Identifier: MIT
#include "tools/exploration/facts.hpp"

namespace qz::tools::check {

const FactTable::Entry* FactTable::find(FactKind kind, Subject subject) const {
  const auto& entries = all(kind);
  const auto found = entries.find(subject);
  return found == entries.end() ? nullptr : &found->second;
}

void FactTable::add(const Fact& fact, Occasion occasion, std::uint32_t place) {
  auto& entries = entries_[static_cast<std::size_t>(fact.kind)];
  const auto [entry, isNew] = entries.try_emplace(fact.subject);
  if (isNew) {
    entry->second.first = occasion;
    entry->second.detail = fact.detail;
  }
  if (entry->second.lastPlace == place) return;
  entry->second.lastPlace = place;
  ++entry->second.places;
}

}  // namespace qz::tools::check
