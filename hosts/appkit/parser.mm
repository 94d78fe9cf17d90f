// SPDX-License-Identifier: MIT
// QZ_Plist_State_Parser as a class of Objective-C. Every method passes its arguments to the C++
// engine of the same name. The classes of arguments are checked, because Objective-C does not.

#include <string>

#import "QZ_Plist_State_Parser.h"
#import "hosts/appkit/arguments.hpp"
#import "hosts/appkit/behind.hpp"
#import "hosts/appkit/engine_timers.hpp"
#import "hosts/appkit/sheet_delegate.hpp"
#import "toolkit/foundation/strings.hpp"
#import "toolkit/foundation/values.hpp"

namespace face = qz::hosts::appkit;
using face::Behind;
using face::Engine;
using face::numberOf;
using qz::toolkit::foundation::answering;
using qz::toolkit::foundation::nsString;
using qz::toolkit::foundation::objectOf;
using qz::toolkit::foundation::Twin;
using qz::toolkit::foundation::valueOf;

@interface QZ_Plist_State_Parser ()
- (Behind&)behind;
@end

namespace qz::hosts::appkit {

namespace {

using toolkit::foundation::objectOf;
using Lock = std::lock_guard<std::recursive_mutex>;

/// A property whose values are those of scripts.
template <class Value>
struct ValueProperty {
  Twin Behind::*twin;
  Value (Engine::*get)() const;
  void (Engine::*set)(Value);
  Class (*wanted)();
};

template <class Value>
id get(Behind& behind, const ValueProperty<Value>& property) {
  return answering([&] {
    const Lock lock(behind.mutex);
    return (behind.*property.twin).objectFor((behind.engine.get()->*property.get)());
  });
}

template <class Value>
void set(Behind& behind, const ValueProperty<Value>& property, id object) {
  answering([&] {
    if (object) requireKind(object, property.wanted());
    const Lock lock(behind.mutex);
    const auto value = (behind.*property.twin).valueFor(object);
    using Held = std::remove_reference_t<decltype(*std::declval<Value>())>;
    (behind.engine.get()->*property.set)(as<Held>(value));
  });
}

Class anArray() { return [NSArray class]; }
Class aDictionary() { return [NSDictionary class]; }
Class aNumber() { return [NSNumber class]; }

constexpr ValueProperty<Engine::Dictionary> script = {
    &Behind::plistDictionary, &Engine::plistDictionary, &Engine::setPlistDictionary, aDictionary};
constexpr ValueProperty<Engine::Value> list = {&Behind::commandArray, &Engine::commandArray,
                                               &Engine::setCommandArray, anArray};
constexpr ValueProperty<Engine::ObjectId> hostsId = {&Behind::objectId, &Engine::objectId,
                                                     &Engine::setObjectId, aNumber};
constexpr ValueProperty<Engine::Dictionary> flashingIds = {
    &Behind::flashingTagIds, &Engine::flashingTagIds, &Engine::setFlashingTagIds, aDictionary};
constexpr ValueProperty<Engine::ObjectId> lastId = {&Behind::lastTagId, &Engine::lastTagId,
                                                    &Engine::setLastTagId, aNumber};
constexpr ValueProperty<Engine::Dictionary> tags = {&Behind::originalTagValues,
                                                    &Engine::originalTagValues,
                                                    &Engine::setOriginalTagValues, aDictionary};

/// A property with another table of the engine.
template <class Table>
struct TableProperty {
  TableTwin<Table> Behind::*twin;
  Table (Engine::*get)() const;
  void (Engine::*set)(Table);
  Class (*wanted)();
};

template <class Table>
id get(Behind& behind, const TableProperty<Table>& property) {
  return answering([&] {
    const Lock lock(behind.mutex);
    return (behind.*property.twin)
        .objectFor((behind.engine.get()->*property.get)(), behind.platform);
  });
}

template <class Table>
void set(Behind& behind, const TableProperty<Table>& property, id object) {
  answering([&] {
    if (object) requireKind(object, property.wanted());
    const Lock lock(behind.mutex);
    (behind.engine.get()->*property.set)((behind.*property.twin).tableFor(object, behind.platform));
  });
}

constexpr TableProperty<Engine::Controls> addedControls = {
    &Behind::addedObjectToTutorial, &Engine::addedObjectToTutorial,
    &Engine::setAddedObjectToTutorial, anArray};
constexpr TableProperty<Engine::GuiAssets> records = {&Behind::guiAssets, &Engine::guiAssets,
                                                      &Engine::setGuiAssets, aDictionary};
constexpr TableProperty<Engine::Timers> timers = {&Behind::objectIdTimers, &Engine::objectIdTimers,
                                                  &Engine::setObjectIdTimers, aDictionary};

// The seconds of the timer are the address of this value, which is never 0.
Engine::Value addressOf(id object) {
  return object ? Engine::Value(toolkit::Number::withBool(true)) : Engine::Value();
}

// A view of the engine's is changed in place; another dictionary gets the new entry from a copy.
bool addEntry(Engine& engine, NSMutableDictionary* entries, const std::optional<std::string>& name,
              const toolkit::Rect& frame, std::uint64_t tag) {
  auto dictionary = entries ? toolkit::Dictionary::make() : Engine::Dictionary();
  if (!engine.createNextGuiAssetEntry(&dictionary, name, frame, tag)) return false;
  for (const auto& entry : dictionary->entries()) {
    [entries setObject:[NSArray arrayWithArray:objectOf(entry.value)] forKey:objectOf(entry.key)];
  }
  return true;
}

}  // namespace

}  // namespace qz::hosts::appkit

