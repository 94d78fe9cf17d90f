// SPDX-License-Identifier: MIT
// The engine object: construction, termination, destruction, current list and action.

#include "QZ_Plist_State_Parser.hpp"
#include "engine/tag_key.hpp"

using toolkit::StoredRef;

namespace {

constexpr double flasherPeriod = 0.5;  // seconds

void stop(const toolkit::Ref<toolkit::Timer>& timer) {
  if (timer->isValid()) timer->invalidate();
}

}  // namespace

std::shared_ptr<QZ_Plist_State_Parser> QZ_Plist_State_Parser::init(toolkit::Toolkit& toolkit) {
  return std::shared_ptr<QZ_Plist_State_Parser>(new QZ_Plist_State_Parser(toolkit));
}

std::shared_ptr<QZ_Plist_State_Parser> QZ_Plist_State_Parser::initWithWindow(
    toolkit::Toolkit& toolkit, const Window& window) {
  auto engine = init(toolkit);
  engine->window_.set(StoredRef<toolkit::Window>::refer(window));
  engine->buttonStates_ = toolkit::Dictionary::make();
  engine->plistDictionary_.set(toolkit::Dictionary::make());
  engine->flashingTagIds_.set(toolkit::Dictionary::make());
  engine->addedObjectToTutorial_.set(toolkit::List<Control>::make());
  engine->objectIdTimers_.set(toolkit::Table<Timer>::make());
  // The timer keeps the engine alive while it ticks.
  engine->flashingTimer_.set(toolkit.runLoop().schedule(
      flasherPeriod, true, [engine](const Timer& timer) { engine->flasherFired(timer); }));
  engine->guiAssets_.set(toolkit::Table<AssetRecord>::make());
  engine->originalTagValues_.set(toolkit::Dictionary::make());
  return engine;
}

void QZ_Plist_State_Parser::terminateParser() {
  const auto kept = keepAlive();
  restoreOriginalTagValues();
  terminating_ = true;
  stop(*flashingTimer_);
  flashingTimer_.set(nullptr);
  // Tables are emptied before they are dropped, so that a host that kept one sees the end.
  if (objectIdTimers_->count() > 0) {
    killAllTimers();
    objectIdTimers_.set(nullptr);
  }
  const Window tutorial = tutorialWindow();
  if (!(tutorial && tutorial == window()) && addedObjectToTutorial_->count() > 0) {
    addedObjectToTutorial_->removeAllObjects();
    addedObjectToTutorial_.set(nullptr);
  }
  guiAssets_->removeAllObjects();
  guiAssets_.set(nullptr);
  plistDictionary_->removeAllObjects();
  plistDictionary_.set(nullptr);
  commandArray_.set(nullptr);
  if (runningAsSheet_) {
    toolkit_.application().endSheet(tutorial, 0);  // at every call, unlike closing the window
  } else if (!hasTerminated_) {
    hasTerminated_ = true;
    tutorial->close();
  }
}

QZ_Plist_State_Parser::~QZ_Plist_State_Parser() {
  stop(*flashingTimer_);
  flashingTimer_.set(nullptr);
  const Timers timers = *objectIdTimers_;
  const auto pending = timers->entries();  // a copy: releasing a timer may change the table
  for (const auto& [key, timer] : pending) timer->invalidate();
  timers->removeAllObjects();
  const Window tutorial = tutorialWindow();
  const Window host = window();
  // Unlike in `terminateParser`, the list stays if either window is absent.
  if (tutorial && host && tutorial != host) addedObjectToTutorial_->removeAllObjects();
  buttonStates_->removeAllObjects();
}

std::string QZ_Plist_State_Parser::currentCommandState() const {
  return tagKey(lastTagId_->longValue());
}

bool QZ_Plist_State_Parser::tryToPerform(std::string_view action, const Control& sender) {
  if (action != "buttonPushed:") return false;
  buttonPushed(sender);
  return true;
}
