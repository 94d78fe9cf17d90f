// SPDX-License-Identifier: MIT
// The commands as the runner and the catalogue call them for every element of a list: arguments
// are passed by reference, without counting or copying.
//
// The caller keeps the engine and the arguments alive and makes sure that nothing else changes them
// meanwhile. The engine's operations of the same names do this for a host's arguments.
#pragma once

#include <cstddef>
#include <string_view>

#include "qz/engine.hpp"

namespace qz::commands {

/// A compound command that is running.
struct CompoundCall {
  QZ_Plist_State_Parser& engine;
  const QZ_Plist_State_Parser::Parameters& parameters;
  const QZ_Plist_State_Parser::ObjectId& id;  // the list's own
  toolkit::Toolkit& toolkit;

  /// Returns the parameter at a position after the name; a position beyond the end raises.
  const QZ_Plist_State_Parser::Value& at(std::size_t position) const {
    return parameters->objectAtIndex(position);
  }
};

/// A simple command that is running.
struct SimpleCall {
  QZ_Plist_State_Parser& engine;
  const QZ_Plist_State_Parser::Control& control;  // absent if no control has the id
  const QZ_Plist_State_Parser::ObjectId& id;      // the list's own
};

/// Run the command with this name and return its result; NO if no command has the name.
bool runCompound(std::string_view name, const CompoundCall& call);
bool runSimple(std::string_view name, QZ_Plist_State_Parser& engine,
               const QZ_Plist_State_Parser::ObjectId& id);

// The commands that are not one call of a processor with converted parameters.
bool hide(const CompoundCall& call);
bool hide(const SimpleCall& call);
bool show(const CompoundCall& call);
bool show(const SimpleCall& call);
bool enable(const CompoundCall& call);
bool enable(const SimpleCall& call);
bool disable(const CompoundCall& call);
bool disable(const SimpleCall& call);
bool setToolTip(const CompoundCall& call);
bool loadGraphic(const CompoundCall& call);
bool loadBackground(const CompoundCall& call);
bool processCommands(const SimpleCall& call);
bool idle(const SimpleCall& call);
bool terminate(const SimpleCall& call);

/// Returns a copy of the list that only the caller holds; absent for an absent list.
QZ_Plist_State_Parser::Parameters ownList(const QZ_Plist_State_Parser::Parameters& parameters);

}  // namespace qz::commands
