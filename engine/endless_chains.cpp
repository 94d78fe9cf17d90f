// SPDX-License-Identifier: MIT
#include "engine/endless_chains.hpp"

#include <algorithm>
#include <set>
#include <utility>

#include "engine/tag_key.hpp"
#include "qz/commands.hpp"
#include "qz/property_list/scalars.hpp"
#include "qz/toolkit/exception.hpp"

namespace qz {

namespace {

using Keys = std::vector<std::string>;
using Graph = std::map<std::string, Keys, std::less<>>;
using KeySet = std::set<std::string, std::less<>>;

// The engine has no script after this command: later elements chain to nothing.
bool endsTheWalkThrough(const toolkit::ValueRef<>& element) {
  const auto simple = toolkit::asString(element);
  const Command* const command = simple ? simpleCommandNamed(simple->text()) : nullptr;
  return command && command->flow == CommandFlow::endsWalkThrough;
}

bool runsList(const Command* command) { return command && command->flow == CommandFlow::runsList; }

// Removes the chains that come after one to a list that ends the walk-through. `ending` are the
// lists that end it themselves.
void removeChainsAfterTheEnd(Graph& graph, const KeySet& ending) {
  std::map<std::string, std::vector<std::pair<std::string, std::size_t>>, std::less<>> callers;
  for (const auto& [key, targets] : graph) {
    for (std::size_t i = 0; i < targets.size(); ++i) callers[targets[i]].emplace_back(key, i);
  }
  KeySet known = ending;
  Keys open(ending.begin(), ending.end());
  while (!open.empty()) {
    const std::string key = open.back();
    open.pop_back();
    for (const auto& [caller, index] : callers[key]) {
      Keys& targets = graph[caller];
      if (index >= targets.size()) continue;
      targets.resize(index + 1);
      if (known.insert(caller).second) open.push_back(caller);
    }
  }
}

Graph chainsOf(const toolkit::ValueRef<toolkit::Dictionary>& script) {
  Graph graph;
  KeySet ending;
  for (const auto& [key, list] : script->entries()) {
    const auto name = toolkit::asString(key);
    if (!name) continue;
    Keys& targets = graph[std::string(name->text())];
    const std::string own = tagKey(key->intValue());  // the list of "07" runs with the id 7
    const auto elements = toolkit::asArray(list);
    for (const auto& element : elements->elements()) {
      if (endsTheWalkThrough(element)) {
        ending.emplace(name->text());
        break;
      }
      if (auto to = chainTarget(element, own)) targets.push_back(*std::move(to));
    }
  }
  removeChainsAfterTheEnd(graph, ending);
  return graph;
}

// Removes the lists that end: those that chain only to such lists.
void removeEndingLists(Graph& graph) {
  std::map<std::string, Keys, std::less<>> callers;
  std::map<std::string, std::size_t, std::less<>> open;  // chains to lists not yet known to end
  Keys ending;
  for (const auto& [key, targets] : graph) {
    for (const auto& to : targets) {
      if (!graph.contains(to)) continue;
      callers[to].push_back(key);
      ++open[key];
    }
    if (!open.contains(key)) ending.push_back(key);
  }
  while (!ending.empty()) {
    const std::string key = ending.back();
    ending.pop_back();
    for (const auto& caller : callers[key]) {
      if (--open[caller] == 0) ending.push_back(caller);
    }
    graph.erase(key);
  }
}

}  // namespace

std::optional<std::string> chainTarget(const toolkit::ValueRef<>& element, const std::string& own) {
  if (const auto simple = toolkit::asString(element)) {
    return runsList(simpleCommandNamed(simple->text())) ? std::optional(own) : std::nullopt;
  }
  const auto compound = toolkit::asArray(element);
  if (compound->count() == 0) return std::nullopt;
  const auto name = toolkit::asString(compound->elements()[0]);
  const Command* const command = name ? compoundCommandNamed(name->text()) : nullptr;
  if (!runsList(command)) return std::nullopt;
  try {
    const auto position = *command->positionOf(ParameterType::listTag);
    return tagKey(compound->objectAtIndex(position + 1)->intValue());
  } catch (const toolkit::Exception&) {
    return std::nullopt;  // missing, or not a tag: the run continues with the next element
  }
}

EndlessChains endlessChains(const toolkit::ValueRef<toolkit::Dictionary>& script) {
  Graph graph = chainsOf(script);
  removeEndingLists(graph);
  EndlessChains chains;
  for (const auto& [start, unused] : graph) {
    Keys path;
    std::map<std::string, std::size_t, std::less<>> placeInPath;
    std::string key = start;
    while (!chains.loopOf.contains(key) && !placeInPath.contains(key)) {
      placeInPath[key] = path.size();
      path.push_back(key);
      const Keys& targets = graph[key];
      key = *std::find_if(targets.begin(), targets.end(),
                          [&](const auto& to) { return graph.contains(to); });
    }
    if (!chains.loopOf.contains(key)) {
      std::string loop;
      for (std::size_t i = placeInPath[key]; i < path.size(); ++i) loop += path[i] + " -> ";
      chains.loops.push_back(loop + key);
      chains.loopOf[key] = chains.loops.size() - 1;
    }
    for (const auto& passed : path) chains.loopOf[passed] = chains.loopOf[key];
  }
  return chains;
}

}  // namespace qz
