// SPDX-License-Identifier: MIT
// The statements of the language: how each is written, and what it does.
#pragma once

#include <span>
#include <vector>

#include "tools/scenario/arguments.hpp"
#include "tools/scenario/stage.hpp"
#include "tools/scenario/vocabulary.hpp"

namespace qz::tools::scenario {

struct StatementKind {
  std::string_view syntax;
  Result result;
  Outcome (*run)(Stage& stage, const Arguments& arguments);
};

// The tables, by subject. If several forms begin with the same word, the first that fits is used.
std::span<const StatementKind> settingUpStatements();
std::span<const StatementKind> drivingStatements();
std::span<const StatementKind> hostStatements();
std::span<const StatementKind> expectingStatements();

/// Returns all statements. A parsed statement's `form` is an index into them.
const std::vector<StatementKind>& statementKinds();

/// Returns the language, as the parser needs to know it.
const Vocabulary& vocabulary();

}  // namespace qz::tools::scenario
