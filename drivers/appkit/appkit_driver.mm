// SPDX-License-Identifier: MIT
// Acts as a user through AppKit's own events, and reads what the views show.

#import "drivers/appkit/appkit_driver.hpp"

#include <algorithm>
#include <utility>

#import "drivers/appkit/tagged_views.hpp"
#include "qz/drivers/appkit/toolkit_row.hpp"
#include "qz/toolkit/exception.hpp"
#import "toolkit/appkit/parts.hpp"
#import "toolkit/appkit/views.hpp"
#import "toolkit/appkit/window.hpp"
#import "toolkit/foundation/exceptions.hpp"
#import "toolkit/foundation/strings.hpp"

/// Takes the arguments of the program, which GNUstep would open as documents.
@interface QZDriverDelegate : NSObject <NSApplicationDelegate>
@end

@implementation QZDriverDelegate

- (BOOL)application:(NSApplication*)application openFile:(NSString*)path {
  (void)application;
  (void)path;
  return YES;
}

@end

namespace qz::drivers {

using toolkit::foundation::Kept;
using toolkit::foundation::nsString;
using toolkit::foundation::Pool;
using toolkit::foundation::sending;
using toolkit::foundation::utf8;

namespace {

template <class ViewClass>
NSView* plain() {
  return [[[ViewClass alloc] initWithFrame:NSZeroRect] autorelease];
}

NSButton* pushButton() {
  NSButton* const button = [[[NSButton alloc] initWithFrame:NSZeroRect] autorelease];
  [button setTitle:@"Button"];
  return button;
}

NSView* newButton() { return pushButton(); }

NSView* newToggle() {
  NSButton* const button = pushButton();
  [button setButtonType:NSSwitchButton];
  return button;
}

NSView* newMixed() {
  NSButton* const button = static_cast<NSButton*>(newToggle());
  [button setAllowsMixedState:YES];
  return button;
}

NSView* newPopUpButton() {
  return [[[NSPopUpButton alloc] initWithFrame:NSZeroRect pullsDown:NO] autorelease];
}

// A label, as hosts have: a new text field has a frame and can be edited.
NSView* newTextField() {
  NSTextField* const field = [[[NSTextField alloc] initWithFrame:NSZeroRect] autorelease];
  [field setEditable:NO];
  [field setBezeled:NO];
  [field setDrawsBackground:NO];
  return field;
}

// How a kind of view is made.
struct AppKitKind {
  ViewKind kind;
  std::string_view className;
  NSView* (*make)();
};

constexpr AppKitKind appKitKinds[] = {
    {ViewKind::button, "NSButton", newButton},
    {ViewKind::toggle, "NSButton", newToggle},
    {ViewKind::mixed, "NSButton", newMixed},
    {ViewKind::popUpButton, "NSPopUpButton", newPopUpButton},
    {ViewKind::textField, "NSTextField", newTextField},
    {ViewKind::imageView, "NSImageView", plain<NSImageView>},
    {ViewKind::box, "QZTaggedBox", plain<QZTaggedBox>},
    {ViewKind::plain, "QZTaggedView", plain<QZTaggedView>},
};

static_assert(hasOneRowForEachKind(appKitKinds));

ViewKind kindOf(NSButton* button) {
  if ([button isKindOfClass:[NSPopUpButton class]]) return ViewKind::popUpButton;
  if ([button allowsMixedState]) return ViewKind::mixed;
  const bool showsState = [static_cast<NSButtonCell*>([button cell]) showsStateBy] != NSNoCellMask;
  return showsState ? ViewKind::toggle : ViewKind::button;
}

ViewKind kindOf(View& view, NSView* object) {
  if (view.asButton()) return kindOf(static_cast<NSButton*>(object));
  if (view.asTextField()) return ViewKind::textField;
  if (view.asImageView()) return ViewKind::imageView;
  return [object isKindOfClass:[NSBox class]] ? ViewKind::box : ViewKind::plain;
}

void requireApplication() {
  const Pool pool;
  sending([] {
    if (NSApp) return;
    [NSApplication sharedApplication];
    [NSApp setDelegate:[[QZDriverDelegate alloc] init]];  // lives as long as the application
    [NSApp finishLaunching];
  });
}

NSPoint middleOf(NSView* view) {
  const NSRect bounds = [view bounds];
  return [view convertPoint:NSMakePoint(NSMidX(bounds), NSMidY(bounds)) toView:nil];
}

// Whether the user sees the view, and no sheet is attached to its window.
bool takesInput(NSView* view) {
  NSWindow* const window = [view window];
  return [window isVisible] && ![view isHiddenOrHasHiddenAncestor] && !SheetPlace::covers(window);
}

bool isUnderMouse(NSView* view) {
  NSView* const top = [[[view window] contentView] superview];
  return [[top hitTest:middleOf(view)] isDescendantOf:view];
}

NSEvent* mouseEvent(NSEventType type, NSView* view) {
  return [NSEvent mouseEventWithType:type
                            location:middleOf(view)
                       modifierFlags:0
                           timestamp:[[NSDate date] timeIntervalSinceReferenceDate]
                        windowNumber:[[view window] windowNumber]
                             context:[[view window] graphicsContext]
                         eventNumber:0
                          clickCount:1
                            pressure:1];
}

// The release must already wait when AppKit follows the mouse. The press comes from the queue too,
// because AppKit's cells read the event that the application took from it last.
void clickWithMouse(NSView* view) {
  [NSApp postEvent:mouseEvent(NSLeftMouseUp, view) atStart:YES];
  [NSApp postEvent:mouseEvent(NSLeftMouseDown, view) atStart:YES];
  [NSApp sendEvent:[NSApp nextEventMatchingMask:NSLeftMouseDownMask
                                      untilDate:[NSDate distantPast]
                                         inMode:NSEventTrackingRunLoopMode
                                        dequeue:YES]];
}

bool isButton(NSView* view) { return [view isKindOfClass:[NSButton class]]; }
bool isPopUp(NSView* view) { return [view isKindOfClass:[NSPopUpButton class]]; }

// As the space key does, but at once: AppKit would show the button pressed in for a moment. Only
// buttons react.
void clickWithoutMouse(NSView* view) {
  NSButton* const button = static_cast<NSButton*>(view);
  if (!isButton(view) || ![button isEnabled]) return;
  [button highlight:NO];
  if (kindOf(button) == ViewKind::toggle || kindOf(button) == ViewKind::mixed) {
    [static_cast<NSCell*>([button cell]) setNextState];
  }
  [button sendAction:[button action] to:[button target]];
}

}  // namespace

template class PacedDriver<AppKitToolkit>;

Ref<Window> AppKitDriver::makeWindow(const Rect& content) {
  const Pool pool;
  auto window = AppKitWindow::make(content, StyleMask::titledAndClosable, BackingStore::buffered,
                                   false, toolkit_.application().desk(), KeptBy::holder);
  window->makeKeyAndOrderFront();
  return window;
}

Ref<View> AppKitDriver::makeView(ViewKind kind, Tag tag, const Rect& frame,
                                 const Ref<View>& parent) {
  const Pool pool;
  const auto node = toolkit_.application().desk()->nodeOf(rowOf(appKitKinds, kind).make());
  node->place(frame);
  Ref<View> view = node->view();
  view->setTag(tag);
  parent->addSubview(view);
  return view;
}

void AppKitDriver::removeFromSuperview(const Ref<View>& view) {
  const Pool pool;
  if (const auto node = ViewNode::of(view)) node->removeFromSuperview();
}

void AppKitDriver::setFrame(const Ref<View>& view, const Rect& frame) {
  const Pool pool;
  if (const auto node = ViewNode::of(view)) node->place(frame);
}

void AppKitDriver::setWindowTitle(const Ref<Window>& window, std::string_view title) {
  const Pool pool;
  [toolkit_.application().object(window) setTitle:nsString(title)];
}

std::string_view AppKitDriver::className(ViewKind kind) const {
  return rowOf(appKitKinds, kind).className;
}

void AppKitDriver::click(const Ref<View>& view) {
  const Pool pool;
  settle();
  const Kept<NSView*> object(toolkit_.application().object(view));
  if (!takesInput(object.get())) return;
  const bool withMouse = !isHeld_ && !isPopUp(object.get()) && isUnderMouse(object.get());
  if (object.get() == held_.get()) held_ = {};
  sending([&] { withMouse ? clickWithMouse(object.get()) : clickWithoutMouse(object.get()); });
  settle();
  raiseWhatWasThrown();
}

void AppKitDriver::hold(const Ref<View>& view) {
  const Pool pool;
  letGo();
  NSView* const object = toolkit_.application().object(view);
  if (!isButton(object) || !takesInput(object)) return;
  if (![static_cast<NSButton*>(object) isEnabled]) return;
  held_ = Kept<NSView*>(object);
  setHeld(true);
}

void AppKitDriver::setHeld(bool held) {
  isHeld_ = held;
  toolkit_.parts().runLoop.setUserIsBusy(held);
}

void AppKitDriver::letGo() {
  const Pool pool;
  if (!isHeld_) return;
  setHeld(false);
  const Kept<NSView*> held = std::exchange(held_, {});
  if (takesInput(held.get())) sending([&] { clickWithMouse(held.get()); });
  settle();
  advance(0);
}

void AppKitDriver::advance(double seconds) {
  const Pool pool;
  if (held_ && !takesInput(held_.get())) setHeld(false);
  PacedDriver::advance(seconds);
}

// AppKit's queue does not say when a timer has fired, so whoever waits for one must look again
// soon.
void AppKitDriver::awaitEvents(double seconds) {
  constexpr double longestWait = 0.05;
  const Pool pool;
  NSDate* const end = [NSDate dateWithTimeIntervalSinceNow:std::min(seconds, longestWait)];
  NSEvent* const event = [NSApp nextEventMatchingMask:NSAnyEventMask
                                            untilDate:end
                                               inMode:NSDefaultRunLoopMode
                                              dequeue:YES];
  if (event) sending([&] { [NSApp sendEvent:event]; });
}

// Processes waiting events, and draws what has changed.
void AppKitDriver::settle() {
  const Pool pool;
  sending([] {
    while (NSEvent* const event = [NSApp nextEventMatchingMask:NSAnyEventMask
                                                     untilDate:[NSDate distantPast]
                                                        inMode:NSDefaultRunLoopMode
                                                       dequeue:YES]) {
      [NSApp sendEvent:event];
    }
    [[NSApp windows] makeObjectsPerformSelector:@selector(displayIfNeeded)];
  });
}

ViewPicture AppKitDriver::look(const Ref<View>& view) {
  const Pool pool;
  ViewPicture picture;
  const auto node = ViewNode::of(view);
  if (!node) return picture;
  picture.kind = kindOf(*view, node->object());
  picture.className = view->className();
  picture.tag = view->tag();
  picture.frame = view->frame();
  picture.hidden = node->isHidden();
  picture.state = view->state();
  picture.toolTip = utf8([node->object() toolTip]);
  if (const auto* control = dynamic_cast<const ControlNode*>(node.get())) {
    picture.enabled = [control->control() isEnabled];
    picture.text = control->value();
    picture.target = control->target();
    if (!control->action().empty()) picture.action = control->action();
  }
  if (const auto* button = dynamic_cast<const AppKitButton*>(node.get())) {
    picture.highlighted = button->isHighlighted();
    picture.title = *button->attributedTitle();
    picture.background = button->backgroundColor();
  }
  if (const auto* imageView = dynamic_cast<const AppKitImageView*>(node.get())) {
    picture.image = nameOf(imageView->image());
  }
  return picture;
}

WindowPicture AppKitDriver::look(const Ref<Window>& window) {
  const Pool pool;
  WindowPicture picture;
  const auto shown = AppKitWindow::of(window);
  if (!shown) return picture;
  NSWindow* const object = shown->object();
  picture.visible = [object isVisible];
  picture.key = [object isKeyWindow];
  picture.closes = shown->closes();
  picture.content = shown->content();
  picture.style = static_cast<unsigned>([object styleMask]);
  picture.background = shown->backgroundColor();
  picture.delegate = shown->delegate();
  const auto content = ViewNode::of(shown->contentView());
  picture.layered = content->wantsLayer();
  picture.layerImage = nameOf(content->layerContents());
  picture.sheetOf = shown->sheetParent();
  picture.sheetEnds = shown->sheetEnds();
  return picture;
}

AppKitDriver::~AppKitDriver() {
  const Pool pool;
  settle();
}

std::unique_ptr<Driver> makeAppkitDriver() {
  requireApplication();
  return std::make_unique<AppKitDriver>();
}

}  // namespace qz::drivers
