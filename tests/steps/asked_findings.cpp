// SPDX-License-Identifier: MIT
// The list of what sources ask for, with the reasons.
#include "tests/steps/asked_findings.hpp"

#include <algorithm>
#include <iterator>
#include <sstream>

namespace qz::meaning {

namespace {

/// Whether users who read 200 words in a minute can read the text in so many seconds.
bool canBeRead(const Reading& reading, int seconds) {
  std::string text;
  for (const Span& span : reading) text += span.text;
  std::istringstream in(text);
  const auto words = std::distance(std::istream_iterator<std::string>(in), {});
  return seconds >= 2 && seconds >= 0.3 * static_cast<double>(words);
}

/// Whether the wait of the place changes a text before it can be read.
bool isHasty(const Tour& tour, const Interpreter& meaning, const State& state) {
  if (!state.waits) return false;
  const State next = meaning.waitOver(state);
  if (next.isOver) return false;
  const Look before = meaning.look(state);
  const Look later = meaning.look(next);
  for (std::size_t i = 0; i < tour.controls.size(); ++i) {
    const Reading& text = before.controls[i].reading;
    if (tour.controls[i].kind != ViewKind::textField || text == later.controls[i].reading) continue;
    if (!canBeRead(text, meaning.waitOf(state)->seconds)) return true;
  }
  return false;
}

}  // namespace

Asked askedFor(const Generated& generated) {
  const Interpreter meaning(generated.tour);
  const Places& places = generated.places;
  const auto withAWayOut = placesWithAWayOut(places);
  Asked asked;
  if (withAWayOut.empty()) {
    // Nothing leads to the end. Of some places nothing may lead on.
    asked = {{"no-end"}, {"no-end", "dead-end"}};
  } else if (withAWayOut.size() != places.size()) {
    // From some places nothing leads to the end: from one to another, or nowhere.
    asked = {{"trap", "dead-end"}, {"trap", "dead-end"}};
  }
  // A wait is shorter than the time that its texts take to read.
  const auto isHastyPlace = [&](const auto& place) {
    return isHasty(generated.tour, meaning, place.first);
  };
  if (std::any_of(places.begin(), places.end(), isHastyPlace)) asked.may.insert("too-brief");
  return asked;
}

}  // namespace qz::meaning
