// SPDX-License-Identifier: MIT
// The commands as the runner and the dispatcher call them for every element of a list: arguments
// are passed by reference, without counting or copying.
//
// The caller keeps the engine and the arguments alive and makes sure that nothing else changes them
// meanwhile. The engine's operations of the same names do this for a host's arguments.
#pragma once

#include <string_view>

#include "qz/engine.hpp"

namespace qz::commands {

bool runSimple(QZ_Plist_State_Parser& engine, std::string_view name,
               const QZ_Plist_State_Parser::ObjectId& id);
bool runCompound(QZ_Plist_State_Parser& engine, toolkit::Toolkit& toolkit, std::string_view name,
                 const QZ_Plist_State_Parser::Parameters& parameters,
                 const QZ_Plist_State_Parser::ObjectId& id);

bool setToolTip(QZ_Plist_State_Parser& engine, const QZ_Plist_State_Parser::Parameters& parameters,
                const QZ_Plist_State_Parser::ObjectId& id);
bool loadGraphic(QZ_Plist_State_Parser& engine, toolkit::Toolkit& toolkit,
                 const QZ_Plist_State_Parser::Parameters& parameters);

/// Returns a copy of the list that only the caller holds; absent for an absent list.
QZ_Plist_State_Parser::Parameters ownList(const QZ_Plist_State_Parser::Parameters& parameters);

}  // namespace qz::commands
