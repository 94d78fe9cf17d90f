// SPDX-License-Identifier: MIT
#include "tools/check/replay.hpp"

#include <charconv>
#include <sstream>

#include "drivers/memory/memory_driver.hpp"
#include "qz/toolkit/exception.hpp"
#include "tools/exploration/endless_run.hpp"
#include "tools/exploration/recorder.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::check {
namespace {

using walkthrough::ControlPicture;
using walkthrough::StepPicture;
using walkthrough::TimerPicture;

std::string number(double value) {
  std::ostringstream text;
  text << value;
  return text.str();
}

class Replay {
 public:
  explicit Replay(const Setting& setting)
      : script_(setting.script.dictionary()), naming_(setting.plan.names) {
    driver_.setResourcePath(setting.resources);
    stage_.emplace(driver_, setting.plan);
    stage_->engine().setObserver(std::make_shared<EndlessGuard>());
  }

  /// What became of a move. After one that would never end, the window shows nothing of use.
  enum class Outcome : std::uint8_t { made, raised, endless };

  Outcome make(const Step& step) {
    try {
      if (const auto* start = std::get_if<StartMove>(&step)) {
        stage_->start(script_, start->key);
      } else if (const auto* press = std::get_if<PressMove>(&step)) {
        driver_.click(controls()[press->control]);
      } else {
        driver_.advance(std::get<WaitMove>(step).seconds);
      }
    } catch (const EndlessRun&) {
      return Outcome::endless;
    } catch (const toolkit::Exception&) {
      return Outcome::raised;  // the picture shows what was done until then
    }
    return Outcome::made;
  }

  StepPicture picture() {
    StepPicture picture = walkthrough::takePicture(driver_, stage_->engine(), "");
    naming_.apply(picture);
    return picture;
  }

 private:
  const toolkit::Subviews& controls() {
    return stage_->engine().tutorialWindow()->contentView()->subviews();
  }

  QZ_Plist_State_Parser::Dictionary script_;
  walkthrough::Naming naming_;
  drivers::MemoryDriver driver_;
  std::optional<walkthrough::Stage> stage_;
};

std::string wordsOf(const Step& step, const walkthrough::Names& names) {
  if (const auto* start = std::get_if<StartMove>(&step)) {
    const std::string name = names.stepOf(start->key);
    return "start " + (name.empty() ? start->key : quote(name));
  }
  if (const auto* press = std::get_if<PressMove>(&step)) {
    return "press " + names.controlWords(press->tag);
  }
  return "wait " + number(std::get<WaitMove>(step).seconds) + " s";
}

/// Says what differs between two pictures of one control.
class Changes {
 public:
  Changes(const ControlPicture& before, const ControlPicture& after)
      : before_(before.view), after_(after.view), name_(before.name) {
    if (name_.empty() && before_.tag != after_.tag)
      add("gets the tag " + std::to_string(after_.tag));
    if (before_.hidden != after_.hidden) add(after_.hidden ? "hidden" : "shown");
    if (before_.enabled != after_.enabled) add(after_.enabled ? "enabled" : "disabled");
    addText("title", before_.title, after_.title);
    addText("text", before_.text, after_.text);
    if (before_.state != after_.state) add(after_.state == toolkit::State::on ? "on" : "off");
    if (before_.image != after_.image) add("image " + after_.image.value_or("none"));
    if (before_.toolTip != after_.toolTip) add("tooltip " + quoteStart(after_.toolTip));
    if (before_.background != after_.background) add("another background");
    if (before.flashing != after.flashing) add(after.flashing ? "flashes" : "stops flashing");
  }

  /// Returns a line such as "tag 5: hidden, new tag 6"; empty if nothing differs.
  std::string line() const {
    if (words_.empty()) return words_;
    return (name_.empty() ? "tag " + std::to_string(before_.tag) : name_) + ": " + words_;
  }

 private:
  void addText(const std::string& what, const toolkit::AttributedString& before,
               const toolkit::AttributedString& after) {
    if (before.string() != after.string()) {
      add(what + " " + quoteStart(after.string()));
    } else if (!(before == after)) {
      add("another look of the " + what);
    }
  }
  void add(const std::string& words) { words_ += (words_.empty() ? "" : ", ") + words; }

  const drivers::ViewPicture& before_;
  const drivers::ViewPicture& after_;
  const std::string& name_;  // empty: the control has none
  std::string words_;
};

std::string timerWords(const TimerPicture& timer) {
  const bool fires = timer.timeLeft <= longestDelay;
  return (timer.step.empty() ? "timer " + timer.key : quote(timer.step)) +
         (fires ? " in " + number(timer.timeLeft) + " s" : ", which never fires");
}

std::vector<std::string> changesBetween(const StepPicture& before, const StepPicture& after) {
  std::vector<std::string> changes;
  for (std::size_t i = 0; i < after.controls.size() && i < before.controls.size(); ++i) {
    std::string line = Changes(before.controls[i], after.controls[i]).line();
    if (!line.empty()) changes.push_back(std::move(line));
  }
  for (const TimerPicture& timer : after.timers) changes.push_back(timerWords(timer));
  if (after.ended && !before.ended) changes.emplace_back("the end");
  return changes;
}

}  // namespace

void playEach(const Setting& setting, const Path& path,
              const std::function<void(const SeenMove&)>& see) {
  Replay replay(setting);
  StepPicture before = replay.picture();
  for (const Step& step : path) {
    const auto outcome = replay.make(step);
    if (outcome == Replay::Outcome::endless) return;
    StepPicture after = replay.picture();
    see({step, before, after, outcome == Replay::Outcome::raised});
    before = std::move(after);
  }
}

std::vector<PlayedMove> playPath(const Setting& setting, const Path& path) {
  const auto& names = setting.plan.names;
  std::vector<PlayedMove> played;
  playEach(setting, path, [&](const SeenMove& move) {
    played.push_back(
        {wordsOf(move.step, names), changesBetween(move.before, move.after), move.raised, false});
  });
  if (played.size() < path.size()) {
    played.push_back({wordsOf(path[played.size()], names),
                      {"runs lists without end, so the program crashes"},
                      false,
                      true});
  }
  return played;
}

walkthrough::StepPicture pictureAfter(const Setting& setting, const Path& path) {
  Replay replay(setting);
  for (const Step& step : path) {
    if (replay.make(step) == Replay::Outcome::endless) break;
  }
  return replay.picture();
}

}  // namespace qz::tools::check
