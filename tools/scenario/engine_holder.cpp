// SPDX-License-Identifier: MIT
// The engine of a scenario.

#include "tools/scenario/engine_holder.hpp"

#include <utility>

#include "tools/scenario/unmet.hpp"

namespace qz::tools::scenario {

EngineHolder::~EngineHolder() {
  for (const auto& begun : begun_) {
    const auto engine = begun.lock();
    if (!engine) continue;
    engine->killAllTimers();
    engine->flashingTimer()->invalidate();
  }
}

void EngineHolder::begin(std::shared_ptr<Engine> engine) {
  current_ = engine;
  begun_.push_back(engine);
  held_ = std::move(engine);
}

// The engine may be destroyed here and call back; by then the host no longer holds it.
void EngineHolder::release() { const auto last = std::exchange(held_, nullptr); }

std::shared_ptr<Engine> EngineHolder::held() const {
  if (!held_) throw Unmet("an engine that the host holds", "none");
  return held_;
}

std::shared_ptr<Engine> EngineHolder::existing() const {
  auto engine = current();
  if (!engine) throw Unmet("an engine", begun_.empty() ? "none" : "a destroyed engine");
  return engine;
}

}  // namespace qz::tools::scenario
