// SPDX-License-Identifier: MIT
// A walk over a value and its whole content, in order. It uses a fixed amount of stack, because a
// host can build values that nest far deeper than in any file.
#pragma once

#include <cstddef>
#include <vector>

#include "qz/property_list/collections.hpp"

namespace qz::toolkit {

inline bool isCollection(const Value& value) {
  return value.kind() == Value::Kind::array || value.kind() == Value::Kind::dictionary ||
         value.kind() == Value::Kind::set;
}

/// Returns the number of values directly in a collection, including keys.
inline std::size_t childCount(const Value& collection) {
  const std::size_t count = collection.count();
  return collection.kind() == Value::Kind::dictionary ? 2 * count : count;
}

/// Returns a value in a collection; in a dictionary, keys and values alternate.
inline const Value& childAt(const Value& collection, std::size_t index) {
  switch (collection.kind()) {
    case Value::Kind::array:
      return *static_cast<const Array&>(collection).elements()[index];
    case Value::Kind::set:
      return *static_cast<const Set&>(collection).elements()[index];
    default:
      break;
  }
  const Dictionary::Entry& entry = static_cast<const Dictionary&>(collection).entries()[index / 2];
  return index % 2 == 0 ? *entry.key : *entry.value;
}

/// Visits `root` and its whole content. Calls `visitor.scalar(value)` for a scalar. For a
/// collection, calls `open(collection)`; then, for each child, `beforeChild(collection, index)`
/// before visiting the child; then `close(collection)`.
template <class Visitor>
void walk(const Value& root, Visitor& visitor) {
  struct Level {
    const Value* collection;
    std::size_t next;
    std::size_t count;
  };
  std::vector<Level> levels;
  const auto visit = [&](const Value& value) {
    if (!isCollection(value)) return visitor.scalar(value);
    visitor.open(value);
    levels.push_back({&value, 0, childCount(value)});
  };
  visit(root);
  while (!levels.empty()) {
    Level& level = levels.back();
    if (level.next == level.count) {
      visitor.close(*level.collection);
      levels.pop_back();
      continue;
    }
    const std::size_t index = level.next++;
    const Value& collection = *level.collection;
    visitor.beforeChild(collection, index);
    visit(childAt(collection, index));
  }
}

/// Returns the number of values that a walk visits, including `root`; the largest std::size_t if
/// there are more. The number may far exceed the number of distinct values, because a binary
/// property list can share a collection at many nested places. The time is proportional to the
/// distinct values. No collection in `root` may contain itself.
std::size_t visitsInWalk(const Value& root);

}  // namespace qz::toolkit
