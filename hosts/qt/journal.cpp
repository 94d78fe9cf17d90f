// SPDX-License-Identifier: MIT
// Records steps, and makes them again.

#include "hosts/qt/journal.hpp"

#include <QStringList>

#include "engine/tag_key.hpp"
#include "qz/toolkit/view.hpp"

namespace qz::hosts::qt {

QString JournalStep::text() const {
  const QString number = QString::number(tag);
  return isPress ? "press " + number + (isOn ? " on" : "") : "list " + number;
}

std::optional<JournalStep> JournalStep::of(const QString& text) {
  const QStringList words = text.split(' ');
  bool isTag = false;
  JournalStep step{.tag = words.value(1).toLongLong(&isTag),
                   .isPress = words[0] == "press",
                   .isOn = words.value(2) == "on"};
  return isTag && step.text() == text ? std::optional(step) : std::nullopt;
}

void Journal::controlPressed(const toolkit::Ref<toolkit::View>& control) {
  steps_.push_back(
      {.tag = control->tag(), .isPress = true, .isOn = control->state() == toolkit::State::on});
  isPressed_ = true;
  listener_.pressed();
}

void Journal::timerFired(std::string_view) { isPressed_ = false; }

void Journal::listWillRun(const Value&, const ObjectId& id) {
  if (depth_++ > 0) return;
  running_ = id->longValue();
  if (!std::exchange(isPressed_, false)) steps_.push_back({.tag = running_});
  listener_.stepped(running_);
}

void Journal::listDidRun(const Value&, const ObjectId&) { --depth_; }

void Journal::commandRaised(const Value&, std::size_t index, const toolkit::Exception& exception) {
  listener_.failed("list " + std::to_string(running_) + ", command " + std::to_string(index + 1) +
                   ": " + exception.reason());
}

void repeat(const JournalStep& step, QZ_Plist_State_Parser& engine) {
  const auto control = engine.findObjectWithTag(step.tag);
  if (step.isPress && control) {
    toolkit::asButton(control)->setState(step.isOn ? toolkit::State::on : toolkit::State::off);
    engine.buttonPushed(control);
  } else {
    engine.killAllTimers();  // as every press and every timer does
    engine.processCommandArray(engine.plistDictionary()->objectForKey(tagKey(step.tag)),
                               toolkit::Number::withLong(step.tag));
  }
}

}  // namespace qz::hosts::qt
