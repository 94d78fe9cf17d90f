// SPDX-License-Identifier: MIT
// Fonts by name: the catalogue, and the names that are understood.

#include "toolkit/memory/fonts.hpp"

#include <gtest/gtest.h>

#include <limits>

#include "toolkit/backend/font_names.hpp"

namespace qz::toolkit::memory {
namespace {

const MemoryFonts fonts;

TEST(MemoryFonts, NamesAreUnderstood) {
  const struct {
    const char* name;
    Font font;
  } cases[] = {
      {"Times", {"Times", 12, false, false, false}},
      {"times", {"Times", 12, false, false, false}},
      {"Times-Roman", {"Times", 12, false, false, false}},
      {"Times-Bold", {"Times", 12, true, false, false}},
      {"Times-Italic", {"Times", 12, false, true, false}},
      {"Times-BoldItalic", {"Times", 12, true, true, false}},
      {"Helvetica", {"Helvetica", 12, false, false, false}},
      {"Helvetica-Bold", {"Helvetica", 12, true, false, false}},
      {"Helvetica-Oblique", {"Helvetica", 12, false, true, false}},
      {"Helvetica-BoldOblique", {"Helvetica", 12, true, true, false}},
      {"Courier", {"Courier", 12, false, false, true}},
      {"Courier-BoldOblique", {"Courier", 12, true, true, true}},
      {"Courier New", {"Courier New", 12, false, false, true}},
      {"CourierNewPSMT", {"Courier New", 12, false, false, true}},
      {"CourierNewPS-BoldItalicMT", {"Courier New", 12, true, true, true}},
      {"Arial", {"Arial", 12, false, false, false}},
      {"ArialMT", {"Arial", 12, false, false, false}},
      {"Arial-BoldMT", {"Arial", 12, true, false, false}},
      {"Arial-ItalicMT", {"Arial", 12, false, true, false}},
      {"Times New Roman", {"Times New Roman", 12, false, false, false}},
      {"TimesNewRomanPSMT", {"Times New Roman", 12, false, false, false}},
      {"TimesNewRomanPS-BoldMT", {"Times New Roman", 12, true, false, false}},
      {"Georgia-BoldItalic", {"Georgia", 12, true, true, false}},
      {"Verdana-Bold", {"Verdana", 12, true, false, false}},
      {"LucidaGrande-Bold", {"Lucida Grande", 12, true, false, false}},
      {"Lucida Grande", {"Lucida Grande", 12, false, false, false}},
      {"Menlo-Regular", {"Menlo", 12, false, false, true}},
      {"Monaco", {"Monaco", 12, false, false, true}},
  };
  for (const auto& c : cases) EXPECT_EQ(fonts.fontWithName(c.name, 12), c.font) << c.name;
}

TEST(MemoryFonts, OtherNamesAreUnknown) {
  for (const char* const name : {"", " ", "-", "-Bold", "Nonesuch", "Nonesuch-Bold", "Times-",
                                 "Times-Heavy", "Times-Bold-Italic", "Bold", "Tim", "MT", "PSMT"}) {
    EXPECT_EQ(fonts.fontWithName(name, 12), std::nullopt) << name;
  }
}

TEST(MemoryFonts, ASizeNotAboveZeroIsTheDefaultSize) {
  const struct {
    double asked, given;
  } cases[] = {{0, 12},    {-0.0, 12}, {-3, 12}, {std::numeric_limits<double>::quiet_NaN(), 12},
               {0.5, 0.5}, {12, 12},   {72, 72}, {1e6, 1e6}};
  for (const auto& c : cases) EXPECT_EQ(fonts.fontWithName("Times", c.asked)->size, c.given);
}

// A family name may look like the PostScript name of another family.
TEST(FontNames, TheWholeNameOfAFamilyComesFirst) {
  const FontFamily families[] = {{"Gill Sans", false}, {"Gill Sans MT", false}, {"A-Bold", true}};
  const struct {
    const char* name;
    Font font;
  } cases[] = {
      {"Gill Sans MT", {"Gill Sans MT", 9, false, false, false}},
      {"GillSansMT-Italic", {"Gill Sans MT", 9, false, true, false}},
      {"GillSans-Italic", {"Gill Sans", 9, false, true, false}},
      {"A-Bold", {"A-Bold", 9, false, false, true}},
      {"A-Bold-Bold", {"A-Bold", 9, true, false, true}},
  };
  for (const auto& c : cases) EXPECT_EQ(fontNamed(c.name, 9, families), c.font) << c.name;
  EXPECT_EQ(fontNamed("Gill Sans", 9, {}), std::nullopt);
}

}  // namespace
}  // namespace qz::toolkit::memory
