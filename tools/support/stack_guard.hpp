// SPDX-License-Identifier: MIT
// The stack guard: turns a crash into one line that says which lists ran each other without end.
//
// The lines are prepared beforehand: once the stack is exhausted, there is no room to build them,
// and any lock may be held.
#pragma once

#include <memory>
#include <string>

#include "qz/engine.hpp"

namespace qz::tools {

/// The exit status of a tool whose script exhausted the stack.
inline constexpr int stackExhausted = 3;

/// From now on, an exhausted stack ends the program with `stackExhausted` and one line on standard
/// error while a script is guarded. Does nothing except on Linux.
void installStackGuard();

/// Guards the script that `engine` is about to run: finds its endless chains and prepares the
/// lines, which call the script `name`. `engine` must live until the next call, or until
/// `forgetScript`.
void guardScript(const QZ_Plist_State_Parser& engine, const std::string& name,
                 const toolkit::ValueRef<toolkit::Dictionary>& script);
void forgetScript();

/// Guards a script while this object lives.
class ScriptGuard {
 public:
  ScriptGuard(const QZ_Plist_State_Parser& engine, const std::string& name,
              const toolkit::ValueRef<toolkit::Dictionary>& script) {
    guardScript(engine, name, script);
  }
  ~ScriptGuard() { forgetScript(); }
  ScriptGuard(const ScriptGuard&) = delete;
  ScriptGuard& operator=(const ScriptGuard&) = delete;
};

}  // namespace qz::tools
