// SPDX-License-Identifier: MIT
// The kinds of view: chooses the kind, sends actions, shows contents.

#import "toolkit/appkit/views.hpp"

#import "toolkit/appkit/images.hpp"
#import "toolkit/appkit/window.hpp"
#include "toolkit/backend/responder_chain.hpp"
#import "toolkit/foundation/strings.hpp"

namespace qz::toolkit::appkit {

using foundation::nsString;
using foundation::utf8;

namespace {

template <class V>
std::shared_ptr<ViewNode> make(NSView* view, const std::shared_ptr<Desk>& desk) {
  const auto node = std::make_shared<V>(view, desk);
  desk->enter(view, node);
  return node;
}

}  // namespace

std::shared_ptr<ViewNode> makeView(NSView* view, const std::shared_ptr<Desk>& desk) {
  if ([view isKindOfClass:[NSButton class]]) return make<AppKitButton>(view, desk);
  if ([view isKindOfClass:[NSTextField class]]) return make<AppKitTextField>(view, desk);
  if ([view isKindOfClass:[NSImageView class]]) return make<AppKitImageView>(view, desk);
  if ([view isKindOfClass:[NSControl class]]) return make<AppKitOtherControl>(view, desk);
  return make<AppKitView<View>>(view, desk);
}

ControlNode::~ControlNode() {
  if (target_.made([control() target])) [control() setTarget:nil];
}

std::string ControlNode::action() const {
  const foundation::Pool pool;
  const SEL action = [control() action];
  return action ? utf8(NSStringFromSelector(action)) : "";
}

void ControlNode::aim(const std::shared_ptr<Responder>& target) {
  Stand stand(target, desk_);
  calling([&] { [control() setTarget:stand.object()]; });
  target_ = stand;
}

bool ControlNode::send(std::string_view action, const std::shared_ptr<Responder>& target) {
  const auto kept = shared_from_this();
  const ResponderPlaces places{
      .superviewOf = [](const Ref<View>& view) { return of(view)->superview(); },
      .window = [&]() -> Ref<Window> { return desk_->knownWindow([object() window]); }};
  selectorOf(action);
  return calling([&] { return sendAlongResponderChain(action, target, view(), places); });
}

bool AppKitButton::isPopUp() const { return [object() isKindOfClass:[NSPopUpButton class]]; }

// The title of a pop-up button is that of the chosen item.
NSString* AppKitButton::shownTitle() const {
  return isPopUp() ? [static_cast<NSPopUpButton*>(button()) titleOfSelectedItem] : [button() title];
}

// AppKit does not say whether a title has attributes. The text tells whether the host has set
// another title since.
std::optional<AttributedString> AppKitButton::attributedTitle() const {
  return calling([&]() -> std::optional<AttributedString> {
    const std::string shown = utf8(shownTitle());
    if (title_ && title_->string() == shown) return title_;
    if (isPopUp()) return AttributedString(shown);
    return attributedStringOf([button() attributedTitle], look());
  });
}

TextLook AppKitButton::look() const {
  NSFont* const font = [button() font];
  return {font ? font : [NSFont systemFontOfSize:0], [NSColor controlTextColor],
          TextAlignment::center};
}

void AppKitButton::show(const AttributedString& title) {
  calling([&] {
    title_ = title;
    if (isPlain(title) || isPopUp()) {
      [button() setTitle:nsString(title.string())];
    } else {
      [button() setAttributedTitle:nsAttributedString(title, look())];
    }
  });
}

void AppKitButton::setTitle(std::string_view title) { show(AttributedString(std::string(title))); }

void AppKitButton::setAttributedTitle(const AttributedString& title) { show(title); }

bool AppKitButton::showsState() const {
  return [static_cast<NSButtonCell*>([button() cell]) showsStateBy] != NSNoCellMask;
}

State AppKitButton::state() const {
  return showsState() ? static_cast<State>([button() state]) : heldState_;
}

void AppKitButton::setState(State state) {
  calling([&] { [button() setState:static_cast<NSInteger>(state)]; });
  heldState_ = static_cast<State>([button() state]);
}

void AppKitButton::highlight(bool highlighted) {
  calling([&] { [button() highlight:highlighted]; });
}

void AppKitButton::setBackgroundColor(const Color& color) {
  calling([&] {
    [static_cast<NSButtonCell*>([button() cell]) setBackgroundColor:nsColor(color)];
#ifdef GNUSTEP
    [button() setBordered:NO];  // GNUstep's bezels cover the colour
#endif
    [button() setNeedsDisplay:YES];
    background_ = color;
  });
}

void AppKitButton::setBezelStyle(BezelStyle style) {
  calling([&] { [button() setBezelStyle:static_cast<NSBezelStyle>(style)]; });
}

AppKitTextField::~AppKitTextField() {
  if (delegate_.made([field() delegate])) [field() setDelegate:nil];
}

TextLook AppKitTextField::look() const {
  NSFont* const font = [field() font];
  return {font ? font : [NSFont systemFontOfSize:0], [field() textColor], TextAlignment::natural};
}

AttributedString AppKitTextField::value() const {
  return calling([&] {
    const std::string text = utf8([field() stringValue]);
    return text == value_.string() ? value_ : AttributedString(text);
  });
}

void AppKitTextField::setValue(const AttributedString& value) {
  value_ = value;
  if (isPlain(value)) {
    [field() setStringValue:nsString(value.string())];
  } else {
    [field() setAttributedStringValue:nsAttributedString(value, look())];
  }
}

void AppKitTextField::setDelegate(const std::shared_ptr<Responder>& delegate) {
  const Stand stand(delegate, desk_);
  calling([&] { [field() setDelegate:stand.object()]; });
  delegate_ = stand;
}

void AppKitImageView::setImage(const Ref<Image>& image) {
  calling([&] { [imageView() setImage:AppKitImage::objectOf(image)]; });
  image_ = image;
}

void AppKitImageView::setImageFrameStyle(ImageFrameStyle) {
  calling([&] { [imageView() setImageFrameStyle:NSImageFrameNone]; });
}

void AppKitImageView::setImageScaling(ImageScaling) {
  calling([&] { [imageView() setImageScaling:NSImageScaleProportionallyDown]; });
}

void AppKitImageView::setImageAlignment(ImageAlignment) {
  calling([&] { [imageView() setImageAlignment:NSImageAlignCenter]; });
}

Ref<Image> AppKitImageView::image() const {
  NSImage* const shown = [imageView() image];
  if (!shown || shown == AppKitImage::objectOf(image_)) return shown ? image_ : Ref<Image>();
  return std::make_shared<AppKitImage>(utf8([shown name]), "", shown);
}

void AppKitOtherControl::setEnabled(bool enabled) {
  calling([&] { [control() setEnabled:enabled]; });
}

void AppKitOtherControl::setAction(std::string_view action) {
  calling([&] { [control() setAction:selectorOf(action)]; });
}

std::string AppKitOtherControl::stringValue() const {
  return calling([&] { return utf8([control() stringValue]); });
}

void AppKitOtherControl::setStringValue(std::string_view text) {
  calling([&] { [control() setStringValue:nsString(text)]; });
}

void AppKitOtherControl::setAttributedStringValue(const AttributedString& text) {
  const TextLook look{[NSFont systemFontOfSize:0], nil, TextAlignment::natural};
  calling([&] { [control() setAttributedStringValue:nsAttributedString(text, look)]; });
}

}  // namespace qz::toolkit::appkit
