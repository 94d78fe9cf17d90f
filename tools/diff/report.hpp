// SPDX-License-Identifier: MIT
// Writes what users would notice.
#pragma once

#include <iosfwd>
#include <string>
#include <string_view>
#include <vector>

#include "tools/diff/diff.hpp"

namespace qz::tools::diff {

/// A comparison with what its report needs.
struct Report {
  const Both<Subject>& subjects;
  const Diff& diff;
  Both<std::string> play;  ///< the command lines of `play` without the moves; empty where the file
                           ///< does not stay
  Both<std::string> name;  ///< of the scripts, for people
};

/// A format of the reports.
struct ReportFormat {
  std::string_view name;
  void (*write)(const Report& report, bool color, std::ostream& out);
};

/// Returns the formats, the standard one first.
std::vector<ReportFormat> reportFormats();

void writeText(const Report& report, bool color, std::ostream& out);
void writeJson(const Report& report, bool color, std::ostream& out);

}  // namespace qz::tools::diff
