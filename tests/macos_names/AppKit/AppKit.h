// SPDX-License-Identifier: MIT
// What the sources use of AppKit; the rules are in Foundation/Foundation.h. Names marked “renamed”
// are deprecated on macOS, but still there. GNUstep does not have their new names.
#pragma once

#import <Foundation/Foundation.h>

#pragma clang assume_nonnull begin

@class CALayer, NSApplication, NSColor, NSEvent, NSFont, NSGraphicsContext, NSImage, NSMenu,
    NSMenuItem, NSView, NSWindow;

@protocol NSApplicationDelegate <NSObject>
@optional
- (BOOL)application:(NSApplication*)application openFile:(NSString*)path;
@end
@protocol NSWindowDelegate <NSObject>
@end
@protocol NSTextFieldDelegate <NSObject>
@end

// --- events and the application ---

typedef NS_ENUM(NSUInteger, NSEventType) {
  NSLeftMouseDown = 1,  // renamed
  NSLeftMouseUp = 2     // renamed
};
typedef NS_OPTIONS(unsigned long long, NSEventMask) {
  NSLeftMouseDownMask = 1U << NSLeftMouseDown,  // renamed
  NSAnyEventMask = ~0ULL                        // renamed
};
typedef NSUInteger NSEventModifierFlags;

FOUNDATION_EXPORT NSString* const NSEventTrackingRunLoopMode;

@interface NSEvent : NSObject
+ (nullable NSEvent*)mouseEventWithType:(NSEventType)type
                               location:(NSPoint)location
                          modifierFlags:(NSEventModifierFlags)flags
                              timestamp:(NSTimeInterval)time
                           windowNumber:(NSInteger)window
                                context:(nullable NSGraphicsContext*)context
                            eventNumber:(NSInteger)number
                             clickCount:(NSInteger)clicks
                               pressure:(float)pressure;
@end

@interface NSResponder : NSObject
@property(readonly) BOOL acceptsFirstResponder;
- (void)mouseDown:(NSEvent*)event;
- (void)keyDown:(NSEvent*)event;
- (BOOL)performKeyEquivalent:(NSEvent*)event;
@end

@interface NSApplication : NSResponder
@property(class, readonly, strong) NSApplication* sharedApplication;
@property(nullable, weak) id<NSApplicationDelegate> delegate;
@property(readonly, copy) NSArray* windows;
@property(nullable, strong) NSMenu* mainMenu;
- (void)finishLaunching;
- (void)run;
- (void)terminate:(nullable id)sender;
- (void)sendEvent:(NSEvent*)event;
- (void)postEvent:(NSEvent*)event atStart:(BOOL)atStart;
- (nullable NSEvent*)nextEventMatchingMask:(NSEventMask)mask
                                 untilDate:(nullable NSDate*)limit
                                    inMode:(NSString*)mode
                                   dequeue:(BOOL)dequeue;
- (BOOL)sendAction:(SEL)action to:(nullable id)target from:(nullable id)sender;
@end

FOUNDATION_EXPORT __kindof NSApplication* _Null_unspecified NSApp;

@interface NSMenuItem : NSObject
@property(nullable, weak) id target;
@end

@interface NSMenu : NSObject
- (instancetype)initWithTitle:(NSString*)title;
- (NSMenuItem*)addItemWithTitle:(NSString*)title
                         action:(nullable SEL)action
                  keyEquivalent:(NSString*)key;
- (void)setSubmenu:(nullable NSMenu*)menu forItem:(NSMenuItem*)item;
@end

// --- views ---

typedef NS_OPTIONS(NSUInteger, NSAutoresizingMaskOptions) {
  NSViewWidthSizable = 2,
  NSViewHeightSizable = 16
};
typedef NS_ENUM(NSInteger, NSWindowOrderingMode) { NSWindowAbove = 1, NSWindowBelow = -1 };

