// SPDX-License-Identifier: MIT
// What is wrong in a source, in the order of its lines.
#include "tools/steps/place.hpp"

#include <algorithm>

#include "tools/steps/source_files.hpp"

namespace qz::tools::steps {

void Mistakes::throwIfAny(const SourceFiles& files) {
  if (list_.empty()) return;
  std::stable_sort(list_.begin(), list_.end(),
                   [](const Mistake& a, const Mistake& b) { return a.place < b.place; });
  std::vector<std::string> messages;
  for (const Mistake& mistake : list_) {
    messages.push_back(files.at(mistake.place).text() + ": " + mistake.message);
  }
  throw SourceRefused(std::move(messages), files.paths());
}

}  // namespace qz::tools::steps
