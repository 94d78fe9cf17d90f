// SPDX-License-Identifier: MIT
// Checks that the parser of scenario files returns scenarios, or a reason with a place in the file.
#include <algorithm>
#include <cstdint>

#include "fuzz/require.hpp"
#include "tools/scenario/parser.hpp"
#include "tools/scenario/statements.hpp"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  using qz::fuzz::require;
  const std::string_view text(reinterpret_cast<const char*>(data), size);
  const auto lines = 1 + std::count(text.begin(), text.end(), '\n');
  try {
    const auto file = qz::tools::scenario::parseScenarios(text, qz::tools::scenario::vocabulary());
    require(!file.scenarios.empty(), "a file has scenarios");
    for (const auto& scenario : file.scenarios) {
      require(scenario.line >= 1 && scenario.line <= lines, "a scenario begins in the file");
    }
  } catch (const qz::tools::scenario::SyntaxError& error) {
    require(!std::string_view(error.what()).empty(), "a refusal has a reason");
    require(error.at().line >= 1 && error.at().line <= lines && error.at().column >= 1,
            "a refusal points into the file");
  }
  return 0;
}
