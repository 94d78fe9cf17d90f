// SPDX-License-Identifier: MIT
// Explores a script, writes the source, builds it, explores what was built, and compares.
#include "tools/lift/lift.hpp"

#include <string>
#include <variant>

#include "tools/comparison/comparison.hpp"
#include "tools/lift/draft.hpp"
#include "tools/lift/way_back.hpp"
#include "tools/steps/compiler.hpp"
#include "tools/steps/source.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::lift {
namespace {

using comparison::Difference;
using comparison::Played;

class Lifter {
 public:
  Lifter(const InputFile& file, const Played& played, const LiftOptions& options)
      : file_(file),
        options_(options),
        played_(played),
        script_(played.script),
        behavior_(played, looks_, options.limits, options.threads, options.hooks),
        stand_(played.plan, played.resources, looks_),
        sayings_(stand_, script_) {}

  Lifted run() {
    requireComplete(behavior_, "the script");
    refuseEndlessRuns();
    std::optional<Failure> reason;
    for (const States states : {States::ofUser, States::exact}) {
      try {
        return attemptWith(states);
      } catch (const Failure& failure) {
        reason = failure;
      }
    }
    throw *reason;  // NOLINT(misc-throw-by-value-catch-by-reference): of an attempt before
  }

 private:
  void requireComplete(const Behavior& behavior, const std::string& what) const {
    if (behavior.isComplete()) return;
    throw Failure(ExitStatus::failed,
                  file_.path() + ": " + what + " has more places than the limit of " +
                      std::to_string(options_.limits.places) + "; expected a higher --limit");
  }

  void refuseEndlessRuns() const {
    const auto start = behavior_.starts().front();
    if (!start) fail(0, "the start runs lists without end");
    if (behavior_.situations()[*start].isOver) fail(0, "the walk-through ends at its start");
    for (const auto& situation : behavior_.situations()) {
      for (const auto& [move, to] : situation.moves) {
        if (!to) refuseEndless(situation.visit, move);
      }
    }
  }

  [[noreturn]] void refuseEndless(std::uint32_t visit, check::Move move) const {
    const auto& exploration = behavior_.exploration();
    const auto place = exploration.visits()[visit].place;
    const auto step = exploration.stepFrom(place, move);
    const auto* const press = std::get_if<check::PressMove>(&step);
    const auto list = press ? script_.listOfTag(press->tag)
                            : script_.listUnder(exploration.timers(place).front().key);
    failAt(list, wordsFor(step) + " runs lists without end");
  }

  Lifted attemptWith(States states) {
    try {
      const Walk walk = walkOf(behavior_, states);
      const Walk back = withBack(behavior_, walk);
      return back.goesBack ? attemptEither(back, walk) : attempt(walk);
    } catch (const Unsayable& unsayable) {
      explain(unsayable);
    }
  }

  Lifted attemptEither(const Walk& one, const Walk& other) {
    try {
      return attempt(one);
    } catch (const Failure&) {
      return attempt(other);
    }
  }

  Lifted attempt(const Walk& walk) {
    const std::string source = Draft(behavior_, walk, stand_, sayings_).text(options_.window);
    requireNoDifference(source);
    return {source, walk.steps.size()};
  }

  /// Fails at the command that did what cannot be said, or else at the list that had the last word.
  [[noreturn]] void explain(const Unsayable& unsayable) {
    const auto& situation = behavior_.situations()[unsayable.situation()];
    const std::string message = subject(unsayable.control()) + unsayable.what();
    for (const check::ScriptList& list : script_.lists()) {
      for (const check::Element& element : list.elements) {
        if (!isToBlame(element, situation, unsayable.control())) continue;
        throw Failure(ExitStatus::failed, file_.placeOf(element.value) + ": list " +
                                              quote(list.key) + ": " +
                                              std::string(element.command->name) + ": " + message);
      }
    }
    fail(situation.visit, message);
  }

  /// Whether a command alone makes the control look so, or starts such a wait.
  bool isToBlame(const check::Element& element, const comparison::Situation& situation,
                 const std::optional<ControlIndex>& control) {
    if (!element.command) return false;
    if (control) {
      if (element.command->target == TargetKind::none) return false;  // it may run lists
      const LookValue look = stand_.withoutState(situation.controls[*control].look);
      return look != stand_.show(*control, {}) && stand_.run(*control, element) == look;
    }
    const auto position = element.command->positionOf(ParameterType::seconds);
    const auto seconds = position ? element.parameter(*position) : nullptr;
    return seconds && situation.wait == seconds->doubleValue();
  }

  std::string subject(const std::optional<ControlIndex>& control) const {
    if (!control) return "";
    return "the control with the tag " + std::to_string(stand_.controls()[*control].tag) + ": ";
  }

  /// Throws a Failure at the list that had the last word at a visit.
  [[noreturn]] void fail(std::uint32_t visit, const std::string& message) const {
    const auto& visits = behavior_.exploration().visits();
    const bool hasList = visit < visits.size() && visits[visit].lastList != check::noList;
    failAt(hasList ? std::optional<std::size_t>(visits[visit].lastList) : std::nullopt, message);
  }

  [[noreturn]] void failAt(const std::optional<std::size_t>& list,
                           const std::string& message) const {
    if (!list) throw Failure(ExitStatus::failed, file_.path() + ": " + message);
    const check::ScriptList& found = script_.lists()[*list];
    throw Failure(ExitStatus::failed,
                  file_.placeOf(found.keyValue) + ": list " + quote(found.key) + ": " + message);
  }

  static std::string wordsFor(const check::Step& step) {
    if (const auto* press = std::get_if<check::PressMove>(&step)) {
      return "a press of the tag " + std::to_string(press->tag);
    }
    return std::holds_alternative<check::WaitMove>(step) ? "a wait" : "the start";
  }

  steps::Built build(const std::string& source) const {
    const auto readControls = [&](const walkthrough::StageOptions&) { return stand_.controls(); };
    const auto read = steps::readSourceText(
        "the source", source, {.readControls = readControls, .readText = {}});  // includes nothing
    steps::Mistakes mistakes;
    auto built = steps::build(read.tour, {0}, mistakes);
    mistakes.throwIfAny(read.files);
    return built;
  }

  void requireNoDifference(const std::string& source) {
    const auto built = build(source);
    Played again = played_;
    again.script = built.script;
    again.startKeys = built.startKeys;
    const Behavior after(again, looks_, options_.limits, options_.threads, options_.hooks);
    requireComplete(after, "the built script");
    const auto differences = compare(behavior_, after);
    if (!differences.empty()) refuse(differences.front());
  }

  [[noreturn]] void refuse(const Difference& difference) const {
    std::string path;
    for (const check::Step& step : pathIn(behavior_, difference.path)) {
      path += (path.empty() ? "" : ", ") + wordsFor(step);
    }
    const bool hasVisit = difference.before.has_value();
    fail(hasVisit ? behavior_.situations()[*difference.before].visit : 0,
         "built again it would be different after " + path + ": " + subject(difference.control) +
             difference.words);
  }

  const InputFile& file_;
  const LiftOptions& options_;
  const Played& played_;
  check::Script script_;
  check::Looks looks_;
  Behavior behavior_;
  Stand stand_;
  Sayings sayings_;
};

}  // namespace

Lifted liftScript(const InputFile& file, const Played& played, const LiftOptions& options) {
  return Lifter(file, played, options).run();
}

}  // namespace qz::tools::lift
