// SPDX-License-Identifier: MIT
// Makes the same calls from Lua: a script that calls the toolkit's operations through the leanest
// possible binding (one to one, views are bare pointers, nothing is checked).
#pragma once

#include <memory>
#include <vector>

#include "bench/operations.hpp"
#include "qz/toolkit/window.hpp"

struct lua_State;

namespace qz::bench {

class LuaWalkthrough {
 public:
  /// Compiles a script of the operations, one call a line. `window` must outlive this object.
  LuaWalkthrough(toolkit::Window& window, const std::vector<Operation>& operations);
  ~LuaWalkthrough();
  LuaWalkthrough(const LuaWalkthrough&) = delete;
  LuaWalkthrough& operator=(const LuaWalkthrough&) = delete;

  void run();

 private:
  lua_State* lua_;  // owned
};

}  // namespace qz::bench