@interface NSView : NSResponder
@property NSRect frame;
@property NSRect bounds;
@property(copy) NSArray* subviews;
@property(nullable, readonly, assign) NSView* superview;
@property(nullable, readonly, assign) NSWindow* window;
@property(getter=isHidden) BOOL hidden;
@property(readonly, getter=isHiddenOrHasHiddenAncestor) BOOL hiddenOrHasHiddenAncestor;
@property NSAutoresizingMaskOptions autoresizingMask;
@property BOOL needsDisplay;
@property BOOL wantsLayer;
@property(nullable, strong) CALayer* layer;
@property(nullable, copy) NSString* toolTip;
@property(readonly) NSInteger tag;
- (instancetype)initWithFrame:(NSRect)frame;
- (void)addSubview:(NSView*)view;
- (void)addSubview:(NSView*)view
        positioned:(NSWindowOrderingMode)place
        relativeTo:(nullable NSView*)other;
- (void)removeFromSuperview;
- (BOOL)isDescendantOf:(NSView*)view;
- (nullable __kindof NSView*)viewWithTag:(NSInteger)tag;
- (nullable NSView*)hitTest:(NSPoint)point;
- (NSPoint)convertPoint:(NSPoint)point toView:(nullable NSView*)view;
- (void)setFrameOrigin:(NSPoint)origin;
- (void)display;
- (void)displayIfNeeded;
- (void)lockFocus;    // deprecated since 10.14
- (void)unlockFocus;  // deprecated since 10.14
@end

@interface NSBox : NSView
@property(nullable, strong) __kindof NSView* contentView;
@end

typedef NS_ENUM(NSUInteger, NSBorderType) { NSBezelBorder = 2 };

@interface NSScrollView : NSView
@property(nullable, strong) __kindof NSView* documentView;
@property BOOL hasVerticalScroller;
- (void)setBorderType:(NSBorderType)type;
@end

@interface NSTextView : NSView
@property(copy) NSString* string;
@end

// --- controls ---

typedef NSInteger NSControlStateValue;
static const NSControlStateValue NSMixedState = -1;  // renamed
static const NSControlStateValue NSOffState = 0;     // renamed
static const NSControlStateValue NSOnState = 1;      // renamed
typedef NS_OPTIONS(NSUInteger, NSCellStyleMask) { NSNoCellMask = 0 };

@interface NSCell : NSObject
@property(getter=isHighlighted) BOOL highlighted;
- (void)setNextState;
@end

@interface NSButtonCell : NSCell
@property(nullable, copy) NSColor* backgroundColor;
@property NSCellStyleMask showsStateBy;
@end

@interface NSControl : NSView
@property(nullable, weak) id target;
@property(nullable) SEL action;
@property NSInteger tag;
@property(getter=isEnabled) BOOL enabled;
@property(nullable, strong) NSFont* font;
@property(nullable, strong) __kindof NSCell* cell;
@property(copy) NSString* stringValue;
@property(copy) NSAttributedString* attributedStringValue;
@property int intValue;
- (BOOL)sendAction:(nullable SEL)action to:(nullable id)target;
- (void)performClick:(nullable id)sender;
@end

typedef NS_ENUM(NSUInteger, NSButtonType) { NSSwitchButton = 3 /* renamed */ };
typedef NS_ENUM(NSUInteger, NSBezelStyle) { NSRoundedBezelStyle = 1 /* renamed */ };

@interface NSButton : NSControl
@property(copy) NSString* title;
@property(copy) NSAttributedString* attributedTitle;
@property NSControlStateValue state;
@property BOOL allowsMixedState;
@property(getter=isBordered) BOOL bordered;
@property NSBezelStyle bezelStyle;
- (void)setButtonType:(NSButtonType)type;
- (void)highlight:(BOOL)highlighted;
@end

