// SPDX-License-Identifier: MIT
// Fonts that a program adds while it runs.

#include <gtest/gtest.h>

#include <QDirIterator>
#include <QFile>
#include <QFontDatabase>
#include <QStandardPaths>

#include "toolkit/qt/fonts.hpp"

namespace qz {

namespace {

using toolkit::qt::QtFonts;

/// Returns the contents of the desktop's font file of this name; empty if there is none.
QByteArray fontFile(const QString& name) {
  for (const QString& directory :
       QStandardPaths::standardLocations(QStandardPaths::FontsLocation)) {
    QDirIterator files(directory, {name}, QDir::Files, QDirIterator::Subdirectories);
    if (!files.hasNext()) continue;
    QFile file(files.next());
    if (file.open(QIODevice::ReadOnly)) return file.readAll();
  }
  return {};
}

/// Renames the family in a font's table of names, which holds it in two encodings.
QByteArray renamed(QByteArray font, const QByteArray& from, const QByteArray& to) {
  const auto wide = [](const QByteArray& name) {
    QByteArray units;
    for (const char c : name) units.append('\0').append(c);
    return units;
  };
  return font.replace(from, to).replace(wide(from), wide(to));
}

TEST(AddedFonts, AreKnownAtOnce) {
  const QByteArray font = fontFile("LiberationSans-Regular.ttf");
  ASSERT_FALSE(font.isEmpty()) << "the tests need the Liberation fonts";
  const QtFonts fonts;
  ASSERT_FALSE(fonts.fontWithName("Exhibition Sans", 9));
  const int id = QFontDatabase::addApplicationFontFromData(
      renamed(font, "Liberation Sans", "Exhibition Sans"));
  ASSERT_GE(id, 0);
  const auto added = fonts.fontWithName("Exhibition Sans", 9);
  ASSERT_TRUE(added);
  EXPECT_EQ(*added, (toolkit::Font{"Exhibition Sans", 9}));
  ASSERT_TRUE(QFontDatabase::removeApplicationFont(id));
  EXPECT_FALSE(fonts.fontWithName("Exhibition Sans", 9));
}

}  // namespace

}  // namespace qz
