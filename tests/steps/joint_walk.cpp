// SPDX-License-Identifier: MIT
// Breadth first, with a fresh play for each move.
#include "tests/steps/joint_walk.hpp"

#include <cmath>

#include "tools/walkthrough/possible_steps.hpp"

namespace qz::meaning {

using tools::walkthrough::StepPicture;

namespace {

// In this time flashing buttons become pressed in, and no wait is over.
constexpr double untilPressed = 0.6;

}  // namespace

JointWalk::JointWalk(const Tour& tour, const PlayableSource& source, const std::string& step)
    : tour_(tour), source_(source), meaning_(tour), start_(meaning_.startAt(step)) {}

std::string JointWalk::run() {
  Play first(source_);
  std::string wrong = arrive(start_, first.picture(), {});
  for (std::size_t i = 0; i < pending_.size() && wrong.empty(); ++i) {
    const Arrival from = pending_[i];
    for (const Move& move : movesOf(meaning_, from.state)) {
      if (wrong.empty()) wrong = makeMove(from, move);
    }
  }
  return wrong;
}

std::string JointWalk::makeMove(const Arrival& from, const Move& move) {
  ++moves_;
  Play play(source_);
  this->play(play, from.path);
  if (everythingKept(play.picture()) != from.kept) return "it does not play twice the same";
  const double early = move ? untilPressed : meaning_.waitOf(from.state)->seconds - 0.25;
  const std::string wrong = passTime(from.state, play, early);
  if (!wrong.empty()) return wrong + "\nwhile time passes after" + words(from.path);
  if (move) {
    play.click(*move);
  } else {
    play.letPass(0.25);
  }
  Path path = from.path;
  path.push_back(move);
  return arrive(after(meaning_, from.state, move), play.picture(), path);
}

std::string JointWalk::arrive(const State& state, const StepPicture& picture, const Path& path) {
  const std::string wrong = compare(state, picture);
  if (!wrong.empty()) return wrong + "\nafter" + words(path);
  const std::string kept = everythingKept(picture);
  if (++arrivals_[{state, kept}] <= 2) pending_.push_back({state, kept, path});
  return "";
}

std::string JointWalk::compare(const State& state, const StepPicture& picture) {
  if (state.isOver != picture.ended) return picture.ended ? "it has ended" : "it has not ended";
  if (state.isOver) return picture.timers.empty() ? "" : "a timer is pending after the end";
  if (!acceptsPresses(picture)) return "the window is not on the screen";
  const Look expected = meaning_.look(state);
  std::string wrong = difference(expected, seen(picture, expected));
  std::vector<std::size_t> pressable;
  for (std::size_t i = 0; i < picture.controls.size(); ++i) {
    if (canBePressed(picture.controls[i])) pressable.push_back(i);
  }
  if (wrong.empty() && pressable != meaning_.pressable(state)) wrong = "other presses are possible";
  if (wrong.empty()) wrong = compareTimers(state, picture, 0);
  const std::string all = everythingSeen(picture);
  if (wrong.empty() && seenAt_.emplace(state.step, all).first->second != all) {
    wrong = "the step looked like this before:\n" + seenAt_[state.step] + "and now:\n" + all;
  }
  return wrong;
}

// A wait that leads nowhere may have a timer: nobody can tell.
std::string JointWalk::compareTimers(const State& state, const StepPicture& picture,
                                     double passed) const {
  const auto wait = meaning_.waitOf(state);
  if (!wait && meaning_.hasWait(state.step)) return "";
  if (picture.timers.size() != (state.waits ? 1 : 0)) {
    return std::to_string(picture.timers.size()) + " timers are pending";
  }
  if (!state.waits) return "";
  const double left = picture.timers[0].timeLeft;
  const bool isRight = std::abs(left - (wait->seconds - passed)) < 0.001;
  return isRight ? "" : "the timer has " + std::to_string(left) + " s left";
}

// Nothing happens before the wait is over.
std::string JointWalk::passTime(const State& state, Play& play, double seconds) const {
  play.letPass(seconds);
  const StepPicture picture = play.picture();
  const Look expected = meaning_.look(state);
  const std::string wrong = difference(expected, seen(picture, expected));
  return wrong.empty() ? compareTimers(state, picture, seconds) : wrong;
}

void JointWalk::play(Play& play, const Path& path) const {
  State state = start_;
  for (const Move& move : path) {
    if (move) {
      play.letPass(untilPressed);
      play.click(*move);
    } else {
      play.letPass(meaning_.waitOf(state)->seconds);
    }
    state = after(meaning_, state, move);
  }
}

std::string JointWalk::words(const Path& path) const {
  State state = start_;
  std::string words = " the start at “" + state.step + "”";
  for (const Move& move : path) {
    state = after(meaning_, state, move);
    words += move ? ", a press of " + std::to_string(tour_.controls[*move].tag) : ", the wait";
    words += " to “" + (state.isOver ? "the end" : state.step) + "”";
  }
  return words;
}

}  // namespace qz::meaning
