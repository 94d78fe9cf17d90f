// SPDX-License-Identifier: MIT
// Writes what checks have found.
#pragma once

#include <iosfwd>
#include <string>
#include <string_view>
#include <vector>

#include "tools/check/check.hpp"

namespace qz::tools::check {

/// A verdict with what its report needs.
struct Report {
  const Verdict& verdict;
  const InputFile& file;
  std::string stageArguments;  ///< the arguments of `play` that set up the window, or empty
  Severity failOn;             ///< the least severity that fails
};

/// A script that could not be checked.
struct Unchecked {
  std::string script;   ///< its path
  std::string message;  ///< where, what is wrong, and what was expected
};

/// What one run of the command reports. Each part has the order of the command line.
struct RunReport {
  std::vector<Report> scripts;       ///< those that were checked
  std::vector<Unchecked> unchecked;  ///< the others
};

/// A format of the reports.
struct ReportFormat {
  std::string_view name;
  std::string_view description;  ///< for the help
  void (*write)(const RunReport& run, bool color, std::ostream& out);
};

/// Returns the formats, the standard one first.
std::vector<ReportFormat> reportFormats();

void writeText(const RunReport& run, bool color, std::ostream& out);
void writeSarif(const RunReport& run, bool color, std::ostream& out);
void writeJunit(const RunReport& run, bool color, std::ostream& out);
void writeGithub(const RunReport& run, bool color, std::ostream& out);
void writeJson(const RunReport& run, bool color, std::ostream& out);

/// Returns where in the script a finding is; absent for one elsewhere, or in a binary file.
std::optional<toolkit::TextPosition> positionOf(const Finding& finding, const InputFile& file);
/// Returns the path of the file in which the finding's cause is.
const std::string& pathOf(const Finding& finding, const InputFile& file);
/// Returns the place of a finding, such as "intro.plist:12:5"; the path alone if that is all.
std::string placeOf(const Finding& finding, const InputFile& file);

/// Returns the text as one word of a shell's command line.
std::string shellWord(const std::string& text);
/// Returns the arguments of `play` that set up the window of the options, each after a space.
std::string stageArguments(const CheckOptions& options);
/// Returns the command line that plays a path of the report's script.
std::string playCommand(const Report& report, const Path& path);
/// Returns the arguments of `play` that walk a path, such as "--start 1 --press 2 3".
std::string playArguments(const Path& path, const walkthrough::Names& names = {});

}  // namespace qz::tools::check
