// SPDX-License-Identifier: MIT
// The fonts that the Qt toolkit knows, and the fonts that it draws them with.

#include "toolkit/qt/fonts.hpp"

#include <gtest/gtest.h>

#include <QFontDatabase>
#include <QFontInfo>

#include "toolkit/qt/strings.hpp"

namespace qz {

namespace {

using toolkit::Font;
using toolkit::qt::qFont;
using toolkit::qt::QtFonts;

TEST(QtFonts, KnowTheClassicNamesInAllTheirForms) {
  struct Case {
    const char* name;
    Font font;
    const char* drawnWith;
  };
  const Case cases[] = {
      {"Times", {"Times", 14}, "Liberation Serif"},
      {"Times-Bold", {"Times", 14, true}, "Liberation Serif"},
      {"Times-BoldItalic", {"Times", 14, true, true}, "Liberation Serif"},
      {"Helvetica", {"Helvetica", 14}, "Liberation Sans"},
      {"Helvetica-Oblique", {"Helvetica", 14, false, true}, "Liberation Sans"},
      {"Arial-Bold", {"Arial", 14, true}, "Liberation Sans"},
      {"Courier-Bold", {"Courier", 14, true, false, true}, "Liberation Mono"},
      {"Georgia-Italic", {"Georgia", 14, false, true}, nullptr},
      {"Verdana", {"Verdana", 14}, nullptr},
  };
  const QtFonts fonts;
  for (const Case& test : cases) {
    SCOPED_TRACE(test.name);
    const auto font = fonts.fontWithName(test.name, 14);
    ASSERT_TRUE(font);
    EXPECT_EQ(*font, test.font);
    const QFontInfo drawn(qFont(*font));
    if (test.drawnWith) {
      EXPECT_EQ(drawn.family().toStdString(), test.drawnWith);
    }
    EXPECT_EQ(drawn.pixelSize(), 14);
    EXPECT_EQ(drawn.bold(), test.font.bold);
    EXPECT_EQ(drawn.italic(), test.font.italic);
  }
}

TEST(QtFonts, KnowTheFamiliesOfTheDesktopAndNoOthers) {
  const QtFonts fonts;
  for (const QString& family : QFontDatabase::families()) {
    const std::string name = toolkit::qt::utf8(family);
    ASSERT_TRUE(fonts.fontWithName(name, 9)) << name;
  }
  for (const char* name : {"No Such Family", "", "-Bold", "Times-Heavy"}) {
    EXPECT_FALSE(fonts.fontWithName(name, 9)) << name;
  }
}

TEST(QtFonts, TakeSizeZeroForTheDefault) {
  EXPECT_EQ(QtFonts().fontWithName("Times", 0)->size, toolkit::defaultFontSize);
}

TEST(QtFonts, TellFixedPitchFamiliesOfTheDesktop) {
  EXPECT_TRUE(QtFonts().fontWithName("Liberation Mono", 12)->fixedPitch);
  EXPECT_FALSE(QtFonts().fontWithName("Liberation Serif", 12)->fixedPitch);
}

}  // namespace

}  // namespace qz