@implementation QZ_Plist_State_Parser

- (Behind&)behind {
  if (!_behind) _behind = new Behind(self, [QZ_Plist_State_Parser class]);
  return *static_cast<Behind*>(_behind);
}

- (id)initWithWindow:(NSWindow*)window {
  self = [super init];
  if (self) {
    Behind& behind = [self behind];
    answering([&] { behind.initWithWindow(window); });
  }
  return self;
}

- (void)dealloc {
  delete static_cast<Behind*>(_behind);
  [super dealloc];
}

- (BOOL)loadGuiAssets:(NSDictionary*)description error:(NSError**)error {
  (void)error;
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.loadGuiAssets(face::dictionaryOf(description), nullptr);
  });
}

- (BOOL)getGuiAssetsFromWindow:(NSWindow*)window {
  Behind& behind = [self behind];
  return perform(self, behind, _cmd, [&](Engine& engine) {
    if (!window) return engine.getGuiAssetsFromWindow({});
    return engine.getGuiAssetsFromWindow(behind.keep(behind.adoptedWindow, window));
  });
}

- (BOOL)loadPlist:(NSString*)name
       runFromKey:(NSString*)key
     withDelegate:(id)delegate
       runAsSheet:(BOOL)runAsSheet {
  Behind& behind = [self behind];
  return perform(self, behind, _cmd, [&](Engine& engine) {
    const auto path = face::textOf(name);
    const auto start = face::textOf(key);
    if (runAsSheet) behind.sheetDelegate = face::sheetDelegateFor(delegate, behind.platform);
    return engine.loadPlist(path, start, behind.sheetDelegate, runAsSheet);
  });
}

- (void)buttonPushed:(id)sender {
  Behind& behind = [self behind];
  perform(self, behind, _cmd,
          [&](Engine& engine) { engine.buttonPushed(behind.platform.view(sender)); });
}

- (NSString*)currentCommandState {
  return nsString([self behind].engine->currentCommandState());
}

- (void)terminateParser {
  perform(self, [self behind], _cmd, [](Engine& engine) { engine.terminateParser(); });
}

- (NSDictionary*)buttonStates {
  const auto states = [self behind].engine->buttonStates();
  return states ? [NSDictionary dictionaryWithDictionary:objectOf(states)] : nil;
}

- (BOOL)setButtonSates:(NSDictionary*)states {
  return perform(self, [self behind], _cmd,
                 [&](Engine& engine) { return engine.setButtonSates(face::dictionaryOf(states)); });
}

- (BOOL)createNextGuiAssetEntry:(NSMutableDictionary**)entries
                      forObject:(NSString*)className
                     usingFrame:(NSRect)frame
                      withTagId:(NSUInteger)tagId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    NSMutableDictionary* const wanted = entries ? *entries : nil;
    if (![wanted isKindOfClass:[NSMutableDictionary class]]) return false;
    return face::addEntry(engine, wanted, face::textOf(className),
                          {frame.origin.x, frame.origin.y, frame.size.width, frame.size.height},
                          tagId);
  });
}

- (BOOL)forceButtonPushedToBeActionForGuiAttribute:(id)object {
  Behind& behind = [self behind];
  return perform(self, behind, _cmd, [&](Engine& engine) {
    return engine.forceButtonPushedToBeActionForGuiAttribute(behind.platform.view(object));
  });
}

- (BOOL)processCommandArray:(NSArray*)list ForObject:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.processCommandArray(valueOf(list), numberOf(objectId));
  });
}

- (BOOL)doSimpleCommand:(NSString*)name
             withParams:(NSMutableArray*)parameters
            usingObject:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.doSimpleCommand(face::textOf(name).value_or(""), face::arrayOf(parameters),
                                  numberOf(objectId));
  });
}

- (BOOL)doCompoundCommand:(NSString*)name
           withParameters:(NSMutableArray*)parameters
              usingObject:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.doCompoundCommand(face::textOf(name).value_or(""), face::arrayOf(parameters),
                                    numberOf(objectId));
  });
}

