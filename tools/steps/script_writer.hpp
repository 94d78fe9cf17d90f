// SPDX-License-Identifier: MIT
// Writes the lists of a script, and remembers from which place of the source each command comes.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/format_readers.hpp"
#include "qz/toolkit/tag.hpp"
#include "tools/steps/looks.hpp"

namespace qz::tools::steps {

/// A command of a list, with the tag that is its last parameter, if it has one.
struct TaggedCommand {
  Command command{};
  std::optional<toolkit::Tag> tag{};
};

using List = std::vector<TaggedCommand>;

/// Returns about how many characters the list takes in a file.
std::size_t sizeOf(const List& list);

class ScriptWriter {
 public:
  /// Adds a list under a key that has none yet.
  void add(toolkit::Tag key, Place place, const List& list);

  toolkit::ValueRef<toolkit::Dictionary> script() const;
  /// Returns where each value was written in the source.
  const toolkit::ValueOffsets& offsets() const { return offsets_; }

 private:
  toolkit::ValueRef<> make(const TaggedCommand& element);

  std::vector<toolkit::Dictionary::Entry> entries_;
  toolkit::ValueOffsets offsets_;
};

}  // namespace qz::tools::steps
