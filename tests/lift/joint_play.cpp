// SPDX-License-Identifier: MIT
#include "tests/lift/joint_play.hpp"

#include <set>
#include <utility>

namespace qz::naive {

namespace {

/// What a user sees, or with `all` everything that the walk-through can depend on.
std::string lookText(const World& world, TextNumbers& numbers, bool all) {
  if (world.hasEnded()) return "the end";
  const auto marks = world.flashMarks();
  std::set<toolkit::Tag> tags;
  std::string text;
  const auto pictures = world.pictures();
  for (std::size_t i = 0; i < pictures.size(); ++i) {
    const auto& picture = pictures[i];
    const bool isFirst = tags.insert(picture.tag).second;
    text += "\n" + std::to_string(i) + ": ";
    if (picture.hidden && !all) continue;
    const auto mark = marks.find(std::to_string(picture.tag));
    const bool flashes = world.flashingAllowed() && isFirst && mark != marks.end() &&
                         mark->second && isButton(picture.kind);
    ControlLook look = world.lookOf(picture, i, numbers);
    look.back().clear();  // the state follows, whoever made it
    for (const std::string& part : look) text += part + "|";
    const bool hasState = rowOf(picture.kind).showsState;
    text += (hasState ? std::to_string(static_cast<int>(picture.state)) : "") +
            (picture.enabled ? "" : " disabled") + (flashes ? " flashes" : "");
  }
  const auto timers = world.timers();
  const auto moves = world.moves();
  const bool waits = !moves.empty() && moves.back().kind == Move::Kind::wait;
  if (waits) text += "\nwaits " + std::to_string(timers.front().timeLeft);
  if (!all) return text;
  for (const auto& [key, isSet] : marks) text += key + (isSet ? "+" : "-");
  return text + (world.flashingAllowed() ? "flashing" : "") + world.place();
}

}  // namespace

JointPlay::JointPlay(StartedScript one, StartedScript other, const HostWindow& host,
                     std::string resources)
    : one_(std::move(one)),
      other_(std::move(other)),
      host_(host),
      resources_(std::move(resources)) {}

std::string JointPlay::run(std::size_t mostPairs) {
  pending_ = {{}};
  for (std::size_t i = 0; i < pending_.size() && known_.size() < mostPairs; ++i) {
    const Path path = pending_[i];
    const std::string wrong = arrive(path);
    if (!wrong.empty()) return wrong;
  }
  return "";
}

std::string JointPlay::arrive(const Path& path) {
  World one(one_.script, host_, resources_);
  World other(other_.script, host_, resources_);
  one.perform({.kind = Move::Kind::start, .key = one_.startKey});
  other.perform({.kind = Move::Kind::start, .key = other_.startKey});
  for (const Move& move : path) {
    one.perform(move);
    other.perform(move);
  }
  TextNumbers numbers;
  const std::string seen = lookText(one, numbers, false);
  const std::string seenOther = lookText(other, numbers, false);
  if (seen != seenOther) {
    return "after" + words(path) + " one shows" + seen + "\nthe other" + seenOther;
  }
  // The numbers of texts are those of this pair, so whole texts tell pairs apart.
  std::string kept = lookText(one, numbers, true) + lookText(other, numbers, true);
  for (const auto& picture : one.pictures()) {
    for (const auto& run : picture.text.runs())
      kept += picture.text.string() + std::to_string(run.range.length);
    for (const auto& run : picture.title.runs())
      kept += picture.title.string() + std::to_string(run.range.length);
  }
  if (!known_.try_emplace(kept, true).second) return "";
  for (const Move& move : one.moves()) {
    pending_.push_back(path);
    pending_.back().push_back(move);
  }
  return "";
}

std::string JointPlay::words(const Path& path) const {
  std::string words = " the start";
  for (const Move& move : path) {
    words +=
        move.kind == Move::Kind::wait ? ", a wait" : ", a press of " + std::to_string(move.index);
  }
  return words;
}

}  // namespace qz::naive
