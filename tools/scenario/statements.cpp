// SPDX-License-Identifier: MIT
// Collects the statements of the language.

#include "tools/scenario/statements.hpp"

#include "tools/scenario/command_names.hpp"
#include "tools/scenario/properties.hpp"

namespace qz::tools::scenario {

const std::vector<StatementKind>& statementKinds() {
  static const auto kinds = [] {
    std::vector<StatementKind> all;
    for (const auto table :
         {settingUpStatements(), drivingStatements(), hostStatements(), expectingStatements()}) {
      all.insert(all.end(), table.begin(), table.end());
    }
    return all;
  }();
  return kinds;
}

const Vocabulary& vocabulary() {
  static const auto vocabulary = [] {
    Vocabulary all{
        {}, engineProperties(), controlProperties(), windowProperties(), commandConstants()};
    for (const auto& kind : statementKinds()) all.forms.push_back({kind.syntax, kind.result});
    return all;
  }();
  return vocabulary;
}

}  // namespace qz::tools::scenario
