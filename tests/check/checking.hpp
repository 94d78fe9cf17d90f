// SPDX-License-Identifier: MIT
// Checks scripts of the tests.
#pragma once

#include <algorithm>
#include <filesystem>
#include <set>
#include <string>
#include <vector>

#include "tools/check/check.hpp"
#include "tools/support/drivers.hpp"

namespace qz::tools::check {

/// Checks the script in a folder over its `window.plist`, if it has one.
inline Verdict checkFolder(const std::filesystem::path& folder, CheckOptions options = {}) {
  const auto window = folder / "window.plist";
  options.toolkit = testToolkit();
  options.standIn = !std::filesystem::exists(window);
  if (!options.standIn) options.stage.window = window.string();
  return checkScript(InputFile((folder / "script.plist").string(), "a script"), options, {});
}

/// Returns the codes of the findings of at least this severity, each once.
inline std::set<std::string> codesOf(const Verdict& verdict, Severity least = Severity::note) {
  std::set<std::string> codes;
  for (const Finding& finding : verdict.findings) {
    if (finding.severity >= least) codes.insert(finding.code);
  }
  return codes;
}

/// Returns the messages of the findings, for a failing test.
inline std::string messagesOf(const Verdict& verdict) {
  std::string text;
  for (const Finding& finding : verdict.findings) {
    text += finding.list.value_or("-") + ": " + finding.message + " [" + finding.code + "]\n";
  }
  return text;
}

}  // namespace qz::tools::check
