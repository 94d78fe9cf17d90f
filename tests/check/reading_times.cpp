// SPDX-License-Identifier: MIT
// Whether a user can read a text in time.
#include "tests/check/reading_times.hpp"

#include <algorithm>
#include <iterator>
#include <limits>
#include <sstream>

namespace qz::naive {

double readingTime(const std::string& text) {
  constexpr double secondsPerWord = 60.0 / 200;
  constexpr double least = 2;
  std::istringstream stream(text);
  const auto words = std::distance(std::istream_iterator<std::string>(stream), {});
  return words == 0 ? 0 : std::max(least, static_cast<double>(words) * secondsPerWord);
}

ReadingTimes::ReadingTimes(drivers::Driver& driver, const toolkit::Ref<toolkit::Window>& window,
                           const std::vector<toolkit::Tag>& hostTags, const History& history)
    : driver_(driver),
      window_(window),
      ownTags_(hostTags),
      before_(fields()),
      ages_(history.textAge) {}

std::vector<ReadingTimes::Field> ReadingTimes::fields() const {
  std::vector<Field> fields;
  const auto content = window_->contentView();
  const auto& views = content->subviews();
  const bool onScreen = driver_.look(window_).visible;
  for (std::size_t i = 0; i < views.size(); ++i) {
    if (!views[i]->asTextField()) continue;
    const auto picture = driver_.look(views[i]);
    const bool isSeen = onScreen && !picture.hidden;
    fields.push_back(
        {i, ownTags_[i], isSeen ? std::optional(picture.text.string()) : std::nullopt});
  }
  return fields;
}

void ReadingTimes::wait(double seconds, const Site& starter) {
  seconds_ = seconds;
  starter_ = starter;
}

void ReadingTimes::end(History& history, Trace& trace) const {
  const auto now = fields();
  for (std::size_t k = 0; k < now.size(); ++k) {
    const auto& [index, tag, shown] = before_[k];
    const double needed = shown ? readingTime(*shown) : 0;
    double age = seconds_ ? ages_[index] + *seconds_ : std::numeric_limits<double>::infinity();
    if (age >= needed) age = std::numeric_limits<double>::infinity();
    if (shown != now[k].shown) {
      const bool isReplaced = shown && now[k].shown;
      if (isReplaced && age < needed) trace.brief.insert({starter_, tag});
      age = 0;
    }
    history.textAge[index] = age;
  }
}

}  // namespace qz::naive
