// SPDX-License-Identifier: MIT
// The same calls from Lua: the toolkit's operations bound one to one, as lean as a binding can be
// (views are bare pointers, nothing is checked), and a script that calls them.
#pragma once

#include <memory>
#include <vector>

#include "bench/operations.hpp"
#include "toolkit/window.hpp"

struct lua_State;

namespace bench {

class LuaWalkthrough {
 public:
  /// Compiles a script of the operations, one call a line. The window outlives this.
  LuaWalkthrough(toolkit::Window& window, const std::vector<Operation>& operations);
  ~LuaWalkthrough();
  LuaWalkthrough(const LuaWalkthrough&) = delete;
  LuaWalkthrough& operator=(const LuaWalkthrough&) = delete;

  void run();

 private:
  lua_State* lua_;  // ours
};

}  // namespace bench
