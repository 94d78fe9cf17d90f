// SPDX-License-Identifier: MIT
// Observer: watches an engine at work, for hosts that log or measure and for tools.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>

#include "toolkit/exception.hpp"
#include "toolkit/property_list/collections.hpp"
#include "toolkit/property_list/scalars.hpp"
#include "toolkit/tag.hpp"
#include "toolkit/view.hpp"

namespace qz {

/// Is told what an engine does, while the engine does it. Every function does nothing by default: a
/// subclass overrides those that it needs. They are called on the engine's thread, and must neither
/// raise nor call the engine's operations; its getters are allowed.
class Observer {
 public:
  using Value = toolkit::ValueRef<>;
  using ObjectId = toolkit::ValueRef<toolkit::Number>;

  virtual ~Observer() = default;

  /// A list begins to run for an object id, which may be absent. Lists nest: a command may run
  /// another list.
  virtual void listWillRun(const Value& /*list*/, const ObjectId& /*id*/) {}
  /// The list that began last has run to its end.
  virtual void listDidRun(const Value& /*list*/, const ObjectId& /*id*/) {}

  /// The list's element at `index`, counted from 0, is about to run.
  virtual void commandWillRun(const Value& /*list*/, std::size_t /*index*/) {}
  /// The command has run with this result.
  virtual void commandDidRun(const Value& /*list*/, std::size_t /*index*/, bool /*result*/) {}
  /// The command has raised, and the engine's log line says so; the list goes on behind it.
  virtual void commandRaised(const Value& /*list*/, std::size_t /*index*/,
                             const toolkit::Exception& /*exception*/) {}

  /// The engine has looked for a control by its tag; absent when there is none.
  virtual void controlSought(toolkit::Tag /*tag*/, const toolkit::Ref<toolkit::View>& /*control*/) {
  }

  /// An object timer of `seconds` begins under a tag key. A pending one under that key is replaced.
  virtual void timerSet(std::string_view /*key*/, double /*seconds*/) {}
  /// The object timer under a tag key has fired; its press or list comes next.
  virtual void timerFired(std::string_view /*key*/) {}
  /// The pending object timer under a tag key will not fire.
  virtual void timerCancelled(std::string_view /*key*/) {}
};

}  // namespace qz
