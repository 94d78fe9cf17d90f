// SPDX-License-Identifier: MIT
#include "tools/check/self_check.hpp"

#include <algorithm>

#include "tools/check/replay.hpp"
#include "tools/check/report.hpp"

namespace qz::tools::check {
namespace {

using walkthrough::ControlPicture;
using walkthrough::StepPicture;

constexpr std::size_t sampleSize = 50;    // visits
constexpr std::size_t longestPath = 500;  // moves; a longer path would take too long to play
// Each wait of a path ticks the flasher twice a second.
constexpr double longestWait = 24 * 3600.0;  // seconds

bool canBePlayed(const Path& path) {
  return path.size() <= longestPath && std::all_of(path.begin(), path.end(), [](const Step& step) {
           const auto* wait = std::get_if<WaitMove>(&step);
           return !wait || wait->seconds <= longestWait;
         });
}

class Likeness {
 public:
  Likeness(const Exploration& exploration, const Visit& visit, const StepPicture& picture)
      : exploration_(exploration), visit_(visit), picture_(picture) {}

  std::string difference() const {
    const auto* const place = exploration_.place(visit_.place);
    const auto& format = exploration_.format();
    if (format.isOver(place) != picture_.ended) return "the end";
    for (std::size_t i = 0; i < format.controls(); ++i) {
      if (auto found = differenceOf(format.control(place, i), i); !found.empty()) {
        return "control " + std::to_string(i) + ": " + found;
      }
    }
    return picture_.ended ? "" : differenceOfTimers();
  }

 private:
  std::string differenceOf(const ControlState& state, std::size_t index) const {
    const ControlPicture& control = picture_.controls[index];
    const ViewLook& look =
        exploration_.looks().look(exploration_.looks().parts(visit_.look)[index]);
    if (state.tag != control.view.tag) return "tag";
    if (state.hidden != control.view.hidden) return "hidden";
    if (state.enabled != control.view.enabled) return "enabled";
    if (look.view.toolTip != control.view.toolTip) return "tooltip";
    if (!(look.view.title == control.view.title)) return "title";
    // Looks have the texts of text fields only.
    const bool showsText = exploration_.setting().kinds[index] == drivers::ViewKind::textField;
    if (showsText && !(look.view.text == control.view.text)) return "text";
    if (look.view.background != control.view.background) return "background";
    const auto image = look.view.image ? std::optional(look.view.image->name()) : std::nullopt;
    if (image != control.view.image) return "image";
    if (!look.hasUsersState && look.view.state != control.view.state) return "state";
    return "";
  }

  std::string differenceOfTimers() const {
    const PendingTimers& timers = exploration_.timers(visit_.place);
    if (timers.size() != picture_.timers.size()) return "the number of pending timers";
    for (const auto& timer : timers) {
      const bool isThere = std::any_of(picture_.timers.begin(), picture_.timers.end(),
                                       [&](const auto& each) { return each.key == timer.key; });
      if (!isThere) return "timer " + timer.key;
    }
    return "";
  }

  const Exploration& exploration_;
  const Visit& visit_;
  const StepPicture& picture_;
};

}  // namespace

std::optional<std::string> selfCheck(const Exploration& exploration) {
  const auto& visits = exploration.visits();
  const std::size_t stride = std::max<std::size_t>(visits.size() / sampleSize, 1);
  for (std::size_t number = 0; number < visits.size(); number += stride) {
    const Path path = exploration.path(static_cast<std::uint32_t>(number));
    if (!canBePlayed(path)) continue;
    const StepPicture picture = pictureAfter(exploration.setting(), path);
    const auto difference = Likeness(exploration, visits[number], picture).difference();
    if (!difference.empty()) return difference + " after " + playArguments(path);
  }
  return std::nullopt;
}

}  // namespace qz::tools::check
