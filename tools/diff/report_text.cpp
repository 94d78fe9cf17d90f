// SPDX-License-Identifier: MIT
// The report for people.
#include <algorithm>
#include <ostream>

#include "tools/check/report.hpp"
#include "tools/diff/report.hpp"
#include "tools/play/words.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::diff {
namespace {

std::string counted(std::size_t count, const std::string& noun) {
  return std::to_string(count) + " " + noun + (count == 1 ? "" : "s");
}

class TextReport {
 public:
  TextReport(const Report& report, bool color, std::ostream& out)
      : report_(report), isColored_(color), out_(out) {}

  void write() {
    out_ << bold(oneLine(report_.name.before + " → " + report_.name.after)) << '\n';
    writeChanges("Behaviour and looks", false);
    writeChanges("Words", true);
    writeFindings();
    writeSummary();
  }

 private:
  std::string bold(const std::string& text) const {
    return isColored_ ? "\x1b[1m" + text + "\x1b[0m" : text;
  }

  void writeChanges(const char* heading, bool words) {
    const char* separator = heading;
    for (const Change& change : report_.diff.changes) {
      if (change.isWords() != words) continue;
      if (*separator) out_ << '\n' << bold(std::exchange(separator, "")) << '\n';
      writeChange(change);
    }
  }

  void writeChange(const Change& change) {
    out_ << "  " << oneLine(wordsFor(change));
    if (change.steps > 1) out_ << ", and at " << counted(change.steps - 1, "other step");
    out_ << '\n';
    if (change.kind == Change::Kind::move) writeTargets(change.controls);
    writePath("before", Side::before, change.path);
    writePath("now", Side::after, change.path);
  }

  std::string wordsFor(const Change& change) const {
    const auto& [before, after] = change.target;
    switch (change.kind) {
      case Change::Kind::goneStep:
        return "gone: " + change.step.before.words();
      case Change::Kind::newStep:
        return "new: " + change.step.after.words();
      case Change::Kind::move:
        return moveWords(change) + " leads to " + after.words() + " instead of " + before.words();
      case Change::Kind::wait:
        return "the wait at " + stepWords(change) + ": " + secondsWords(change.seconds.after) +
               " instead of " + secondsWords(change.seconds.before);
      case Change::Kind::look:
        break;
    }
    const std::string control = controlWords(change.controls.front());
    return isAboutWindows() ? control : control + ", at " + stepWords(change);
  }

  /// Windows have no steps.
  bool isAboutWindows() const { return report_.subjects.after.isWindow; }

  std::string moveWords(const Change& change) const {
    if (change.isStart) return "the start";
    const std::string move =
        change.pressed ? "a press of " + nameOfControl(*change.pressed) : std::string("the wait");
    return move + " at " + stepWords(change);
  }

  static std::string stepWords(const Change& change) {
    const auto& [before, after] = change.step;
    const bool isSame = before.name == after.name;
    return isSame ? after.words() : after.words() + " (before: " + before.words() + ")";
  }

  static std::string secondsWords(const std::optional<double>& seconds) {
    return seconds ? play::numberWords(*seconds) + " s" : "none";
  }

  std::string nameOfControl(std::size_t joint) const {
    return factsOf(report_.diff, joint).words();
  }

  std::string controlWords(const ControlChange& change) const {
    return (change.control ? nameOfControl(*change.control) : std::string("the window")) + ": " +
           valueWords(change.property);
  }

  static std::string valueWords(const PropertyChange& change) {
    const auto& [before, after] = change.values;
    if (before == no && after == yes) return "now " + change.property;
    if (before == yes && after == no) return "no longer " + change.property;
    return change.property + " " + after + " instead of " + before;
  }

  void writeTargets(const std::vector<ControlChange>& controls) {
    constexpr std::size_t mostShown = 5;
    for (std::size_t i = 0; i < std::min(controls.size(), mostShown); ++i) {
      out_ << "    there: " << oneLine(controlWords(controls[i])) << '\n';
    }
    if (controls.size() > mostShown) {
      out_ << "    there: " << counted(controls.size() - mostShown, "other difference") << '\n';
    }
  }

  void writePath(const char* title, Side side, const Both<check::Path>& paths) {
    if (paths[side].empty() || isAboutWindows()) return;
    const std::string& play = report_.play[side];
    out_ << "    " << title << ": "
         << oneLine((play.empty() ? play : play + " ") +
                    check::playArguments(paths[side], report_.subjects[side].options.stage.names))
         << '\n';
  }

  void writeFindings() {
    const char* separator = "\n";
    for (const Side side : bothSides) {
      for (const check::Finding& finding : report_.diff.findings[side]) {
        if (finding.severity == check::Severity::note) continue;  // the summary counts them
        if (*separator) out_ << std::exchange(separator, "") << bold("Findings of check") << '\n';
        writeFinding(side, finding);
      }
    }
  }

  void writeFinding(Side side, const check::Finding& finding) {
    out_ << (side == Side::before ? "  went: " : "  came: ")
         << oneLine(check::placeOf(finding, report_.subjects[side].file)) << ": "
         << nameOf(finding.severity) << ": " << oneLine(finding.message) << " [" << finding.code
         << "]\n";
    Both<check::Path> paths;
    paths[side] = finding.path;
    writePath("see it", side, paths);
  }

  void writeSummary() {
    const auto& changes = report_.diff.changes;
    const auto words = static_cast<std::size_t>(std::count_if(
        changes.begin(), changes.end(), [](const Change& change) { return change.isWords(); }));
    const auto& [went, came] = report_.diff.findings;
    if (!changes.empty() || !went.empty() || !came.empty()) out_ << '\n';
    if (changes.empty()) {
      out_ << (report_.diff.isComplete ? "no difference for users" : "no difference was found");
    } else {
      out_ << counted(changes.size() - words, "change") << " of behaviour and looks, " << words
           << " of words";
    }
    if (!went.empty() || !came.empty()) {
      out_ << "; " << counted(came.size(), "finding") << " came, " << went.size() << " went";
    }
    out_ << (report_.diff.isComplete ? "" : "; not everything was compared: --limit was reached")
         << '\n';
  }

  const Report& report_;
  bool isColored_;
  std::ostream& out_;
};

}  // namespace

void writeText(const Report& report, bool color, std::ostream& out) {
  TextReport(report, color, out).write();
}

}  // namespace qz::tools::diff
