// SPDX-License-Identifier: MIT
// Measures how `qz-walkthrough check` explores a script, against the verifier that SPIN generates
// for the same graph; and the whole command on the examples.
#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <map>
#include <string>
#include <utility>
#include <vector>

#include "bench/measuring.hpp"
#include "bench/program_run.hpp"
#include "bench/spin_verifier.hpp"
#include "bench/switches.hpp"
#include "tools/check/conclusions.hpp"
#include "tools/check/look_conclusions.hpp"
#include "tools/exploration/exploration.hpp"
#include "tools/exploration/script.hpp"
#include "tools/exploration/world.hpp"

namespace qz {

namespace {

using tools::check::Exploration;

constexpr std::size_t buttonsAlone[] = {10, 12, 14, 16, 18, 20};
constexpr std::size_t buttonsTogether[] = {18, 20};
constexpr std::size_t mostButtons = 20;
constexpr std::size_t fewButtons = 14;  // whose presses are compared with those of the most

// What is required of `check`.
constexpr double mostTimesSpin = 5;
constexpr double mostBytes = 150;     // a place
constexpr double leastSpeedUp = 1.6;  // of two threads
constexpr double mostTime = 0.05;     // seconds, on an example

void require(bool holds, const std::string& what) {
  if (holds) return;
  std::fprintf(stderr, "bench-checking: %s\n", what.c_str());
  std::exit(1);
}

/// What a check of one script cost.
struct Cost {
  double wall = 0;        // seconds, of the exploration
  double processor = 0;   // seconds, of the exploration, in all threads
  double bytes = 0;       // a place, at the peak of the exploration
  double concluding = 0;  // seconds of wall time after the exploration
  double allBytes = 0;    // a place, at the peak of the whole check
};

double placesOf(std::size_t buttons) { return static_cast<double>(std::size_t{1} << buttons); }

double pressesOf(std::size_t buttons) { return static_cast<double>(buttons) * placesOf(buttons); }

double secondsSince(std::chrono::steady_clock::time_point began) {
  return std::chrono::duration<double>(std::chrono::steady_clock::now() - began).count();
}

void requireAllPlaces(const Exploration& exploration, std::size_t buttons) {
  require(
      exploration.isComplete() && static_cast<double>(exploration.places()) == placesOf(buttons),
      "other places than expected");
  require(static_cast<double>(exploration.presses()) == pressesOf(buttons),
          "other presses than expected");
}

/// Draws all conclusions from an exploration. Requires that the only finding is `no-end`.
void conclude(Exploration& exploration, unsigned threads) {
  const auto found = tools::check::conclude(exploration, {}, false, threads);
  require(found.size() == 1 && found.front().code == "no-end", "other findings than expected");
  require(tools::check::concludeFromLooks(exploration, {200, threads}).empty(),
          "other findings in looks than expected");
}

/// Checks a script in this program, and prints what that cost.
void checkOnce(std::size_t buttons, unsigned threads) {
  const tools::check::Script script(bench::switchesScript(buttons));
  tools::walkthrough::StagePlan plan;
  plan.host = bench::switchesWindow(buttons);
  const auto setting = tools::check::settingOf(script, plan, "/");
  tools::check::ExplorationLimits limits;
  limits.places = std::size_t{2} << buttons;  // never reached
  const std::size_t before = bench::memory().now;
  Exploration exploration(setting, {bench::switchesStart});
  const auto began = std::chrono::steady_clock::now();
  const double processor = bench::timeOf([&] { exploration.run(limits, threads, {}); });
  const double wall = secondsSince(began);
  requireAllPlaces(exploration, buttons);
  const auto bytesOfPlace = [&] {
    return static_cast<double>(bench::memory().most - before) / placesOf(buttons);
  };
  const double bytes = bytesOfPlace();
  const auto explored = std::chrono::steady_clock::now();
  conclude(exploration, threads);
  std::printf("%g %g %g %g %g\n", wall, processor, bytes, secondsSince(explored), bytesOfPlace());
}

/// Checks a script in a program of its own, so that memory of other work does not count.
Cost costOf(std::size_t buttons, unsigned threads) {
  const auto numbers =
      bench::numbersOfOwnRun(std::to_string(buttons) + " " + std::to_string(threads));
  return {numbers.at(0), numbers.at(1), numbers.at(2), numbers.at(3), numbers.at(4)};
}

Cost least(const Cost& a, const Cost& b) {
  return {std::min(a.wall, b.wall), std::min(a.processor, b.processor), std::min(a.bytes, b.bytes),
          std::min(a.concluding, b.concluding), std::min(a.allBytes, b.allBytes)};
}

int roundsFor(std::size_t buttons) { return buttons < 16 ? 5 : 3; }

/// The least of several rounds.
struct Costs {
  Cost alone;     // on one thread
  Cost together;  // on two threads, if that is measured
  double spin = 0;
};

double spinTime(const bench::SpinVerifier& verifier, std::size_t buttons) {
  const auto verification = verifier.run();
  require(static_cast<double>(verification.states) == placesOf(buttons),
          "SPIN visits other states than there are places");
  // SPIN counts the beginning as a transition.
  require(static_cast<double>(verification.transitions) == pressesOf(buttons) + 1,
          "SPIN makes other transitions than there are presses");
  return verification.processor;
}

Costs costsOf(std::size_t buttons) {
  const bench::SpinVerifier verifier(buttons);
  const bool hasTwo = std::count(std::begin(buttonsTogether), std::end(buttonsTogether), buttons);
  Costs costs;
  for (int round = 0; round < roundsFor(buttons); ++round) {
    const Costs next{.alone = costOf(buttons, 1),
                     .together = hasTwo ? costOf(buttons, 2) : Cost{},
                     .spin = spinTime(verifier, buttons)};
    costs = round == 0 ? next
                       : Costs{least(costs.alone, next.alone), least(costs.together, next.together),
                               std::min(costs.spin, next.spin)};
  }
  return costs;
}

using AllCosts = std::map<std::size_t, Costs>;

std::string whole(double number) { return std::to_string(static_cast<std::size_t>(number)); }

double timeOfPress(const AllCosts& costs, std::size_t buttons) {
  return costs.at(buttons).alone.processor / pressesOf(buttons);
}

AllCosts measureAlone() {
  bench::printHead("Exploring a script on one thread: n buttons, each of which switches a field",
                   {"buttons", "places", "presses", "wall time", "processor time", "a press",
                    "bytes a place", "SPIN", "this : SPIN", "conclusions", "bytes with them"});
  AllCosts all;
  for (const std::size_t buttons : buttonsAlone) {
    const Costs& costs = all.emplace(buttons, costsOf(buttons)).first->second;
    bench::printRow(
        {std::to_string(buttons), whole(placesOf(buttons)), whole(pressesOf(buttons)),
         bench::shownTime(costs.alone.wall), bench::shownTime(costs.alone.processor),
         bench::shownTime(timeOfPress(all, buttons)), bench::shownBytes(costs.alone.bytes),
         bench::shownTime(costs.spin), bench::shownRatio(costs.alone.processor / costs.spin),
         bench::shownTime(costs.alone.concluding), bench::shownBytes(costs.alone.allBytes)});
  }
  return all;
}

double speedUp(const Costs& costs) { return costs.alone.wall / costs.together.wall; }

void showTogether(const AllCosts& all) {
  bench::printHead("The same on two threads",
                   {"buttons", "wall time", "processor time", "bytes a place", "one thread : two"});
  for (const std::size_t buttons : buttonsTogether) {
    const Costs& costs = all.at(buttons);
    bench::printRow({std::to_string(buttons), bench::shownTime(costs.together.wall),
                     bench::shownTime(costs.together.processor),
                     bench::shownBytes(costs.together.bytes), bench::shownRatio(speedUp(costs))});
  }
}

void showRequirements(const AllCosts& all) {
  const Costs& most = all.at(mostButtons);
  const std::string at = ", " + std::to_string(mostButtons) + " buttons";
  bench::printHead("What is required", {"", "measured", "required"});
  bench::printRow({"this : SPIN, one thread" + at,
                   bench::shownRatio(most.alone.processor / most.spin),
                   "at most " + bench::shownRatio(mostTimesSpin)});
  bench::printRow({"bytes a place" + at, bench::shownBytes(most.alone.bytes),
                   "at most " + bench::shownBytes(mostBytes)});
  bench::printRow({"one thread : two" + at, bench::shownRatio(speedUp(most)),
                   "at least " + bench::shownRatio(leastSpeedUp)});
  std::vector<std::pair<double, double>> points;
  for (const auto& [buttons, costs] : all) {
    points.emplace_back(pressesOf(buttons), costs.alone.processor);
  }
  bench::printRow({"a press" + at + " : " + std::to_string(fewButtons) + " buttons",
                   bench::shownRatio(timeOfPress(all, mostButtons) / timeOfPress(all, fewButtons)),
                   "about " + bench::shownRatio(1)});
  bench::printExponent("Time grows with the number of presses", points);
}

/// The arguments of `check` for examples, in their directory.
constexpr const char* examples[] = {"first-steps/backup.yaml",
                                    "photo-import/import.yaml",
                                    "built-window/script.plist --assets built-window/assets.plist",
                                    "embedding/script.plist",
                                    "qt-host/tour.plist",
                                    "qt-host/tips.plist"};

void measureExamples() {
  bench::printHead("The whole command on the examples",
                   {"`qz-walkthrough check` …", "wall time", "processor time", "required"});
  constexpr int rounds = 20;
  for (const std::string arguments : examples) {
    bench::ProgramRun fastest;
    for (int round = 0; round < rounds; ++round) {
      const auto run = bench::runProgram("cd '" EXAMPLES "' && exec '" QZ_WALKTHROUGH "' check " +
                                         arguments + " --format json");
      require(run.status <= 1, "check " + arguments + " exits with an error:\n" + run.output);
      if (round == 0 || run.wall < fastest.wall) fastest = run;
    }
    bench::printRow({arguments, bench::shownTime(fastest.wall), bench::shownTime(fastest.processor),
                     "under " + bench::shownTime(mostTime)});
  }
}

}  // namespace

}  // namespace qz

using namespace qz;

int main(int argc, char** argv) {
  if (argc == 3) {
    checkOnce(std::strtoull(argv[1], nullptr, 10),
              static_cast<unsigned>(std::strtoul(argv[2], nullptr, 10)));
    return 0;
  }
  const AllCosts costs = measureAlone();
  showTogether(costs);
  showRequirements(costs);
  measureExamples();
  return 0;
}
