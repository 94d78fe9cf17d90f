// SPDX-License-Identifier: MIT
// The meaning of walk-throughs in steps, in the order in which docs/steps.md tells it.
#include "tests/steps/interpreter.hpp"

#include <algorithm>

#include "tests/steps/sharing.hpp"

namespace qz::meaning {

namespace {

toolkit::State stateAfterClick(ViewKind kind, toolkit::State state) {
  using toolkit::State;
  if (kind == ViewKind::toggle) return state == State::on ? State::off : State::on;
  if (kind != ViewKind::mixed) return state;
  if (state == State::off) return State::mixed;
  return state == State::mixed ? State::on : State::off;
}

Reading asItIs(const std::string& text) {
  Reading plain;
  append(plain, {text});
  return plain;
}

Reading readingOf(ViewKind kind, const Content& content) {
  if (content.isHtml) return readHtml(content.written);
  if (kind == ViewKind::textField) return readMarkdown(content.written);
  return asItIs(content.written);
}

bool isStyled(const Reading& reading) {
  return std::any_of(reading.begin(), reading.end(), [](const Span& span) {
    return span.isBold || span.isItalic || !span.link.empty();
  });
}

}  // namespace

Interpreter::Interpreter(const Tour& tour)
    : tour_(tour), everyStep_(completed(tour, tour.everyStep)) {
  for (const auto& [name, part] : tour_.steps) {
    own_[name] = completed(tour, part);
    steps_[name] = joined(own_[name], everyStep_);
  }
}

Words Interpreter::said(const Part& part, std::size_t control) const {
  const std::string& name = tour_.controls[control].name;
  const auto found = part.controls.find(name);
  return name.empty() || found == part.controls.end() ? Words{} : found->second;
}

Words Interpreter::wordsOf(const std::string& step, std::size_t control) const {
  return said(steps_.at(step), control);
}

// "What is shown"
bool Interpreter::isShown(const std::string& step, std::size_t control) const {
  const HostControl& host = tour_.controls[control];
  const Words own = said(own_.at(step), control);
  const Words common = said(everyStep_, control);
  if (own.isShown) return *own.isShown;
  if (own.isEntry) return true;
  if (common.isShown) return *common.isShown;
  if (host.kind == ViewKind::button && !host.name.empty() && !own.press && !common.press) {
    return false;
  }
  if (host.kind == ViewKind::imageView && !own.content && !common.content && host.caption.empty()) {
    return false;
  }
  return host.isShown;
}

// "What is enabled"
bool Interpreter::isEnabled(const State& state, std::size_t control) const {
  const Words words = wordsOf(state.step, control);
  if (words.isEnabled) return *words.isEnabled;
  if (words.press == "back") return !state.way.empty();
  return tour_.controls[control].isEnabled;
}

ControlLook Interpreter::lookOf(const State& state, std::size_t control) const {
  const HostControl& host = tour_.controls[control];
  const Words words = wordsOf(state.step, control);
  ControlLook look;
  look.reading = words.content ? readingOf(host.kind, *words.content) : asItIs(host.caption);
  look.isCentered = words.isCentered.value_or(false);
  const bool isHtml = words.content && words.content->isHtml;
  const bool hasStyle = isHtml || look.isCentered || isStyled(look.reading);
  look.font = words.font || !hasStyle ? words.font : "Helvetica 12";
  look.toolTip = words.toolTip.value_or(host.toolTip);
  look.color = words.color.value_or("");
  look.isRed = words.isRed.value_or(false);
  look.state = state.boxes[control];
  look.isShown = isShown(state.step, control);
  look.isEnabled = isEnabled(state, control);
  look.isFlashing = words.flashes.value_or(false) && look.isShown && look.isEnabled;
  return look;
}

Look Interpreter::look(const State& state) const {
  Look look;
  for (std::size_t i = 0; i < tour_.controls.size(); ++i) {
    look.controls.push_back(lookOf(state, i));
  }
  look.background = steps_.at(state.step).background.value_or("");
  return look;
}

std::vector<std::size_t> Interpreter::pressable(const State& state) const {
  std::vector<std::size_t> controls;
  for (std::size_t i = 0; i < tour_.controls.size() && !state.isOver; ++i) {
    if (!drivers::isButton(tour_.controls[i].kind)) continue;
    if (isShown(state.step, i) && isEnabled(state, i)) controls.push_back(i);
  }
  return controls;
}

std::optional<Wait> Interpreter::waitOf(const State& state) const {
  const std::optional<Wait>& wait = steps_.at(state.step).wait;
  return wait && leadsNowhere(state, wait->go) ? std::nullopt : wait;
}

std::optional<std::string> Interpreter::pressOf(const std::string& step,
                                                std::size_t control) const {
  return wordsOf(step, control).press;
}

State Interpreter::startAt(const std::string& step) const {
  State state;
  for (const HostControl& control : tour_.controls) state.boxes.push_back(control.state);
  return enter(state, step);
}

// "A step sets them if it, or any other step, says `state`." The wait of the step begins.
State Interpreter::enter(State state, const std::string& step) const {
  state.step = step;
  for (std::size_t i = 0; i < tour_.controls.size(); ++i) {
    const bool isSet = std::any_of(steps_.begin(), steps_.end(),
                                   [&](const auto& any) { return wordsOf(any.first, i).isOn; });
    const auto isOn = wordsOf(step, i).isOn;
    if (isSet) state.boxes[i] = tour_.controls[i].state;
    if (isOn) state.boxes[i] = *isOn ? toolkit::State::on : toolkit::State::off;
  }
  state.waits = waitOf(state).has_value();
  return state;
}

State Interpreter::press(State state, std::size_t control) const {
  state.boxes[control] = stateAfterClick(tour_.controls[control].kind, state.boxes[control]);
  const std::string target = wordsOf(state.step, control).press.value_or("nothing");
  if (!leadsNowhere(state, target)) return go(state, target);
  if (state.waits && waitOf(state)->givesUp) state.waits = false;
  return state;
}

bool Interpreter::leadsNowhere(const State& state, const std::string& target) const {
  return target == "nothing" || (target == "back" && state.way.empty());
}

// "The way"
State Interpreter::go(State state, const std::string& said) const {
  const bool isInstead = said.starts_with(instead);
  const std::string target = isInstead ? said.substr(instead.size()) : said;
  if (target == "end") {
    State over;
    over.isOver = true;
    return over;
  }
  if (target == "back") {
    const std::string last = state.way.back();
    state.way.pop_back();
    return enter(state, last);
  }
  if (target == state.step) return enter(state, target);
  const bool isPassedOver = isInstead || steps_.at(state.step).isPassedOver.value_or(false);
  if (!isPassedOver) state.way.push_back(state.step);
  state.way.erase(std::find(state.way.begin(), state.way.end(), target), state.way.end());
  if (tour_.backOver && state.way.size() > *tour_.backOver) state.way.erase(state.way.begin());
  return enter(state, target);
}

}  // namespace qz::meaning
