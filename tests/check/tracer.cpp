// SPDX-License-Identifier: MIT
// Follows an engine.
#include "tests/check/tracer.hpp"

#include <algorithm>
#include <limits>
#include <string>
#include <utility>

namespace qz::naive {

namespace {

std::vector<toolkit::Tag> tagsOf(const toolkit::Subviews& views) {
  std::vector<toolkit::Tag> tags;
  for (const auto& view : views) tags.push_back(view->tag());
  return tags;
}

}  // namespace

Tracer::Tracer(const QZ_Plist_State_Parser& engine, Script script)
    : engine_(engine), script_(std::move(script)), tags_(tagsOf(views())) {
  history.userState.resize(tags_.size());
  history.textAge.resize(tags_.size(), std::numeric_limits<double>::infinity());
  history.taggedBy.resize(tags_.size());
}

const toolkit::Subviews& Tracer::views() const {
  return engine_.tutorialWindow()->contentView()->subviews();
}

void Tracer::listWillRun(const Value& list, const ObjectId& id) {
  Running next{list, keyOf(list, id), id->longValue()};
  if (toolkit::asArray(list)) {
    const bool isInside = std::any_of(running_.begin(), running_.end(),
                                      [&](const Running& outer) { return outer.list == list; });
    if (isInside) {
      trace.endless = current().site;
      throw EndlessChain();
    }
    trace.lists.push_back(next.key);
  }
  running_.push_back(std::move(next));
}

void Tracer::listDidRun(const Value&, const ObjectId&) { running_.pop_back(); }

void Tracer::commandWillRun(const Value& list, std::size_t index) {
  Running& frame = running_.back();
  const toolkit::ValueRef<>& element = list->objectAtIndex(index);
  CommandRun run{.site = {frame.key, index},
                 .command = commandOf(element),
                 .tag = namedTag(element, frame.id)};
  run.tagIsShared = run.tag && isShared(*run.tag);
  run.raisesBySight = raisesBySight(element, script_);
  frame.command = trace.commands.size();
  trace.commands.push_back(std::move(run));
  history.lastWord = frame.key;
}

void Tracer::commandDidRun(const Value&, std::size_t, bool result) {
  current().result = result;
  endCommand();
}

void Tracer::commandRaised(const Value&, std::size_t, const toolkit::Exception&) {
  if (!running_.back().command) return;  // a dictionary raises for each entry, which is no command
  current().raised = true;
  endCommand();
}

void Tracer::endCommand() {
  const CommandRun& run = current();
  const bool setsState = run.command && run.command->target == TargetKind::buttonWithState;
  if (setsState && run.found) history.userState[*run.found] = false;
  if (run.command && run.command->flow == CommandFlow::endsWalkThrough && run.result &&
      history.endList.empty()) {
    history.endList = run.site.list;
  }
  noteTags(run);
}

void Tracer::noteTags(const CommandRun& run) {
  const bool restores = run.command && run.command->flow == CommandFlow::endsWalkThrough;
  const auto tags = tagsOf(views());
  for (std::size_t i = 0; i < tags.size(); ++i) {
    if (tags[i] == tags_[i]) continue;
    history.taggedBy[i] = restores ? std::nullopt : std::optional(run.site);
  }
  tags_ = tags;
}

void Tracer::controlSought(toolkit::Tag tag, const toolkit::Ref<toolkit::View>& control) {
  if (running_.empty() || !running_.back().command) return;
  CommandRun& run = current();
  if (run.tag != tag) return;
  run.sought = true;
  const auto& all = views();
  const auto place = std::find(all.begin(), all.end(), control);
  if (place != all.end()) run.found = static_cast<std::size_t>(place - all.begin());
}

void Tracer::timerSet(std::string_view key, double seconds) {
  const TimerStart start{current().site, std::string(key)};
  const auto replaced = history.starters.find(start.key);
  if (replaced != history.starters.end()) trace.beaten.insert(replaced->second);
  history.starters[start.key] = start;
  history.startOrder[start.key] = timersStarted_++;
  if (!lastsForEver(seconds)) trace.started.insert(start);
}

void Tracer::timerFired(std::string_view key) {
  const std::string fired(key);
  trace.fired.insert(history.starters[fired]);
  history.starters.erase(fired);
  for (const auto& [unused, other] : history.starters) trace.beaten.insert(other);
  const toolkit::Tag tag = std::stoll(fired);
  for (const auto& view : views()) {
    if (view->tag() != tag) continue;
    if (view->asButton()) pressed(tag);
    break;
  }
}

void Tracer::timerCancelled(std::string_view key) { history.starters.erase(std::string(key)); }

void Tracer::pressed(toolkit::Tag tag) {
  if (isShared(tag)) trace.sharedPresses.push_back(tag);
}

// A list is known by the key under which the engine found it. The host may start at a key that is
// not the plain form of its number.
std::string Tracer::keyOf(const Value& list, const ObjectId& id) const {
  std::string plain = std::to_string(id->longValue());
  if (!list || script_->objectForKey(plain) == list) return plain;
  for (const auto& entry : script_->entries()) {
    if (entry.value == list) return entry.key->description();
  }
  return plain;
}

bool Tracer::isShared(toolkit::Tag tag) const {
  const auto& all = views();
  return std::count_if(all.begin(), all.end(),
                       [&](const auto& view) { return view->tag() == tag; }) > 1;
}

}  // namespace qz::naive
