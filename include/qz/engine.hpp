// SPDX-License-Identifier: MIT
// QZ_Plist_State_Parser: plays scripted walk-throughs over the controls of a window.
//
// A host creates one engine and gives it a window and a script. The script is a property list that
// maps the tags of controls, written as decimal strings, to lists of commands. The engine then
// drives the window's controls; each press of a button runs the list under the button's tag.
//
// Calling order: construct the engine with the host window; build the walk-through window from a
// description (`loadGuiAssets`) or adopt one (`getGuiAssetsFromWindow`); load and run a script
// (`loadPlist`). A command of the script or `terminateParser` ends the walk-through. End the
// walk-through before you release the engine: a running flasher keeps the engine alive.
//
// An operation keeps its arguments and its engine alive until it returns. Host code that it calls
// (the log's sink, a delegate, an action, a control) may therefore change the variables that were
// passed in, or release the engine.
//
// Everything runs on one thread, the application's event thread. Only the getters and setters of
// the object-valued properties, except `observer`, may be called on any thread.
#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

#include "qz/api.hpp"
#include "qz/asset_record.hpp"
#include "qz/observer.hpp"
#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"
#include "qz/subclass.hpp"
#include "qz/toolkit/exception.hpp"
#include "qz/toolkit/table.hpp"
#include "qz/toolkit/tag.hpp"
#include "qz/toolkit/toolkit.hpp"

