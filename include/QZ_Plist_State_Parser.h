// SPDX-License-Identifier: MIT
// QZ_Plist_State_Parser for Objective-C: plays scripted walk-throughs over the controls of a
// window.
//
// A host creates one engine and gives it a window and a script. The script is a property list that
// maps the tags of controls, written as decimal strings, to lists of commands. The engine then
// drives the window's controls; each press of a button runs the list under the button's tag.
//
// Calling order: make the engine with the host window; build the walk-through window from a
// description (loadGuiAssets:error:) or adopt one (getGuiAssetsFromWindow:); load and run a script
// (loadPlist:runFromKey:withDelegate:runAsSheet:). A command of the script or terminateParser ends
// the walk-through. End it before you release the engine: a running flasher keeps the engine alive.
//
// Nil is an absent object: absent arguments never raise because they are absent. Everything runs on
// the main thread, except the getters and setters of the object-valued properties.
//
// For Objective-C and Objective-C++, with and without ARC; C code can pass an engine on. C++ code
// includes "qz/engine.hpp" instead, also beside this header.
#ifndef QZ_PLIST_STATE_PARSER_H
#define QZ_PLIST_STATE_PARSER_H

#if defined(__clang__) && defined(__has_feature)
#if __has_feature(nullability)
#define QZ_NULLABLE _Nullable
#define QZ_NONNULL _Nonnull
#endif
#if __has_feature(objc_arc)
#define QZ_AUTORELEASING __autoreleasing
#endif
#endif
#ifndef QZ_NULLABLE
#define QZ_NULLABLE
#define QZ_NONNULL
#endif
#ifndef QZ_AUTORELEASING
#define QZ_AUTORELEASING
#endif

#if defined(__GNUC__)
#define QZ_EXPORTED __attribute__((visibility("default")))
#else
#define QZ_EXPORTED
#endif

#ifdef __OBJC__

#import <AppKit/AppKit.h>

#ifdef __cplusplus
extern "C" {
#endif

/// \name Names of commands
/// \{

/// The name of a command in scripts. Assigning another string to one renames the command for
/// every script from then on; with nil, no command has the name. The engine looks at the names when
/// one of its operations is called. The names of compound commands are upper-cased before they are
/// compared; those of simple commands are not. QZ_PLIST_STATE_PARSER_RETURN_TO_IDLE_LOOP holds
/// "IDLE_LOOP", the one value that differs from its constant's name. No command has the names
/// BUTTON_WITH_ID_AT, IMAGE_WITH_ID_AND_PATH_AT and HIGHLIGHT_ID.
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_TERMINATE_PARSER;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_RETURN_TO_IDLE_LOOP;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_HIDE_OBJECT_WITH_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_SHOW_OBJECT_WITH_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_ENABLE_OBJECT_WITH_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_DISABLE_OBJECT_WITH_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_PROCESS_COMMANDS_FOR_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_SET_TOOL_TIP_FOR_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_SET_TEXT_FOR_OBJECT_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_LOAD_BACKGROUND_WITH_IMAGE;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_BUTTON_WITH_ID_AT;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_IMAGE_WITH_ID_AND_PATH_AT;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_ALLOW_FLASHING;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_FLASH_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_HIGHLIGHT_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_SET_STATE_ON_FOR_OBJECT_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_SET_STATE_OFF_FOR_OBJECT_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_SET_BACKGROUND_COLOR_FOR_OBJECT_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_SET_FOREGROUND_COLOR_FOR_OBJECT_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_SET_TITLE_FOR_OBJECT_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_SET_TAG_FOR_OBJECT_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_SET_TAG_FOR_OBJECT_ID_WITH_TIMER;
QZ_EXPORTED extern NSString* QZ_NULLABLE QZ_PLIST_STATE_PARSER_SET_TIMER_FOR_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE
    QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE
    QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID;
QZ_EXPORTED extern NSString* QZ_NULLABLE
    QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_IS_WITH_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID;

/// \}

#ifdef __cplusplus
}
#endif

/// What the delegate of a sheet may implement.
@protocol QZ_Plist_State_Parser_SheetDelegate <NSObject>
@optional
/// The walk-through's sheet was ended; `contextInfo` is NULL. The sheet is still on the screen: the
/// delegate must order it out.
- (void)sheetDidEnd:(NSWindow* QZ_NULLABLE)sheet
         returnCode:(NSInteger)returnCode
        contextInfo:(void* QZ_NULLABLE)contextInfo;
