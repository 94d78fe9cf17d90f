// SPDX-License-Identifier: MIT
// The report for people.
#include <algorithm>
#include <map>
#include <ostream>
#include <set>
#include <sstream>

#include "tools/check/report.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools::check {
namespace {

constexpr std::size_t widestLine = 100;  // columns of a source line

struct Colors {
  bool isOn;
  std::string_view bold() const { return isOn ? "\x1b[1m" : ""; }
  std::string_view plain() const { return isOn ? "\x1b[0m" : ""; }
  std::string_view of(Severity severity) const {
    if (!isOn) return "";
    if (severity == Severity::error) return "\x1b[1;31m";
    return severity == Severity::warning ? "\x1b[1;33m" : "\x1b[1;36m";
  }
};

std::string counted(std::size_t count, const std::string& noun) {
  const std::string many = noun == "press" ? "presses" : noun + "s";
  return std::to_string(count) + " " + (count == 1 ? noun : many);
}

/// Returns how many columns of the terminal come before a position in a line.
std::size_t widthBefore(const std::string& line, const toolkit::TextPosition& position) {
  return displayWidth(oneLine(firstCharacters(line, position.column - 1)));
}

class TextReport {
 public:
  TextReport(const Report& report, bool color, std::ostream& out)
      : report_(report), colors_{color}, out_(out) {}

  void write() {
    for (const Finding& finding : report_.verdict.findings) writeFinding(finding);
    writeSummary();
  }

 private:
  void writeFinding(const Finding& finding) {
    out_ << colors_.bold() << oneLine(placeOf(finding, report_.file)) << ": "
         << colors_.of(finding.severity) << nameOf(finding.severity) << ":" << colors_.plain()
         << ' ' << oneLine(finding.message) << " [" << finding.code << "]\n";
    writeSource(finding);
    writePath(finding.path, "see it");
    writeMoves(finding);
    writePath(finding.otherPath, "and the other");
    if (finding.places > 1) out_ << "  places: " << finding.places << " show it\n";
    if (!finding.help.empty()) out_ << "  help: " << oneLine(finding.help) << '\n';
  }

  const std::vector<std::string>& linesOf(const std::string& path) {
    const auto [known, isNew] = lines_.try_emplace(path);
    std::istringstream source(isNew ? wholeFile(path).value_or("") : "");
    for (std::string line; std::getline(source, line);) known->second.push_back(line);
    return known->second;
  }

  void writeSource(const Finding& finding) {
    const auto text = positionOf(finding, report_.file);
    if (!text) return;
    const auto& lines = linesOf(pathOf(finding, report_.file));
    if (text->line > lines.size()) return;
    const std::string& line = lines[text->line - 1];
    if (displayWidth(line) > widestLine || line.find('\0') != std::string::npos) return;
    out_ << "  | " << oneLine(line) << "\n  | " << std::string(widthBefore(line, *text), ' ')
         << colors_.of(finding.severity) << '^' << colors_.plain() << '\n';
  }

  void writePath(const Path& path, std::string_view title) {
    if (path.empty()) return;
    out_ << "  " << title << ": " << oneLine(playCommand(report_, path)) << '\n';
  }

  /// Writes the moves of a path, unless an earlier finding has the same path.
  void writeMoves(const Finding& finding) {
    if (finding.played.empty()) return;
    if (!shown_.insert(playArguments(finding.path, report_.verdict.names)).second) {
      out_ << "    (the moves are above)\n";
      return;
    }
    for (const PlayedMove& move : finding.played) writeMove(move);
  }

  void writeMove(const PlayedMove& move) {
    out_ << "    " << oneLine(move.words) << ": ";
    for (std::size_t i = 0; i < move.changes.size(); ++i) {
      out_ << (i == 0 ? "" : "; ") << oneLine(move.changes[i]);
    }
    out_ << (move.changes.empty() ? "nothing changes" : "") << '\n';
  }

  void writeSummary() {
    const Explored& explored = report_.verdict.explored;
    out_ << colors_.bold() << oneLine(report_.verdict.path) << colors_.plain() << ": explored "
         << counted(explored.places, "place") << ", " << counted(explored.presses, "press")
         << " and " << counted(explored.waits, "wait") << ", "
         << (explored.complete ? "which are all" : "not everything: " + whyIncomplete(explored))
         << "; " << findingCounts() << '\n';
    writeExpected(report_.verdict.expected);
    if (report_.verdict.inBaseline > 0) {
      out_ << "  The baseline has taken back " << counted(report_.verdict.inBaseline, "finding")
           << ".\n";
    }
    if (report_.verdict.isStandIn) {
      out_ << "  The window was made from the script, so nothing is said about the tags, kinds and "
              "looks of its controls; name the window with --window or --assets.\n";
    }
  }

  void writeExpected(const ExpectationCounts& expected) {
    if (expected.hold + expected.fail + expected.open == 0) return;
    out_ << "  expectations: " << expected.hold << " hold, " << expected.fail << " fail";
    if (expected.open > 0) {
      out_ << ", " << expected.open << " not known, because not everything was explored";
    }
    out_ << '\n';
  }

  static std::string whyIncomplete(const Explored& explored) {
    std::string rest =
        " (the moves of " + counted(explored.frontier, "known place") + " were not made)";
    switch (explored.stop) {
      case Stop::places:
        return "--limit was reached" + rest;
      case Stop::memory:
        return "--memory was reached" + rest;
      case Stop::time:
        return "--seconds have passed" + rest;
      case Stop::cancelled:
        return "you stopped it" + rest;
      case Stop::none:
        break;
    }
    return rest;
  }

  std::string findingCounts() const {
    std::string counts;
    for (const auto severity : {Severity::error, Severity::warning, Severity::note}) {
      const auto count = static_cast<std::size_t>(
          std::count_if(report_.verdict.findings.begin(), report_.verdict.findings.end(),
                        [&](const Finding& each) { return each.severity == severity; }));
      counts += (counts.empty() ? "" : ", ") + counted(count, std::string(nameOf(severity)));
    }
    return counts;
  }

  const Report& report_;
  Colors colors_;
  std::ostream& out_;
  std::map<std::string, std::vector<std::string>> lines_;  // of files, by their paths
  std::set<std::string> shown_;                            // the paths whose moves were written
};

/// Says which of several scripts could not be checked; standard error says why. Of a run with one
/// script, standard error says everything.
void writeUncheckedNames(const RunReport& run, const Colors& colors, std::ostream& out) {
  const std::size_t all = run.scripts.size() + run.unchecked.size();
  if (run.unchecked.empty() || all == 1) return;
  out << colors.of(Severity::error) << run.unchecked.size() << " of " << all
      << " scripts could not be checked" << colors.plain() << ": ";
  for (std::size_t i = 0; i < run.unchecked.size(); ++i) {
    out << (i == 0 ? "" : ", ") << oneLine(run.unchecked[i].script);
  }
  out << '\n';
}

}  // namespace

void writeText(const RunReport& run, bool color, std::ostream& out) {
  for (const Report& report : run.scripts) TextReport(report, color, out).write();
  writeUncheckedNames(run, Colors{color}, out);
}

}  // namespace qz::tools::check
