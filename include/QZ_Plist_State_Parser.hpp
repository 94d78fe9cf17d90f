// SPDX-License-Identifier: MIT
// QZ_Plist_State_Parser: plays scripted walk-throughs over the controls of a window.
//
// A host makes one engine, gives it a window to play over, and hands it a script: a property list
// that maps the tags of controls, written as decimal strings, to lists of commands. From then on
// the engine drives the window's controls; every press of a button runs the list under the button's
// tag.
//
// The calling order: construct with the host window; build the walk-through window from a
// description (`loadGuiAssets`) or adopt one (`getGuiAssetsFromWindow`); load and run a script
// (`loadPlist`). The walk-through ends by the script's own command or by `terminateParser`. End it
// before you let the engine go: a running flasher keeps the engine alive.
//
// An operation goes on with the arguments and the engine that it was called with, whatever it calls
// out to meanwhile: the log's sink, a delegate, an action, a control. A host may change there the
// variables that it handed in, and let go of the engine.
//
// Everything happens on one thread, the application's event thread. Only the getters and setters of
// the object-valued properties may be called on any.
#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

#include "engine/asset_record.hpp"
#include "engine/keep_alive.hpp"
#include "engine/property.hpp"
#include "qz/observer.hpp"
#include "toolkit/exception.hpp"
#include "toolkit/property_list/collections.hpp"
#include "toolkit/property_list/scalars.hpp"
#include "toolkit/table.hpp"
#include "toolkit/tag.hpp"
#include "toolkit/toolkit.hpp"

// The names of the commands that scripts write. Assigning another string to one renames the command
// for every script from then on. Compound commands are upper-cased before they are compared, simple
// ones are not.
extern std::string QZ_PLIST_STATE_PARSER_TERMINATE_PARSER;
/// Holds "IDLE_LOOP", the one value that differs from its constant's name.
extern std::string QZ_PLIST_STATE_PARSER_RETURN_TO_IDLE_LOOP;
extern std::string QZ_PLIST_STATE_PARSER_HIDE_OBJECT_WITH_ID;
extern std::string QZ_PLIST_STATE_PARSER_SHOW_OBJECT_WITH_ID;
extern std::string QZ_PLIST_STATE_PARSER_ENABLE_OBJECT_WITH_ID;
extern std::string QZ_PLIST_STATE_PARSER_DISABLE_OBJECT_WITH_ID;
extern std::string QZ_PLIST_STATE_PARSER_LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID;
extern std::string QZ_PLIST_STATE_PARSER_PROCESS_COMMANDS_FOR_ID;
extern std::string QZ_PLIST_STATE_PARSER_SET_TOOL_TIP_FOR_ID;
extern std::string QZ_PLIST_STATE_PARSER_SET_TEXT_FOR_OBJECT_ID;
extern std::string QZ_PLIST_STATE_PARSER_LOAD_BACKGROUND_WITH_IMAGE;
/// Declared for hosts only: no command of this name is recognised.
extern std::string QZ_PLIST_STATE_PARSER_BUTTON_WITH_ID_AT;
/// Declared for hosts only: no command of this name is recognised.
extern std::string QZ_PLIST_STATE_PARSER_IMAGE_WITH_ID_AND_PATH_AT;
extern std::string QZ_PLIST_STATE_PARSER_ALLOW_FLASHING;
extern std::string QZ_PLIST_STATE_PARSER_FLASH_ID;
/// Declared for hosts only: no command of this name is recognised.
extern std::string QZ_PLIST_STATE_PARSER_HIGHLIGHT_ID;
extern std::string QZ_PLIST_STATE_PARSER_SET_STATE_ON_FOR_OBJECT_ID;
extern std::string QZ_PLIST_STATE_PARSER_SET_STATE_OFF_FOR_OBJECT_ID;
extern std::string QZ_PLIST_STATE_PARSER_SET_BACKGROUND_COLOR_FOR_OBJECT_ID;
extern std::string QZ_PLIST_STATE_PARSER_SET_FOREGROUND_COLOR_FOR_OBJECT_ID;
extern std::string QZ_PLIST_STATE_PARSER_SET_TITLE_FOR_OBJECT_ID;
extern std::string QZ_PLIST_STATE_PARSER_SET_TAG_FOR_OBJECT_ID;
extern std::string QZ_PLIST_STATE_PARSER_SET_TAG_FOR_OBJECT_ID_WITH_TIMER;
extern std::string QZ_PLIST_STATE_PARSER_SET_TIMER_FOR_ID;
extern std::string
    QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID;
extern std::string
    QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID;
extern std::string
    QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_IS_WITH_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID;

