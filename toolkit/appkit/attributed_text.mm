// SPDX-License-Identifier: MIT
// Conversions of styled text, run by run.

#import "toolkit/appkit/attributed_text.hpp"

#include <algorithm>

#import "toolkit/appkit/fonts.hpp"
#import "toolkit/foundation/strings.hpp"

namespace qz::toolkit::appkit {

namespace {

using foundation::nsString;
using foundation::utf8;

struct AlignmentPair {
  TextAlignment alignment;
  NSTextAlignment native;
};

// AppKit's numbers are not the same everywhere.
const AlignmentPair alignments[] = {
    {TextAlignment::left, NSLeftTextAlignment},
    {TextAlignment::right, NSRightTextAlignment},
    {TextAlignment::center, NSCenterTextAlignment},
    {TextAlignment::justified, NSJustifiedTextAlignment},
    {TextAlignment::natural, NSNaturalTextAlignment},
};

NSTextAlignment nativeAlignment(TextAlignment alignment) {
  const auto* const found =
      std::find_if(std::begin(alignments), std::end(alignments),
                   [&](const AlignmentPair& pair) { return pair.alignment == alignment; });
  return found->native;
}

TextAlignment alignmentOf(NSTextAlignment native) {
  const auto* const found =
      std::find_if(std::begin(alignments), std::end(alignments),
                   [&](const AlignmentPair& pair) { return pair.native == native; });
  return found == std::end(alignments) ? TextAlignment::natural : found->alignment;
}

NSParagraphStyle* nsParagraphStyle(const ParagraphStyle& style) {
  NSMutableParagraphStyle* const native = [[[NSMutableParagraphStyle alloc] init] autorelease];
  [native setAlignment:nativeAlignment(style.alignment)];
  [native setFirstLineHeadIndent:style.firstLineHeadIndent];
  [native setHeadIndent:style.headIndent];
  return native;
}

ParagraphStyle paragraphStyleOf(NSParagraphStyle* style) {
  return {.alignment = alignmentOf([style alignment]),
          .firstLineHeadIndent = [style firstLineHeadIndent],
          .headIndent = [style headIndent]};
}

NSDictionary* nsAttributes(const TextAttributes& attributes, const TextLook& look) {
  NSMutableDictionary* const native = [NSMutableDictionary dictionary];
  NSNumber* const one = [NSNumber numberWithInt:1];
  NSColor* const color =
      attributes.foregroundColor ? nsColor(*attributes.foregroundColor) : look.color;
  [native setObject:attributes.font ? nsFont(*attributes.font) : look.font
             forKey:NSFontAttributeName];
  if (color) [native setObject:color forKey:NSForegroundColorAttributeName];
  if (attributes.backgroundColor) {
    [native setObject:nsColor(*attributes.backgroundColor) forKey:NSBackgroundColorAttributeName];
  }
  const ParagraphStyle style =
      attributes.paragraphStyle.value_or(ParagraphStyle{.alignment = look.alignment});
  [native setObject:nsParagraphStyle(style) forKey:NSParagraphStyleAttributeName];
  if (attributes.link) {
    [native setObject:nsString(attributes.link->address()) forKey:NSLinkAttributeName];
  }
  if (attributes.underline) [native setObject:one forKey:NSUnderlineStyleAttributeName];
  if (attributes.strikethrough) [native setObject:one forKey:NSStrikethroughStyleAttributeName];
  if (attributes.superscript != 0) {
    [native setObject:[NSNumber numberWithInt:attributes.superscript]
               forKey:NSSuperscriptAttributeName];
  }
  return native;
}

std::string addressOf(id link) {
  return utf8([link isKindOfClass:[NSURL class]] ? [link absoluteString] : [link description]);
}

TextAttributes attributesOf(NSDictionary* native) {
  TextAttributes attributes;
  if (NSFont* const font = [native objectForKey:NSFontAttributeName]) {
    attributes.font = fontOf(font);
  }
  if (NSColor* const color = [native objectForKey:NSForegroundColorAttributeName]) {
    attributes.foregroundColor = colorOf(color);
  }
  if (NSColor* const color = [native objectForKey:NSBackgroundColorAttributeName]) {
    attributes.backgroundColor = colorOf(color);
  }
  if (NSParagraphStyle* const style = [native objectForKey:NSParagraphStyleAttributeName]) {
    attributes.paragraphStyle = paragraphStyleOf(style);
  }
  if (const id link = [native objectForKey:NSLinkAttributeName]) attributes.link = addressOf(link);
  attributes.underline = [[native objectForKey:NSUnderlineStyleAttributeName] intValue] != 0;
  attributes.strikethrough =
      [[native objectForKey:NSStrikethroughStyleAttributeName] intValue] != 0;
  attributes.superscript = [[native objectForKey:NSSuperscriptAttributeName] intValue];
  return attributes;
}

TextAttributes without(TextAttributes attributes, const TextLook& look) {
  if (attributes.font == fontOf(look.font)) attributes.font.reset();
  if (look.color && attributes.foregroundColor == colorOf(look.color)) {
    attributes.foregroundColor.reset();
  }
  if (attributes.paragraphStyle == ParagraphStyle{.alignment = look.alignment}) {
    attributes.paragraphStyle.reset();
  }
  return attributes;
}

template <class Change>
AttributedString converted(NSAttributedString* string, Change change) {
  AttributedString text;
  for (NSUInteger at = 0; at < [string length];) {
    NSRange range;
    NSDictionary* const native = [string attributesAtIndex:at effectiveRange:&range];
    text.append(utf8([[string string] substringWithRange:range]), change(attributesOf(native)));
    at = NSMaxRange(range);
  }
  return text;
}

}  // namespace

NSAttributedString* nsAttributedString(const AttributedString& text, const TextLook& look) {
  NSMutableAttributedString* const native = [[[NSMutableAttributedString alloc] init] autorelease];
  const std::string_view whole = text.string();
  for (const TextRun& run : text.runs()) {
    NSString* const part = nsString(whole.substr(run.range.location, run.range.length));
    NSAttributedString* const styled =
        [[NSAttributedString alloc] initWithString:part
                                        attributes:nsAttributes(run.attributes, look)];
    [native appendAttributedString:styled];
    [styled release];
  }
  return native;
}

AttributedString attributedStringOf(NSAttributedString* string, const TextLook& look) {
  return converted(string,
                   [&](const TextAttributes& attributes) { return without(attributes, look); });
}

AttributedString attributedStringOf(NSAttributedString* string) {
  return converted(string, [](const TextAttributes& attributes) { return attributes; });
}

NSColor* nsColor(const Color& color) {
  return [NSColor colorWithSRGBRed:color.red green:color.green blue:color.blue alpha:color.alpha];
}

Color colorOf(NSColor* color) {
  NSColor* const rgb = [color colorUsingColorSpaceName:NSCalibratedRGBColorSpace];
  if (!rgb) return {};
  return {[rgb redComponent], [rgb greenComponent], [rgb blueComponent], [rgb alphaComponent]};
}

bool isPlain(const AttributedString& text) {
  return std::all_of(text.runs().begin(), text.runs().end(),
                     [](const TextRun& run) { return run.attributes == TextAttributes{}; });
}

}  // namespace qz::toolkit::appkit
