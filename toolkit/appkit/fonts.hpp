// SPDX-License-Identifier: MIT
// The AppKit toolkit's fonts: the families of the desktop, and the classic names that scripts use.
#pragma once

#import <AppKit/AppKit.h>

#include "qz/styled_text/fonts.hpp"

namespace qz::toolkit::appkit {

class AppKitFonts final : public Fonts {
 public:
  /// Knows the desktop's families, and Times, Helvetica, Courier, Arial, Georgia and Verdana, which
  /// another family replaces where one is missing.
  std::optional<Font> fontWithName(std::string_view name, double size) const override;
};

/// Returns the font to draw with: of the family itself or of its substitute.
NSFont* nsFont(const Font& font);
/// Returns what the toolkit interface says of `font`.
Font fontOf(NSFont* font);

}  // namespace qz::toolkit::appkit
