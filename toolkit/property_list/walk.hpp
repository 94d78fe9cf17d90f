// SPDX-License-Identifier: MIT
// A walk over a value and everything in it, in order. It takes no more stack however deeply
// collections nest: a host can build values that are far deeper than any file's.
#pragma once

#include <cstddef>
#include <vector>

#include "toolkit/property_list/collections.hpp"

namespace toolkit {

inline bool isCollection(const Value& value) {
  return value.kind() == Value::Kind::array || value.kind() == Value::Kind::dictionary ||
         value.kind() == Value::Kind::set;
}

/// How many values a collection holds directly: keys count too.
inline std::size_t childCount(const Value& collection) {
  const std::size_t count = collection.count();
  return collection.kind() == Value::Kind::dictionary ? 2 * count : count;
}

/// The values in a collection; in a dictionary, key and value alternate.
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

/// Calls, for `root` and all that it holds: `visitor.scalar(value)` for what holds nothing, and for
/// a collection `open(collection)`, for each child `beforeChild(collection, index)` and the child,
/// then `close(collection)`.
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

/// How many values such a walk visits, `root` among them. That may be far more than there are: a
/// binary property list can hold one collection in many places, and nests such sharing. Counting
/// takes time in proportion to the values that there are; what is too many to count is the greatest
/// number. `root` holds no collection that holds itself.
std::size_t visitsInWalk(const Value& root);

}  // namespace toolkit
