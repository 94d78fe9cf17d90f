// SPDX-License-Identifier: MIT
// The AppKit toolkit: gives access to its parts, and reads HTML.

#include "qz/toolkit/appkit/appkit_toolkit.hpp"

#import "toolkit/appkit/attributed_text.hpp"
#import "toolkit/appkit/calling.hpp"
#import "toolkit/appkit/parts.hpp"

namespace qz::toolkit::appkit {

AppKitToolkit::AppKitToolkit() : parts_(std::make_unique<Parts>()) {}
AppKitToolkit::AppKitToolkit(Clock& clock) : parts_(std::make_unique<Parts>(clock)) {}
AppKitToolkit::~AppKitToolkit() = default;

AppKitApplication& AppKitToolkit::application() { return parts_->application; }
RunLoop& AppKitToolkit::runLoop() { return parts_->runLoop; }
Images& AppKitToolkit::images() { return parts_->images; }
Fonts& AppKitToolkit::fonts() { return parts_->fonts; }
AppKitFiles& AppKitToolkit::files() { return parts_->files; }
AppKitLog& AppKitToolkit::log() { return parts_->log; }
Calls& AppKitToolkit::calls() { return parts_->application.desk()->calls; }

// GNUstep's reader yields nothing.
std::optional<AttributedString> AppKitToolkit::attributedStringWithHTML(std::string_view document) {
#ifndef GNUSTEP
  const auto read = calling([&]() -> std::optional<AttributedString> {
    NSData* const data = [NSData dataWithBytes:document.data() length:document.size()];
    NSAttributedString* const string = [[[NSAttributedString alloc] initWithHTML:data
                                                              documentAttributes:NULL] autorelease];
    return string ? std::optional(attributedStringOf(string)) : std::nullopt;
  });
  if (read) return read;
#endif
  return Toolkit::attributedStringWithHTML(document);
}

}  // namespace qz::toolkit::appkit
