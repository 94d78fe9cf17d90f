// SPDX-License-Identifier: MIT
// The commands as the runner and the dispatcher call them, for every element of a list: by
// reference, which counts and copies nothing.
//
// The caller keeps the engine alive, and holds arguments that nobody else can change or let go of
// meanwhile. The engine's operations of the same names do so for a host's arguments.
#pragma once

#include <string_view>

#include "QZ_Plist_State_Parser.hpp"

namespace commands {

bool runSimple(QZ_Plist_State_Parser& engine, std::string_view name,
               const QZ_Plist_State_Parser::ObjectId& id);
bool runCompound(QZ_Plist_State_Parser& engine, toolkit::Toolkit& toolkit, std::string_view name,
                 const QZ_Plist_State_Parser::Parameters& parameters,
                 const QZ_Plist_State_Parser::ObjectId& id);

bool setToolTip(QZ_Plist_State_Parser& engine, const QZ_Plist_State_Parser::Parameters& parameters,
                const QZ_Plist_State_Parser::ObjectId& id);
bool loadGraphic(QZ_Plist_State_Parser& engine, toolkit::Toolkit& toolkit,
                 const QZ_Plist_State_Parser::Parameters& parameters);

/// A list of the same elements that the caller alone holds; absent for an absent one.
QZ_Plist_State_Parser::Parameters ownList(const QZ_Plist_State_Parser::Parameters& parameters);

}  // namespace commands
