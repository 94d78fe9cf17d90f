// SPDX-License-Identifier: MIT
#include "tools/exploration/recorder.hpp"

#include <algorithm>

#include "tools/exploration/endless_run.hpp"

namespace qz::tools::check {
namespace {

using drivers::ViewKind;

/// Whether a command for this kind of target works on a control of this kind.
bool suits(TargetKind target, ViewKind kind) {
  const drivers::ViewKindRow& row = drivers::rowOf(kind);
  switch (target) {
    case TargetKind::none:
    case TargetKind::anyView:
      return true;
    case TargetKind::anyControl:
      return row.isControl;
    case TargetKind::button:
      return row.isButton;
    case TargetKind::buttonWithState:
      return row.showsState;
    case TargetKind::imageView:
      return kind == ViewKind::imageView;
    case TargetKind::textField:
      return kind == ViewKind::textField;
  }
  return true;
}

bool hasParameter(const Command& command, ParameterType type) {
  return command.positionOf(type).has_value();
}

bool marksFlashing(const Command& command) {
  return command.target == TargetKind::button && hasParameter(command, ParameterType::flag);
}

/// Whether the command changes what its control shows, and not only whether and where it is.
bool changesLook(const Command& command) {
  if (command.target == TargetKind::none || marksFlashing(command)) return false;
  if (command.target == TargetKind::buttonWithState) return true;
  return std::any_of(command.parameters.begin(), command.parameters.end(), [](const auto& each) {
    switch (each.type) {
      case ParameterType::text:
      case ParameterType::html:
      case ParameterType::imageName:
      case ParameterType::colorName:
      case ParameterType::integer:
        return true;
      default:
        return false;
    }
  });
}

bool changesNotes(const Command& command) {
  return marksFlashing(command) ||
         (command.target == TargetKind::none && (hasParameter(command, ParameterType::flag) ||
                                                 hasParameter(command, ParameterType::imageName)));
}

}  // namespace

Recorder::Recorder(const Script& script, Surroundings& surroundings,
                   const std::vector<bool>& watched)
    : script_(script),
      surroundings_(surroundings),
      watched_(watched),
      noted_(std::max(script.elementCount(), script.lists().size())) {}

void Recorder::begin() {
  isRecording_ = true;
  running_.clear();
  timers_.clear();
  facts_.clear();
  watchedLists_.clear();
  firstList_.reset();
  endList_.reset();
  lastList_.reset();
  isFirstTime_ = false;
  ranList_ = false;
  notesMayHaveChanged_ = false;
}

void Recorder::end(bool isOver) {
  isRecording_ = false;
  // Those that never fire have no order, and are sorted by key.
  std::stable_sort(timers_.begin(), timers_.end(), [](const Timer& a, const Timer& b) {
    if (a.timer.seconds != b.timer.seconds) return a.timer.seconds < b.timer.seconds;
    return a.timer.seconds == neverFires && a.timer.key < b.timer.key;
  });
  if (isOver) return;
  bool isFirst = true;
  for (const Timer& timer : timers_) {
    if (timer.timer.seconds != neverFires && timer.element) {
      noteOnce(isFirst ? FactKind::timerFires : FactKind::timerBeaten, *timer.element);
    }
    isFirst = false;
  }
}

void Recorder::abandon() {
  isRecording_ = false;
  timers_.clear();
}

std::vector<std::uint32_t> Recorder::pendingElements() const {
  std::vector<std::uint32_t> elements;
  for (const Timer& timer : timers_) {
    if (timer.element) elements.push_back(static_cast<std::uint32_t>(*timer.element));
  }
  return elements;
}

PendingTimers Recorder::pending() const {
  PendingTimers pending;
  for (const Timer& timer : timers_) pending.push_back(timer.timer);
  return pending;
}

void Recorder::note(FactKind kind, Subject subject, std::string detail) {
  facts_.push_back({kind, subject, std::move(detail)});
}

void Recorder::noteOnce(FactKind kind, std::size_t subject) {
  const std::uint32_t bit = 1U << static_cast<unsigned>(kind);
  if ((noted_[subject] & bit) != 0) return;
  noted_[subject] |= bit;
  isFirstTime_ = true;
  note(kind, static_cast<Subject>(subject));
}

void Recorder::listWillRun(const Value& list, const ObjectId& id) {
  if (!isRecording_) return;
  const Tag tag = id->longValue();
  const auto running = script_.runningList(list, tag);
  throwIfEndless(running);
  running_.push_back({.list = running, .id = tag});
  if (!running) return;
  ranList_ = true;
  const std::size_t index = *running;
  if (!firstList_) firstList_ = index;
  if (!watched_.empty() && watched_[index]) {
    watchedLists_.push_back(static_cast<std::uint32_t>(index));
  }
  noteOnce(FactKind::listRan, index);
}

// A list that begins inside itself does so again and again: scripts have no conditions.
void Recorder::throwIfEndless(const std::optional<std::size_t>& list) {
  const auto outer = std::find_if(running_.begin(), running_.end(),
                                  [&](const Running& each) { return list && each.list == list; });
  if (outer == running_.end() && running_.size() < deepestNesting) return;
  std::string loop;
  for (auto each = outer; each != running_.end(); ++each) {
    if (each->list) loop += script_.lists()[*each->list].key + " -> ";
  }
  note(FactKind::endlessChain, static_cast<Subject>(running_.back().element),
       outer == running_.end() ? std::to_string(deepestNesting) + " lists run inside each other"
                               : loop + script_.lists()[*list].key);
  throw EndlessRun();
}

void Recorder::listDidRun(const Value&, const ObjectId&) {
  if (isRecording_) running_.pop_back();
}

void Recorder::commandWillRun(const Value&, std::size_t index) {
  if (!isRecording_ || !running_.back().list) return;
  Running& running = running_.back();
  const ScriptList& list = script_.lists()[*running.list];
  running.element = list.firstElement + index;
  running.command = &list.elements[index];
  running.target = running.command->target(running.id);
  running.found.reset();
  lastList_ = running.list;
  noteOnce(FactKind::elementRan, running.element);
  const Command* const command = running.command->command;
  notesMayHaveChanged_ |= command && changesNotes(*command);
  if (running.target && surroundings_.controlsWithTag(*running.target) > 1) {
    note(FactKind::sharedTagUsed, static_cast<Subject>(running.element));
  }
}

void Recorder::commandDidRun(const Value&, std::size_t, bool result) {
  if (!isRecording_ || !running_.back().list) return;
  const Running& running = running_.back();
  if (!running.command->command) return;
  if (running.command->command->flow == CommandFlow::endsWalkThrough) {
    if (!endList_) endList_ = running.list;
    surroundings_.tagsMayBeRestored();
  }
  noteTarget(running);
  if (!marksFlashing(*running.command->command)) return;
  if (result) {
    noteOnce(FactKind::flashAccepted, running.element);
  } else {
    note(FactKind::flashRefused, static_cast<Subject>(running.element));
  }
}

void Recorder::commandRaised(const Value&, std::size_t, const toolkit::Exception& exception) {
  if (!isRecording_ || !running_.back().list) return;
  const Running& running = running_.back();
  if (!running.command) return;  // an entry of a dictionary in place of a list
  note(FactKind::elementRaised, static_cast<Subject>(running.element), exception.reason());
  const Command* const command = running.command->command;
  if (!command) return;
  noteTarget(running);
  if (marksFlashing(*command)) noteOnce(FactKind::flashAccepted, running.element);  // not refused
}

void Recorder::noteTarget(const Running& running) {
  const Command& command = *running.command->command;
  // A mark for flashing is for whatever control has the tag later: it looks none up.
  if (!running.target || !running.found) return;
  const auto& control = *running.found;
  const auto subject = static_cast<Subject>(running.element);
  if (control) {
    noteOnce(FactKind::targetFound, running.element);
    if (hasParameter(command, ParameterType::newTag)) {
      surroundings_.tagMayHaveChanged(control, static_cast<std::uint32_t>(running.element));
    }
    if (command.target == TargetKind::buttonWithState) surroundings_.stateWasSet(control);
    if (changesLook(command)) surroundings_.lookMayHaveChanged(control);
    if (suits(command.target, surroundings_.kindOf(control))) {
      noteOnce(FactKind::targetSuited, running.element);
    } else {
      const auto kind = surroundings_.kindOf(control);
      note(FactKind::targetUnsuited, subject, std::string(drivers::rowOf(kind).word));
    }
  } else if (hasParameter(command, ParameterType::controlOrListTag) &&
             script_.listOfTag(*running.target)) {
    noteOnce(FactKind::targetFound, running.element);
  } else {
    note(FactKind::targetMissed, subject);
  }
}

void Recorder::controlSought(Tag tag, const toolkit::Ref<toolkit::View>& control) {
  surroundings_.tagWasSought(tag);
  if (control) surroundings_.willTouch(control);
  if (!isRecording_ || running_.empty()) return;
  Running& running = running_.back();
  if (running.target == tag) running.found = control;
}

void Recorder::timerSet(std::string_view key, double seconds) {
  if (!isRecording_) return;
  for (const Timer& replaced : timers_) {
    if (replaced.timer.key == key && replaced.element) {
      noteOnce(FactKind::timerBeaten, *replaced.element);
    }
  }
  forget(key);
  std::optional<std::size_t> element;
  if (seconds > longestDelay) seconds = neverFires;
  const Running* const running = running_.empty() ? nullptr : &running_.back();
  if (running && running->list) {
    element = running->element;
    if (hasParameter(*running->command->command, ParameterType::anything)) seconds = neverFires;
    if (seconds != neverFires) noteOnce(FactKind::timerStarted, *element);
  }
  timers_.push_back({{std::string(key), seconds}, element});
}

void Recorder::timerFired(std::string_view key) { forget(key); }

void Recorder::timerCancelled(std::string_view key) { forget(key); }

void Recorder::forget(std::string_view key) {
  std::erase_if(timers_, [&](const Timer& each) { return each.timer.key == key; });
}

}  // namespace qz::tools::check
