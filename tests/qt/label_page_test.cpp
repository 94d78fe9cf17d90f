// SPDX-License-Identifier: MIT
// A label whose styled text a LabelPage draws looks like a label that shows the same HTML itself.

#include "toolkit/qt/label_page.hpp"

#include <gtest/gtest.h>

#include <QLabel>
#include <QSignalSpy>
#include <QTest>
#include <functional>
#include <ostream>

#include "tests/qt/rendering.hpp"
#include "toolkit/qt/text_look.hpp"

namespace qz {

namespace {

using namespace toolkit;
using namespace toolkit::qt;
using namespace rendering;

AttributedString styledText() {
  AttributedString text("Some words, and ", {.font = Font{"Helvetica", 18}});
  text.append("red ones", {.font = Font{"Times", 14, true}, .foregroundColor = colors::red});
  text.append("\n", {});
  text.append("in the middle, with a link",
              {.paragraphStyle = ParagraphStyle{TextAlignment::center},
               .link = "https://example.org/",
               .underline = true});
  text.append("\nand more, as it comes, on several lines of their own", {});
  return text;
}

/// The settings of a label before the text is shown, and changes afterwards.
struct PageCase {
  const char* name;
  std::function<void(QLabel&)> before;
  std::function<void(QLabel&)> after = [](QLabel&) {};
};

void PrintTo(const PageCase& page, std::ostream* out) { *out << page.name; }

const PageCase pageCases[] = {
    {"as it is", [](QLabel&) {}},
    {"wrapped", [](QLabel& label) { label.setWordWrap(true); }},
    {"wrapped afterwards", [](QLabel&) {}, [](QLabel& label) { label.setWordWrap(true); }},
    {"at the top", [](QLabel& label) { label.setAlignment(Qt::AlignTop | Qt::AlignLeading); }},
    {"below", [](QLabel& label) { label.setAlignment(Qt::AlignBottom | Qt::AlignRight); }},
    {"on the right afterwards", [](QLabel&) {},
     [](QLabel& label) { label.setAlignment(Qt::AlignTop | Qt::AlignRight); }},
    {"in the middle", [](QLabel& label) { label.setAlignment(Qt::AlignCenter); }},
    {"framed", [](QLabel& label) { label.setFrameStyle(QFrame::Box | QFrame::Sunken); }},
    {"indented", [](QLabel& label) { label.setIndent(25); }},
    {"indented at the top",
     [](QLabel& label) {
       label.setIndent(25);
       label.setAlignment(Qt::AlignTop | Qt::AlignRight);
     }},
    {"with a margin", [](QLabel& label) { label.setMargin(15); }},
    {"from right to left", [](QLabel& label) { label.setLayoutDirection(Qt::RightToLeft); }},
    {"mirrored afterwards", [](QLabel&) {},
     [](QLabel& label) { label.setLayoutDirection(Qt::RightToLeft); }},
    {"disabled", [](QLabel& label) { label.setEnabled(false); }},
    {"disabled afterwards", [](QLabel&) {}, [](QLabel& label) { label.setEnabled(false); }},
    {"in another font afterwards", [](QLabel&) {},
     [](QLabel& label) { label.setFont(QFont("Liberation Serif", 20)); }},
    {"in other colours",
     [](QLabel& label) {
       QPalette palette;
       palette.setColor(QPalette::WindowText, Qt::blue);
       palette.setColor(QPalette::Link, Qt::darkGreen);
       label.setPalette(palette);
     }},
    {"with a style sheet",
     [](QLabel& label) { label.setStyleSheet("color: purple; border: 3px solid green"); }},
    {"narrower afterwards", [](QLabel& label) { label.setWordWrap(true); },
     [](QLabel& label) { label.resize(180, 160); }},
    {"selectable", [](QLabel& label) { label.setTextInteractionFlags(Qt::TextSelectableByMouse); }},
};

/// Counts the paint events that no event filter installed later intercepts.
struct Painted : QObject {
  explicit Painted(QObject& watched) { watched.installEventFilter(this); }
  bool eventFilter(QObject*, QEvent* event) override {
    if (event->type() == QEvent::Paint) ++count;
    return false;
  }
  int count = 0;
};

class DrawnLabels : public testing::TestWithParam<PageCase> {};

TEST_P(DrawnLabels, LookAsTheyWouldByThemselves) {
  QLabel drawn;
  const Painted byLabel(drawn);
  drawn.resize(320, 160);
  GetParam().before(drawn);
  showText(drawn, styledText());
  pictureOf(drawn);  // lays the text out before the changes below
  GetParam().after(drawn);

  QLabel plain;
  plain.resize(320, 160);
  GetParam().before(plain);
  GetParam().after(plain);
  plain.resize(drawn.size());
  plain.setText(drawn.text());
  for (const double ratio : {1.0, 2.0}) {
    const QImage picture = pictureOf(drawn, ratio);
    EXPECT_EQ(picture, pictureOf(plain, ratio)) << "at " << ratio << " pixels a point";
    EXPECT_GT(countPixels(picture, [](const QColor& c) { return c != Qt::white; }), 500);
  }
  EXPECT_EQ(byLabel.count == 0, LabelPage::canDraw(drawn));
}

INSTANTIATE_TEST_SUITE_P(Qt, DrawnLabels, testing::ValuesIn(pageCases), [](const auto& test) {
  std::string name = test.param.name;
  std::replace(name.begin(), name.end(), ' ', '_');
  return name;
});

TEST(LabelPage, LeavesLabelsToThemselvesThatPaintInAWayOfTheirOwn) {
  struct CrossedOut : QLabel {
    void paintEvent(QPaintEvent* event) override {
      QLabel::paintEvent(event);
      QPainter(this).fillRect(0, height() / 2, width(), 2, Qt::black);
    }
  } label;
  label.resize(200, 40);
  showText(label, AttributedString("red", {.foregroundColor = colors::red}));
  const QImage picture = pictureOf(label);
  EXPECT_EQ(picture.pixelColor(190, 20), QColor(Qt::black));
  EXPECT_GT(countPixels(picture, isReddish), 0);
}

TEST(LabelPage, LeavesLabelsToThemselvesThatShowASelection) {
  QLabel label;
  EXPECT_TRUE(LabelPage::canDraw(label));
  label.setTextInteractionFlags(Qt::NoTextInteraction);
  EXPECT_TRUE(LabelPage::canDraw(label));
  for (const auto flags : {Qt::TextSelectableByMouse, Qt::TextSelectableByKeyboard,
                           Qt::LinksAccessibleByKeyboard, Qt::TextEditable}) {
    label.setTextInteractionFlags(flags | Qt::LinksAccessibleByMouse);
    EXPECT_FALSE(LabelPage::canDraw(label));
  }
}

// The label finds the link itself, in its own layout.
TEST(LabelPage, LeavesLinksToTheHostWhereTheyAreDrawn) {
  QLabel label;
  label.resize(300, 60);
  AttributedString text("Something before the ", {.font = Font{"Helvetica", 18}});
  text.append("link",
              {.font = Font{"Helvetica", 18}, .foregroundColor = colors::red, .link = "x:y"});
  showText(label, text);
  const QRect link = boundsOf(pictureOf(label), isReddish);
  ASSERT_GT(link.left(), 100);
  label.show();
  const QSignalSpy activated(&label, &QLabel::linkActivated);
  QTest::mouseClick(&label, Qt::LeftButton, {}, {link.left() / 2, link.center().y()});
  EXPECT_EQ(activated.count(), 0);
  for (const QPoint& at : {link.topLeft() + QPoint(1, 1), link.center(), link.bottomRight()}) {
    QTest::mouseClick(&label, Qt::LeftButton, {}, at);
  }
  ASSERT_EQ(activated.count(), 3);
  EXPECT_EQ(activated[0][0], "x:y");
  EXPECT_FALSE(label.openExternalLinks());
}

TEST(LabelPage, ShowsWhatTheHostShowsInstead) {
  QLabel label;
  label.resize(200, 40);
  showText(label, AttributedString("red", {.foregroundColor = colors::red}));
  EXPECT_GT(countPixels(pictureOf(label), isReddish), 0);
  label.setText("black");
  const QImage picture = pictureOf(label);
  EXPECT_EQ(countPixels(picture, isReddish), 0);
  EXPECT_GT(countPixels(picture, isDark), 0);
}

}  // namespace

}  // namespace qz