@end

/// Plays scripted walk-throughs over the controls of a window.
@interface QZ_Plist_State_Parser : NSObject <NSWindowDelegate> {
 @private
  void* _behind;  // made at the first use
}

// --- for the host, in calling order ---

/// Makes an engine with its tables and starts the flasher. `window` is the parent of a sheet.
/// (`init` makes an engine without tables and without a flasher.)
- (id QZ_NULLABLE)initWithWindow:(NSWindow* QZ_NULLABLE)window;

/// Builds the walk-through window and its controls from a description. YES if at least one control
/// was made. The error is never written. A malformed entry raises.
- (BOOL)loadGuiAssets:(NSDictionary* QZ_NULLABLE)description
                error:(NSError* QZ_NULLABLE QZ_AUTORELEASING* QZ_NULLABLE)error;

/// Adopts `window` as the walk-through window: makes the engine its delegate if it has none, makes
/// the engine the target of every button directly in its content view, and records every button,
/// image view and text field there. YES if at least one was recorded.
- (BOOL)getGuiAssetsFromWindow:(NSWindow* QZ_NULLABLE)window;

/// Reads the script at the path `name` (absolute, or relative to the main bundle's resource
/// directory; used exactly as given), shows the walk-through window as a sheet over the host window
/// if `runAsSheet`, and runs the list under `key`. A nil key runs no list and gives YES; an empty
/// key means the smallest tag. Otherwise returns the result of the run. `delegate` is sent
/// sheetDidEnd:returnCode:contextInfo:, and is not retained.
- (BOOL)loadPlist:(NSString* QZ_NULLABLE)name
       runFromKey:(NSString* QZ_NULLABLE)key
     withDelegate:(id QZ_NULLABLE)delegate
       runAsSheet:(BOOL)runAsSheet;

/// Handles the press of a control: the action of the walk-through's buttons.
- (IBAction)buttonPushed:(id QZ_NULLABLE)sender;

/// Returns the tag of the list that was started last, in decimal; "0" before the first.
- (NSString* QZ_NONNULL)currentCommandState;

/// Ends the walk-through: restores changed tags, stops the flasher and the timers, drops the script
/// and the records, and closes the window (once) or ends the sheet (at every call).
- (void)terminateParser;

/// Returns a copy of the states of the controls pressed so far, by tag: YES for on. Nil if the
/// engine has no tables.
- (NSDictionary* QZ_NULLABLE)buttonStates;
/// Turns the walk-through's buttons on or off, by tag. YES if at least one was set.
- (BOOL)setButtonSates:(NSDictionary* QZ_NULLABLE)states;

// --- helpers for hosts ---

/// Adds an entry to a description, under the decimal form of `tagId`. `className` is NSButton,
/// NSImageView, NSTextField or NSWindow. NO if an argument is absent, the class is another one, or
/// the dictionary is immutable.
- (BOOL)createNextGuiAssetEntry:
            (NSMutableDictionary* QZ_NULLABLE QZ_AUTORELEASING* QZ_NULLABLE)entries
                      forObject:(NSString* QZ_NULLABLE)className
                     usingFrame:(NSRect)frame
                      withTagId:(NSUInteger)tagId;
/// Makes buttonPushed: the action of a button or gradient; its target stays. NO for anything else.
- (BOOL)forceButtonPushedToBeActionForGuiAttribute:(id QZ_NULLABLE)object;

// --- the engine's own operations; it sends them to itself, so a subclass may override them ---

/// Runs a list for an object id. Returns the result of the last element that did not raise. A list
/// that is not an array raises.
- (BOOL)processCommandArray:(NSArray* QZ_NULLABLE)list ForObject:(NSNumber* QZ_NULLABLE)objectId;
/// Runs a simple command on the control whose tag is the object id. NO for an unknown name.
- (BOOL)doSimpleCommand:(NSString* QZ_NULLABLE)name
             withParams:(NSMutableArray* QZ_NULLABLE)parameters
            usingObject:(NSNumber* QZ_NULLABLE)objectId;
