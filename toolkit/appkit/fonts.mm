// SPDX-License-Identifier: MIT
// The families that replace the classic ones, which are missing outside macOS. The first of each
// row is metric-compatible, so that lines break where the script's author saw them break.

#import "toolkit/appkit/fonts.hpp"

#include <algorithm>
#include <array>
#include <map>
#include <string>
#include <unordered_map>
#include <vector>

#import "toolkit/appkit/calling.hpp"
#include "toolkit/backend/font_names.hpp"
#import "toolkit/foundation/strings.hpp"

namespace qz::toolkit::appkit {

namespace {

struct ClassicFamily {
  std::string_view name;
  bool fixedPitch;
  std::array<std::string_view, 2> standIns;
};

constexpr ClassicFamily classicFamilies[] = {
    {"Times", false, {"Liberation Serif", "DejaVu Serif"}},
    {"Times New Roman", false, {"Liberation Serif", "DejaVu Serif"}},
    {"Helvetica", false, {"Liberation Sans", "DejaVu Sans"}},
    {"Arial", false, {"Liberation Sans", "DejaVu Sans"}},
    {"Courier", true, {"Liberation Mono", "DejaVu Sans Mono"}},
    {"Courier New", true, {"Liberation Mono", "DejaVu Sans Mono"}},
    {"Georgia", false, {"Gelasio", "DejaVu Serif"}},
    {"Verdana", false, {"DejaVu Sans", "Liberation Sans"}},
};

/// Caches AppKit's answers, each of which can take longer than a whole command list.
class Families {
 public:
  static Families& known() {
    static auto& families = *new Families;
    return families;
  }

  std::optional<Font> fontNamed(std::string_view name) {
    const auto known = named_.find(name);
    if (known != named_.end()) return known->second;
    const auto font = toolkit::fontNamed(name, 0, families_);
    if (font) named_.emplace(name, *font);
    return font;
  }

  NSString* drawnWith(const std::string& family) const {
    const auto found = drawn_.find(family);
    return foundation::nsString(found == drawn_.end() ? family : found->second);
  }

 private:
  Families() {
    NSEnumerator* const all =
        [[[NSFontManager sharedFontManager] availableFontFamilies] objectEnumerator];
    while (NSString* const name = [all nextObject]) {
      families_.push_back({foundation::utf8(name), isFixedPitch(name)});
    }
    for (const ClassicFamily& classic : classicFamilies) add(classic);
  }

  static bool isFixedPitch(NSString* family) {
    NSFont* const font = [[NSFontManager sharedFontManager] fontWithFamily:family
                                                                    traits:0
                                                                    weight:5
                                                                      size:12];
    return [font isFixedPitch];
  }

  bool has(std::string_view name) const {
    return std::any_of(families_.begin(), families_.end(),
                       [&](const FontFamily& family) { return family.name == name; });
  }

  void add(const ClassicFamily& classic) {
    if (has(classic.name)) return;
    const auto found = std::find_if(classic.standIns.begin(), classic.standIns.end(),
                                    [&](std::string_view standIn) { return has(standIn); });
    if (found != classic.standIns.end()) drawn_.emplace(classic.name, *found);
    families_.push_back({std::string(classic.name), classic.fixedPitch});
  }

  std::vector<FontFamily> families_;
  std::unordered_map<std::string, std::string> drawn_;  // the substitute of a missing family
  std::map<std::string, Font, std::less<>> named_;
};

NSFontTraitMask traitsOf(const Font& font) {
  const unsigned bold = font.bold ? NSBoldFontMask : 0;
  const unsigned italic = font.italic ? NSItalicFontMask : 0;
  return static_cast<NSFontTraitMask>(bold | italic);
}

}  // namespace

std::optional<Font> AppKitFonts::fontWithName(std::string_view name, double size) const {
  auto font = calling([&] { return Families::known().fontNamed(name); });
  if (font && size > 0) font->size = size;
  return font;
}

NSFont* nsFont(const Font& font) {
  // GNUstep draws no text any more, in any font, after a size that it cannot draw.
  const double size = std::clamp(font.size, 1.0, 1000.0);
  constexpr NSInteger regular = 5;
  constexpr NSInteger bold = 9;
  NSFont* const drawn =
      [[NSFontManager sharedFontManager] fontWithFamily:Families::known().drawnWith(font.family)
                                                 traits:traitsOf(font)
                                                 weight:font.bold ? bold : regular
                                                   size:static_cast<float>(size)];
  return drawn ? drawn : [NSFont userFontOfSize:size];
}

Font fontOf(NSFont* font) {
  const NSFontTraitMask traits = [[NSFontManager sharedFontManager] traitsOfFont:font];
  return {.family = foundation::utf8([font familyName]),
          .size = [font pointSize],
          .bold = (traits & NSBoldFontMask) != 0,
          .italic = (traits & NSItalicFontMask) != 0,
          .fixedPitch = static_cast<bool>([font isFixedPitch])};
}

}  // namespace qz::toolkit::appkit
