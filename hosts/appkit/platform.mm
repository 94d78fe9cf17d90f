// SPDX-License-Identifier: MIT
// All engines share one toolkit, so that a control has one view, whichever engine uses it.

#import "hosts/appkit/platform.hpp"

#import "hosts/appkit/arguments.hpp"

namespace qz::hosts::appkit {

using toolkit::Ref;

namespace {

void withdrawFrom(NSControl* control, id object) {
  if ([control target] == object) [control setTarget:nil];
  if (![control isKindOfClass:[NSTextField class]]) return;
  NSTextField* const field = static_cast<NSTextField*>(control);
  if ([field delegate] == object) [field setDelegate:nil];
}

}  // namespace

// Never destroyed: host objects may release their engines while the program exits.
Platform& Platform::shared() {
  static auto& platform = *new Platform;
  return platform;
}

Ref<toolkit::View> Platform::view(id object) {
  if (object) requireKind(object, [NSView class]);
  return application().view(object);
}

Ref<toolkit::Window> Platform::window(id object) {
  if (object) requireKind(object, [NSWindow class]);
  return application().window(object);
}

NSView* Platform::object(const Ref<toolkit::View>& view) {
  return [[application().object(view) retain] autorelease];
}

NSWindow* Platform::object(const Ref<toolkit::Window>& window) {
  return [[application().object(window) retain] autorelease];
}

void Platform::present(const std::shared_ptr<toolkit::Responder>& engine, id object) {
  application().present(engine, object);
}

void Platform::withdraw(const std::shared_ptr<toolkit::Responder>& engine, id object,
                        const Ref<toolkit::Window>& window) {
  application().present(engine, nil);
  NSWindow* const known = application().object(window);
  if ([known delegate] == object) [known setDelegate:nil];
  NSEnumerator* const views = [[[known contentView] subviews] objectEnumerator];
  while (NSView* const view = [views nextObject]) {
    if ([view isKindOfClass:[NSControl class]]) withdrawFrom(static_cast<NSControl*>(view), object);
  }
}

}  // namespace qz::hosts::appkit
