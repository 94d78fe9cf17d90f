// SPDX-License-Identifier: MIT
// The stage of one scenario: everything that its statements act on, made new for each scenario.
#pragma once

#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <string>

#include "qz/drivers/driver.hpp"
#include "tools/scenario/cast.hpp"
#include "tools/scenario/class_names.hpp"
#include "tools/scenario/command_names.hpp"
#include "tools/scenario/engine_holder.hpp"
#include "tools/scenario/host.hpp"
#include "tools/scenario/log_record.hpp"
#include "tools/scenario/parser.hpp"
#include "tools/scenario/resource_directory.hpp"

namespace qz::tools::scenario {

/// The value that a property shows, as JSON; no value for `absent`.
using Reading = std::optional<Json>;

/// Something that the host keeps under a name: a table of the engine, or a timer.
struct Kept {
  std::function<Reading()> read;
  toolkit::Ref<toolkit::Timer> timer;  ///< absent if it is a table
  bool isFlasher = false;
  bool namesClasses = false;  ///< its texts are names of classes
};

/// The result of a statement's call.
struct Outcome {
  Result kind = Result::nothing;
  bool flag = false;
  toolkit::Ref<toolkit::View> control;

  Outcome() = default;
  Outcome(bool result) : kind(Result::flag), flag(result) {}
  Outcome(toolkit::Ref<toolkit::View> found) : kind(Result::control), control(std::move(found)) {}
};

/// Thrown if a statement does not do what the scenario says.
struct Failed {
  const Statement* statement;  ///< the scenario's, which outlives this
  std::string problem;         ///< "expected …, got …"
};

/// Invariant: what a statement names is found only here. The driver, which must outlive the stage,
/// owns the toolkit's objects.
class Stage {
 public:
  /// `file` is the scenario's, as messages name it. `performed` is called after each statement that
  /// succeeded, with its outcome in words.
  using Performed = std::function<void(const Statement&, const std::string& outcome)>;
  Stage(drivers::Driver& driver, std::string file, Performed performed);
  ~Stage();
  Stage(const Stage&) = delete;
  Stage& operator=(const Stage&) = delete;

  /// Performs a statement and checks its result. Throws a Failed if the statement fails, or a
  /// reaction to an event during it.
  void perform(const Statement& statement);
  /// Checks at the end that every log line was expected and everything awaited happened. Throws a
  /// Failed, about `last`, the scenario's last statement, if no other statement is to blame.
  void requireNothingLeft(const Statement& last);
  /// Returns "FILE:LINE".
  std::string placeOf(const Statement& statement) const;

  drivers::Driver& driver;
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

}  // namespace qz::tools::scenario
