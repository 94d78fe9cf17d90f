// SPDX-License-Identifier: MIT
// Finding the form that a statement is written in.
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

namespace tools::scenario {

/// The first word of a form.
std::string_view keywordOf(const Form& form);

struct Match {
  std::size_t form;  ///< in the forms that were tried
  Arguments arguments;
  std::vector<std::pair<Word, NameKind>> declared;
  std::size_t used;  ///< how many words; more follow only where the form ends in a statement
};

/// The first of the vocabulary's forms that `words` (at least one) are written in; `end` is the
/// place behind the last of them. Throws a SyntaxError that says what was found and expected where
/// the words ceased to make sense.
Match matchForm(std::span<const Word> words, Position end, const Vocabulary& vocabulary,
                const Names& names);

}  // namespace tools::scenario
