// SPDX-License-Identifier: MIT
// The stack guard: instead of a bare crash, one line that says which lists ran each other without
// end.
//
// All that it will say is worked out beforehand, for when the stack is exhausted there is no room,
// and no certainty about any lock, to work anything out.
#pragma once

#include <memory>
#include <string>

#include "QZ_Plist_State_Parser.hpp"

namespace tools {

/// The exit status of a tool whose script exhausted the stack.
inline constexpr int stackExhausted = 3;

/// From now on an exhausted stack ends the program with `stackExhausted` and one line on standard
/// error. Where the system has no such signals, nothing changes.
void installStackGuard();

/// Names the script that `engine` is about to run, as `name` calls it, and works out its endless
/// chains. `engine` must live until the next call, or until `forgetScript`.
void guardScript(const QZ_Plist_State_Parser& engine, const std::string& name,
                 const toolkit::ValueRef<toolkit::Dictionary>& script);
void forgetScript();

}  // namespace tools
