// SPDX-License-Identifier: MIT
// The slots of the statements' forms: which words fit into each.
#pragma once

#include <string_view>

#include "tools/scenario/references.hpp"
#include "tools/scenario/vocabulary.hpp"

namespace qz::tools::scenario {

struct SlotContext {
  const Vocabulary& vocabulary;
  const Names& names;
  /// The values accepted by the property that the statement named last.
  Takes value = Takes::nothing;
};

struct Slot {
  std::string_view name;
  std::string_view expected;  ///< for messages
  /// Whether the word fits. Throws a SyntaxError instead of saying no if it can give a reason.
  bool (*fits)(const Word& word, SlotContext& context);
};

/// Returns the slot with this name. An unknown slot in a form is a programming error.
const Slot& slotNamed(std::string_view name);

/// Returns what a slot declares: `+W` a window, `+C` a control, `+NAME` a kept value; else absent.
std::optional<NameKind> declaredBy(std::string_view slot);

}  // namespace qz::tools::scenario
