// SPDX-License-Identifier: MIT
// Explores what the interpreter says.
#include "tests/steps/places.hpp"

#include <algorithm>

namespace qz::meaning {

std::vector<Move> movesOf(const Interpreter& meaning, const State& state) {
  if (state.isOver) return {};
  const auto pressable = meaning.pressable(state);
  std::vector<Move> moves(pressable.begin(), pressable.end());
  if (state.waits) moves.emplace_back(std::nullopt);
  return moves;
}

State after(const Interpreter& meaning, const State& state, const Move& move) {
  return move ? meaning.press(state, *move) : meaning.waitOver(state);
}

std::optional<Places> placesOf(const Interpreter& meaning, std::size_t limit) {
  Places places;
  std::vector<State> found = {meaning.start()};
  while (!found.empty() && places.size() <= limit) {
    const State state = found.back();
    found.pop_back();
    if (places.contains(state)) continue;
    std::set<State>& next = places[state];
    for (const Move& move : movesOf(meaning, state)) next.insert(after(meaning, state, move));
    found.insert(found.end(), next.begin(), next.end());
  }
  return found.empty() && places.size() <= limit ? std::optional(places) : std::nullopt;
}

std::set<State> placesWithAWayOut(const Places& places) {
  std::set<State> out;
  for (auto known = places.size() + 1; out.size() != known;) {
    known = out.size();
    for (const auto& [state, next] : places) {
      const bool leadsOut = std::any_of(next.begin(), next.end(),
                                        [&](const State& each) { return out.contains(each); });
      if (state.isOver || leadsOut) out.insert(state);
    }
  }
  return out;
}

}  // namespace qz::meaning
