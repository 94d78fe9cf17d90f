// SPDX-License-Identifier: MIT
// A script and its window while they are being made at random.
#pragma once

#include <cstddef>
#include <cstdint>
#include <map>
#include <random>
#include <string_view>
#include <vector>

#include "qz/commands.hpp"
#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"
#include "tools/walkthrough/host_window.hpp"

namespace qz::naive {

using Value = toolkit::ValueRef<>;

inline Value text(std::string_view text) { return toolkit::String::make(text); }
inline Value number(std::int64_t number) { return toolkit::Number::withLong(number); }
/// Returns a compound command.
inline Value compound(std::string_view name, std::vector<Value> parameters) {
  parameters.insert(parameters.begin(), text(name));
  return toolkit::Array::make(std::move(parameters), toolkit::Mutability::immutable);
}

/// Random choices that are the same on every platform.
class Dice {
 public:
  explicit Dice(std::uint64_t seed) : random_(seed) {}

  /// Returns a number from 0 to `count` - 1.
  std::size_t below(std::size_t count) { return static_cast<std::size_t>(random_() % count); }
  bool oneIn(std::size_t count) { return below(count) == 0; }
  template <class Collection>
  const auto& oneOf(const Collection& collection) {
    return collection[below(std::size(collection))];
  }

 private:
  std::mt19937_64 random_;
};

struct Draft {
  using List = std::vector<Value>;

  static constexpr toolkit::Tag start = 1;  // the tag of the first list, which is the smallest

  tools::walkthrough::HostWindow host;
  std::map<toolkit::Tag, List> lists = {{start, {}}};
  std::vector<toolkit::Dictionary::Entry> others;  // what is no proper list

  void addControl(drivers::ViewKind kind, toolkit::Tag tag) {
    const auto count = static_cast<double>(host.controls.size());
    tools::walkthrough::HostControl control;
    control.kind = kind;
    control.tag = tag;
    control.frame = {10, 10 + 40 * count, 100, 30};
    host.controls.push_back(control);
  }
  void addToStart(Value command) { lists[start].push_back(std::move(command)); }
  toolkit::ValueRef<toolkit::Dictionary> script() const;
};

/// How the rest of a script is made, so that a planted defect stays what it is.
struct Bounds {
  std::size_t controls = 6;
  std::size_t lists = 8;
  bool startIsQuiet = false;  ///< the start runs no other list and ends nothing
  bool ends = true;           ///< some list may end the walk-through
  bool isWild = false;        ///< any tag may be anywhere: twice, nowhere, or of any kind
};

/// Each control of a draft has three tags of its own, so that only wild scripts mix them up.
inline constexpr toolkit::Tag tagsOfControl(std::size_t control) {
  return 10 * (static_cast<toolkit::Tag>(control) + 1);
}
inline constexpr toolkit::Tag ownTags = 3;

/// Makes a window and lists of random commands.
void fillAtRandom(Draft& draft, const Bounds& bounds, Dice& dice);

/// Returns the bounds within which a defect of the code can be planted.
Bounds boundsFor(std::string_view code);
/// Plants a defect of the code. Its controls and lists have tags of at least 200.
void plant(std::string_view code, Draft& draft);

}  // namespace qz::naive
