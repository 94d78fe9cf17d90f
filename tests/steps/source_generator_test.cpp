// SPDX-License-Identifier: MIT
// Generated sources have everything that the language has, often enough that a mistake shows.

#include "tests/steps/source_generator.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>

namespace qz::meaning {
namespace {

constexpr std::uint64_t seeds = 200;  // as many as are always compared

using Says = std::function<bool(const Generated&)>;

bool somePart(const Generated& source, const std::function<bool(const Part&)>& says) {
  const auto& [controls, everyStep, fragments, backOver, steps] = source.tour;
  const auto inPair = [&](const auto& named) { return says(named.second); };
  return says(everyStep) || std::any_of(fragments.begin(), fragments.end(), inPair) ||
         std::any_of(steps.begin(), steps.end(), inPair);
}

bool someWords(const Generated& source, const std::function<bool(const Words&)>& says) {
  return somePart(source, [&](const Part& part) {
    return std::any_of(part.controls.begin(), part.controls.end(),
                       [&](const auto& named) { return says(named.second); });
  });
}

/// Whether at some place of the source something is so.
bool somePlace(const Generated& source, const std::function<bool(const State&)>& is) {
  return std::any_of(source.places.begin(), source.places.end(),
                     [&](const auto& place) { return is(place.first); });
}

/// Whether users come to one step on two ways.
bool forks(const Generated& source) {
  return somePlace(source, [&](const State& one) {
    return somePlace(source, [&](const State& other) {
      return one.step == other.step && one.way.size() > 1 && other.way.size() > 1 &&
             one.way != other.way;
    });
  });
}

/// Whether users decide what a box shows at a step.
bool leavesBoxes(const Generated& source) {
  return somePlace(source, [&](const State& one) {
    return somePlace(source, [&](const State& other) {
      return one.step == other.step && one.way == other.way && one.boxes != other.boxes;
    });
  });
}

Says inSomePart(const std::function<bool(const Part&)>& says) {
  return [says](const Generated& source) { return somePart(source, says); };
}

template <class Option>
Says said(Option option) {
  return [option](const Generated& source) {
    return someWords(source, [&](const Words& words) { return (words.*option).has_value(); });
  };
}

const std::vector<std::pair<const char*, Says>>& features() {
  static const std::vector<std::pair<const char*, Says>> all = {
      {"a fork", forks},
      {"boxes that are the user's", leavesBoxes},
      {"boxes that steps set", said(&Words::isOn)},
      {"a wait that is given up",
       inSomePart([](const Part& p) { return p.wait && p.wait->givesUp; })},
      {"a wait that starts again",
       inSomePart([](const Part& p) { return p.wait && !p.wait->givesUp; })},
      {"a wait that leads back",
       inSomePart([](const Part& p) { return p.wait && p.wait->go == "back"; })},
      {"a full way",
       [](const Generated& source) {
         return somePlace(source,
                          [&](const State& s) { return s.way.size() == source.tour.backOver; });
       }},
      {"back passes over", inSomePart([](const Part& p) { return p.isPassedOver == true; })},
      {"like", inSomePart([](const Part& p) { return !p.like.empty(); })},
      {"arguments",
       inSomePart([](const Part& p) { return !p.uses.empty() && !p.uses[0].arguments.empty(); })},
      {"several fragments", inSomePart([](const Part& p) { return p.uses.size() > 1; })},
      {"an image behind all", inSomePart([](const Part& p) { return p.background.has_value(); })},
      {"contents", said(&Words::content)},
      {"fonts", said(&Words::font)},
      {"alignments", said(&Words::isCentered)},
      {"tooltips", said(&Words::toolTip)},
      {"colours", said(&Words::color)},
      {"red buttons", said(&Words::isRed)},
      {"show and hide", said(&Words::isShown)},
      {"enable and disable", said(&Words::isEnabled)},
      {"flash", said(&Words::flashes)},
      {"an end",
       [](const Generated& source) {
         return source.places.contains({"", {}, {}, false, true});
       }},
  };
  return all;
}

TEST(GeneratedSources, HaveEverythingOften) {
  std::map<std::string, int> counts;
  for (std::uint64_t seed = 1; seed <= seeds; ++seed) {
    const Generated source = generate(seed);
    for (const auto& [name, has] : features()) counts[name] += has(source) ? 1 : 0;
  }
  for (const auto& feature : features()) EXPECT_GE(counts[feature.first], 10) << feature.first;
}

TEST(GeneratedSources, AreTheSameAgain) {
  EXPECT_EQ(generate(7).yaml, generate(7).yaml);
  EXPECT_NE(generate(7).yaml, generate(8).yaml);
}

}  // namespace
}  // namespace qz::meaning
