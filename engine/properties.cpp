// SPDX-License-Identifier: MIT
// The properties of the engine.

#include "engine/state.hpp"

namespace qz {

using toolkit::StoredRef;

bool QZ_Plist_State_Parser::flashing() const { return state_->flashing; }
void QZ_Plist_State_Parser::setFlashing(bool flashing) { state_->flashing = flashing; }
bool QZ_Plist_State_Parser::runningAsSheet() const { return state_->runningAsSheet; }
void QZ_Plist_State_Parser::setRunningAsSheet(bool runningAsSheet) {
  state_->runningAsSheet = runningAsSheet;
}
bool QZ_Plist_State_Parser::terminating() const { return state_->terminating; }
void QZ_Plist_State_Parser::setTerminating(bool terminating) { state_->terminating = terminating; }
bool QZ_Plist_State_Parser::hasTerminated() const { return state_->hasTerminated; }
void QZ_Plist_State_Parser::setHasTerminated(bool hasTerminated) {
  state_->hasTerminated = hasTerminated;
}
QZ_Plist_State_Parser::Window QZ_Plist_State_Parser::window() const {
  return state_->window.ask(&StoredRef<toolkit::Window>::get);
}
void QZ_Plist_State_Parser::setWindow(const Window& window) {
  state_->window.set(StoredRef<toolkit::Window>::own(window));
}
QZ_Plist_State_Parser::Dictionary QZ_Plist_State_Parser::plistDictionary() const {
  return state_->plistDictionary.get();
}
void QZ_Plist_State_Parser::setPlistDictionary(Dictionary script) {
  state_->plistDictionary.set(std::move(script));
}
QZ_Plist_State_Parser::Value QZ_Plist_State_Parser::commandArray() const {
  return state_->commandArray.get();
}
void QZ_Plist_State_Parser::setCommandArray(Value list) {
  state_->commandArray.set(std::move(list));
}
QZ_Plist_State_Parser::ObjectId QZ_Plist_State_Parser::objectId() const {
  return state_->objectId.get();
}
void QZ_Plist_State_Parser::setObjectId(ObjectId id) { state_->objectId.set(std::move(id)); }
QZ_Plist_State_Parser::Timer QZ_Plist_State_Parser::flashingTimer() const {
  return state_->flashingTimer.get();
}
void QZ_Plist_State_Parser::setFlashingTimer(Timer timer) {
  state_->flashingTimer.set(std::move(timer));
}
QZ_Plist_State_Parser::Dictionary QZ_Plist_State_Parser::flashingTagIds() const {
  return state_->flashingTagIds.get();
}
void QZ_Plist_State_Parser::setFlashingTagIds(Dictionary ids) {
  state_->flashingTagIds.set(std::move(ids));
}
QZ_Plist_State_Parser::Window QZ_Plist_State_Parser::tutorialWindow() const {
  return state_->tutorialWindow.ask(&StoredRef<toolkit::Window>::get);
}
void QZ_Plist_State_Parser::setTutorialWindow(const Window& window) {
  state_->tutorialWindow.set(StoredRef<toolkit::Window>::own(window));
}
QZ_Plist_State_Parser::Controls QZ_Plist_State_Parser::addedObjectToTutorial() const {
  return state_->addedObjectToTutorial.get();
}
void QZ_Plist_State_Parser::setAddedObjectToTutorial(Controls controls) {
  state_->addedObjectToTutorial.set(std::move(controls));
}
QZ_Plist_State_Parser::GuiAssets QZ_Plist_State_Parser::guiAssets() const {
  return state_->guiAssets.get();
}
void QZ_Plist_State_Parser::setGuiAssets(GuiAssets assets) {
  state_->guiAssets.set(std::move(assets));
}
QZ_Plist_State_Parser::ObjectId QZ_Plist_State_Parser::lastTagId() const {
  return state_->lastTagId.get();
}
void QZ_Plist_State_Parser::setLastTagId(ObjectId id) { state_->lastTagId.set(std::move(id)); }
QZ_Plist_State_Parser::Timers QZ_Plist_State_Parser::objectIdTimers() const {
  return state_->objectIdTimers.get();
}
void QZ_Plist_State_Parser::setObjectIdTimers(Timers timers) {
  state_->objectIdTimers.set(std::move(timers));
}
QZ_Plist_State_Parser::Dictionary QZ_Plist_State_Parser::originalTagValues() const {
  return state_->originalTagValues.get();
}
void QZ_Plist_State_Parser::setOriginalTagValues(Dictionary tags) {
  state_->originalTagValues.set(std::move(tags));
}
const std::shared_ptr<qz::Observer>& QZ_Plist_State_Parser::observer() const {
  return state_->observer;
}
const std::shared_ptr<qz::Subclass>& QZ_Plist_State_Parser::subclass() const {
  return state_->subclass;
}
void QZ_Plist_State_Parser::setObserver(std::shared_ptr<qz::Observer> observer) {
  state_->observer = std::move(observer);
}

}  // namespace qz
