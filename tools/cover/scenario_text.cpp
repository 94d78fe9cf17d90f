// SPDX-License-Identifier: MIT
// A move is followed by what differs from before; the start, by all that can be expected.
#include "tools/cover/scenario_text.hpp"

#include <algorithm>
#include <sstream>

#include "tools/check/replay.hpp"
#include "tools/cover/control_names.hpp"
#include "tools/scenario/text_properties.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::cover {
namespace {

using check::quotedWord;
using check::yesNo;
using drivers::ViewPicture;
using walkthrough::ControlPicture;
using walkthrough::StepPicture;

constexpr std::size_t longestFileName = 60;

/// Expects what differs between two pictures of one control; all that is there to see, at the start
/// and if the control was hidden. What a hidden control has is nobody's business, but for its tag.
class ControlExpectations {
 public:
  ControlExpectations(const std::string& name, const ControlPicture& before, bool isStart,
                      const ControlPicture& after, std::ostream& out)
      : name_(name),
        before_(isStart || before.view.hidden ? nullptr : &before.view),
        after_(after.view),
        out_(out) {
    if (before.view.tag != after_.tag) expect("tag", std::to_string(after_.tag));
    if (isStart || before.view.hidden != after_.hidden) expect("hidden", yesNo(after_.hidden));
    if (after_.hidden) return;
    const auto& row = drivers::rowOf(after_.kind);
    if (row.isControl && differs(&ViewPicture::enabled)) expect("enabled", yesNo(after_.enabled));
    if (row.showsState && differs(&ViewPicture::state)) {
      expect("state", std::to_string(static_cast<int>(after_.state)));
    }
    expectCaption(row);
    expectIfSet("tooltip", &ViewPicture::toolTip, quotedWord(after_.toolTip));
    const auto& color = after_.background;
    expectIfSet("background", &ViewPicture::background,
                color ? quotedWord(scenario::showColor(*color)) : "absent");
    if (after.flashing && (isStart || !before.flashing)) {
      out_ << "expect engine.flashingTagIds." << after_.tag << " YES\n";
    }
  }

 private:
  template <class Value>
  bool differs(Value ViewPicture::*value) const {
    return !before_ || before_->*value != after_.*value;
  }

  void expect(const char* property, const std::string& words) {
    out_ << "expect " << name_ << '.' << property << ' ' << words << '\n';
  }

  /// Expects a value that most controls do not have.
  template <class Value>
  void expectIfSet(const char* property, Value ViewPicture::*value, const std::string& words) {
    const bool isSet = before_ ? differs(value) : after_.*value != Value{};
    if (isSet) expect(property, words);
  }

  void expectCaption(const drivers::ViewKindRow& row) {
    if (row.caption == drivers::Caption::title) expectText("title", &ViewPicture::title);
    if (row.caption == drivers::Caption::text) expectText("text", &ViewPicture::text);
    if (row.caption == drivers::Caption::imageName && differs(&ViewPicture::image)) {
      expect("image", after_.image ? quotedWord(*after_.image) : "absent");
    }
  }

  /// Expects the characters; the runs instead, if the text has attributes or had some.
  void expectText(const char* property, toolkit::AttributedString ViewPicture::*text) {
    if (!differs(text)) return;
    const auto runs = scenario::showRuns(after_.*text);
    if (isPlain(runs) && (!before_ || isPlain(scenario::showRuns(before_->*text)))) {
      expect(property, quotedWord((after_.*text).string()));
    } else {
      expect("runs", runs.dump());
    }
  }

  static bool isPlain(const scenario::Json& runs) {
    return runs.empty() || (runs.size() == 1 && runs[0][1].empty());
  }

  const std::string& name_;
  const ViewPicture* before_;
  const ViewPicture& after_;
  std::ostream& out_;
};

/// Whether some command starts a timer: then it matters where none is pending.
bool hasTimers(const check::Script& script) {
  const auto startsOne = [](const check::Element& element) {
    return element.command && element.command->name.find("TIMER") != std::string_view::npos;
  };
  const auto& lists = script.lists();
  return std::any_of(lists.begin(), lists.end(), [&](const check::ScriptList& list) {
    return std::any_of(list.elements.begin(), list.elements.end(), startsOne);
  });
}

class Writer {
 public:
  Writer(const check::WrittenPlay& play, const check::Path& path) : play_(play), path_(path) {}

  WrittenScenario write() {
    check::playEach(play_.setting, path_, [&](const check::SeenMove& move) { add(move); });
    std::ostringstream text;
    text << signature << '\n' << "# " << oneLine(what_) << '\n';
    check::writeSetUp(play_, names_, text);
    if (play_.setting.plan.description) nameControls(text);
    text << moves_.str() << "ignore log\n";
    return {slugOf(what_, longestFileName), text.str()};
  }

 private:
  /// For a window that the engine builds, whose controls have no names.
  void nameControls(std::ostream& out) const {
    for (std::size_t i = 0; i < names_.size(); ++i)
      out << "name " << names_[i] << " @" << i << '\n';
  }

  void add(const check::SeenMove& move) {
    const bool isStart = std::holds_alternative<check::StartMove>(move.step);
    if (isStart) names_ = controlNames(move.before);
    const auto* press = std::get_if<check::PressMove>(&move.step);
    const std::string pressed = press ? names_[press->control] : "";
    tell(move.step, pressed);
    if (!isStart) moves_ << '\n';
    check::writeMove(play_, move.step, pressed, moves_);
    moves_ << (move.raised ? " => raises" : "") << '\n';
    expectChanges(move, isStart);
  }

  void tell(const check::Step& step, const std::string& pressed) {
    if (const auto* start = std::get_if<check::StartMove>(&step)) {
      what_ = "from " + start->key + ":";
      return;
    }
    what_ += " " + (pressed.empty() ? std::string("wait") : pressed);
  }

  void expectChanges(const check::SeenMove& move, bool isStart) {
    const StepPicture& after = move.after;
    if (after.ended) {
      moves_ << "expect engine.terminating YES\n";
      return;
    }
    for (std::size_t i = 0; i < after.controls.size(); ++i) {
      ControlExpectations(names_[i], move.before.controls[i], isStart, after.controls[i], moves_);
    }
    if (move.before.flashingAllowed != after.flashingAllowed) {
      moves_ << "expect engine.flashing " << yesNo(after.flashingAllowed) << '\n';
    }
    const bool staysQuiet = after.timers.empty() && hasTimers(play_.setting.script);
    if (staysQuiet || move.before.timers != after.timers) expectTimers(after);
  }

  void expectTimers(const StepPicture& after) {
    if (after.timers.empty()) moves_ << "expect engine.objectIdTimers empty\n";
    for (const auto& timer : after.timers) {
      moves_ << "expect engine.objectIdTimers." << timer.key << ' '
             << check::numberWord(timer.timeLeft) << '\n';
    }
  }

  const check::WrittenPlay& play_;
  const check::Path& path_;
  std::vector<std::string> names_;  // of the controls
  std::string what_;                // the user does
  std::ostringstream moves_;
};

}  // namespace

WrittenScenario scenarioOf(const check::WrittenPlay& play, const check::Path& path) {
  return Writer(play, path).write();
}

}  // namespace qz::tools::cover
