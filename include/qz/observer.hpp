// SPDX-License-Identifier: MIT
// Observer: lets hosts and tools follow what an engine does, for example to log or measure it.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>

#include "qz/api.hpp"
#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"
#include "qz/toolkit/exception.hpp"
#include "qz/toolkit/tag.hpp"
#include "qz/toolkit/view.hpp"

namespace qz {

/// The engine calls these functions while it works. By default they do nothing; a subclass
/// overrides the ones it needs. They run on the engine's thread. They must not raise a
/// toolkit::Exception, nor call the engine's operations; the engine's getters are allowed. An
/// exception of another type stops the operation in its middle and reaches the operation's caller.
class QZ_API Observer {
 public:
  using Value = toolkit::ValueRef<>;                    ///< a value of a script
  using ObjectId = toolkit::ValueRef<toolkit::Number>;  ///< the number of a control

  virtual ~Observer() = default;

  /// A list is about to run for an object id, which may be absent. Lists nest: a command may run
  /// another list.
  virtual void listWillRun(const Value& /*list*/, const ObjectId& /*id*/) {}
  /// The innermost running list has ended.
  virtual void listDidRun(const Value& /*list*/, const ObjectId& /*id*/) {}

  /// The list's element at `index`, counted from 0, is about to run.
  virtual void commandWillRun(const Value& /*list*/, std::size_t /*index*/) {}
  /// The command has returned this result.
  virtual void commandDidRun(const Value& /*list*/, std::size_t /*index*/, bool /*result*/) {}
  /// The command has raised, and the engine has logged the exception. The list continues with the
  /// next element.
  virtual void commandRaised(const Value& /*list*/, std::size_t /*index*/,
                             const toolkit::Exception& /*exception*/) {}

  /// The engine has looked up a control by its tag; `control` is absent if there is none.
  virtual void controlSought(toolkit::Tag /*tag*/, const toolkit::Ref<toolkit::View>& /*control*/) {
  }

  /// The user or a timer has pressed a control; the list under its tag, if there is one, follows.
  /// Pending timers are cancelled before.
  virtual void controlPressed(const toolkit::Ref<toolkit::View>& /*control*/) {}

  /// An object timer of `seconds` has started under a tag key. It replaces a pending timer under
  /// that key.
  virtual void timerSet(std::string_view /*key*/, double /*seconds*/) {}
  /// The object timer under a tag key has fired; its press or list follows.
  virtual void timerFired(std::string_view /*key*/) {}
  /// The pending object timer under a tag key has been cancelled.
  virtual void timerCancelled(std::string_view /*key*/) {}
};

}  // namespace qz