class QZ_Plist_State_Parser final : public toolkit::Responder,
                                    public std::enable_shared_from_this<QZ_Plist_State_Parser> {
 public:
  using ObjectId = toolkit::ValueRef<toolkit::Number>;
  using Parameters = toolkit::ValueRef<toolkit::Array>;
  using Value = toolkit::ValueRef<>;
  using Dictionary = toolkit::ValueRef<toolkit::Dictionary>;
  using Control = toolkit::Ref<toolkit::View>;
  using Controls = toolkit::Ref<toolkit::List<Control>>;
  using GuiAssets = toolkit::Ref<toolkit::Table<AssetRecord>>;
  using Timers = toolkit::Ref<toolkit::Table<toolkit::Ref<toolkit::Timer>>>;
  using Timer = toolkit::Ref<toolkit::Timer>;
  using Window = toolkit::Ref<toolkit::Window>;

  // --- for the host, in calling order ---

  /// An engine over the host's window, which may be absent: it serves as the parent of a sheet and
  /// is not kept alive. Creates the tables and starts the flasher. `toolkit` outlives the engine.
  static std::shared_ptr<QZ_Plist_State_Parser> initWithWindow(toolkit::Toolkit& toolkit,
                                                               const Window& window);
  /// An engine without tables and without a flasher.
  static std::shared_ptr<QZ_Plist_State_Parser> init(toolkit::Toolkit& toolkit);
  ~QZ_Plist_State_Parser() override;
  QZ_Plist_State_Parser(const QZ_Plist_State_Parser&) = delete;
  QZ_Plist_State_Parser& operator=(const QZ_Plist_State_Parser&) = delete;

  /// Builds the walk-through window and its controls from a description; see docs/gui-assets.md.
  /// YES when at least one control was made. `error` is never written. A malformed entry raises;
  /// what was built before it stays.
  bool loadGuiAssets(Dictionary description, std::shared_ptr<toolkit::Exception>* error);

  /// Adopts `window` as the walk-through window: makes the engine its delegate if it has none,
  /// wires every button to the engine, and records every button, image view and text field that
  /// lies directly in its content view. YES when at least one was recorded. An absent window
  /// changes nothing. The window stays the host's to keep alive.
  bool getGuiAssetsFromWindow(Window window);

  /// Reads the script named `name` (absolute, or relative to the resource directory; used exactly
  /// as given), shows the walk-through window as a sheet over the host window if asked, and runs
  /// the list under `runFromKey`: an absent key runs none and gives YES, an empty one stands for
  /// the smallest tag. Gives that run's result; NO when the file exists but is no dictionary.
  /// Without such a file the script that is already there stays in use. `withDelegate` is told when
  /// the sheet ends and is not kept alive. A value under the key that is no list raises.
  bool loadPlist(std::optional<std::string> name, std::optional<std::string> runFromKey,
                 std::shared_ptr<toolkit::SheetDelegate> withDelegate, bool runAsSheet);

  /// The press of a control: cancels every object timer, logs, records the control's state, and, of
  /// a button, runs the list under its tag. The action of the walk-through's buttons.
  void buttonPushed(Control sender);

  /// The tag of the list that was started last, in decimal; "0" before any.
  std::string currentCommandState() const;

  /// Ends the walk-through: puts changed tags back, stops flasher and timers, drops the script and
  /// the records, and closes the walk-through window once, or ends its sheet, at every call.
  void terminateParser();

  /// A copy of the states of the buttons pressed so far, by tag: YES for on. Absent when there is
  /// no such table.
  Dictionary buttonStates() const;
  /// Turns the walk-through's buttons on or off, by tag. YES when at least one was set. A value
  /// that has no boolean value raises.
  bool setButtonSates(Dictionary states);

  // --- helpers for hosts ---

  /// Stores a description entry under the decimal form of `withTagId`, in the form that
  /// `loadGuiAssets` reads. NO when an argument is absent, the class name is none of the four, or
  /// the dictionary cannot be changed.
  bool createNextGuiAssetEntry(Dictionary* entries, const std::optional<std::string>& forObject,
                               const toolkit::Rect& usingFrame, std::uint64_t withTagId);
  /// Makes `buttonPushed:` the action of a button (or gradient), leaving its target. NO of anything
  /// else.
  bool forceButtonPushedToBeActionForGuiAttribute(Control object);

  // --- the engine's own operations, callable by anyone ---

  /// Runs a list for an object id; gives the result of the last element that raised nothing.
  bool processCommandArray(Value list, ObjectId forObject);
  bool doSimpleCommand(std::string_view name, Parameters withParams, ObjectId usingObject);
  /// `name` is expected in upper case. NO for an unknown name; too few parameters raise.
  bool doCompoundCommand(std::string_view name, Parameters withParameters, ObjectId usingObject);
  /// The back-most view directly in the walk-through window that carries the tag now, or absent.
  Control findObjectWithTag(toolkit::Tag tag) const;
  void restoreOriginalTagValues();
  /// Arms a one-shot timer of `value` seconds for a tag key; 0 or no key does nothing.
  void startTimerWithValue(std::uint64_t value, std::optional<std::string> forKey);
  void killAllTimers();
  /// What an object timer calls when it fires.
  void pseudoButtonPush(Timer timer);
  /// What the flasher calls at every tick.
  void flasherFired(Timer timer);

  // --- the command processors; each takes its target's tag from an object id ---

  bool QZ_Plist_State_Processor_SET_TEXT(Value text, ObjectId forId);
  bool QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML(Value html, Value WITH_FONT_NAME,
                                                              Value WITH_SIZE,
                                                              ObjectId FOR_OBJECT_ID);
  bool QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER(Value html,
                                                                        Value WITH_FONT_NAME,
                                                                        Value WITH_SIZE,
                                                                        ObjectId FOR_OBJECT_ID);
  bool QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_IS(bool asIs, Value WITH_HTML,
                                                            Value WITH_FONT_NAME, Value WITH_SIZE,
                                                            ObjectId FOR_OBJECT_ID);
  bool QZ_Plist_State_Processor_SET_BACKGROUND_COLOR(std::uint64_t color, ObjectId forId);
  bool QZ_Plist_State_Processor_SET_FOREGROUND_COLOR(Value name, ObjectId FOR_OBJECT_ID);
  bool QZ_Plist_State_Processor_SET_TITLE(Value title, ObjectId forId);
  bool QZ_Plist_State_Processor_SET_STATE_ON(ObjectId id);
  bool QZ_Plist_State_Processor_SET_STATE_OFF(ObjectId id);
  bool QZ_Plist_State_Processor_SET_TOOL_TIP(Parameters parameters, ObjectId forObject);
  bool QZ_Plist_State_Processor_LOAD_GRAPHIC_OBJECT_WITH_PATH(Parameters parameters,
                                                              ObjectId forObject);
  bool QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID(ObjectId id);
  void QZ_Plist_State_Processor_TERMINATE_PARSER();
  void QZ_Plist_State_Processor_RETURN_TO_IDLE_LOOP();
  bool QZ_Plist_State_Processor_SET_TIMER(std::uint64_t value, ObjectId forId);
  bool QZ_Plist_State_Processor_SET_TAG(ObjectId newTag, ObjectId forId);
  bool QZ_Plist_State_Processor_SET_TAG(ObjectId newTag, ObjectId forId, Value withTimerValue);
  bool QZ_Plist_State_Processor_ALLOW_FLASHING(bool allow);
  bool QZ_Plist_State_Processor_FLASH_ID(ObjectId id, bool flashOn);
  bool QZ_Plist_State_Processor_HIGHLIGHT_ID(ObjectId id);

  // --- properties ---

  /// Whether the flasher's ticks act.
  bool flashing() const { return flashing_; }
  void setFlashing(bool flashing) { flashing_ = flashing; }
  /// Whether the walk-through was shown as a sheet, by the last load-and-run.
  bool runningAsSheet() const { return runningAsSheet_; }
  void setRunningAsSheet(bool runningAsSheet) { runningAsSheet_ = runningAsSheet; }
  /// Whether termination began; a firing object timer then runs nothing.
  bool terminating() const { return terminating_; }
  void setTerminating(bool terminating) { terminating_ = terminating; }
  /// Whether termination closed the walk-through window.
  bool hasTerminated() const { return hasTerminated_; }
  void setHasTerminated(bool hasTerminated) { hasTerminated_ = hasTerminated; }

  /// The host window. A setter's window is kept alive, the constructor's is not.
  Window window() const { return window_.ask(&toolkit::StoredRef<toolkit::Window>::get); }
  void setWindow(const Window& window) {
    window_.set(toolkit::StoredRef<toolkit::Window>::own(window));
  }
  /// The script: tag key to command list.
  Dictionary plistDictionary() const { return plistDictionary_.get(); }
  void setPlistDictionary(Dictionary script) { plistDictionary_.set(std::move(script)); }
  /// The host's own; the engine only clears it.
  Value commandArray() const { return commandArray_.get(); }
  void setCommandArray(Value list) { commandArray_.set(std::move(list)); }
  /// The host's own; the engine never touches it.
  ObjectId objectId() const { return objectId_.get(); }
  void setObjectId(ObjectId id) { objectId_.set(std::move(id)); }
  /// The repeating half-second timer behind flashing.
  Timer flashingTimer() const { return flashingTimer_.get(); }
  void setFlashingTimer(Timer timer) { flashingTimer_.set(std::move(timer)); }
  /// Which tags flash: tag key to boolean.
  Dictionary flashingTagIds() const { return flashingTagIds_.get(); }
  void setFlashingTagIds(Dictionary ids) { flashingTagIds_.set(std::move(ids)); }
  /// The window whose controls the script drives. One that the engine built or a setter gave is
  /// kept alive, an adopted one is not.
  Window tutorialWindow() const {
    return tutorialWindow_.ask(&toolkit::StoredRef<toolkit::Window>::get);
  }
  void setTutorialWindow(const Window& window) {
    tutorialWindow_.set(toolkit::StoredRef<toolkit::Window>::own(window));
  }
  /// The controls that the latest load of a description made, in that order.
  Controls addedObjectToTutorial() const { return addedObjectToTutorial_.get(); }
  void setAddedObjectToTutorial(Controls controls) {
    addedObjectToTutorial_.set(std::move(controls));
  }
  /// The records of the adopted window's controls, by registry key.
  GuiAssets guiAssets() const { return guiAssets_.get(); }
  void setGuiAssets(GuiAssets assets) { guiAssets_.set(std::move(assets)); }
  /// The id of the list that was started last.
  ObjectId lastTagId() const { return lastTagId_.get(); }
  void setLastTagId(ObjectId id) { lastTagId_.set(std::move(id)); }
  /// The pending object timers, by tag key.
  Timers objectIdTimers() const { return objectIdTimers_.get(); }
  void setObjectIdTimers(Timers timers) { objectIdTimers_.set(std::move(timers)); }
  /// The tag that each adopted control had, by registry key.
  Dictionary originalTagValues() const { return originalTagValues_.get(); }
  void setOriginalTagValues(Dictionary tags) { originalTagValues_.set(std::move(tags)); }

  /// Who is told what the engine does; absent at first. The engine keeps it alive.
  const std::shared_ptr<qz::Observer>& observer() const { return observer_; }
  void setObserver(std::shared_ptr<qz::Observer> observer) { observer_ = std::move(observer); }

  /// Understands "buttonPushed:".
  bool tryToPerform(std::string_view action, const Control& sender) override;

 private:
  explicit QZ_Plist_State_Parser(toolkit::Toolkit& toolkit) : toolkit_(toolkit) {}

  /// Every operation that calls out begins with this. (`findObjectWithTag` need not: it reads the
  /// engine before it calls out, and not again.)
  [[nodiscard]] KeepAlive keepAlive() { return {*this, isKept_}; }
  /// Tells the observer, if there is one, which is kept meanwhile: it may be replaced.
  template <class... Parameters, class... Arguments>
  void notify(void (qz::Observer::*event)(Parameters...), const Arguments&... arguments) const {
    if (!observer_) return;
    const auto observer = observer_;
    ((*observer).*event)(arguments...);
  }
  std::optional<std::string> keyOfTimer(const Timer& timer) const;
  void rewriteFlashingEntry(const ObjectId& id);
  bool setState(const ObjectId& id, toolkit::State state);
  Window makeTutorialWindow(const toolkit::Rect& content);
  Control makeControl(const toolkit::ValueRef<>& key, const Value& entry);
  bool showHtml(std::string_view documentHead, std::optional<toolkit::TextAlignment> alignment,
                const Value& html, const Value& fontName, const Value& size, const ObjectId& id);

  toolkit::Toolkit& toolkit_;  // the host's, which keeps it longer than the engine

  std::shared_ptr<qz::Observer> observer_;

  bool isKept_ = false;  // while an operation runs; see KeepAlive

  // The tables are the engine's own; so are the walk-through window and the controls that it built.
  bool flashing_ = false;
  bool runningAsSheet_ = false;
  bool terminating_ = false;
  bool hasTerminated_ = false;
  Property<toolkit::StoredRef<toolkit::Window>> window_;
  Property<Dictionary> plistDictionary_;
  Property<Value> commandArray_;
  Property<ObjectId> objectId_;
  Property<Timer> flashingTimer_;
  Property<Dictionary> flashingTagIds_;
  Property<toolkit::StoredRef<toolkit::Window>> tutorialWindow_;
  Property<Controls> addedObjectToTutorial_;
  Property<GuiAssets> guiAssets_;
  Property<ObjectId> lastTagId_;
  Property<Timers> objectIdTimers_;
  Dictionary buttonStates_;
  Property<Dictionary> originalTagValues_;
};
