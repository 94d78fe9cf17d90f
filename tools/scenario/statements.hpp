// SPDX-License-Identifier: MIT
// The statements of the language: how each is written, and what it does.
#pragma once

#include <span>
#include <vector>

#include "tools/scenario/arguments.hpp"
#include "tools/scenario/stage.hpp"
#include "tools/scenario/vocabulary.hpp"

namespace tools::scenario {

struct StatementKind {
  std::string_view syntax;
  Result result;
  Outcome (*run)(Stage& stage, const Arguments& arguments);
};

// The tables, by subject. Of two forms with the same first word, the first that fits is taken.
std::span<const StatementKind> settingUpStatements();
std::span<const StatementKind> drivingStatements();
std::span<const StatementKind> hostStatements();
std::span<const StatementKind> expectingStatements();

/// All of them. A parsed statement's `form` is an index into this.
const std::vector<StatementKind>& statementKinds();

/// The language, as the parser needs to know it.
const Vocabulary& vocabulary();

}  // namespace tools::scenario
