// SPDX-License-Identifier: MIT
// The state of an engine. Only the engine's own sources include this header.
#pragma once

#include "engine/keep_alive.hpp"
#include "engine/property.hpp"
#include "qz/engine.hpp"

namespace qz {

/// The engine owns the tables, and the walk-through window and the controls that it built.
struct QZ_Plist_State_Parser::State {
  explicit State(toolkit::Toolkit& usedToolkit) : toolkit(usedToolkit) {}

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

  toolkit::Toolkit& toolkit;  // the host's; outlives the engine
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
