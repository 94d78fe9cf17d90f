// SPDX-License-Identifier: MIT
// Every place to which a user can come, as the interpreter says.
#pragma once

#include <cstddef>
#include <map>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include "tests/steps/interpreter.hpp"

namespace qz::meaning {

/// A press of this control; absent: the user does nothing until the wait is over.
using Move = std::optional<std::size_t>;

/// Returns the moves that are possible.
std::vector<Move> movesOf(const Interpreter& meaning, const State& state);

/// Returns the state after the move.
State after(const Interpreter& meaning, const State& state, const Move& move);

/// The places, each with where its moves lead.
using Places = std::map<State, std::set<State>>;

/// Returns all places after the start; absent if there are more than `limit`.
std::optional<Places> placesOf(const Interpreter& meaning, std::size_t limit);

/// Returns the places from which a user can come to the end.
std::set<State> placesWithAWayOut(const Places& places);

}  // namespace qz::meaning