- (id)findObjectWithTag:(NSInteger)tag {
  Behind& behind = [self behind];
  return perform(self, behind, _cmd, [&](Engine& engine) {
    return behind.platform.object(engine.findObjectWithTag(tag));
  });
}

- (void)restoreOriginalTagValues {
  perform(self, [self behind], _cmd, [](Engine& engine) { engine.restoreOriginalTagValues(); });
}

- (void)startTimerWithValue:(NSUInteger)value forKey:(NSString*)key {
  perform(self, [self behind], _cmd,
          [&](Engine& engine) { engine.startTimerWithValue(value, face::textOf(key)); });
}

- (void)killAllTimers {
  perform(self, [self behind], _cmd, [](Engine& engine) { engine.killAllTimers(); });
}

- (void)pseudoButtonPush:(NSTimer*)timer {
  perform(self, [self behind], _cmd,
          [&](Engine& engine) { engine.pseudoButtonPush(face::timerOf(timer)); });
}

- (void)flasherFired:(NSTimer*)timer {
  perform(self, [self behind], _cmd,
          [&](Engine& engine) { engine.flasherFired(face::timerOf(timer)); });
}

- (BOOL)QZ_Plist_State_Processor_SET_TEXT:(NSString*)text forId:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_SET_TEXT(valueOf(text), numberOf(objectId));
  });
}

- (BOOL)QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML:(NSString*)html
                                                WITH_FONT_NAME:(NSString*)fontName
                                                     WITH_SIZE:(id)size
                                                 FOR_OBJECT_ID:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML(
        valueOf(html), valueOf(fontName), valueOf(size), numberOf(objectId));
  });
}

- (BOOL)QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER:(NSString*)html
                                                          WITH_FONT_NAME:(NSString*)fontName
                                                               WITH_SIZE:(id)size
                                                           FOR_OBJECT_ID:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER(
        valueOf(html), valueOf(fontName), valueOf(size), numberOf(objectId));
  });
}

- (BOOL)QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_IS:(BOOL)asIs
                                                   WITH_HTML:(NSString*)html
                                              WITH_FONT_NAME:(NSString*)fontName
                                                   WITH_SIZE:(id)size
                                               FOR_OBJECT_ID:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_IS(
        asIs, valueOf(html), valueOf(fontName), valueOf(size), numberOf(objectId));
  });
}

- (BOOL)QZ_Plist_State_Processor_SET_BACKGROUND_COLOR:(NSUInteger)color forId:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_SET_BACKGROUND_COLOR(color, numberOf(objectId));
  });
}

- (BOOL)QZ_Plist_State_Processor_SET_FOREGROUND_COLOR:(NSString*)name
                                        FOR_OBJECT_ID:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_SET_FOREGROUND_COLOR(valueOf(name), numberOf(objectId));
  });
}

- (BOOL)QZ_Plist_State_Processor_SET_TITLE:(NSString*)title forId:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_SET_TITLE(valueOf(title), numberOf(objectId));
  });
}

- (BOOL)QZ_Plist_State_Processor_SET_STATE_ON:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_SET_STATE_ON(numberOf(objectId));
  });
}

- (BOOL)QZ_Plist_State_Processor_SET_STATE_OFF:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_SET_STATE_OFF(numberOf(objectId));
  });
}

- (BOOL)QZ_Plist_State_Processor_SET_TOOL_TIP:(NSArray*)parameters forObject:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_SET_TOOL_TIP(face::arrayOf(parameters),
                                                        numberOf(objectId));
  });
}

- (BOOL)QZ_Plist_State_Processor_LOAD_GRAPHIC_OBJECT_WITH_PATH:(NSArray*)parameters
                                                     forObject:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_LOAD_GRAPHIC_OBJECT_WITH_PATH(face::arrayOf(parameters),
                                                                         numberOf(objectId));
  });
}

- (BOOL)QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID(numberOf(objectId));
  });
}

- (void)QZ_Plist_State_Processor_TERMINATE_PARSER {
  perform(self, [self behind], _cmd,
          [](Engine& engine) { engine.QZ_Plist_State_Processor_TERMINATE_PARSER(); });
}

- (void)QZ_Plist_State_Processor_RETURN_TO_IDLE_LOOP {
  perform(self, [self behind], _cmd,
          [](Engine& engine) { engine.QZ_Plist_State_Processor_RETURN_TO_IDLE_LOOP(); });
}

- (BOOL)QZ_Plist_State_Processor_SET_TIMER:(NSUInteger)value forId:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_SET_TIMER(value, numberOf(objectId));
  });
}

- (BOOL)QZ_Plist_State_Processor_SET_TAG:(NSNumber*)newTag forId:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_SET_TAG(numberOf(newTag), numberOf(objectId));
  });
}

