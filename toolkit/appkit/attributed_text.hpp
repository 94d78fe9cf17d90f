// SPDX-License-Identifier: MIT
// Attributed strings and colours between the toolkit interface and AppKit.
#pragma once

#import <AppKit/AppKit.h>

#include "qz/styled_text/attributed_string.hpp"

namespace qz::toolkit::appkit {

/// What text without attributes looks like in a control.
struct TextLook {
  NSFont* font;
  NSColor* color;  // nil: AppKit's default
  TextAlignment alignment;
};

/// Returns the text as AppKit's, autoreleased. The control's look completes the attributes.
NSAttributedString* nsAttributedString(const AttributedString& text, const TextLook& look);
/// Returns the text of `string` with the attributes that the toolkit interface knows. Attributes
/// that say only what `look` says are left out.
AttributedString attributedStringOf(NSAttributedString* string, const TextLook& look);
/// The same with all attributes.
AttributedString attributedStringOf(NSAttributedString* string);

NSColor* nsColor(const Color& color);
/// Returns the colour in sRGB; black for a colour that has no components.
Color colorOf(NSColor* color);

/// Whether no run has an attribute.
bool isPlain(const AttributedString& text);

}  // namespace qz::toolkit::appkit
