// SPDX-License-Identifier: MIT
// The engine object: construction, termination, destruction, current list and action.

#include "engine/state.hpp"
#include "engine/tag_key.hpp"

namespace qz {

using toolkit::StoredRef;

namespace {

constexpr double flasherPeriod = 0.5;  // seconds

void stop(const toolkit::Ref<toolkit::Timer>& timer) {
  if (timer->isValid()) timer->invalidate();
}

}  // namespace

QZ_Plist_State_Parser::QZ_Plist_State_Parser(toolkit::Toolkit& toolkit,
                                             std::shared_ptr<Subclass> subclass)
    : state_(std::make_unique<State>(toolkit, std::move(subclass))) {}

std::shared_ptr<QZ_Plist_State_Parser> QZ_Plist_State_Parser::init(
    toolkit::Toolkit& toolkit, std::shared_ptr<Subclass> subclass) {
  return std::shared_ptr<QZ_Plist_State_Parser>(
      new QZ_Plist_State_Parser(toolkit, std::move(subclass)));
}

std::shared_ptr<QZ_Plist_State_Parser> QZ_Plist_State_Parser::initWithWindow(
    toolkit::Toolkit& toolkit, const Window& window, std::shared_ptr<Subclass> subclass) {
  auto engine = init(toolkit, std::move(subclass));
  engine->state_->window.set(StoredRef<toolkit::Window>::refer(window));
  engine->state_->buttonStates = toolkit::Dictionary::make();
  engine->state_->plistDictionary.set(toolkit::Dictionary::make());
  engine->state_->flashingTagIds.set(toolkit::Dictionary::make());
  engine->state_->addedObjectToTutorial.set(toolkit::List<Control>::make());
  engine->state_->objectIdTimers.set(toolkit::Table<Timer>::make());
  // The timer keeps the engine alive while it ticks.
  engine->state_->flashingTimer.set(toolkit.runLoop().schedule(
      flasherPeriod, true, [self = engine->state_->forTimers(engine)](const Timer& timer) {
        self->flasherFired(timer);
      }));
  engine->state_->guiAssets.set(toolkit::Table<AssetRecord>::make());
  engine->state_->originalTagValues.set(toolkit::Dictionary::make());
  return engine;
}

void QZ_Plist_State_Parser::terminateParser() {
  if (state_->overridden("terminateParser")) return;
  const auto kept = keepAlive();
  restoreOriginalTagValues();
  state_->terminating = true;
  stop(*state_->flashingTimer);
  state_->flashingTimer.set(nullptr);
  // Tables are emptied before they are dropped, so that a host that kept one sees the end.
  if (state_->objectIdTimers->count() > 0) {
    cancelTimers();
    state_->objectIdTimers.set(nullptr);
  }
  const Window tutorial = tutorialWindow();
  if (!(tutorial && tutorial == window()) && state_->addedObjectToTutorial->count() > 0) {
    state_->addedObjectToTutorial->removeAllObjects();
    state_->addedObjectToTutorial.set(nullptr);
  }
  state_->guiAssets->removeAllObjects();
  state_->guiAssets.set(nullptr);
  state_->plistDictionary->removeAllObjects();
  state_->plistDictionary.set(nullptr);
  state_->commandArray.set(nullptr);
  if (state_->runningAsSheet) {
    state_->toolkit.application().endSheet(tutorial,
                                           0);  // at every call, unlike closing the window
  } else if (!state_->hasTerminated) {
    state_->hasTerminated = true;
    tutorial->close();
  }
}

QZ_Plist_State_Parser::~QZ_Plist_State_Parser() {
  stop(*state_->flashingTimer);
  state_->flashingTimer.set(nullptr);
  const Timers timers = *state_->objectIdTimers;
  const auto pending = timers->entries();  // a copy: releasing a timer may change the table
  for (const auto& [key, timer] : pending) timer->invalidate();
  timers->removeAllObjects();
  const Window tutorial = tutorialWindow();
  const Window host = window();
  // Unlike in `terminateParser`, the list stays if either window is absent.
  if (tutorial && host && tutorial != host) state_->addedObjectToTutorial->removeAllObjects();
  state_->buttonStates->removeAllObjects();
}

std::string QZ_Plist_State_Parser::currentCommandState() const {
  return tagKey(state_->lastTagId->longValue());
}

bool QZ_Plist_State_Parser::tryToPerform(std::string_view action, const Control& sender) {
  if (action != "buttonPushed:") return false;
  buttonPushed(sender);
  return true;
}

}  // namespace qz
