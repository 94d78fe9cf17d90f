// SPDX-License-Identifier: MIT
// What assistive technology learns: names, descriptions, and their changes.

#include "toolkit/qt/accessibility.hpp"

#include <gtest/gtest.h>

#include <QAccessible>
#include <QCheckBox>
#include <QLabel>
#include <QPushButton>
#include <QTemporaryDir>
#include <QTextEdit>

#include "qz/toolkit/system_files.hpp"
#include "tests/qt/announcements.hpp"
#include "toolkit/qt/button_look.hpp"
#include "toolkit/qt/image_look.hpp"
#include "toolkit/qt/images.hpp"
#include "toolkit/qt/strings.hpp"
#include "toolkit/qt/text_look.hpp"

namespace qz {

namespace {

using namespace toolkit;
using namespace toolkit::qt;

using hosts::announcements;

class Accessibility : public ::testing::Test {
 protected:
  Accessibility() { hosts::listen(); }

  static bool wasAnnounced(const QObject& object, QAccessible::Event event) {
    for (const auto& said : announcements) {
      if (said.object == &object && said.event == event) return true;
    }
    return false;
  }
  static std::string textOf(QWidget& widget, QAccessible::Text which) {
    return utf8(QAccessible::queryAccessibleInterface(&widget)->text(which));
  }
};

const AttributedString styled("Styled", {.foregroundColor = colors::red});

TEST_F(Accessibility, TitlesAreNamesAndAnnounced) {
  QPushButton button("Before");
  QCheckBox box("Before");
  for (QAbstractButton* const each :
       {static_cast<QAbstractButton*>(&button), static_cast<QAbstractButton*>(&box)}) {
    hosts::listen();
    showTitle(*each, "A & B");
    EXPECT_TRUE(wasAnnounced(*each, QAccessible::NameChanged));
    EXPECT_EQ(textOf(*each, QAccessible::Name), "A & B");
    hosts::listen();
    showTitle(*each, styled);
    EXPECT_TRUE(wasAnnounced(*each, QAccessible::NameChanged));
    EXPECT_EQ(textOf(*each, QAccessible::Name), "Styled");
  }
}

TEST_F(Accessibility, ReplacesANameThatTheHostGave) {
  QPushButton button("Before");
  button.setAccessibleName("Go on");
  showTitle(button, "Close");
  EXPECT_EQ(textOf(button, QAccessible::Name), "Close");
}

TEST_F(Accessibility, TextsOfLabelsAreNamesAndAnnounced) {
  QLabel label("Before");
  hosts::listen();
  showText(label, "Plain");
  EXPECT_TRUE(wasAnnounced(label, QAccessible::NameChanged));
  EXPECT_EQ(textOf(label, QAccessible::Name), "Plain");
  hosts::listen();
  showText(label, styled);
  EXPECT_TRUE(wasAnnounced(label, QAccessible::NameChanged));
  EXPECT_EQ(textOf(label, QAccessible::Name), "Styled");
}

TEST_F(Accessibility, ToolTipsAreDescriptionsAndAnnounced) {
  QPushButton button("Next");
  showToolTip(button, "Goes on");
  EXPECT_TRUE(wasAnnounced(button, QAccessible::DescriptionChanged));
  EXPECT_EQ(textOf(button, QAccessible::Description), "Goes on");
  for (const char* text : {"<b>tag</b>", "a & b", "two\nlines", ""}) {
    showToolTip(button, text);
    EXPECT_EQ(shownToolTip(button), text);
    EXPECT_EQ(textOf(button, QAccessible::Description), text);
  }
}

TEST_F(Accessibility, ImagesAreNamedByTheirNames) {
  QTemporaryDir directory;
  QImage(4, 4, QImage::Format_RGB32).save(directory.filePath("disk.png"));
  QImage(4, 4, QImage::Format_RGB32).save(directory.filePath("done.png"));
  SystemFiles files;
  files.setResourcePath(utf8(directory.path()));
  QtImages images(files);
  QLabel label;
  for (const char* name : {"disk", "done"}) {
    hosts::listen();
    showImage(label, images.imageNamed(name));
    EXPECT_TRUE(wasAnnounced(label, QAccessible::NameChanged));
    EXPECT_EQ(textOf(label, QAccessible::Name), name);
    EXPECT_EQ(textOf(label, QAccessible::Description), name);
  }
  showImage(label, nullptr);
  EXPECT_EQ(textOf(label, QAccessible::Name), "");
}

}  // namespace

}  // namespace qz