@interface NSPopUpButton : NSButton
@property(nullable, readonly, copy) NSString* titleOfSelectedItem;
- (instancetype)initWithFrame:(NSRect)frame pullsDown:(BOOL)pullsDown;
- (void)addItemsWithTitles:(NSArray*)titles;
@end

@interface NSTextField : NSControl
@property(nullable, weak) id<NSTextFieldDelegate> delegate;
@property(nullable, copy) NSColor* textColor;
@property(getter=isEditable) BOOL editable;
@property(getter=isSelectable) BOOL selectable;
@property(getter=isBezeled) BOOL bezeled;
@property BOOL drawsBackground;
@end

@interface NSSlider : NSControl
@end

@interface NSStepper : NSControl
@property double minValue;
@property double maxValue;
@end

typedef NS_ENUM(NSUInteger, NSImageScaling) {
  NSImageScaleProportionallyDown = 0,
  NSImageScaleAxesIndependently = 1
};
typedef NS_ENUM(NSUInteger, NSImageFrameStyle) { NSImageFrameNone = 0 };
typedef NS_ENUM(NSUInteger, NSImageAlignment) { NSImageAlignCenter = 0 };

@interface NSImageView : NSControl
@property(nullable, strong) NSImage* image;
@property NSImageScaling imageScaling;
@property NSImageFrameStyle imageFrameStyle;
@property NSImageAlignment imageAlignment;
@end

// --- windows ---

typedef NS_OPTIONS(NSUInteger, NSWindowStyleMask) {
  NSTitledWindowMask = 1,         // renamed
  NSClosableWindowMask = 2,       // renamed
  NSMiniaturizableWindowMask = 4  // renamed
};
typedef NS_ENUM(NSUInteger, NSBackingStoreType) { NSBackingStoreBuffered = 2 };

FOUNDATION_EXPORT NSString* const NSWindowWillCloseNotification;

@interface NSWindow : NSResponder
@property(nullable, weak) id<NSWindowDelegate> delegate;
@property(nullable, strong) __kindof NSView* contentView;
@property(copy) NSString* title;
@property(nullable, copy) NSColor* backgroundColor;
@property NSWindowStyleMask styleMask;
@property(readonly) NSRect frame;
@property(readonly) NSInteger windowNumber;
@property(nullable, readonly, strong) NSGraphicsContext* graphicsContext;  // since 10.14 deprecated
@property(readonly, getter=isVisible) BOOL visible;
@property(readonly, getter=isKeyWindow) BOOL keyWindow;
@property(getter=isReleasedWhenClosed) BOOL releasedWhenClosed;
- (instancetype)initWithContentRect:(NSRect)content
                          styleMask:(NSWindowStyleMask)style
                            backing:(NSBackingStoreType)backing
                              defer:(BOOL)defer;
- (NSRect)contentRectForFrameRect:(NSRect)frame;
- (void)setFrameOrigin:(NSPoint)origin;
- (BOOL)makeFirstResponder:(nullable NSResponder*)responder;
- (void)makeKeyWindow;
- (void)makeKeyAndOrderFront:(nullable id)sender;
- (void)orderOut:(nullable id)sender;
- (void)close;
- (void)display;
- (void)displayIfNeeded;
@end

@interface NSPanel : NSWindow
@end

// --- images ---

@interface NSImage : NSObject
@property(readonly, getter=isValid) BOOL valid;
+ (nullable NSImage*)imageNamed:(NSString*)name;
- (nullable instancetype)initWithContentsOfFile:(NSString*)path;
- (instancetype)initWithSize:(NSSize)size;
- (BOOL)setName:(nullable NSString*)name;
- (nullable NSString*)name;
- (void)lockFocus;    // deprecated since 14
- (void)unlockFocus;  // deprecated since 14
@end

typedef NS_ENUM(NSUInteger, NSBitmapImageFileType) { NSPNGFileType = 4 };  // renamed

