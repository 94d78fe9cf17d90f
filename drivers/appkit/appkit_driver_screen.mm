// SPDX-License-Identifier: MIT
// Pictures of the windows.

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
