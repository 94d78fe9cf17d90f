// SPDX-License-Identifier: MIT
#include "bench/lua_walkthrough.hpp"

#include <lua.hpp>

#include <cstdio>
#include <cstdlib>
#include <string>

#include "qz/toolkit/view.hpp"

namespace qz::bench {
namespace {

using toolkit::View;

View& viewAt(lua_State* lua) { return *static_cast<View*>(lua_touserdata(lua, 1)); }

std::string_view textAt(lua_State* lua, int index) {
  std::size_t size = 0;
  const char* text = lua_tolstring(lua, index, &size);
  return {text, size};
}

int contentView(lua_State* lua) {
  auto& window = *static_cast<toolkit::Window*>(lua_touserdata(lua, 1));
  lua_pushlightuserdata(lua, &*window.contentView());
  return 1;
}
int subviewCount(lua_State* lua) {
  lua_pushinteger(lua, static_cast<lua_Integer>(viewAt(lua).subviews().size()));
  return 1;
}
int subview(lua_State* lua) {
  const auto index = static_cast<std::size_t>(lua_tointeger(lua, 2) - 1);
  lua_pushlightuserdata(lua, &*viewAt(lua).subviews()[index]);
  return 1;
}
int tag(lua_State* lua) {
  lua_pushinteger(lua, viewAt(lua).tag());
  return 1;
}
int setStringValue(lua_State* lua) {
  viewAt(lua).setStringValue(textAt(lua, 2));
  return 0;
}
int stringValue(lua_State* lua) {
  const std::string text = viewAt(lua).stringValue();
  lua_pushlstring(lua, text.data(), text.size());
  return 1;
}
int setTitle(lua_State* lua) {
  viewAt(lua).asButton()->setTitle(textAt(lua, 2));
  return 0;
}
int setToolTip(lua_State* lua) {
  viewAt(lua).setToolTip(textAt(lua, 2));
  return 0;
}
int setEnabled(lua_State* lua) {
  viewAt(lua).setEnabled(lua_toboolean(lua, 2) != 0);
  return 0;
}
int setState(lua_State* lua) {
  viewAt(lua).asButton()->setState(static_cast<toolkit::State>(lua_tointeger(lua, 2)));
  return 0;
}
int needsDisplay(lua_State* lua) {
  lua_pushboolean(lua, viewAt(lua).needsDisplay());
  return 1;
}

constexpr luaL_Reg functions[] = {{"contentView", contentView},
                                  {"subviewCount", subviewCount},
                                  {"subview", subview},
                                  {"tag", tag},
                                  {"setStringValue", setStringValue},
                                  {"stringValue", stringValue},
                                  {"setTitle", setTitle},
                                  {"setToolTip", setToolTip},
                                  {"setEnabled", setEnabled},
                                  {"setState", setState},
                                  {"needsDisplay", needsDisplay}};

// Locals are Lua's fastest variables.
constexpr const char* library = R"(
local contentView, subviewCount, subview, tag = contentView, subviewCount, subview, tag
local setStringValue, stringValue, setTitle = setStringValue, stringValue, setTitle
local setToolTip, setEnabled, setState, needsDisplay = setToolTip, setEnabled, setState, needsDisplay
local function find(wanted)
  local content = contentView(window)
  for i = 1, subviewCount(content) do
    local view = subview(content, i)
    if tag(view) == wanted then return view end
  end
end
function text(to, t) local v = find(t); setStringValue(v, to); return stringValue(v) == to end
function title(to, t) setTitle(find(t), to) end
function toolTip(to, t) local v = find(t); setToolTip(v, to); needsDisplay(v) end
function enable(t) local v = find(t); setEnabled(v, true); needsDisplay(v) end
function disable(t) local v = find(t); setEnabled(v, false); needsDisplay(v) end
function stateOn(t) setState(find(t), 1) end
)";

std::string line(const Operation& operation) {
  const std::string target = std::to_string(operation.tag) + ")\n";
  switch (operation.what) {
    case What::text:
      return "text('" + operation.text + "', " + target;
    case What::title:
      return "title('" + operation.text + "', " + target;
    case What::toolTip:
      return "toolTip('" + operation.text + "', " + target;
    case What::enable:
      return "enable(" + target;
    case What::disable:
      return "disable(" + target;
    case What::stateOn:
      return "stateOn(" + target;
  }
  return {};
}

void require(lua_State* lua, int status) {
  if (status == LUA_OK) return;
  std::fprintf(stderr, "bench-running: Lua: %s\n", lua_tostring(lua, -1));
  std::exit(1);
}

}  // namespace

LuaWalkthrough::LuaWalkthrough(toolkit::Window& window, const std::vector<Operation>& operations)
    : lua_(luaL_newstate()) {
  for (const luaL_Reg& function : functions) lua_register(lua_, function.name, function.func);
  lua_pushlightuserdata(lua_, &window);
  lua_setglobal(lua_, "window");
  require(lua_, luaL_loadstring(lua_, library));
  require(lua_, lua_pcall(lua_, 0, 0, 0));
  std::string script;
  for (const Operation& operation : operations) script += line(operation);
  require(lua_, luaL_loadbuffer(lua_, script.data(), script.size(), "walkthrough"));
}

LuaWalkthrough::~LuaWalkthrough() { lua_close(lua_); }

void LuaWalkthrough::run() {
  lua_pushvalue(lua_, -1);  // a copy: the script stays for the next run
  require(lua_, lua_pcall(lua_, 0, 0, 0));
}

}  // namespace qz::bench
