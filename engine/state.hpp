// SPDX-License-Identifier: MIT
// The state of an engine. Only the engine's own sources include this header.
#pragma once

#include <array>
#include <optional>
#include <utility>

#include "engine/keep_alive.hpp"
#include "engine/property.hpp"
#include "qz/engine.hpp"

namespace qz {

/// The engine owns the tables, and the walk-through window and the controls that it built.
struct QZ_Plist_State_Parser::State {
  State(toolkit::Toolkit& usedToolkit, std::shared_ptr<Subclass> usedSubclass)
      : toolkit(usedToolkit), subclass(std::move(usedSubclass)) {}

  /// Notifies the observer, if there is one.
  template <class... Parameters, class... Arguments>
  void notify(void (Observer::*event)(Parameters...), const Arguments&... arguments) const {
    if (observer) [[unlikely]]
      tell(event, arguments...);
  }
  /// Keeps the observer alive meanwhile, because it may be replaced. Not inlined, so that commands
  /// that nobody observes stay fast.
  template <class... Parameters, class... Arguments>
  [[gnu::noinline]] void tell(void (Observer::*event)(Parameters...),
                              const Arguments&... arguments) const {
    const auto told = observer;
    ((*told).*event)(arguments...);
  }

  /// Performs an operation as the subclass overrides it; absent if it does not. Every operation
  /// that the engine itself calls begins with this.
  template <class... Arguments>
  std::optional<Subclass::Result> overridden(std::string_view operation,
                                             const Arguments&... arguments) const {
    if (!subclass) [[likely]]
      return std::nullopt;
    return performed(operation, arguments...);
  }
  /// Keeps the subclass alive meanwhile, because it may release the engine.
  template <class... Arguments>
  [[gnu::noinline]] std::optional<Subclass::Result> performed(std::string_view operation,
                                                              const Arguments&... arguments) const {
    const auto performer = subclass;
    if (!performer->overrides(operation)) return std::nullopt;
    const std::array<Subclass::Argument, sizeof...(arguments)> all{argumentOf(arguments)...};
    return performer->perform(operation, all);
  }

  template <class Argument>
  static Subclass::Argument argumentOf(const Argument& argument) {
    if constexpr (std::is_same_v<Argument, std::optional<std::string>>) {
      return argument ? argumentOf(std::string_view(*argument)) : Value();
    } else if constexpr (std::is_same_v<Argument, std::string_view>) {
      return Value(toolkit::String::make(argument));
    } else {
      return argument;
    }
  }

  /// Returns the reference to the engine that its timers hold: with the object of the subclass.
  std::shared_ptr<QZ_Plist_State_Parser> forTimers(
      std::shared_ptr<QZ_Plist_State_Parser> engine) const {
    if (!subclass) return engine;
    auto both = std::make_shared<std::pair<decltype(engine), std::shared_ptr<void>>>(
        engine, subclass->object());
    return {std::move(both), engine.get()};
  }

  toolkit::Toolkit& toolkit;  // the host's; outlives the engine
  std::shared_ptr<Subclass> subclass;
  std::shared_ptr<Observer> observer;
  bool isKept = false;  // YES while an operation runs; see KeepAlive

  bool flashing = false;
  bool runningAsSheet = false;
  bool terminating = false;
  bool hasTerminated = false;
  Property<toolkit::StoredRef<toolkit::Window>> window;
  Property<Dictionary> plistDictionary;
  Property<Value> commandArray;
  Property<ObjectId> objectId;
  Property<Timer> flashingTimer;
  Property<Dictionary> flashingTagIds;
  Property<toolkit::StoredRef<toolkit::Window>> tutorialWindow;
  Property<Controls> addedObjectToTutorial;
  Property<GuiAssets> guiAssets;
  Property<ObjectId> lastTagId;
  Property<Timers> objectIdTimers;
  Dictionary buttonStates;
  Property<Dictionary> originalTagValues;
};

inline KeepAlive QZ_Plist_State_Parser::keepAlive() { return {*this, state_->isKept}; }

}  // namespace qz
