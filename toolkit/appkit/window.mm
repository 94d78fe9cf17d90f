// SPDX-License-Identifier: MIT
// Windows and sheets over `NSWindow`.

#import "toolkit/appkit/window.hpp"

#include <cmath>
#include <utility>

#import "toolkit/appkit/attributed_text.hpp"
#import "toolkit/appkit/calling.hpp"
#import "toolkit/appkit/view_node.hpp"

using qz::toolkit::appkit::AppKitWindow;

/// Tells a window that AppKit closes it.
@interface QZWindowWatch : NSObject {
 @private
  AppKitWindow* window_;  // its owner
}
- (id)initWithOwner:(AppKitWindow*)window;
- (void)forgetOwner;
@end

@implementation QZWindowWatch

- (id)initWithOwner:(AppKitWindow*)window {
  self = [super init];
  window_ = window;
  [[NSNotificationCenter defaultCenter] addObserver:self
                                           selector:@selector(windowWillClose:)
                                               name:NSWindowWillCloseNotification
                                             object:window->object()];
  return self;
}

- (void)forgetOwner {
  [[NSNotificationCenter defaultCenter] removeObserver:self];
  window_ = nullptr;
}

- (void)windowWillClose:(NSNotification*)notification {
  (void)notification;
  if (window_) window_->willClose();
}

@end

namespace qz::toolkit::appkit {

namespace {

/// The code of a sheet that the user has closed.
constexpr long cancelled = 0;

NSRect nsRect(const Rect& rect) { return NSMakeRect(rect.x, rect.y, rect.width, rect.height); }

Rect rectOf(const NSRect& rect) {
  return {rect.origin.x, rect.origin.y, rect.size.width, rect.size.height};
}

bool isNear(double a, double b) { return std::abs(a - b) < 1; }

}  // namespace

AppKitWindow::AppKitWindow(NSWindow* window, std::shared_ptr<Desk> desk, KeptBy keptBy)
    : object_(window), desk_(std::move(desk)), keptBy_(keptBy) {
  watch_ = foundation::Kept<id>::adopt([[QZWindowWatch alloc] initWithOwner:this]);
}

std::shared_ptr<AppKitWindow> AppKitWindow::make(NSWindow* window,
                                                 const std::shared_ptr<Desk>& desk, KeptBy keptBy) {
  std::shared_ptr<AppKitWindow> made(new AppKitWindow(window, desk, keptBy));
  desk->enter(window, made);
  return made;
}

std::shared_ptr<AppKitWindow> AppKitWindow::make(const Rect& content, StyleMask style,
                                                 BackingStore backing, bool defer,
                                                 const std::shared_ptr<Desk>& desk, KeptBy keptBy) {
  return calling([&] {
    NSWindow* const window =
        [[NSWindow alloc] initWithContentRect:nsRect(content)
                                    styleMask:static_cast<NSUInteger>(style)
                                      backing:static_cast<NSBackingStoreType>(backing)
                                        defer:defer];
    [window setReleasedWhenClosed:NO];
    auto made = make(window, desk, keptBy);
    [window release];
    made->asked_ = content;
    return made;
  });
}

AppKitWindow::~AppKitWindow() {
  const foundation::Pool pool;
  [watch_.get() forgetOwner];
  detach();
  desk_->forget(object());
  if (delegate_.made([object() delegate])) [object() setDelegate:nil];
  if (keptBy_ != KeptBy::host) [object() orderOut:nil];
  content_ = nullptr;
  object_ = {};
}

std::shared_ptr<AppKitWindow> AppKitWindow::of(const Ref<Window>& window) {
  return std::dynamic_pointer_cast<AppKitWindow>(window.pointer());
}

Ref<View> AppKitWindow::contentView() const {
  const foundation::Pool pool;
  NSView* const content = [object() contentView];
  const auto known = ViewNode::of(content_);
  if (!known || known->object() != content) {
    content_ = content ? desk_->nodeOf(content)->view() : Ref<View>();
  }
  return content_;
}

std::shared_ptr<Responder> AppKitWindow::delegate() const {
  return responderFor([object() delegate], desk_);
}

void AppKitWindow::setDelegate(const std::shared_ptr<Responder>& delegate) {
  const Stand stand(delegate, desk_);
  calling([&] { [object() setDelegate:stand.object()]; });
  delegate_ = stand;
}

void AppKitWindow::setBackgroundColor(const Color& color) {
  calling([&] {
    [object() setBackgroundColor:nsColor(color)];
    [[object() contentView] setNeedsDisplay:YES];
  });
  background_ = color;
}

Color AppKitWindow::backgroundColor() const {
  return background_.value_or(colorOf([object() backgroundColor]));
}

void AppKitWindow::makeKeyAndOrderFront() {
  if (keptBy_ == KeptBy::application) desk_->keep(shared_from_this());
  calling([&] { [object() makeKeyAndOrderFront:nil]; });
  for (const auto& other : desk_->windows()) {
    if (other->sheetParent().get() == this) other->makeKeyAndOrderFront();
  }
}

void AppKitWindow::orderOut() {
  const auto kept = shared_from_this();
  const auto parent = sheetParent();
  const foundation::Pool pool;
  detach();
  calling([&] { [object() orderOut:nil]; });
  desk_->letGo(*this);
  if (parent && [parent->object() isVisible]) calling([&] { [parent->object() makeKeyWindow]; });
}

// Closing counts once even if AppKit does not report it, as for a window that was closed before.
void AppKitWindow::close() {
  const auto kept = shared_from_this();
  const int before = closes_;
  isClosing_ = true;
  calling([&] { [object() close]; });
  isClosing_ = false;
  if (closes_ == before) ++closes_;
  orderOut();
}

void AppKitWindow::willClose() {
  const auto kept = shared_from_this();
  ++closes_;
  if (isClosing_) return;
  const bool wasSheet = place_ != nullptr;
  detach();
  desk_->letGo(*this);
  if (wasSheet) desk_->calls.make([this] { endAsSheet(cancelled); });
}

Rect AppKitWindow::content() const {
  const Rect now = rectOf([object() contentRectForFrameRect:[object() frame]]);
  const bool isAsAsked =
      asked_ && isNear(now.width, asked_->width) && isNear(now.height, asked_->height);
  return isAsAsked ? *asked_ : now;
}

void AppKitWindow::detach() {
  sheetParent_.reset();
  place_.reset();
}

void AppKitWindow::beginAsSheet(const std::shared_ptr<AppKitWindow>& parent,
                                const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo) {
  const foundation::Pool pool;
  detach();
  session_.begin(delegate, contextInfo);
  if (parent && !isAttachedTo(*this, parent)) {
    sheetParent_ = parent;
    place_ = std::make_unique<SheetPlace>(object(), parent->object());
  }
  makeKeyAndOrderFront();
}

void AppKitWindow::endAsSheet(long returnCode) { session_.end(shared_from_this(), returnCode); }

}  // namespace qz::toolkit::appkit
