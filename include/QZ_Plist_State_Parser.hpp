// SPDX-License-Identifier: MIT
// QZ_Plist_State_Parser: plays scripted walk-throughs over the controls of a window.
//
// Most hosts include only this header. It brings the engine's class and the names of the commands
// into the global namespace. A host that has other things of these names there includes
// "qz/engine.hpp" instead, and writes qz::QZ_Plist_State_Parser.
#pragma once

#include "qz/engine.hpp"

using qz::QZ_Plist_State_Parser;
using namespace qz::command_names;
