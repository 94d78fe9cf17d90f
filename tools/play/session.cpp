// A walk-through being played.
#include "tools/play/session.hpp"

#include "toolkit/exception.hpp"
#include "tools/play/pressing.hpp"
#include "tools/play/words.hpp"
#include "tools/text_layout.hpp"

namespace tools::play {

Session::Session(toolkit::TestDriver& driver, Stage& stage, std::ostream& out, const Style& style)
    : driver_(driver), stage_(stage), transcript_(out, style) {
  transcript_.startFrom(look());
}

void Session::start(const std::string& script, const std::string& startKey) {
  run("start", [&] { stage_.load(script, startKey); });
}

void Session::perform(const Step& step) {
  if (const auto* pressed = std::get_if<Press>(&step)) {
    press(pressed->tag);
  } else {
    advance(std::get<Advance>(step).seconds);
  }
}

void Session::press(long tag) {
  const std::string heading = "press " + pressWords(picture(), tag);
  if (const auto reason = whyNotPress(picture(), tag)) return refuse(heading, *reason);
  run(heading, [&] { driver_.click(stage_.engine().findObjectWithTag(tag)); });
}

void Session::advance(double seconds) {
  const std::string heading = "let " + numberWords(seconds) + " s pass";
  if (picture().ended) return refuse(heading, "the walk-through has ended");
  run(heading, [&] { driver_.advance(seconds); });
}

void Session::run(const std::string& heading, const std::function<void()>& action) {
  transcript_.beginStep(heading);
  try {
    action();
  } catch (const toolkit::Exception& exception) {
    // A host's event loop would report it and go on; so does the transcript.
    failed_ = true;
    transcript_.note("Raised " + exception.name() + ": " + printable(exception.reason()));
  }
  transcript_.endStep(look());
}

void Session::refuse(const std::string& heading, const std::string& reason) {
  failed_ = true;
  transcript_.beginStep(heading);
  transcript_.note("Not possible: " + reason + ".");
}

void Session::conclude() {
  const std::string states = recordedStates();
  transcript_.paragraph(standing(picture()) + "\n" +
                        (states.empty() ? "" : "Button states recorded: " + states + ".\n"));
}

std::string Session::recordedStates() {
  const auto states = stage_.engine().buttonStates();
  std::string words;
  for (const std::string& key : states->allKeys()) {
    if (!words.empty()) words += ", ";
    words += key + (states->objectForKey(key)->boolValue() ? " on" : " off");
  }
  return words;
}

}  // namespace tools::play