/// Runs a compound command, whose name is in upper case. NO for an unknown name. Most commands
/// raise if a parameter is missing.
- (BOOL)doCompoundCommand:(NSString* QZ_NULLABLE)name
           withParameters:(NSMutableArray* QZ_NULLABLE)parameters
              usingObject:(NSNumber* QZ_NULLABLE)objectId;
/// Returns the back-most view directly in the walk-through window that now has the tag, or nil.
- (id QZ_NULLABLE)findObjectWithTag:(NSInteger)tag;
/// Gives every recorded control the tag that it had when it was recorded.
- (void)restoreOriginalTagValues;
/// Starts a one-shot timer of `value` seconds for a tag key; does nothing for 0 and for no key.
- (void)startTimerWithValue:(NSUInteger)value forKey:(NSString* QZ_NULLABLE)key;
/// Cancels every pending object timer.
- (void)killAllTimers;
/// Sent by an object timer when it fires.
- (void)pseudoButtonPush:(NSTimer* QZ_NULLABLE)timer;
/// Sent by the flasher at every tick.
- (void)flasherFired:(NSTimer* QZ_NULLABLE)timer;

// --- the command processors; each takes the tag of its target as an object id ---

/// Sets the text of a control. YES if the control then reads back the same text.
- (BOOL)QZ_Plist_State_Processor_SET_TEXT:(NSString* QZ_NULLABLE)text
                                    forId:(NSNumber* QZ_NULLABLE)objectId;
/// Shows HTML, centred, in a font of `size` points; `size` is anything with intValue.
- (BOOL)QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML:(NSString* QZ_NULLABLE)html
                                                WITH_FONT_NAME:(NSString* QZ_NULLABLE)fontName
                                                     WITH_SIZE:(id QZ_NULLABLE)size
                                                 FOR_OBJECT_ID:(NSNumber* QZ_NULLABLE)objectId;
/// The same with the natural alignment.
- (BOOL)QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER:(NSString* QZ_NULLABLE)html
                                                          WITH_FONT_NAME:
                                                              (NSString* QZ_NULLABLE)fontName
                                                               WITH_SIZE:(id QZ_NULLABLE)size
                                                           FOR_OBJECT_ID:
                                                               (NSNumber* QZ_NULLABLE)objectId;
/// With `asIs` the HTML keeps its own fonts and alignment.
- (BOOL)QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_IS:(BOOL)asIs
                                                   WITH_HTML:(NSString* QZ_NULLABLE)html
                                              WITH_FONT_NAME:(NSString* QZ_NULLABLE)fontName
                                                   WITH_SIZE:(id QZ_NULLABLE)size
                                               FOR_OBJECT_ID:(NSNumber* QZ_NULLABLE)objectId;
/// Colours a button red; `color` is not used.
- (BOOL)QZ_Plist_State_Processor_SET_BACKGROUND_COLOR:(NSUInteger)color
                                                forId:(NSNumber* QZ_NULLABLE)objectId;
/// Sets the colour of a button's title, by name.
- (BOOL)QZ_Plist_State_Processor_SET_FOREGROUND_COLOR:(NSString* QZ_NULLABLE)name
                                        FOR_OBJECT_ID:(NSNumber* QZ_NULLABLE)objectId;
/// Sets a button's title.
- (BOOL)QZ_Plist_State_Processor_SET_TITLE:(NSString* QZ_NULLABLE)title
                                     forId:(NSNumber* QZ_NULLABLE)objectId;
/// Turns a button on without sending its action.
- (BOOL)QZ_Plist_State_Processor_SET_STATE_ON:(NSNumber* QZ_NULLABLE)objectId;
/// Turns a button off without sending its action.
- (BOOL)QZ_Plist_State_Processor_SET_STATE_OFF:(NSNumber* QZ_NULLABLE)objectId;
/// Sets a tooltip: the text, then optionally the tag of another control.
- (BOOL)QZ_Plist_State_Processor_SET_TOOL_TIP:(NSArray* QZ_NULLABLE)parameters
                                    forObject:(NSNumber* QZ_NULLABLE)objectId;
/// Shows an image in an image view: the image's resource name, then the view's tag.
- (BOOL)QZ_Plist_State_Processor_LOAD_GRAPHIC_OBJECT_WITH_PATH:(NSArray* QZ_NULLABLE)parameters
                                                     forObject:(NSNumber* QZ_NULLABLE)objectId;
