// SPDX-License-Identifier: MIT
// The Qt toolkit's fonts: the families of the desktop, and the classic names that scripts use.
//
// A point of the interface is a pixel of Qt's geometry, for text has to fit into frames that are
// measured in points; fonts are asked for in pixels, whatever resolution the desktop claims.
#pragma once

#include <QFont>
#include <QString>

#include "toolkit/font_names.hpp"
#include "toolkit/styled_text/fonts.hpp"

namespace toolkit::qt {

class QtFonts final : public Fonts {
 public:
  /// Known are the families that the desktop has, and Times, Helvetica, Courier, Arial, Georgia and
  /// Verdana, with which metric-compatible or similar families stand in where they are missing.
  /// Asked while there is an application object.
  std::optional<Font> fontWithName(std::string_view name, double size) const override;
};

/// The font to draw with: the family itself, or what stands in for it.
QFont qFont(const Font& font);
/// The same in words, without making a font.
QString drawnFamily(const Font& font);
int pixelSize(const Font& font);

}  // namespace toolkit::qt
