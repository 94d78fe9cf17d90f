// SPDX-License-Identifier: MIT
#include "tools/reading_errors.hpp"

#include <ostream>

#include "tools/check/reading.hpp"
#include "tools/check/report.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools {
namespace {

void writeError(const check::Finding& finding, const InputFile& script, std::ostream& out) {
  const std::string help = finding.help.empty() ? "" : " (" + finding.help + ")";
  out << oneLine(placeOf(finding, script)) << ": error: " << oneLine(finding.message + help) << " ["
      << finding.code << "]\n";
}

}  // namespace

void writeReadingErrors(const InputFile& script, toolkit::Toolkit& toolkit, std::ostream& out,
                        const std::set<std::string_view>& leftOut) {
  bool isAny = false;
  for (const auto& finding : check::readScript(check::Script(script.dictionary()), toolkit)) {
    if (finding.severity != check::Severity::error || leftOut.contains(finding.code)) continue;
    writeError(finding, script, out);
    isAny = true;
  }
  if (!isAny) return;
  out << "For help and more, run: qz-walkthrough check " << check::shellWord(script.path())
      << " (--no-check turns these messages off)\n";
}

}  // namespace qz::tools
