// SPDX-License-Identifier: MIT
// Plays a walk-through.
#include "tools/play/session.hpp"

#include <algorithm>
#include <set>
#include <utility>

#include "tools/play/pressing.hpp"
#include "tools/play/words.hpp"
#include "tools/support/file_names.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::play {

namespace {

/// Returns the first timer of `before` that is not in `after`, which counts as fired; else null.
const TimerPicture* firedBetween(const StepPicture& before, const StepPicture& after) {
  for (const TimerPicture& timer : before.timers) {
    const bool pends =
        std::any_of(after.timers.begin(), after.timers.end(),
                    [&](const TimerPicture& other) { return timer.identity == other.identity; });
    if (!pends) return &timer;
  }
  return nullptr;
}

std::string headingOf(const TimerPicture& fired) {
  return fired.step.empty() ? "list " + fired.key + " runs by its timer"
                            : "the wait leads to " + quote(fired.step);
}

// Names of pictures, after the number of each.
std::string pictureOfPress(const StepPicture& picture, toolkit::Tag tag) {
  const auto pressed =
      std::find_if(picture.controls.begin(), picture.controls.end(),
                   [&](const ControlPicture& control) { return control.view.tag == tag; });
  const bool hasName = pressed != picture.controls.end() && !pressed->name.empty();
  return "press-" + (hasName ? fileWord(pressed->name) : std::to_string(tag));
}

std::string pictureOf(const TimerPicture& fired) {
  return fired.step.empty() ? "list-" + fired.key : "wait-" + fileWord(fired.step);
}

}  // namespace

Session::Session(drivers::Driver& driver, Stage& stage, Transcript& transcript,
                 Screenshots* screenshots, Names names)
    : driver_(driver),
      stage_(stage),
      naming_(std::move(names)),
      transcript_(transcript),
      screenshots_(screenshots) {
  transcript_.startFrom(look());
  if (screenshots_) screenshots_->keep(transcript_);
}

void Session::start(const std::string& script, const std::string& startKey) {
  run("start", "start", [&] { stage_.load(script, startKey); });
}

void Session::start(const QZ_Plist_State_Parser::Dictionary& script, const std::string& startKey) {
  run("start", "start", [&] { stage_.start(script, startKey); });
}

void Session::perform(const Step& step) {
  if (const auto* pressed = std::get_if<Press>(&step)) {
    press(*pressed);
  } else {
    advance(std::get<Advance>(step).seconds);
  }
}

StepPicture Session::look() {
  StepPicture picture = takePicture(driver_, stage_.engine(), stage_.title());
  naming_.apply(picture);
  return picture;
}

void Session::press(const Press& press) {
  const auto tag = tagOf(picture(), press);
  if (!tag) return refuse("press " + press.name, noSuchName(picture(), press.name));
  const std::string heading = "press " + pressWords(picture(), *tag);
  if (const auto reason = whyNotPress(picture(), *tag)) return refuse(heading, *reason);
  run(heading, pictureOfPress(picture(), *tag),
      [&] { driver_.click(stage_.engine().findObjectWithTag(*tag)); });
}

void Session::advance(double seconds) {
  const std::string heading = "let " + numberWords(seconds) + " s pass";
  if (picture().ended) return refuse(heading, "the walk-through has ended");
  run(heading, "advance-" + numberWords(seconds), [&] { pass(seconds); });
}

// With screenshots, advances from one firing to the next and takes a picture after each.
void Session::pass(double seconds) {
  while (screenshots_) {
    const StepPicture before = look();
    if (before.timers.empty() || before.timers.front().timeLeft > seconds) break;
    const double wait = before.timers.front().timeLeft;
    driver_.advance(wait);
    seconds -= wait;
    const StepPicture after = look();
    const TimerPicture* const fired = firedBetween(before, after);
    if (!fired) break;
    takeScreenshot(pictureOf(*fired));
    if (seconds <= 0) begun_->name.clear();  // nothing has changed since that picture
  }
  driver_.advance(seconds);
}

void Session::run(const std::string& heading, const std::string& name,
                  const std::function<void()>& action) {
  begin(heading, name);
  try {
    action();
  } catch (const toolkit::Exception& exception) {
    noteRaised(exception);
  }
  end();
}

void Session::begin(const std::string& heading, const std::string& name) {
  begun_ = {heading, name};
  transcript_.beginStep(heading);
}

// A host's event loop would report the exception and continue; so does the transcript.
void Session::noteRaised(const toolkit::Exception& exception) {
  const std::string what = exception.name() + ": " + printable(exception.reason());
  problems_.push_back(begun_->heading + ": raised " + what);
  transcript_.note("Raised " + what);
}

void Session::end() {
  transcript_.endStep(look());
  takeScreenshot(std::exchange(begun_, std::nullopt)->name);
}

void Session::takeScreenshot(const std::string& name) {
  if (screenshots_ && !name.empty()) screenshots_->take(stage_.engine().tutorialWindow(), name);
}

void Session::handOver() {
  const auto willAct = [this](const toolkit::Ref<toolkit::View>& view) {
    watch();  // what happened before is its own step, such as the list of a timer
    const toolkit::Tag tag = view->tag();
    const StepPicture now = look();
    begin("press " + pressWords(now, tag), pictureOfPress(now, tag));
  };
  while (watch()) {
    try {
      driver_.handOver(willAct, [this] { return watch(); });
    } catch (const toolkit::Exception& exception) {
      if (!begun_) begin("a timer fires", "list");
      noteRaised(exception);
    }
  }
}

/// Records what has happened since the last step. True if the walk-through continues.
bool Session::watch() {
  if (!begun_) {
    const StepPicture now = look();
    if (const TimerPicture* const fired = firedBetween(picture(), now)) {
      begin(headingOf(*fired), pictureOf(*fired));
    } else {
      return !now.ended && now.window && now.window->visible;
    }
  }
  end();
  return !picture().ended && picture().window && picture().window->visible;
}

void Session::refuse(const std::string& heading, const std::string& reason) {
  problems_.push_back(heading + ": " + reason);
  transcript_.beginStep(heading);
  transcript_.note("Not possible: " + reason + ".");
}

void Session::conclude() {
  if (const auto reason = whyNoWayOn(picture())) {
    problems_.push_back("the walk-through is stuck: " + *reason);
  }
  const std::string states = recordedStates();
  transcript_.paragraph(standing(picture()) + "\n" +
                        (states.empty() ? "" : "Button states recorded: " + states + ".\n"));
}

std::string Session::recordedStates() {
  const auto states = stage_.engine().buttonStates();
  std::string words;
  std::set<std::string> said;  // a control with a name has had several tags
  for (const std::string& key : states->allKeys()) {
    const std::string name = naming_.controlName(key);
    if (!said.insert(name).second) continue;
    if (!words.empty()) words += ", ";
    words += name + (states->objectForKey(key)->boolValue() ? " on" : " off");
  }
  return words;
}

}  // namespace qz::tools::play
