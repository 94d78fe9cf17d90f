// SPDX-License-Identifier: MIT
// The names of the kinds of view, on a toolkit that gives them names of its own.
#pragma once

#include <map>
#include <string>
#include <string_view>

#include "toolkit/test_driver.hpp"
#include "tools/scenario/json.hpp"

namespace tools::scenario {

class ClassNames {
 public:
  explicit ClassNames(const toolkit::TestDriver& driver);

  /// `text` with every class name in it replaced by one that stands for the kind, whether it is the
  /// standard name, such as NSButton, or the toolkit's. Two texts that differ only in these names
  /// become the same.
  std::string unified(std::string_view text) const;
  /// The same in every text of a value.
  Json unifiedTexts(const Json& value) const;

 private:
  std::map<std::string, std::string, std::less<>> standsFor_;
};

}  // namespace tools::scenario
