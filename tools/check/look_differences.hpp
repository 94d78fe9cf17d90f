// SPDX-License-Identifier: MIT
// Finds the places that look different depending on the way to them. An exploration keeps what a
// place can show, but not after which list: so every move is looked at once more.
#pragma once

#include <cstdint>
#include <map>
#include <set>
#include <tuple>
#include <utility>
#include <vector>

#include "tools/exploration/exploration.hpp"
#include "tools/exploration/flashing.hpp"

namespace qz::tools::check {

/// A second look of a control at a place where the same list had the last word.
struct LookDifference {
  std::uint32_t list = 0;
  std::size_t control = 0;
  Occasion first;     ///< after which the place was seen with one look
  Occasion second;    ///< and with another
  std::string words;  ///< such as "the text “A” or the text “B”"
  std::size_t places = 0;
};

class LookComparison {
 public:
  explicit LookComparison(const Exploration& exploration);

  /// Compares what a place shows after `occasion` with what it showed before. `list` had the last
  /// word.
  void see(std::uint32_t place, std::uint32_t list, std::uint32_t look, const Occasion& occasion);

  std::vector<LookDifference> differences() const;

 private:
  /// What a user sees of a control besides what belongs to the place.
  struct Appearance {
    LookValue value = 0;
    bool flashes = false;
    friend bool operator==(const Appearance&, const Appearance&) = default;
  };
  struct Seen {
    Appearance appearance;
    Occasion occasion;
  };

  std::vector<std::size_t> controlsWithSeveralLooks(std::uint32_t place) const;
  bool differ(const Appearance& one, const Appearance& other) const;
  std::string wordsFor(const Appearance& one, const Appearance& other) const;
  void seeControl(std::uint32_t place, std::uint32_t list, std::size_t control, const Seen& seen);
  void add(std::uint32_t place, const LookDifference& difference);

  const Exploration& exploration_;
  Flashing flashing_;
  std::map<std::tuple<std::uint32_t, std::uint32_t, std::size_t>, std::vector<Seen>> seen_;
  using Cause = std::pair<std::uint32_t, std::size_t>;  // list and control
  std::map<Cause, LookDifference> differences_;
  std::map<Cause, std::set<std::uint32_t>> places_;
};

}  // namespace qz::tools::check