@interface NSBitmapImageRep : NSObject
@property(nullable, readonly, copy) NSData* TIFFRepresentation;
- (nullable instancetype)initWithFocusedViewRect:(NSRect)rect;  // deprecated since 10.14
- (BOOL)drawAtPoint:(NSPoint)point;
- (nullable NSData*)representationUsingType:(NSBitmapImageFileType)type
                                 properties:(NSDictionary*)properties;
@end

// --- colours, fonts, styled text ---

FOUNDATION_EXPORT NSString* const NSCalibratedRGBColorSpace;

@interface NSColor : NSObject <NSCopying>
@property(class, readonly, strong) NSColor* redColor;
@property(class, readonly, strong) NSColor* blueColor;
@property(class, readonly, strong) NSColor* controlTextColor;
@property(readonly) CGFloat redComponent;
@property(readonly) CGFloat greenComponent;
@property(readonly) CGFloat blueComponent;
@property(readonly) CGFloat alphaComponent;
+ (NSColor*)colorWithSRGBRed:(CGFloat)red
                       green:(CGFloat)green
                        blue:(CGFloat)blue
                       alpha:(CGFloat)alpha;
- (nullable NSColor*)colorUsingColorSpaceName:(NSString*)name;  // deprecated since 10.14
@end

@interface NSFont : NSObject <NSCopying>
@property(nullable, readonly, copy) NSString* familyName;
@property(readonly) CGFloat pointSize;
@property(readonly, getter=isFixedPitch) BOOL fixedPitch;
+ (NSFont*)systemFontOfSize:(CGFloat)size;
+ (nullable NSFont*)userFontOfSize:(CGFloat)size;
@end

typedef NS_OPTIONS(NSUInteger, NSFontTraitMask) { NSItalicFontMask = 1, NSBoldFontMask = 2 };

@interface NSFontManager : NSObject
@property(class, readonly, strong) NSFontManager* sharedFontManager;
@property(readonly, copy) NSArray* availableFontFamilies;
- (nullable NSFont*)fontWithFamily:(NSString*)family
                            traits:(NSFontTraitMask)traits
                            weight:(NSInteger)weight
                              size:(CGFloat)size;
- (NSFontTraitMask)traitsOfFont:(NSFont*)font;
@end

// The numbers differ between processors.
typedef NS_ENUM(NSInteger, NSTextAlignment) {
  NSLeftTextAlignment = 0,       // renamed
  NSCenterTextAlignment = 1,     // renamed
  NSRightTextAlignment = 2,      // renamed
  NSJustifiedTextAlignment = 3,  // renamed
  NSNaturalTextAlignment = 4     // renamed
};

@interface NSParagraphStyle : NSObject <NSCopying>
@property(readonly) NSTextAlignment alignment;
@property(readonly) CGFloat firstLineHeadIndent;
@property(readonly) CGFloat headIndent;
@end

@interface NSMutableParagraphStyle : NSParagraphStyle
@property NSTextAlignment alignment;
@property CGFloat firstLineHeadIndent;
@property CGFloat headIndent;
@end

FOUNDATION_EXPORT NSString* const NSBackgroundColorAttributeName;
FOUNDATION_EXPORT NSString* const NSFontAttributeName;
FOUNDATION_EXPORT NSString* const NSForegroundColorAttributeName;
FOUNDATION_EXPORT NSString* const NSLinkAttributeName;
FOUNDATION_EXPORT NSString* const NSParagraphStyleAttributeName;
FOUNDATION_EXPORT NSString* const NSStrikethroughStyleAttributeName;
FOUNDATION_EXPORT NSString* const NSSuperscriptAttributeName;
FOUNDATION_EXPORT NSString* const NSUnderlineStyleAttributeName;

@interface NSAttributedString (HTML)
- (nullable instancetype)initWithHTML:(NSData*)document
                   documentAttributes:(NSDictionary* _Nullable* _Nullable)attributes;
@end

#pragma clang assume_nonnull end
