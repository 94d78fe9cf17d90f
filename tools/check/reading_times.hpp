// SPDX-License-Identifier: MIT
// Finds the texts that a timer replaces before a user can read them.
#pragma once

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <tuple>
#include <vector>

#include "tools/exploration/exploration.hpp"

namespace qz::tools::check {

/// A text that a timer replaces too soon.
struct BriefText {
  std::uint32_t element = 0;  ///< which started the timer
  std::size_t control = 0;
  std::string text;
  double shown = 0;   ///< seconds
  double needed = 0;  ///< seconds to read the text
  Path path;
  std::size_t places = 0;
};

/// A text can stay through several waits, so the times from where it appears are added up.
class ReadingTimes {
 public:
  ReadingTimes(const Exploration& exploration, double wordsPerMinute);

  /// Takes note of the texts that a move shows, keeps and replaces.
  void see(const Occasion& occasion, const Arrival& arrival, std::uint32_t place);

  /// Returns the texts, with the shortest path for each element and control.
  std::vector<BriefText> briefTexts() const;

 private:
  using Text = std::uint32_t;  // its number
  /// A text on a control at a place.
  using Shown = std::tuple<std::uint32_t, std::size_t, Text>;
  /// Where the wait at a place leads.
  struct Wait {
    std::uint32_t place = 0;
    std::optional<Text> text{};              // on the same control; absent if it shows none
    std::optional<std::uint32_t> element{};  // which started the next timer
  };
  using Cause = std::pair<std::uint32_t, std::size_t>;  // element and control

  std::optional<Text> textAt(std::uint32_t place, std::uint32_t look, std::size_t control);
  std::optional<Text> textBefore(const Occasion& occasion, std::size_t control);
  std::optional<Text> numberOf(const std::string& text);
  double timeFor(const std::string& text) const;
  std::optional<BriefText> follow(Shown shown, std::uint32_t element,
                                  const Occasion& occasion) const;

  const Exploration& exploration_;
  double wordsPerMinute_;
  std::vector<std::size_t> fields_;  // the controls with a text
  std::map<std::string, Text> numbers_;
  std::vector<const std::string*> texts_;
  std::map<std::pair<Shown, std::uint32_t>, Occasion> appearances_;  // with the timer's element
  std::map<Shown, Wait> waits_;
};

}  // namespace qz::tools::check
