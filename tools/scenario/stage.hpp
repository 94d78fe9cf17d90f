// SPDX-License-Identifier: MIT
// The stage of one scenario: all that its statements act on, fresh for each.
#pragma once

#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <string>

#include "toolkit/test_driver.hpp"
#include "tools/scenario/cast.hpp"
#include "tools/scenario/class_names.hpp"
#include "tools/scenario/command_names.hpp"
#include "tools/scenario/engine_holder.hpp"
#include "tools/scenario/host.hpp"
#include "tools/scenario/log_record.hpp"
#include "tools/scenario/parser.hpp"
#include "tools/scenario/resource_directory.hpp"

namespace tools::scenario {

/// What a property shows: JSON, or nothing for `absent`.
using Reading = std::optional<Json>;

/// Something that the host keeps under a name: a table of the engine, or a timer.
struct Kept {
  std::function<Reading()> read;
  toolkit::Ref<toolkit::Timer> timer;  ///< absent when it is a table
  bool isFlasher = false;
  bool namesClasses = false;  ///< its texts are names of classes
};

/// What a statement's call gave.
struct Outcome {
  Result kind = Result::nothing;
  bool flag = false;
  toolkit::Ref<toolkit::View> control;

  Outcome() = default;
  Outcome(bool result) : kind(Result::flag), flag(result) {}
  Outcome(toolkit::Ref<toolkit::View> found) : kind(Result::control), control(std::move(found)) {}
};

/// A statement that did not go as the scenario says it does.
struct Failed {
  const Statement* statement;  ///< the scenario's, which outlives this
  std::string problem;         ///< "expected …, got …"
};

/// Invariant: what a statement names is found here only; the toolkit's objects are the driver's,
/// which outlives the stage.
class Stage {
 public:
  /// `file` is the scenario's, as messages name it. `performed` is told of every statement that was
  /// performed, and its outcome in words.
  using Performed = std::function<void(const Statement&, const std::string& outcome)>;
  Stage(toolkit::TestDriver& driver, std::string file, Performed performed);
  ~Stage();
  Stage(const Stage&) = delete;
  Stage& operator=(const Stage&) = delete;

  /// Performs a statement and checks its result. Throws a Failed, also one that came of a reaction
  /// to what happened meanwhile.
  void perform(const Statement& statement);
  /// What stands at the end: every log line was expected, everything awaited happened. Throws a
  /// Failed about `last`, the scenario's last statement, where no other one is to blame.
  void requireNothingLeft(const Statement& last);
  /// "FILE:LINE"
  std::string placeOf(const Statement& statement) const;

  toolkit::TestDriver& driver;
  const std::string file;
  const ClassNames classNames;
  const ResourceDirectory resources;
  LogRecord log;
  Reactions reactions;
  const std::shared_ptr<HostResponder> host;
  const std::shared_ptr<SheetRecorder> sheetDelegate;
  RenamedCommands commands;
  EngineHolder engines;
  Cast cast;
  std::map<std::string, Kept> kept;
  /// The description that `entry` writes to.
  Engine::Dictionary entries;
  /// The statement that is being performed.
  const Statement* current = nullptr;

 private:
  void performHere(const Statement& statement);
  void happened(const Reactions::Event& event);
  std::string withPaths(std::string text) const;

  Performed performed_;
  std::optional<Failed> failedReaction_;
};

}  // namespace tools::scenario
