// SPDX-License-Identifier: MIT
// From the text of a scenario file to its scenarios.
//
// Whatever can be known to be wrong before a scenario runs is refused here: statements that do not
// exist, words that make no sense where they stand, names that nothing declares, properties that
// nothing has. The parser knows the language from a vocabulary and runs nothing.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "tools/scenario/arguments.hpp"
#include "tools/scenario/vocabulary.hpp"

namespace tools::scenario {

/// What stands behind `=>`.
struct Clause {
  bool raises = false;
  Word result;  ///< otherwise
};

struct Statement {
  std::size_t form = 0;  ///< in the vocabulary's forms
  Arguments arguments;
  std::optional<Clause> clause;
  Position at;
  std::string source;  ///< as it is written; of several lines, the first
};

struct Scenario {
  std::string title;  ///< empty: the whole file is the scenario
  int line = 1;
  std::vector<std::string> only;  ///< the toolkits that it is for; empty: all
  std::vector<Statement> statements;
};

struct ScenarioFile {
  std::vector<Statement> common;  ///< what every scenario begins with
  std::vector<Scenario> scenarios;
};

/// The scenarios in `text`, at least one. Throws a SyntaxError.
ScenarioFile parseScenarios(std::string_view text, const Vocabulary& vocabulary);

}  // namespace tools::scenario
