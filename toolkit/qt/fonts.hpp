// SPDX-License-Identifier: MIT
// The Qt toolkit's fonts: the families of the desktop, and the classic names that scripts use.
//
// A point of the interface is a pixel of Qt's geometry, because text must fit into frames measured
// in points. Fonts are therefore requested in pixels, whatever resolution the desktop reports.
#pragma once

#include <QFont>
#include <QString>

#include "qz/styled_text/fonts.hpp"
#include "toolkit/backend/font_names.hpp"

namespace qz::toolkit::qt {

class QtFonts final : public Fonts {
 public:
  /// Knows the desktop's families, and Times, Helvetica, Courier, Arial, Georgia and Verdana; if
  /// one of these is missing, a metric-compatible or similar family replaces it. Requires an
  /// application object.
  std::optional<Font> fontWithName(std::string_view name, double size) const override;
};

/// Returns the font to draw with: the family itself or its substitute.
QFont qFont(const Font& font);
/// Returns the name of that family, without making a font.
QString drawnFamily(const Font& font);
int pixelSize(const Font& font);

}  // namespace qz::toolkit::qt