- (BOOL)QZ_Plist_State_Processor_SET_TAG:(NSNumber*)newTag
                                   forId:(NSNumber*)objectId
                          withTimerValue:(id)timerValue {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_SET_TAG(numberOf(newTag), numberOf(objectId),
                                                   face::addressOf(timerValue));
  });
}

- (BOOL)QZ_Plist_State_Processor_ALLOW_FLASHING:(BOOL)allow {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_ALLOW_FLASHING(allow);
  });
}

- (BOOL)QZ_Plist_State_Processor_FLASH_ID:(NSNumber*)objectId flashOn:(BOOL)flashOn {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_FLASH_ID(numberOf(objectId), flashOn);
  });
}

- (BOOL)QZ_Plist_State_Processor_HIGHLIGHT_ID:(NSNumber*)objectId {
  return perform(self, [self behind], _cmd, [&](Engine& engine) {
    return engine.QZ_Plist_State_Processor_HIGHLIGHT_ID(numberOf(objectId));
  });
}

- (BOOL)flashing {
  return [self behind].engine->flashing();
}

- (void)setFlashing:(BOOL)flashing {
  [self behind].engine->setFlashing(flashing);
}

- (BOOL)runningAsSheet {
  return [self behind].engine->runningAsSheet();
}

- (void)setRunningAsSheet:(BOOL)runningAsSheet {
  [self behind].engine->setRunningAsSheet(runningAsSheet);
}

- (BOOL)terminating {
  return [self behind].engine->terminating();
}

- (void)setTerminating:(BOOL)terminating {
  [self behind].engine->setTerminating(terminating);
}

- (BOOL)hasTerminated {
  return [self behind].engine->hasTerminated();
}

- (void)setHasTerminated:(BOOL)hasTerminated {
  [self behind].engine->setHasTerminated(hasTerminated);
}

- (NSWindow*)window {
  Behind& behind = [self behind];
  return answering([&] { return behind.platform.object(behind.engine->window()); });
}

- (void)setWindow:(NSWindow*)window {
  Behind& behind = [self behind];
  answering([&] { behind.engine->setWindow(behind.keep(behind.hostWindow, window)); });
}

- (NSWindow*)tutorialWindow {
  Behind& behind = [self behind];
  return answering([&] { return behind.platform.object(behind.engine->tutorialWindow()); });
}

- (void)setTutorialWindow:(NSWindow*)window {
  Behind& behind = [self behind];
  answering([&] { behind.engine->setTutorialWindow(behind.keep(behind.adoptedWindow, window)); });
}

- (NSTimer*)flashingTimer {
  Behind& behind = [self behind];
  return answering([&] { return face::objectOf(behind.engine->flashingTimer()); });
}

- (void)setFlashingTimer:(NSTimer*)timer {
  Behind& behind = [self behind];
  answering([&] { behind.engine->setFlashingTimer(face::timerOf(timer)); });
}

- (NSMutableDictionary*)plistDictionary {
  return face::get([self behind], face::script);
}

- (void)setPlistDictionary:(NSMutableDictionary*)object {
  face::set([self behind], face::script, object);
}

- (NSArray*)commandArray {
  return face::get([self behind], face::list);
}

- (void)setCommandArray:(NSArray*)object {
  face::set([self behind], face::list, object);
}

- (NSNumber*)objectId {
  return face::get([self behind], face::hostsId);
}

- (void)setObjectId:(NSNumber*)object {
  face::set([self behind], face::hostsId, object);
}

- (NSMutableDictionary*)flashingTagIds {
  return face::get([self behind], face::flashingIds);
}

- (void)setFlashingTagIds:(NSMutableDictionary*)object {
  face::set([self behind], face::flashingIds, object);
}

- (NSMutableArray*)addedObjectToTutorial {
  return face::get([self behind], face::addedControls);
}

- (void)setAddedObjectToTutorial:(NSMutableArray*)object {
  face::set([self behind], face::addedControls, object);
}

- (NSMutableDictionary*)guiAssets {
  return face::get([self behind], face::records);
}

- (void)setGuiAssets:(NSMutableDictionary*)object {
  face::set([self behind], face::records, object);
}

- (NSNumber*)lastTagId {
  return face::get([self behind], face::lastId);
}

- (void)setLastTagId:(NSNumber*)object {
  face::set([self behind], face::lastId, object);
}

- (NSMutableDictionary*)objectIdTimers {
  return face::get([self behind], face::timers);
}

- (void)setObjectIdTimers:(NSMutableDictionary*)object {
  face::set([self behind], face::timers, object);
}

- (NSMutableDictionary*)originalTagValues {
  return face::get([self behind], face::tags);
}

- (void)setOriginalTagValues:(NSMutableDictionary*)object {
  face::set([self behind], face::tags, object);
}

@end
