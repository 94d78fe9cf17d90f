// SPDX-License-Identifier: MIT
// Parses the text of a scenario file.
//
// The parser refuses every error that can be found before a scenario runs: unknown statements,
// misplaced words, undeclared names, unknown properties. It knows the language from a vocabulary
// and runs nothing.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "tools/scenario/arguments.hpp"
#include "tools/scenario/vocabulary.hpp"

namespace qz::tools::scenario {

/// What follows `=>`.
struct Clause {
  bool raises = false;
  Word result;  ///< unless `raises`
};

struct Statement {
  std::size_t form = 0;  ///< in the vocabulary's forms
  Arguments arguments;
  std::optional<Clause> clause;
  Position at;
  std::string source;  ///< as written; the first line if there are several
};

struct Scenario {
  std::string title;  ///< empty: the whole file is the scenario
  int line = 1;
  std::vector<std::string> only;  ///< the toolkits that it runs on; empty: all
  std::vector<Statement> statements;
};

struct ScenarioFile {
  std::vector<Statement> common;  ///< performed at the start of every scenario
  std::vector<Scenario> scenarios;
};

/// Returns the scenarios in `text`, at least one. Throws a SyntaxError.
ScenarioFile parseScenarios(std::string_view text, const Vocabulary& vocabulary);

}  // namespace qz::tools::scenario