namespace qz {

/// The names of the commands in scripts, which QZ_Plist_State_Parser.hpp brings into the global
/// namespace.
inline namespace command_names {

// Assigning another string to one renames the command for
// every script from then on. The names of compound commands are upper-cased before they are
// compared; those of simple commands are not.
/// The command TERMINATE_PARSER.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_TERMINATE_PARSER;
/// Holds "IDLE_LOOP", the one value that differs from its constant's name.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_RETURN_TO_IDLE_LOOP;
/// The command HIDE_OBJECT_WITH_ID.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_HIDE_OBJECT_WITH_ID;
/// The command SHOW_OBJECT_WITH_ID.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_SHOW_OBJECT_WITH_ID;
/// The command ENABLE_OBJECT_WITH_ID.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_ENABLE_OBJECT_WITH_ID;
/// The command DISABLE_OBJECT_WITH_ID.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_DISABLE_OBJECT_WITH_ID;
/// The command LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID;
/// The command PROCESS_COMMANDS_FOR_ID.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_PROCESS_COMMANDS_FOR_ID;
/// The command SET_TOOL_TIP_FOR_ID.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_SET_TOOL_TIP_FOR_ID;
/// The command SET_TEXT_FOR_OBJECT_ID.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_SET_TEXT_FOR_OBJECT_ID;
/// The command LOAD_BACKGROUND_WITH_IMAGE.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_LOAD_BACKGROUND_WITH_IMAGE;
/// Declared for hosts only: no command of this name is recognised.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_BUTTON_WITH_ID_AT;
/// Declared for hosts only: no command of this name is recognised.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_IMAGE_WITH_ID_AND_PATH_AT;
/// The command ALLOW_FLASHING.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_ALLOW_FLASHING;
/// The command FLASH_ID.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_FLASH_ID;
/// Declared for hosts only: no command of this name is recognised.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_HIGHLIGHT_ID;
/// The command SET_STATE_ON_FOR_OBJECT_ID.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_SET_STATE_ON_FOR_OBJECT_ID;
/// The command SET_STATE_OFF_FOR_OBJECT_ID.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_SET_STATE_OFF_FOR_OBJECT_ID;
/// The command SET_BACKGROUND_COLOR_FOR_OBJECT_ID.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_SET_BACKGROUND_COLOR_FOR_OBJECT_ID;
/// The command SET_FOREGROUND_COLOR_FOR_OBJECT_ID.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_SET_FOREGROUND_COLOR_FOR_OBJECT_ID;
/// The command SET_TITLE_FOR_OBJECT_ID.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_SET_TITLE_FOR_OBJECT_ID;
/// The command SET_TAG_FOR_OBJECT_ID.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_SET_TAG_FOR_OBJECT_ID;
/// The command SET_TAG_FOR_OBJECT_ID_WITH_TIMER.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_SET_TAG_FOR_OBJECT_ID_WITH_TIMER;
/// The command SET_TIMER_FOR_ID.
extern QZ_API std::string QZ_PLIST_STATE_PARSER_SET_TIMER_FOR_ID;
/// The command SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID.
extern QZ_API std::string
    QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID;
/// The command SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID.
extern QZ_API std::string
    QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID;
/// The command SET_ATTRIBUTED_STRING_AS_IS_WITH_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID.
extern QZ_API std::string
    QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_IS_WITH_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID;

}  // namespace command_names

class KeepAlive;

/// Plays one walk-through over the controls of a window.
class QZ_API QZ_Plist_State_Parser final
    : public toolkit::Responder,
      public std::enable_shared_from_this<QZ_Plist_State_Parser> {
 public:
  using ObjectId =
      toolkit::ValueRef<toolkit::Number>;  ///< the number of a control, as scripts write it
  using Parameters = toolkit::ValueRef<toolkit::Array>;       ///< the parameters of a command
  using Value = toolkit::ValueRef<>;                          ///< a value of a script
  using Dictionary = toolkit::ValueRef<toolkit::Dictionary>;  ///< a table of a script
  using Control = toolkit::Ref<toolkit::View>;            ///< a control; absent if there is none
  using Controls = toolkit::Ref<toolkit::List<Control>>;  ///< a list of controls
  using GuiAssets = toolkit::Ref<toolkit::Table<AssetRecord>>;  ///< the records of built or adopted
                                                                ///< controls, by tag
  using Timers = toolkit::Ref<toolkit::Table<toolkit::Ref<toolkit::Timer>>>;  ///< timers, by tag
  using Timer = toolkit::Ref<toolkit::Timer>;    ///< a timer; absent if there is none
  using Window = toolkit::Ref<toolkit::Window>;  ///< a window; absent if there is none

  // --- for the host, in calling order ---

  /// Creates an engine with its tables and starts the flasher. `window` is the parent of a sheet;
  /// it may be absent and is not kept alive. `toolkit` must outlive the engine. The engine keeps
  /// `subclass` alive; null if no class of another language derives from it.
  static std::shared_ptr<QZ_Plist_State_Parser> initWithWindow(
      toolkit::Toolkit& toolkit, const Window& window,
      std::shared_ptr<Subclass> subclass = nullptr);
  /// Creates an engine without tables and without a flasher.
  static std::shared_ptr<QZ_Plist_State_Parser> init(toolkit::Toolkit& toolkit,
                                                     std::shared_ptr<Subclass> subclass = nullptr);
  ~QZ_Plist_State_Parser() override;
  QZ_Plist_State_Parser(const QZ_Plist_State_Parser&) = delete;
  QZ_Plist_State_Parser& operator=(const QZ_Plist_State_Parser&) = delete;

  /// Builds the walk-through window and its controls from a description; see docs/gui-assets.md.
  /// YES if at least one control was made; NO for an absent description. `error` is never written.
  /// A malformed entry raises; everything built before it stays.
  bool loadGuiAssets(Dictionary description, std::shared_ptr<toolkit::Exception>* error);

  /// Adopts `window` as the walk-through window: makes the engine its delegate if it has none,
  /// makes the engine the target of every button directly in its content view, and records every
  /// button, image view and text field there. YES if at least one was recorded. An absent window
  /// changes nothing and gives NO. The host must keep the window alive.
  bool getGuiAssetsFromWindow(Window window);

  /// Reads the script at the path `name` (absolute, or relative to the resource directory; used
  /// exactly as given), shows the walk-through window as a sheet over the host window if
  /// `runAsSheet`, and runs the list under `runFromKey`. An absent key runs no list and gives YES;
  /// an empty key means the smallest tag. Otherwise returns the result of the run. NO if the file
  /// exists but is not a dictionary, or if the key is empty and the script has no entry. If the
  /// file does not exist, the engine keeps the current script. `withDelegate` learns when the
  /// sheet ends and is not kept alive. Raises if the value under the key is not a list.
  bool loadPlist(std::optional<std::string> name, std::optional<std::string> runFromKey,
                 std::shared_ptr<toolkit::SheetDelegate> withDelegate, bool runAsSheet);

  /// Handles the press of a control: cancels every object timer, logs the press, records the
  /// control's state and, for a button, runs the list under its tag. This is the action of the
  /// walk-through's buttons. An absent sender counts as a control with the tag 0 and cancels no
  /// timer.
  void buttonPushed(Control sender);

  /// Returns the tag of the list that was started last, in decimal; "0" before the first.
  std::string currentCommandState() const;

  /// Ends the walk-through: restores changed tags, stops the flasher and the timers, and drops the
  /// script and the records. The first call closes the walk-through window; for a sheet, every call
  /// ends the sheet instead.
  void terminateParser();

  /// Returns a copy of the states of the controls pressed so far, by tag: YES for on. Absent if the
  /// engine has no tables (`init`).
  Dictionary buttonStates() const;
  /// Turns the walk-through's buttons on or off, by tag. YES if at least one was set. A value that
  /// cannot be read as a boolean raises.
  bool setButtonSates(Dictionary states);

  // --- helpers for hosts ---

  /// Adds an entry to a description for `loadGuiAssets`, under the decimal form of `withTagId`.
  /// `forObject` is the class name, one of NSButton, NSImageView, NSTextField and NSWindow. NO if
  /// an argument is absent, the class name is another one, or the dictionary is immutable.
  bool createNextGuiAssetEntry(Dictionary* entries, const std::optional<std::string>& forObject,
                               const toolkit::Rect& usingFrame, std::uint64_t withTagId);
  /// Makes `buttonPushed:` the action of a button or gradient; its target stays. NO for anything
  /// else.
  bool forceButtonPushedToBeActionForGuiAttribute(Control object);

  // --- the engine's own operations, callable by anyone ---

  /// Runs a list for an object id. Returns the result of the last element that did not raise; NO
  /// for an empty or absent list. A value that is not a list raises.
  bool processCommandArray(Value list, ObjectId forObject);
  /// Runs a simple command on the control whose tag is `usingObject`. `name` is compared as
  /// written. NO for an unknown name.
  bool doSimpleCommand(std::string_view name, Parameters withParams, ObjectId usingObject);
  /// Runs a compound command. `name` must be in upper case. NO for an unknown name. Most commands
  /// raise if a parameter is missing.
  bool doCompoundCommand(std::string_view name, Parameters withParameters, ObjectId usingObject);
  /// Returns the back-most view directly in the walk-through window that now has the tag; absent if
  /// no view has it.
  Control findObjectWithTag(toolkit::Tag tag) const;
  /// Gives every recorded control the tag that it had when it was recorded.
  void restoreOriginalTagValues();
  /// Starts a one-shot timer of `value` seconds for a tag key. Does nothing if `value` is 0 or the
  /// key is absent or empty.
  void startTimerWithValue(std::uint64_t value, std::optional<std::string> forKey);
  /// Cancels every pending object timer.
  void killAllTimers();
  /// Called by an object timer when it fires: presses the button that has the timer's tag, or runs
  /// the list under it.
  void pseudoButtonPush(Timer timer);
  /// Called by the flasher at every tick.
  void flasherFired(Timer timer);

  // --- the command processors; each takes the tag of its target as an object id ---

  /// Sets the text of a control. YES if the control then reads back the same text. NO if no
  /// control has the tag. A view that is not a control raises, and so does a value that is not a
  /// string, after it has been shown.
  bool QZ_Plist_State_Processor_SET_TEXT(Value text, ObjectId forId);
  /// Shows HTML, centred, in a font of WITH_SIZE points. NO if the HTML cannot be read or the view
  /// cannot show it. Without such a control nothing is shown, and the result is YES.
  bool QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML(Value html, Value WITH_FONT_NAME,
                                                              Value WITH_SIZE,
                                                              ObjectId FOR_OBJECT_ID);
  /// The same with the natural alignment.
  bool QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER(Value html,
                                                                        Value WITH_FONT_NAME,
                                                                        Value WITH_SIZE,
                                                                        ObjectId FOR_OBJECT_ID);
  /// With `asIs` the HTML keeps its own fonts and alignment; otherwise, the same as
  /// SET_ATTRIBUTED_STRING_AS_HTML.
  bool QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_IS(bool asIs, Value WITH_HTML,
                                                            Value WITH_FONT_NAME, Value WITH_SIZE,
                                                            ObjectId FOR_OBJECT_ID);
  /// Colours a button red; `color` is not used. NO if no button has the tag.
  bool QZ_Plist_State_Processor_SET_BACKGROUND_COLOR(std::uint64_t color, ObjectId forId);
  /// Sets the colour of a button's title, by name. NO if no button has the tag or no colour has the
  /// name. A name that is not a string raises.
  bool QZ_Plist_State_Processor_SET_FOREGROUND_COLOR(Value name, ObjectId FOR_OBJECT_ID);
  /// Sets a button's title. NO if no button has the tag. A title that is not a string raises.
  bool QZ_Plist_State_Processor_SET_TITLE(Value title, ObjectId forId);
  /// Turn a button on or off without sending its action. NO if no button has the tag.
  bool QZ_Plist_State_Processor_SET_STATE_ON(ObjectId id);
  /// Turns the button with that tag off. NO without such a control.
  bool QZ_Plist_State_Processor_SET_STATE_OFF(ObjectId id);
  /// Sets a tooltip: the text, then optionally the tag of another control. NO if the text is
  /// missing or no control has the tag.
  bool QZ_Plist_State_Processor_SET_TOOL_TIP(Parameters parameters, ObjectId forObject);
  /// Shows an image in an image view: the image's resource name, then the view's tag. `forObject`
  /// is not used. NO if there are not exactly two parameters or no image view has the tag.
  bool QZ_Plist_State_Processor_LOAD_GRAPHIC_OBJECT_WITH_PATH(Parameters parameters,
                                                              ObjectId forObject);
  /// Runs the list under the tag and returns its result. NO if the script has no list there.
  bool QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID(ObjectId id);
  /// Calls `terminateParser`.
  void QZ_Plist_State_Processor_TERMINATE_PARSER();
  /// Does nothing.
  void QZ_Plist_State_Processor_RETURN_TO_IDLE_LOOP();
  /// Starts the object timer of a tag, if a control or a list has the tag. `value` is in seconds;
  /// for a control, 0 cancels the pending timer. Always NO.
  bool QZ_Plist_State_Processor_SET_TIMER(std::uint64_t value, ObjectId forId);
  /// Gives a control another tag. NO if no control has the old tag.
  bool QZ_Plist_State_Processor_SET_TAG(ObjectId newTag, ObjectId forId);
  /// The same; also starts an object timer under the new tag. Its seconds are the address of the
  /// parameter, not its number: such a timer practically never fires.
  bool QZ_Plist_State_Processor_SET_TAG(ObjectId newTag, ObjectId forId, Value withTimerValue);
  /// Switches flashing on or off. Off also removes the highlight of every button that has a list.
  /// Always YES.
  bool QZ_Plist_State_Processor_ALLOW_FLASHING(bool allow);
  /// Makes a button flash, or never flash. Only the first call for a tag counts; later ones give
  /// NO. `flashOn` NO raises if the control is not a button.
  bool QZ_Plist_State_Processor_FLASH_ID(ObjectId id, bool flashOn);
  /// Does nothing. Always NO.
  bool QZ_Plist_State_Processor_HIGHLIGHT_ID(ObjectId id);

  // --- properties ---

  /// Whether buttons flash. If NO, the flasher's ticks do nothing.
  bool flashing() const;
  /// Sets what `flashing` returns.
  void setFlashing(bool flashing);
  /// Whether the last `loadPlist` was asked to run the walk-through as a sheet.
  bool runningAsSheet() const;
  /// Sets what `runningAsSheet` returns.
  void setRunningAsSheet(bool runningAsSheet);
  /// Whether the end of the walk-through has begun; object timers that fire from then on run
  /// nothing.
  bool terminating() const;
  /// Sets what `terminating` returns.
  void setTerminating(bool terminating);
  /// Whether `terminateParser` has closed the walk-through window.
  bool hasTerminated() const;
  /// Sets what `hasTerminated` returns.
  void setHasTerminated(bool hasTerminated);

  /// The host window. A window from the setter is kept alive, the one from `initWithWindow` is not.
  Window window() const;
  /// Sets what `window` returns, and keeps it alive.
  void setWindow(const Window& window);
  /// The script: tag key to command list.
  Dictionary plistDictionary() const;
  /// Sets what `plistDictionary` returns.
  void setPlistDictionary(Dictionary script);
  /// For the host's use; the engine only clears it.
  Value commandArray() const;
  /// Sets what `commandArray` returns.
  void setCommandArray(Value list);
  /// For the host's use; the engine never touches it.
  ObjectId objectId() const;
  /// Sets what `objectId` returns.
  void setObjectId(ObjectId id);
  /// The repeating half-second timer behind flashing.
  Timer flashingTimer() const;
  /// Sets what `flashingTimer` returns.
  void setFlashingTimer(Timer timer);
  /// The tags that flash: tag key to boolean.
  Dictionary flashingTagIds() const;
  /// Sets what `flashingTagIds` returns.
  void setFlashingTagIds(Dictionary ids);
  /// The window whose controls the script drives. A window that the engine built or that was set
  /// here is kept alive, an adopted window is not.
  Window tutorialWindow() const;
  /// Sets what `tutorialWindow` returns, and keeps it alive.
  void setTutorialWindow(const Window& window);
  /// The controls that the last `loadGuiAssets` made, in the order of their creation.
  Controls addedObjectToTutorial() const;
  /// Sets what `addedObjectToTutorial` returns.
  void setAddedObjectToTutorial(Controls controls);
  /// The records of the adopted window's controls, by registry key: the decimal tag, or a larger
  /// unused number if an earlier control has the same tag.
  GuiAssets guiAssets() const;
  /// Sets what `guiAssets` returns.
  void setGuiAssets(GuiAssets assets);
  /// The object id of the list that was started last.
  ObjectId lastTagId() const;
  /// Sets what `lastTagId` returns.
  void setLastTagId(ObjectId id);
  /// The pending object timers, by tag key.
  Timers objectIdTimers() const;
  /// Sets what `objectIdTimers` returns.
  void setObjectIdTimers(Timers timers);
  /// The tag that each adopted control had when it was recorded, by registry key.
  Dictionary originalTagValues() const;
  /// Sets what `originalTagValues` returns.
  void setOriginalTagValues(Dictionary tags);

  /// Told what the engine does; absent at first. The engine keeps it alive.
  const std::shared_ptr<Observer>& observer() const;
  /// Sets who is told what the engine does; null for nobody.
  void setObserver(std::shared_ptr<Observer> observer);

  /// The class of another language that derives from this engine; null if there is none.
  const std::shared_ptr<Subclass>& subclass() const;

  /// Performs "buttonPushed:"; NO for any other action.
  bool tryToPerform(std::string_view action, const Control& sender) override;

 private:
  struct State;

  QZ_Plist_State_Parser(toolkit::Toolkit& toolkit, std::shared_ptr<Subclass> subclass);

  /// Every operation that calls foreign code begins with this. (`findObjectWithTag` need not: it
  /// does not read the engine after it has called foreign code.)
  [[nodiscard]] KeepAlive keepAlive();
  std::optional<std::string> keyOfTimer(const Timer& timer) const;
  void cancelTimers();
  bool retag(const ObjectId& newTag, const ObjectId& id, const Value& timerValue);
  void rewriteFlashingEntry(const ObjectId& id);
  bool setState(const ObjectId& id, toolkit::State state);
  Window makeTutorialWindow(const toolkit::Rect& content);
  Control makeControl(const toolkit::ValueRef<>& key, const Value& entry);
  bool showHtml(std::string_view documentHead, std::optional<toolkit::TextAlignment> alignment,
                const Value& html, const Value& fontName, const Value& size, const ObjectId& id);

  const std::unique_ptr<State> state_;
};

}  // namespace qz
