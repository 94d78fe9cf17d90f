// SPDX-License-Identifier: MIT
// Finds the form that a statement is written in.
#pragma once

#include <cstddef>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "tools/scenario/arguments.hpp"
#include "tools/scenario/references.hpp"
#include "tools/scenario/vocabulary.hpp"

namespace qz::tools::scenario {

/// Returns the first word of a form.
std::string_view keywordOf(const Form& form);

struct Match {
  std::size_t form;  ///< in the forms that were tried
  Arguments arguments;
  std::vector<std::pair<Word, NameKind>> declared;
  std::size_t used;  ///< how many words; more follow only if the form ends in a statement
};

/// Returns the match of the vocabulary's first form that fits `words` (at least one). `end` is the
/// place after the last of them. Throws a SyntaxError at the first word that fits no form; it says
/// what was found and what was expected.
Match matchForm(std::span<const Word> words, Position end, const Vocabulary& vocabulary,
                const Names& names);

}  // namespace qz::tools::scenario
