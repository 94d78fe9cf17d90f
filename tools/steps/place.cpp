// SPDX-License-Identifier: MIT
// What is wrong in a source, in the order of its lines.
#include "tools/steps/place.hpp"

#include <algorithm>

#include "qz/property_list/positions.hpp"

namespace qz::tools::steps {

void Mistakes::throwIfAny(std::string_view path, std::string_view text) {
  if (list_.empty()) return;
  std::stable_sort(list_.begin(), list_.end(),
                   [](const Mistake& a, const Mistake& b) { return a.place < b.place; });
  toolkit::TextCursor cursor(text);
  std::vector<std::string> messages;
  for (const Mistake& mistake : list_) {
    const auto [line, column] = cursor.at(mistake.place);
    messages.push_back(std::string(path) + ":" + std::to_string(line) + ":" +
                       std::to_string(column) + ": " + mistake.message);
  }
  throw SourceRefused(std::move(messages));
}

}  // namespace qz::tools::steps
