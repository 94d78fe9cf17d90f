// SPDX-License-Identifier: MIT
// Numbers for tags and keys of a script.
#pragma once

#include <string>
#include <unordered_map>
#include <unordered_set>

#include "qz/toolkit/tag.hpp"

namespace qz::tools::steps {

/// Gives numbers to names. A number depends on its name alone, unless two names meet at one, so a
/// script changes little when its source does.
class Numbers {
 public:
  /// No name gets this number.
  void reserve(toolkit::Tag number) { used_.insert(number); }
  /// Returns the number of a name: the same one each time.
  toolkit::Tag of(const std::string& name);

 private:
  std::unordered_map<std::string, toolkit::Tag> numbers_;
  std::unordered_set<toolkit::Tag> used_;
};

}  // namespace qz::tools::steps
