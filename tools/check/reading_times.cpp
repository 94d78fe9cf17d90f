// SPDX-License-Identifier: MIT
#include "tools/check/reading_times.hpp"

#include <algorithm>
#include <iterator>
#include <set>
#include <sstream>

namespace qz::tools::check {
namespace {

constexpr double briefest = 2;  // seconds that every text needs, however short

double wordsIn(const std::string& text) {
  std::istringstream words(text);
  return static_cast<double>(std::distance(std::istream_iterator<std::string>(words), {}));
}

}  // namespace

ReadingTimes::ReadingTimes(const Exploration& exploration, double wordsPerMinute)
    : exploration_(exploration), wordsPerMinute_(wordsPerMinute) {
  const auto& kinds = exploration.setting().kinds;
  for (std::size_t control = 0; control < kinds.size(); ++control) {
    if (kinds[control] == drivers::ViewKind::textField) fields_.push_back(control);
  }
}

void ReadingTimes::see(const Occasion& occasion, const Arrival& arrival, std::uint32_t place) {
  const bool isWait = occasion.visit != noVisit && occasion.move == waitMove;
  const std::optional<std::uint32_t> element =
      arrival.timerElements.empty() ? std::nullopt : std::optional(arrival.timerElements.front());
  if (!isWait && !element) return;
  for (const std::size_t control : fields_) {
    const auto before = textBefore(occasion, control);
    const auto now = textAt(place, arrival.look, control);
    if (isWait && before) {
      const std::uint32_t from = exploration_.visits()[occasion.visit].place;
      waits_.try_emplace({from, control, *before}, Wait{place, now, element});
    }
    if (now && now != before && element) {
      appearances_.try_emplace({{place, control, *now}, *element}, occasion);
    }
  }
}

std::vector<BriefText> ReadingTimes::briefTexts() const {
  std::map<Cause, BriefText> byCause;
  for (const auto& [appearance, occasion] : appearances_) {
    auto found = follow(appearance.first, appearance.second, occasion);
    if (!found) continue;
    auto& known = byCause[{found->element, found->control}];
    found->places = known.places + 1;
    if (known.places > 0 && known.path.size() <= found->path.size()) {
      known.places = found->places;
    } else {
      known = *std::move(found);
    }
  }
  std::vector<BriefText> texts;
  texts.reserve(byCause.size());
  for (auto& [cause, text] : byCause) texts.push_back(std::move(text));
  return texts;
}

std::optional<BriefText> ReadingTimes::follow(Shown shown, std::uint32_t element,
                                              const Occasion& occasion) const {
  const std::size_t control = std::get<1>(shown);
  const Text text = std::get<2>(shown);
  const double needed = timeFor(*texts_[text]);
  double age = 0;
  Path waits;
  for (std::set<std::uint32_t> seen; seen.insert(std::get<0>(shown)).second;) {
    const PendingTimers& timers = exploration_.timers(std::get<0>(shown));
    const auto wait = waits_.find(shown);
    if (timers.empty() || wait == waits_.end()) return std::nullopt;
    age += timers.front().seconds;
    waits.emplace_back(WaitMove{timers.front().seconds});
    if (age >= needed || !wait->second.text) return std::nullopt;
    if (wait->second.text != text) {
      Path path = exploration_.path(occasion);
      path.insert(path.end(), waits.begin(), waits.end());
      return BriefText{element, control, *texts_[text], age, needed, std::move(path), 0};
    }
    if (!wait->second.element) return std::nullopt;
    element = *wait->second.element;
    std::get<0>(shown) = wait->second.place;
  }
  return std::nullopt;
}

std::optional<ReadingTimes::Text> ReadingTimes::textAt(std::uint32_t place, std::uint32_t look,
                                                       std::size_t control) {
  const std::uint8_t* const bytes = exploration_.place(place);
  if (exploration_.format().isOver(bytes)) return std::nullopt;
  if (exploration_.format().control(bytes, control).hidden) return std::nullopt;
  Looks& looks = exploration_.looks();
  return numberOf(looks.look(looks.parts(look)[control]).view.text.string());
}

std::optional<ReadingTimes::Text> ReadingTimes::textBefore(const Occasion& occasion,
                                                           std::size_t control) {
  if (occasion.visit != noVisit) {
    const Visit& visit = exploration_.visits()[occasion.visit];
    return textAt(visit.place, visit.look, control);
  }
  const SavedView& before = exploration_.setting().before[control];
  return before.hidden ? std::nullopt : numberOf(before.text.string());
}

std::optional<ReadingTimes::Text> ReadingTimes::numberOf(const std::string& text) {
  const auto [entry, isNew] = numbers_.emplace(text, static_cast<Text>(texts_.size()));
  if (isNew) texts_.push_back(&entry->first);
  return entry->second;
}

/// Returns the seconds that a user needs to read a text.
double ReadingTimes::timeFor(const std::string& text) const {
  const double words = wordsIn(text);
  return words == 0 ? 0 : std::max(briefest, words * 60 / wordsPerMinute_);
}

}  // namespace qz::tools::check