/// Runs the list under the tag and returns its result.
- (BOOL)QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID:(NSNumber* QZ_NULLABLE)objectId;
/// Sends terminateParser.
- (void)QZ_Plist_State_Processor_TERMINATE_PARSER;
/// Does nothing.
- (void)QZ_Plist_State_Processor_RETURN_TO_IDLE_LOOP;
/// Starts the object timer of a tag, if a control or a list has the tag; for a control, 0 cancels
/// it. Always NO.
- (BOOL)QZ_Plist_State_Processor_SET_TIMER:(NSUInteger)value forId:(NSNumber* QZ_NULLABLE)objectId;
/// Gives a control another tag. NO if no control has the old one.
- (BOOL)QZ_Plist_State_Processor_SET_TAG:(NSNumber* QZ_NULLABLE)newTag
                                   forId:(NSNumber* QZ_NULLABLE)objectId;
/// The same; also starts an object timer under the new tag, unless `timerValue` is nil. Its seconds
/// are an address, whatever the object is: such a timer practically never fires.
- (BOOL)QZ_Plist_State_Processor_SET_TAG:(NSNumber* QZ_NULLABLE)newTag
                                   forId:(NSNumber* QZ_NULLABLE)objectId
                          withTimerValue:(id QZ_NULLABLE)timerValue;
/// Switches flashing on or off. Always YES.
- (BOOL)QZ_Plist_State_Processor_ALLOW_FLASHING:(BOOL)allow;
/// Makes a button flash, or never flash. Only the first call for a tag counts; later ones give NO.
- (BOOL)QZ_Plist_State_Processor_FLASH_ID:(NSNumber* QZ_NULLABLE)objectId flashOn:(BOOL)flashOn;
/// Does nothing. Always NO.
- (BOOL)QZ_Plist_State_Processor_HIGHLIGHT_ID:(NSNumber* QZ_NULLABLE)objectId;

// --- properties ---
//
// A getter returns the engine's own table: both sides see each other's changes. An object from a
// setter is retained, and comes back from the getter.

/// Whether buttons flash. If NO, the flasher's ticks do nothing.
@property BOOL flashing;
/// Whether the last load was asked to run the walk-through as a sheet.
@property BOOL runningAsSheet;
/// Whether the end of the walk-through has begun.
@property BOOL terminating;
/// Whether terminateParser has closed the walk-through window.
@property BOOL hasTerminated;
/// The host window.
@property(retain) NSWindow* QZ_NULLABLE window;
/// The script: tag key to command list.
@property(retain) NSMutableDictionary* QZ_NULLABLE plistDictionary;
/// For the host's use; the engine only clears it.
@property(retain) NSArray* QZ_NULLABLE commandArray;
/// For the host's use; the engine never touches it.
@property(retain) NSNumber* QZ_NULLABLE objectId;
/// The repeating half-second timer behind flashing.
@property(retain) NSTimer* QZ_NULLABLE flashingTimer;
/// The tags that flash: tag key to boolean.
@property(retain) NSMutableDictionary* QZ_NULLABLE flashingTagIds;
/// The window whose controls the script drives.
@property(retain) NSWindow* QZ_NULLABLE tutorialWindow;
/// The controls that the last loadGuiAssets:error: made, in the order of their creation.
@property(retain) NSMutableArray* QZ_NULLABLE addedObjectToTutorial;
/// The records of the adopted window's controls, by registry key. A record is an array: a list with
/// the class name, a list with x, y, width and height, and the control (NSNull once it is gone).
@property(retain) NSMutableDictionary* QZ_NULLABLE guiAssets;
/// The object id of the list that was started last.
@property(retain) NSNumber* QZ_NULLABLE lastTagId;
/// The pending object timers, by tag key.
@property(retain) NSMutableDictionary* QZ_NULLABLE objectIdTimers;
/// The tag that each adopted control had when it was recorded, by registry key.
@property(retain) NSMutableDictionary* QZ_NULLABLE originalTagValues;

@end

#elif !defined(__cplusplus)

/// An engine, which C code can only pass on.
typedef struct objc_object QZ_Plist_State_Parser;

#endif

#endif  // QZ_PLIST_STATE_PARSER_H
