// SPDX-License-Identifier: MIT
// The driver's work with a real screen: hands the windows to the person in front of it, and takes
// pictures of them.

#include <limits>

#import "drivers/appkit/appkit_driver.hpp"
#import "toolkit/appkit/parts.hpp"
#import "toolkit/appkit/window.hpp"
#import "toolkit/foundation/exceptions.hpp"
#import "toolkit/foundation/strings.hpp"

namespace qz::drivers {

using toolkit::foundation::nsString;
using toolkit::foundation::Pool;
using toolkit::foundation::sending;

namespace {

// Returns the pixels of the window without its frame.
NSBitmapImageRep* pixelsOf(NSWindow* window) {
  NSView* const content = [window contentView];
  [window display];
  [content lockFocus];
  NSBitmapImageRep* const pixels =
      [[[NSBitmapImageRep alloc] initWithFocusedViewRect:[content bounds]] autorelease];
  [content unlockFocus];
  return pixels;
}

NSRect contentOnScreen(NSWindow* window) { return [window contentRectForFrameRect:[window frame]]; }

// Draws `window` into the focused picture, whose lower left corner is at `corner` of the screen; a
// sheet lies over its parent.
void draw(const AppKitWindow& window, NSPoint corner) {
  const auto parent = window.sheetParent();
  if (parent) draw(*parent, corner);
  const NSRect place = contentOnScreen(window.object());
  [pixelsOf(window.object())
      drawAtPoint:NSMakePoint(place.origin.x - corner.x, place.origin.y - corner.y)];
}

NSBitmapImageRep* pictureOf(const AppKitWindow& window) {
  const auto parent = window.sheetParent();
  if (!parent) return pixelsOf(window.object());
  const NSRect area =
      NSUnionRect(contentOnScreen(window.object()), contentOnScreen(parent->object()));
  NSImage* const canvas = [[[NSImage alloc] initWithSize:area.size] autorelease];
  [canvas lockFocus];
  draw(window, area.origin);
  NSBitmapImageRep* const picture = [[[NSBitmapImageRep alloc]
      initWithFocusedViewRect:NSMakeRect(0, 0, area.size.width, area.size.height)] autorelease];
  [canvas unlockFocus];
  return picture;
}

}  // namespace

void AppKitDriver::handOver(const std::function<void(const Ref<View>&)>& willAct,
                            const std::function<bool()>& goesOn) {
  const auto desk = toolkit_.application().desk();
  desk->willAct = [&](const Ref<View>& view) {
    clock_.reach(clock_.horizon());  // timers that the action schedules start at this moment
    willAct(view);
  };
  const struct Quiet {
    Desk& desk;
    ~Quiet() { desk.willAct = nullptr; }
  } atTheEnd{*desk};

  const PacedClock::Going going(clock_, std::numeric_limits<double>::max());
  toolkit_.parts().runLoop.wake();
  while (goesOn()) {
    const Pool pool;
    NSEvent* const event = [NSApp nextEventMatchingMask:NSAnyEventMask
                                              untilDate:[NSDate dateWithTimeIntervalSinceNow:0.05]
                                                 inMode:NSDefaultRunLoopMode
                                                dequeue:YES];
    if (event) sending([&] { [NSApp sendEvent:event]; });
    raiseWhatWasThrown();
  }
}

bool AppKitDriver::savePicture(const Ref<Window>& window, const std::string& path) {
  const Pool pool;
  settle();
  const auto shown = AppKitWindow::of(window);
  if (!shown || ![shown->object() isVisible]) return false;
  return sending([&] {
    NSData* const png = [pictureOf(*shown) representationUsingType:NSPNGFileType
                                                        properties:[NSDictionary dictionary]];
    return png && [png writeToFile:nsString(path) atomically:NO];
  });
}

}  // namespace qz::drivers
