// SPDX-License-Identifier: MIT
// All engines share one toolkit, so that a control has one view, whichever engine uses it.

#import "hosts/appkit/appkit_platform.hpp"

#import <AppKit/AppKit.h>

#import "hosts/appkit/arguments.hpp"
#include "qz/toolkit/appkit/appkit_toolkit.hpp"

namespace qz::hosts::appkit {

namespace {

using toolkit::Ref;

class AppKitPlatform final : public Platform {
 public:
  toolkit::Toolkit& toolkit() override { return toolkit_; }

  Ref<toolkit::View> view(id object) override {
    if (object) requireKind(object, [NSView class]);
    return application().view(object);
  }
  Ref<toolkit::Window> window(id object) override {
    if (object) requireKind(object, [NSWindow class]);
    return application().window(object);
  }
  id object(const Ref<toolkit::View>& view) override {
    return [[application().object(view) retain] autorelease];
  }
  id object(const Ref<toolkit::Window>& window) override {
    return [[application().object(window) retain] autorelease];
  }

  void present(const std::shared_ptr<toolkit::Responder>& engine, id object) override {
    application().present(engine, object);
  }
  void withdraw(const std::shared_ptr<toolkit::Responder>& engine, id object,
                const Ref<toolkit::Window>& window) override;

 private:
  toolkit::appkit::AppKitApplication& application() { return toolkit_.application(); }

  toolkit::appkit::AppKitToolkit toolkit_;
};

void withdrawFrom(NSControl* control, id object) {
  if ([control target] == object) [control setTarget:nil];
  if (![control isKindOfClass:[NSTextField class]]) return;
  NSTextField* const field = static_cast<NSTextField*>(control);
  if ([field delegate] == object) [field setDelegate:nil];
}

void AppKitPlatform::withdraw(const std::shared_ptr<toolkit::Responder>& engine, id object,
                              const Ref<toolkit::Window>& window) {
  application().present(engine, nil);
  NSWindow* const known = application().object(window);
  if ([known delegate] == object) [known setDelegate:nil];
  NSEnumerator* const views = [[[known contentView] subviews] objectEnumerator];
  while (NSView* const view = [views nextObject]) {
    if ([view isKindOfClass:[NSControl class]]) withdrawFrom(static_cast<NSControl*>(view), object);
  }
}

}  // namespace

// Never destroyed: host objects may release their engines while the program exits.
Platform& appKitPlatform() {
  static auto& platform = *new AppKitPlatform;
  return platform;
}

}  // namespace qz::hosts::appkit
