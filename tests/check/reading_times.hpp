// SPDX-License-Identifier: MIT
// Whether a user can read a text before a timer replaces it.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "qz/drivers/driver.hpp"
#include "tests/check/trace.hpp"

namespace qz::naive {

/// Returns the seconds that a user needs for a text: 200 words a minute, but 2 seconds at least,
/// and none for a text without words.
double readingTime(const std::string& text);

/// Watches the texts of the text fields during one move.
///
/// The age of a text is the time that has passed by waiting since it was shown; infinite once a
/// user could have read it, because the user has chosen the moment of a press since then.
class ReadingTimes {
 public:
  ReadingTimes(drivers::Driver& driver, const toolkit::Ref<toolkit::Window>& window,
               const std::vector<toolkit::Tag>& hostTags, const History& history);

  /// The move is a wait of so many seconds, for the timer that this element started.
  void wait(double seconds, const Site& starter);
  /// Compares the texts with those before the move, and writes down their ages.
  void end(History& history, Trace& trace) const;

 private:
  struct Field {
    std::size_t index = 0;
    toolkit::Tag tag = 0;
    std::optional<std::string> shown;  // absent if it is not seen
  };

  std::vector<Field> fields() const;

  drivers::Driver& driver_;
  const toolkit::Ref<toolkit::Window>& window_;
  const std::vector<toolkit::Tag>& ownTags_;
  std::vector<Field> before_;
  std::vector<double> ages_;
  std::optional<double> seconds_;
  Site starter_;
};

}  // namespace qz::naive
