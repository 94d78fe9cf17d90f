// SPDX-License-Identifier: MIT
#include "tests/check/joint_play.hpp"

#include <map>

namespace qz::naive {

namespace {

/// What a user sees of a control, by the names of properties; nothing of a hidden one.
using SeenControl = std::map<std::string, std::string>;

/// What a user sees, or that there is nothing to see.
struct Seen {
  std::string rest{};  ///< all but the controls
  std::vector<SeenControl> controls{};

  std::string text() const {
    std::string text = rest;
    for (std::size_t i = 0; i < controls.size(); ++i) {
      text += "\n" + std::to_string(i) + ":";
      for (const auto& [property, value] : controls[i]) text += " " + property + "=" + value;
    }
    return text;
  }
};

/// Whether the button flashes: the mark belongs to the first control with its tag.
bool flashes(const World& world, const drivers::ViewPicture& picture, bool isFirst) {
  const auto marks = world.flashMarks();
  const auto mark = marks.find(std::to_string(picture.tag));
  return world.flashingAllowed() && isFirst && mark != marks.end() && mark->second &&
         isButton(picture.kind);
}

SeenControl seenControl(const World& world, const drivers::ViewPicture& picture, std::size_t index,
                        bool isFirst, TextNumbers& numbers) {
  const ControlLook look = world.lookOf(picture, index, numbers);
  SeenControl seen = {{"shown", "yes"},     {"enabled", picture.enabled ? "yes" : "no"},
                      {"caption", look[0]}, {"image", look[1]},
                      {"tooltip", look[2]}, {"background", look[3]}};
  seen["flashing"] = flashes(world, picture, isFirst) ? "yes" : "no";
  const bool showsState = rowOf(picture.kind).showsState;  // whoever made it
  seen["state"] = showsState ? std::to_string(static_cast<int>(picture.state)) : "";
  return seen;
}

/// Returns what a user sees, or with `all` also what is hidden.
Seen seenIn(const World& world, TextNumbers& numbers, bool all) {
  if (world.hasEnded()) return {.rest = "the end"};
  Seen seen{.rest = "picture " + world.windowImage()};
  const auto moves = world.moves();
  const bool waits = !moves.empty() && moves.back().kind == Move::Kind::wait;
  if (waits) seen.rest += ", wait " + std::to_string(world.timers().front().timeLeft);
  std::set<toolkit::Tag> tags;
  const auto pictures = world.pictures();
  for (std::size_t i = 0; i < pictures.size(); ++i) {
    const bool isFirst = tags.insert(pictures[i].tag).second;
    const bool isSeen = all || !pictures[i].hidden;
    seen.controls.push_back(isSeen ? seenControl(world, pictures[i], i, isFirst, numbers)
                                   : SeenControl());
  }
  return seen;
}

/// Returns everything that the walk-through can depend on. The numbers of texts are those of one
/// pair, so whole texts tell pairs apart.
std::string everythingOf(const World& world, TextNumbers& numbers) {
  std::string text = seenIn(world, numbers, true).text() + world.place();
  for (const auto& [key, isSet] : world.flashMarks()) text += key + (isSet ? "+" : "-");
  text += world.flashingAllowed() ? "flashing" : "";
  for (const auto& picture : world.pictures()) {
    for (const auto* caption : {&picture.text, &picture.title}) {
      for (const auto& run : caption->runs())
        text += caption->string() + std::to_string(run.range.length);
    }
  }
  return text;
}

std::set<std::pair<std::size_t, std::string>> differingControls(const Seen& one,
                                                                const Seen& other) {
  std::set<std::pair<std::size_t, std::string>> controls;
  for (std::size_t i = 0; i < std::min(one.controls.size(), other.controls.size()); ++i) {
    const bool bothShown = !one.controls[i].empty() && !other.controls[i].empty();
    if (one.controls[i] == other.controls[i]) continue;
    if (!bothShown) controls.emplace(i, "shown");
    if (!bothShown) continue;
    for (const auto& [property, value] : one.controls[i]) {
      if (other.controls[i].at(property) != value) controls.emplace(i, property);
    }
  }
  return controls;
}

}  // namespace

JointPlay::JointPlay(StartedScript one, StartedScript other, const HostWindow& host,
                     std::string resources)
    : one_(std::move(one)),
      other_(std::move(other)),
      host_(host),
      resources_(std::move(resources)) {}

std::optional<JointDifference> JointPlay::run(std::size_t mostPairs) {
  pending_ = {{}};
  for (std::size_t i = 0; i < pending_.size() && known_.size() < mostPairs; ++i) {
    const Path path = pending_[i];
    if (auto difference = arrive(path)) return difference;
  }
  return std::nullopt;
}

std::optional<JointDifference> JointPlay::arrive(const Path& path) {
  World one(one_.script, host_, resources_);
  World other(other_.script, host_, resources_);
  bool isEndless =
      one.perform({.kind = Move::Kind::start, .key = one_.startKey}).endless.has_value();
  bool isOtherEndless =
      other.perform({.kind = Move::Kind::start, .key = other_.startKey}).endless.has_value();
  for (const Move& move : path) {
    isEndless = one.perform(move).endless.has_value();
    isOtherEndless = other.perform(move).endless.has_value();
  }
  if (isEndless || isOtherEndless) {
    if (isEndless && isOtherEndless) return std::nullopt;
    return JointDifference{"after" + words(path) + " one runs lists without end", path.size(), {}};
  }
  TextNumbers numbers;
  const Seen seen = seenIn(one, numbers, false);
  const Seen seenOther = seenIn(other, numbers, false);
  if (seen.text() != seenOther.text()) {
    return JointDifference{
        "after" + words(path) + " one shows " + seen.text() + "\nthe other " + seenOther.text(),
        path.size(), differingControls(seen, seenOther)};
  }
  const bool isNew =
      known_.insert(everythingOf(one, numbers) + everythingOf(other, numbers)).second;
  if (!isNew) return std::nullopt;
  for (const Move& move : one.moves()) {
    pending_.push_back(path);
    pending_.back().push_back(move);
  }
  return std::nullopt;
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
