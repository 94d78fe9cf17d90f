// SPDX-License-Identifier: MIT
// The names of the kinds of view, on a toolkit that has its own names for them.
#pragma once

#include <map>
#include <string>
#include <string_view>

#include "qz/drivers/driver.hpp"
#include "tools/scenario/json.hpp"

namespace qz::tools::scenario {

class ClassNames {
 public:
  explicit ClassNames(const drivers::Driver& driver);

  /// Returns `text` with every class name, be it the standard name, such as NSButton, or the
  /// toolkit's, replaced by one that represents the kind. Two texts that differ only in these names
  /// become the same.
  std::string unified(std::string_view text) const;
  /// The same in every text of a value.
  Json unifiedTexts(const Json& value) const;

 private:
  std::map<std::string, std::string, std::less<>> standsFor_;
};

}  // namespace qz::tools::scenario
