// SPDX-License-Identifier: MIT
// The slots of the statements' forms: what a word in such a place must be.
#pragma once

#include <string_view>

#include "tools/scenario/references.hpp"
#include "tools/scenario/vocabulary.hpp"

namespace tools::scenario {

struct SlotContext {
  const Vocabulary& vocabulary;
  const Names& names;
  /// What the value behind the property takes that the statement named last.
  Takes value = Takes::nothing;
};

struct Slot {
  std::string_view name;
  std::string_view expected;  ///< for messages
  /// Whether the word fits. Throws a SyntaxError that says more where more can be said.
  bool (*fits)(const Word& word, SlotContext& context);
};

/// The slot named. A form that names no such slot is a mistake of ours.
const Slot& slotNamed(std::string_view name);

/// What a slot declares, by its name: `+W` a window, `+C` a control, `+NAME` a kept value.
std::optional<NameKind> declaredBy(std::string_view slot);

}  // namespace tools::scenario
