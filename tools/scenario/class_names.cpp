// SPDX-License-Identifier: MIT
// The names of the kinds of view.

#include "tools/scenario/class_names.hpp"

#include <algorithm>
#include <cctype>

namespace qz::tools::scenario {
namespace {

bool isClassNameCharacter(char c) {
  return c == '_' || std::isalnum(static_cast<unsigned char>(c)) != 0;
}

}  // namespace

// Kinds to which a toolkit gives the same name share one representative.
ClassNames::ClassNames(const drivers::Driver& driver) {
  for (const drivers::ViewKindRow& row : drivers::viewKinds) {
    const std::string standard(row.className);
    const std::string own(driver.className(row.kind));
    const auto first = standsFor_.try_emplace(standard, standard).first->second;
    const auto second = standsFor_.try_emplace(own, first).first->second;
    for (auto& [key, representative] : standsFor_) {
      if (representative == second) representative = first;
    }
  }
}

std::string ClassNames::unified(std::string_view text) const {
  std::string result;
  while (!text.empty()) {
    const auto end = std::find_if_not(text.begin(), text.end(), isClassNameCharacter);
    const auto length = std::max<std::size_t>(1, static_cast<std::size_t>(end - text.begin()));
    const auto word = text.substr(0, length);
    const auto found = standsFor_.find(word);
    result += found == standsFor_.end() ? word : found->second;
    text.remove_prefix(length);
  }
  return result;
}

Json ClassNames::unifiedTexts(const Json& value) const {
  if (value.is_string()) return unified(value.get_ref<const std::string&>());
  auto result = value;
  if (value.is_structured()) {
    for (auto& element : result) element = unifiedTexts(element);
  }
  return result;
}

}  // namespace qz::tools::scenario
