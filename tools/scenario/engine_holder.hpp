// SPDX-License-Identifier: MIT
// The engine of a scenario, as its host holds it and as an observer sees it.
#pragma once

#include <memory>
#include <vector>

#include "qz/engine.hpp"

namespace qz::tools::scenario {

using Engine = QZ_Plist_State_Parser;

class EngineHolder {
 public:
  EngineHolder() = default;
  /// Stops the timers of engines that still exist: a running flasher would keep its engine alive.
  ~EngineHolder();
  EngineHolder(const EngineHolder&) = delete;
  EngineHolder& operator=(const EngineHolder&) = delete;

  /// Holds a new engine in place of the one before.
  void begin(std::shared_ptr<Engine> engine);
  /// Releases the engine that the host holds.
  void release();

  /// Returns the engine that the host holds; throws an Unmet if it holds none.
  std::shared_ptr<Engine> held() const;
  /// Returns the engine, whether or not the host still holds it; null if there is none (any more).
  std::shared_ptr<Engine> current() const { return current_.lock(); }
  /// The same; throws an Unmet instead of returning null.
  std::shared_ptr<Engine> existing() const;

 private:
  std::shared_ptr<Engine> held_;              // the host's
  std::weak_ptr<Engine> current_;             // the latest
  std::vector<std::weak_ptr<Engine>> begun_;  // all of them
};

}  // namespace qz::tools::scenario
