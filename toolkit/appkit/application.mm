// SPDX-License-Identifier: MIT
// Makes windows and controls, and passes sheet calls on to their windows.

#include "qz/toolkit/appkit/application.hpp"

#import "toolkit/appkit/calling.hpp"
#import "toolkit/appkit/desk.hpp"
#import "toolkit/appkit/views.hpp"
#import "toolkit/appkit/window.hpp"

namespace qz::toolkit::appkit {

namespace {

template <class ViewClass>
Ref<View> made(const Rect& frame, const std::shared_ptr<Desk>& desk) {
  return calling([&] {
    const auto node = desk->nodeOf([[[ViewClass alloc] initWithFrame:NSZeroRect] autorelease]);
    node->place(frame);
    return node->view();
  });
}

}  // namespace

AppKitApplication::AppKitApplication(Log& log) : desk_(std::make_shared<Desk>(log)) {}
AppKitApplication::~AppKitApplication() { desk_->letAllGo(); }

Ref<Window> AppKitApplication::makeWindow(const Rect& content, StyleMask style,
                                          BackingStore backing, bool defer) {
  return AppKitWindow::make(content, style, backing, defer, desk_, KeptBy::application);
}

Ref<Button> AppKitApplication::makeButton(const Rect& frame) {
  return asButton(made<NSButton>(frame, desk_));
}

Ref<ImageView> AppKitApplication::makeImageView(const Rect& frame) {
  return asImageView(made<NSImageView>(frame, desk_));
}

Ref<TextField> AppKitApplication::makeTextField(const Rect& frame) {
  return asTextField(made<NSTextField>(frame, desk_));
}

void AppKitApplication::beginSheet(const Ref<Window>& sheet, const Ref<Window>& parent,
                                   const std::shared_ptr<SheetDelegate>& delegate,
                                   void* contextInfo) {
  if (const auto window = AppKitWindow::of(sheet)) {
    window->beginAsSheet(AppKitWindow::of(parent), delegate, contextInfo);
  }
}

void AppKitApplication::endSheet(const Ref<Window>& sheet, long returnCode) {
  if (const auto window = AppKitWindow::of(sheet)) window->endAsSheet(returnCode);
}

Ref<Window> AppKitApplication::window(NSWindow* window) {
  return window ? Ref<Window>(desk_->windowOf(window)) : Ref<Window>();
}

Ref<View> AppKitApplication::view(NSView* view) {
  return view ? desk_->nodeOf(view)->view() : Ref<View>();
}

NSWindow* AppKitApplication::object(const Ref<Window>& window) const {
  const auto known = AppKitWindow::of(window);
  return known ? known->object() : nil;
}

NSView* AppKitApplication::object(const Ref<View>& view) const {
  const auto node = ViewNode::of(view);
  return node ? node->object() : nil;
}

void AppKitApplication::present(const std::shared_ptr<Responder>& responder, void* object) {
  desk_->present(responder, static_cast<id>(object));
}

}  // namespace qz::toolkit::appkit
