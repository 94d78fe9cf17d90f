// SPDX-License-Identifier: MIT
// Only what a move may have touched is read back afterwards, only what differs between two places
// is restored, and a press that is remembered is not made again.
#include "tools/exploration/world.hpp"

#include <algorithm>
#include <limits>
#include <utility>

#include "qz/toolkit/exception.hpp"
#include "toolkit/memory/parts.hpp"
#include "tools/exploration/endless_run.hpp"

namespace qz::tools::check {
namespace {

using drivers::MemoryDriver;
using toolkit::memory::ButtonBehavior;
using toolkit::memory::ControlNode;
using toolkit::memory::MemoryButton;
using toolkit::memory::ViewNode;
using walkthrough::Stage;

std::unique_ptr<MemoryDriver> makeDriver(const std::string& resources) {
  auto driver = std::make_unique<MemoryDriver>();
  driver->setResourcePath(resources);
  return driver;
}

std::vector<std::string> flashKeys(const Script& script) {
  std::vector<std::string> keys;
  for (const ScriptList& list : script.lists()) {
    for (const Element& element : list.elements) {
      const bool marks = element.command && element.command->target == TargetKind::button &&
                         element.command->positionOf(ParameterType::flag);
      const auto target = marks ? element.target(0) : std::nullopt;
      if (target) keys.push_back(std::to_string(*target));
    }
  }
  std::sort(keys.begin(), keys.end());
  keys.erase(std::unique(keys.begin(), keys.end()), keys.end());
  return keys;
}

LookValue noteOf(const QZ_Plist_State_Parser::Value& flag) {
  if (!flag) return notedNothing;
  return flag->boolValue() ? notedYes : notedNo;
}

/// Returns the seconds as the engine takes them.
std::uint64_t wholeSeconds(double seconds) {
  constexpr auto most = std::numeric_limits<std::uint64_t>::max();
  return seconds >= static_cast<double>(most) ? most : static_cast<std::uint64_t>(seconds);
}

const toolkit::Subviews& controlsOf(QZ_Plist_State_Parser& engine) {
  return engine.tutorialWindow()->contentView()->subviews();
}

}  // namespace

Setting settingOf(const Script& script, const walkthrough::StagePlan& plan, std::string resources) {
  const auto driver = makeDriver(resources);
  Stage stage(*driver, plan);
  Setting setting{.script = script,
                  .plan = plan,
                  .resources = std::move(resources),
                  .flashKeys = flashKeys(script)};
  for (const auto& view : controlsOf(stage.engine())) {
    setting.ownTags.push_back(view->tag());
    setting.before.push_back(ViewNode::of(view)->save());
    if (!view->asTextField()) setting.before.back().text = {};
    setting.kinds.push_back(driver->look(view).kind);
  }
  return setting;
}

Tag restoredTag(Tag tag) { return toolkit::Number::withLong(tag)->intValue(); }

World::World(const Setting& setting, const PlaceFormat& format, Looks& looks)
    : setting_(setting),
      format_(format),
      looks_(looks),
      context_{.format = format, .notes = 2 + setting.flashKeys.size()},
      presses_(context_),
      place_(format.size()) {
  Surroundings& surroundings = *this;
  recorder_ = std::make_shared<Recorder>(setting.script, surroundings, setting.watchedLists);
  facts_ = &recorder_->facts();
  build(std::nullopt);
}

World::~World() {
  if (stage_) stage_->engine().setObserver(nullptr);
}

// A new window and engine. The parts of the look that are not controls come behind them: the
// background, whether flashing is allowed, the tags that flash, and, if they are tracked, the
// numbers of the elements that gave the controls their tags (from 1; 0 for none).
void World::build(const std::optional<std::string>& startKey) {
  if (stage_) stage_->engine().setObserver(nullptr);
  stage_.reset();
  driver_ = makeDriver(setting_.resources);
  stage_ = std::make_unique<Stage>(*driver_, setting_.plan);
  observe();
  auto& engine = stage_->engine();
  // A tick changes nothing but the pressed-in look, which is not part of a place or a look.
  engine.flashingTimer()->invalidate();
  std::fill(place_.begin(), place_.end(), 0);
  for (std::size_t i = 0; i < controls_.size(); ++i) {
    format_.setControl(place_.data(), i, controls_[i].state);
  }
  if (startKey) recorder_->begin();
  try {
    stage_->start(setting_.script.dictionary(), startKey);
  } catch (const toolkit::Exception&) {
    // The list is not an array, which is found by reading the script.
  }
}

void World::observe() {
  controls_.clear();
  indices_.clear();
  tagCounts_.clear();
  touched_.clear();
  sharedTags_ = 0;
  parts_.clear();
  for (const auto& view : controlsOf(stage_->engine())) {
    Control control{.node = ViewNode::of(view), .view = view};
    control.button = dynamic_cast<MemoryButton*>(control.node.get());
    control.showsState = drivers::rowOf(driver_->look(view).kind).showsState;
    control.state = stateOf(control);
    control.look = looks_.valueOf(lookOf(control));
    parts_.push_back(control.look);
    indices_.emplace(view.pointer().get(), controls_.size());
    if (++tagCounts_[control.state.tag] == 2) ++sharedTags_;
    controls_.push_back(std::move(control));
  }
  const std::size_t taggers = setting_.tracksTaggers ? controls_.size() : 0;
  parts_.resize(controls_.size() + context_.notes + taggers, notedNothing);
  const auto content = stage_->engine().tutorialWindow()->contentView();
  parts_[controls_.size()] = looks_.valueOf({ViewNode::of(content)->save(), false});
  parts_[controls_.size() + 1] = notedNo;
  look_ = looks_.numberOf(parts_);
  readRestoredTags();
  stage_->engine().setObserver(recorder_);
}

void World::readRestoredTags() {
  context_.restoredTags.assign(controls_.size(), std::nullopt);
  for (const auto& [key, asset] : stage_->engine().guiAssets()->entries()) {
    const Control* const control = controlOf(asset.control.get());
    if (!control) continue;
    const std::size_t index = indexOf(*control);
    context_.restoredTags[index] = restoredTag(setting_.ownTags[index]);
  }
}

Arrival World::start(const std::string& key, PendingTimers& timers, std::uint8_t* place) {
  trace_.clear();
  try {
    build(key);
  } catch (const EndlessRun&) {
    return abandon(0);
  }
  return arrive(0, timers, place);
}

std::vector<Move> World::moves(const std::uint8_t* place, const PendingTimers& pending) const {
  std::vector<Move> moves;
  if (format_.isOver(place)) return moves;
  for (std::size_t i = 0; i < controls_.size(); ++i) {
    if (!controls_[i].button) continue;
    const ControlState state = format_.control(place, i);
    if (!state.hidden && state.enabled) moves.push_back(static_cast<Move>(i));
  }
  if (!pending.empty() && pending.front().seconds != neverFires) moves.push_back(waitMove);
  return moves;
}

Arrival World::make(Move move, const Station& from, const PendingTimers& pending,
                    PendingTimers& timers, std::uint8_t* place) {
  if (move == waitMove) return makeAnew(move, from, pending, timers, place);
  if (const RememberedPress* known = presses_.find(move, from)) {
    known->writePlace(context_, from, place);
    timers = known->timers;
    facts_ = &known->facts;
    Arrival arrival = known->arrival;
    arrival.look = known->lookAfter(context_, from, looks_);
    return arrival;
  }
  Arrival arrival = makeAnew(move, from, pending, timers, place);
  remember(from, arrival, timers);
  return arrival;
}

Arrival World::makeAnew(Move move, const Station& from, const PendingTimers& pending,
                        PendingTimers& timers, std::uint8_t* place) {
  goTo(from.place, from.look);
  trace_.clear();
  recorder_->begin();
  facts_ = &recorder_->facts();
  try {
    if (move == waitMove) {
      wait(pending.front());
    } else {
      press(move);
    }
  } catch (const EndlessRun&) {
    return abandon(move);
  }
  return arrive(move, timers, place);
}

// After an endless run the world is of no use.
void World::remember(const Station& from, const Arrival& arrival, const PendingTimers& timers) {
  if (arrival.isEndless || trace_.isLong() || recorder_->isFirstTime()) return;
  RememberedPress press(context_, trace_, from, {place_.data(), look_, parts_});
  press.arrival = arrival;
  press.timers = timers;
  press.facts = recorder_->facts();
  presses_.add(arrival.move, from, std::move(press));
}

void World::goTo(const std::uint8_t* place, std::uint32_t look) {
  if (format_.isOver(place_.data())) build(std::nullopt);
  for (std::size_t i = 0; i < controls_.size(); ++i) {
    if (!format_.differs(place, place_.data(), i)) continue;
    Control& control = controls_[i];
    const ControlState state = format_.control(place, i);
    setTag(control, state.tag);
    if (state.hidden != control.state.hidden) control.view->setHidden(state.hidden);
    if (state.enabled != control.state.enabled) control.view->setEnabled(state.enabled);
    control.state = state;
    format_.setControl(place_.data(), i, state);
  }
  if (look != look_) restoreLook(look);
}

void World::restoreLook(std::uint32_t look) {
  const Looks::Parts& parts = looks_.parts(look);
  const auto restore = [&](ViewNode& node, LookValue value) {
    SavedView saved = looks_.look(value).view;
    const SavedView now = node.save();
    saved.tag = now.tag;
    saved.hidden = now.hidden;
    saved.enabled = now.enabled;
    node.restore(saved);
  };
  for (std::size_t i = 0; i < controls_.size(); ++i) {
    if (parts[i] == parts_[i]) continue;
    restore(*controls_[i].node, parts[i]);
    controls_[i].look = parts[i];
    controls_[i].hasUsersState = controls_[i].showsState && looks_.look(parts[i]).hasUsersState;
  }
  auto& engine = stage_->engine();
  std::size_t part = controls_.size();
  if (parts[part] != parts_[part]) {
    restore(*ViewNode::of(engine.tutorialWindow()->contentView()), parts[part]);
  }
  ++part;
  if (parts[part] != parts_[part]) engine.setFlashing(parts[part] == notedYes);
  const auto flashing = engine.flashingTagIds();
  for (const std::string& key : setting_.flashKeys) {
    ++part;
    if (parts[part] == parts_[part]) continue;
    const LookValue note = parts[part] % flashingAllowed;
    if (note == notedNothing) {
      flashing->removeObjectForKey(key);
    } else {
      flashing->setObject(toolkit::Number::withBool(note == notedYes), key);
    }
  }
  parts_ = parts;
  look_ = look;
}

void World::press(std::size_t control) {
  Control& pressed = controls_[control];
  const Tag tag = pressed.state.tag;
  noteIfShared(tag);
  if (!setting_.script.listOfTag(tag)) recorder_->note(FactKind::noListPressed, tag);
  willTouch(pressed.view);
  const auto behavior = pressed.button->behavior();
  if (behavior == ButtonBehavior::toggle || behavior == ButtonBehavior::mixed) {
    pressed.hasUsersState = true;
    pressed.mayLookDifferent = true;
  }
  try {
    pressed.button->click();
  } catch (const toolkit::Exception&) {
    // as at the start
  }
}

void World::noteIfShared(Tag tag) {
  if (controlsWithTag(tag) > 1) recorder_->note(FactKind::sharedTagPressed, tag);
}

// A timer presses the backmost control with its tag, if that is a button.
void World::noteIfTimerPressesShared(const std::string& key) {
  if (sharedTags_ == 0) return;
  const auto pressed = std::find_if(controls_.begin(), controls_.end(), [&](const Control& each) {
    return std::to_string(each.state.tag) == key;
  });
  if (pressed != controls_.end() && pressed->button) noteIfShared(pressed->state.tag);
}

// Timers of the place where the world was before may be pending. The place's own others need not be
// set: the first that fires cancels them.
void World::wait(const PendingTimer& first) {
  stage_->engine().killAllTimers();
  stage_->engine().startTimerWithValue(wholeSeconds(first.seconds), first.key);
  recorder_->begin();
  noteIfTimerPressesShared(first.key);
  try {
    driver_->toolkit().advance(first.seconds);
  } catch (const toolkit::Exception&) {
    // as at the start
  }
}

Arrival World::arrive(Move move, PendingTimers& timers, std::uint8_t* place) {
  const bool isOver = stage_->engine().terminating();
  recorder_->end(isOver);
  readTouched(place_.data());
  if (recorder_->notesMayHaveChanged()) readEngine();
  format_.setOver(place_.data(), isOver);
  timers = isOver ? pendingAtTheEnd() : recorder_->pending();
  std::copy(place_.begin(), place_.end(), place);
  Arrival arrival{.move = move, .ranList = recorder_->ranList(), .look = look_};
  arrival.watchedLists = recorder_->watchedLists();
  arrival.timerElements = recorder_->pendingElements();
  if (const auto list = recorder_->firstList()) {
    arrival.firstList = static_cast<std::uint32_t>(*list);
  }
  const auto last = isOver ? recorder_->endList() : recorder_->lastList();
  if (last) arrival.lastList = static_cast<std::uint32_t>(*last);
  return arrival;
}

// The engine was stopped in the middle of a list, so the next move is made in a new world.
Arrival World::abandon(Move move) {
  recorder_->abandon();
  format_.setOver(place_.data(), true);
  return {.move = move, .isEndless = true};
}

// The end may have taken the engine's table of timers away; what is set then is not pending.
PendingTimers World::pendingAtTheEnd() const {
  PendingTimers pending = recorder_->pending();
  const auto table = stage_->engine().objectIdTimers();
  std::erase_if(pending, [&](const PendingTimer& timer) {
    return !table || !table->objectForKey(timer.key);
  });
  return pending;
}

// The text of other controls than text fields is not seen, nor is the state of a push button.
ViewLook World::lookOf(const Control& control) const {
  const bool showsState = !control.button || control.showsState;
  const bool isUsers = control.hasUsersState && !setting_.exactStates;
  ViewLook look{control.node->save(), isUsers || !showsState};
  if (!control.view->asTextField()) look.view.text = {};
  return look;
}

void World::readTouched(std::uint8_t* place) {
  if (stage_->engine().terminating()) {  // the end restores tags without looking controls up
    for (Control& control : controls_) touch(control);
  }
  bool looksElse = std::exchange(hasNewTaggers_, false);
  for (const std::size_t index : touched_) {
    Control& control = controls_[index];
    control.isTouched = false;
    const ControlState state = stateOf(control);
    if (!(state == control.state)) {
      setTag(control, state.tag);
      control.state = state;
      format_.setControl(place, index, state);
    }
    if (!std::exchange(control.mayLookDifferent, false)) continue;
    control.look = looks_.valueOf(lookOf(control));
    looksElse |= control.look != parts_[index];
    parts_[index] = control.look;
  }
  touched_.clear();
  if (looksElse) look_ = looks_.numberOf(parts_);
}

void World::readEngine() {
  const auto& engine = stage_->engine();
  Looks::Parts parts = parts_;
  std::size_t part = controls_.size();
  const auto content = engine.tutorialWindow()->contentView();
  parts[part] = looks_.valueOf({ViewNode::of(content)->save(), false});
  parts[++part] = engine.flashing() ? notedYes : notedNo;
  const auto flashing = engine.flashingTagIds();
  for (const std::string& key : setting_.flashKeys) {
    parts[++part] = noteOf(flashing->objectForKey(key)) + (engine.flashing() ? flashingAllowed : 0);
  }
  if (parts == parts_) return;
  parts_ = parts;
  look_ = looks_.numberOf(parts_);
}

void World::setTag(Control& control, Tag tag) {
  if (control.state.tag == tag && control.view->tag() == tag) return;
  if (control.state.tag != tag) {
    if (--tagCounts_[control.state.tag] == 1) --sharedTags_;
    if (++tagCounts_[tag] == 2) ++sharedTags_;
    control.state.tag = tag;
  }
  control.view->setTag(tag);
}

ControlState World::stateOf(const Control& control) const {
  const auto* const node = dynamic_cast<const ControlNode*>(control.node.get());
  return {.tag = control.view->tag(),
          .hidden = control.node->isHidden(),
          .enabled = !node || node->isEnabled()};
}

World::Control* World::controlOf(const toolkit::Ref<toolkit::View>& view) {
  const auto found = indices_.find(view.pointer().get());
  return found == indices_.end() ? nullptr : &controls_[found->second];
}

void World::willTouch(const toolkit::Ref<toolkit::View>& view) {
  Control* const control = controlOf(view);
  if (!control) return;
  touch(*control);
  trace_.addControl(indexOf(*control));
}

void World::touch(Control& control) {
  if (!std::exchange(control.isTouched, true)) touched_.push_back(indexOf(control));
}

void World::tagWasSought(Tag tag) { trace_.addTag(tag); }

void World::tagMayHaveChanged(const toolkit::Ref<toolkit::View>& view, std::uint32_t element) {
  Control* const control = controlOf(view);
  if (!control) return;
  if (updateTag(*control, element + 1)) trace_.addTagged(indexOf(*control));
}

void World::tagsMayBeRestored() {
  for (Control& control : controls_) {
    touch(control);
    updateTag(control, 0);
  }
}

bool World::updateTag(Control& control, LookValue tagger) {
  const ControlState before = control.state;
  setTag(control, control.view->tag());
  if (before == control.state) return false;
  const std::size_t index = indexOf(control);
  format_.setControl(place_.data(), index, control.state);
  if (!setting_.tracksTaggers) return true;
  LookValue& known = parts_[*context_.taggerPart(parts_, index)];
  hasNewTaggers_ |= known != tagger;
  known = tagger;
  return true;
}

void World::stateWasSet(const toolkit::Ref<toolkit::View>& view) {
  if (Control* const control = controlOf(view)) control->hasUsersState = false;
}

void World::lookMayHaveChanged(const toolkit::Ref<toolkit::View>& view) {
  if (Control* const control = controlOf(view)) control->mayLookDifferent = true;
}

std::size_t World::controlsWithTag(Tag tag) {
  trace_.addTag(tag);
  if (sharedTags_ == 0) return 1;
  const auto count = tagCounts_.find(tag);
  return count == tagCounts_.end() ? 0 : count->second;
}

drivers::ViewKind World::kindOf(const toolkit::Ref<toolkit::View>& view) const {
  const auto found = indices_.find(view.pointer().get());
  return found == indices_.end() ? drivers::ViewKind::plain : setting_.kinds[found->second];
}

}  // namespace qz::tools::check
