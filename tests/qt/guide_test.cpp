// SPDX-License-Identifier: MIT
// The guide appears beside the control of a step, follows it, and leaves the form alone.

#include <QDockWidget>
#include <QScrollBar>
#include <QSplitter>
#include <map>
#include <random>
#include <utility>

#include "tests/qt/crowded_form.hpp"
#include "tests/qt/guided.hpp"

namespace qz {

namespace {

using hosts::threeSteps;
using hosts::qt::GuideOptions;
using hosts::qt::Spotlight;
using Lines = std::vector<std::string>;

struct Guides : hosts::Guided {
  void expectBeside(const QWidget& control) {
    const QRect place = onScreen(panel());
    EXPECT_TRUE(panel().isVisible());
    EXPECT_TRUE(panel().screen()->availableGeometry().contains(place));
    EXPECT_FALSE(place.intersects(onScreen(control)));
    const QRect near = onScreen(control).adjusted(-20, -20, 20, 20);
    EXPECT_TRUE(place.intersects(near)) << "it is next to the control";
    ASSERT_TRUE(spotlight());
    EXPECT_TRUE(
        spotlight()->lit().contains({control.mapTo(control.window(), QPoint()), control.size()}));
  }
};

TEST_F(Guides, AppearWithTheFirstStepBesideItsControlAndGoWithTheWalkThrough) {
  show();
  EXPECT_FALSE(panel().isVisible());
  EXPECT_FALSE(spotlight());
  play(threeSteps);
  EXPECT_EQ(guide->target(), &name);
  EXPECT_EQ(panel().heading.text(), "Name");
  expectBeside(name);
  click(panel().next);
  EXPECT_EQ(guide->target(), &send);
  expectBeside(send);
  click(panel().back);
  EXPECT_EQ(guide->target(), nullptr);
  EXPECT_TRUE(panel().isVisible());
  EXPECT_TRUE(spotlight()->lit().isEmpty());
  EXPECT_EQ(onScreen(panel()).center(), onScreen(*form).center());
  click(panel().skip);
  EXPECT_FALSE(panel().isVisible());
  EXPECT_FALSE(spotlight());
  EXPECT_FALSE(walkThrough.engine());
  EXPECT_EQ(panel().heading.text(), "");
  EXPECT_TRUE(form->isActiveWindow());
  EXPECT_EQ(log, Lines{});
}

TEST_F(Guides, ComeAgainInTheNextWalkThrough) {
  show();
  for (int round = 0; round < 3; ++round) {
    play(threeSteps);
    expectBeside(name);
    walkThrough.end();
    settle();
    EXPECT_FALSE(panel().isVisible());
    EXPECT_FALSE(spotlight());
  }
}

TEST_F(Guides, DoNotAppearInAWalkThroughThatDoesNotUseThem) {
  show();
  play("0 = ((SET_TITLE_FOR_OBJECT_ID, New, 2), (SET_TEXT_FOR_OBJECT_ID, 2, 905));");
  EXPECT_EQ(send.text(), "New");
  EXPECT_FALSE(panel().isVisible());
  EXPECT_FALSE(spotlight());
}

TEST_F(Guides, HaveTheTagsThatTheHostChooses) {
  show({.tags = {.heading = 50, .target = 51, .next = 52}});
  play(
      "0 = ((SET_TEXT_FOR_OBJECT_ID, Hello, 50), (SET_TEXT_FOR_OBJECT_ID, 2, 51));"
      "52 = ((SET_TEXT_FOR_OBJECT_ID, Bye, 50), (HIDE_OBJECT_WITH_ID, 1000));");
  EXPECT_EQ(panel().heading.text(), "Hello");
  EXPECT_EQ(guide->target(), &send);
  click(panel().next);
  EXPECT_EQ(panel().heading.text(), "Bye");
  EXPECT_TRUE(panel().back.isHidden());
}

TEST_F(Guides, FollowTheWindowAndTheControl) {
  show();
  play(threeSteps);
  for (const QPoint to : {QPoint(500, 20), QPoint(500, 600), QPoint(0, 600), QPoint(-100, 300)}) {
    form->move(to);
    settle();
    expectBeside(name);
  }
  form->resize(500, 300);
  settle();
  expectBeside(name);
  form->layout()->removeWidget(&name);
  name.move(10, 200);
  expectBeside(name);
}

TEST_F(Guides, GoToTheMiddleWhileTheirControlIsHiddenOrGone) {
  show();
  play(threeSteps);
  name.hide();
  settle();
  EXPECT_TRUE(spotlight()->lit().isEmpty());
  name.show();
  settle();
  expectBeside(name);
  delete &name;
  settle();
  EXPECT_EQ(guide->target(), nullptr);
  EXPECT_TRUE(spotlight()->lit().isEmpty());
  EXPECT_TRUE(panel().isVisible());
}

TEST_F(Guides, PointAtTheControlThatHasTheTagAtThatMoment) {
  show();
  play(
      "0 = ((SET_TEXT_FOR_OBJECT_ID, Hi, 901), (SET_TAG_FOR_OBJECT_ID, 7, 2),"
      "     (SET_TAG_FOR_OBJECT_ID, 2, 3), (SET_TEXT_FOR_OBJECT_ID, 2, 905),"
      "     (SET_TAG_FOR_OBJECT_ID, 8, 2));");
  EXPECT_EQ(guide->target(), &remark);
}

TEST_F(Guides, SayInTheLogWhyTheyPointAtNothing) {
  show();
  play(
      "0 = ((SET_TEXT_FOR_OBJECT_ID, Hi, 901), (SET_TEXT_FOR_OBJECT_ID, 2, 905));"
      "2000 = ((SET_TEXT_FOR_OBJECT_ID, send, 905)); 1000 = ((SET_TEXT_FOR_OBJECT_ID, 77, 905));"
      "906 = ((SET_TEXT_FOR_OBJECT_ID, 901, 905));");
  for (QPushButton* const button : {&panel().next, &panel().back, &panel().skip}) {
    click(*button);
    EXPECT_EQ(guide->target(), nullptr);
  }
  EXPECT_EQ(log, (Lines{"The guide points at \"send\", which is not a tag (a whole decimal number)",
                        "The guide points at \"77\", but no control of the form has this tag",
                        "The guide points at \"901\", but no control of the form has this tag"}));
}

using Geometries = std::map<const QObject*, QRect>;

Geometries geometriesIn(const QWidget& form) {
  Geometries geometries{{&form, form.geometry()}};
  for (const QWidget* const widget : form.findChildren<QWidget*>()) {
    geometries[widget] = widget->geometry();
  }
  return geometries;
}

TEST_F(Guides, MoveNothingInTheForm) {
  for (const bool inside : {false, true}) {
    form->show();
    settle();
    const auto before = geometriesIn(*form);
    show({.insideWindow = inside});
    play(threeSteps);
    for (QPushButton* const button : {&panel().next, &panel().back, &panel().next}) {
      click(*button);
      for (const auto& [widget, geometry] : before) {
        EXPECT_EQ(static_cast<const QWidget*>(widget)->geometry(), geometry);
      }
    }
    guide.reset();
    settle();
    EXPECT_EQ(geometriesIn(*form), before);
  }
}

// A splitter makes a pane of each child that it gets.
TEST_F(Guides, MoveNothingInASplitterThatIsTheForm) {
  for (const bool inside : {false, true}) {
    QSplitter splitter;
    splitter.addWidget(new QPushButton("One"));
    splitter.addWidget(new QPushButton("Two"));
    splitter.widget(0)->setProperty("qzTag", 1);
    splitter.show();
    settle();
    const auto before = geometriesIn(splitter);
    guide =
        std::make_unique<hosts::qt::Guide>(toolkit, splitter, GuideOptions{.insideWindow = inside});
    std::ofstream(directory.filePath("script.plist").toStdString()) << "{" << threeSteps << "}";
    ASSERT_TRUE(walkThrough.play("script.plist", splitter));
    settle();
    EXPECT_EQ(guide->target(), splitter.widget(0));
    EXPECT_TRUE(panel().isVisible());
    EXPECT_EQ(splitter.count(), 2);
    for (const auto& [widget, geometry] : before) {
      EXPECT_EQ(static_cast<const QWidget*>(widget)->geometry(), geometry);
    }
    walkThrough.end();
  }
}

TEST_F(Guides, OpenThePlaceOfTheirControlAndFollowItThere) {
  hosts::CrowdedForm crowded;
  crowded.show();
  settle();
  guide = std::make_unique<hosts::qt::Guide>(toolkit, crowded);
  std::ofstream(directory.filePath("script.plist").toStdString())
      << "{ 0 = ((SET_TEXT_FOR_OBJECT_ID, Hi, 901), (SET_TEXT_FOR_OBJECT_ID, 3, 905)); }";
  ASSERT_TRUE(walkThrough.play("script.plist", crowded));
  settle();
  EXPECT_EQ(guide->target(), &crowded.inArea);
  EXPECT_EQ(crowded.tabs->currentIndex(), 1);
  EXPECT_FALSE(crowded.inArea.visibleRegion().isEmpty());
  EXPECT_FALSE(onScreen(panel()).intersects(onScreen(crowded.inArea)));
  const QPoint before = panel().pos();
  QScrollBar& bar = *crowded.area->verticalScrollBar();
  bar.setValue(bar.value() - 5);
  settle();
  EXPECT_NE(panel().pos(), before) << "it follows the scrolled control";
  walkThrough.end();
  EXPECT_EQ(crowded.tabs->currentIndex(), 0);
}

TEST_F(Guides, FollowAControlIntoAFloatingDock) {
  hosts::CrowdedForm crowded;
  crowded.dock->setFloating(true);
  crowded.show();
  crowded.dock->move(400, 300);
  settle();
  guide = std::make_unique<hosts::qt::Guide>(toolkit, crowded);
  std::ofstream(directory.filePath("script.plist").toStdString())
      << "{ 0 = ((SET_TEXT_FOR_OBJECT_ID, Hi, 901), (SET_TEXT_FOR_OBJECT_ID, 8, 905)); }";
  ASSERT_TRUE(walkThrough.play("script.plist", crowded));
  settle();
  EXPECT_EQ(guide->target(), &crowded.inDock);
  EXPECT_FALSE(onScreen(panel()).intersects(onScreen(crowded.inDock)));
  const auto lightIn = [](const QWidget& window) {
    const auto children = window.findChildren<QWidget*>(QString(), Qt::FindDirectChildrenOnly);
    return std::any_of(children.begin(), children.end(), [](const QWidget* child) {
      return dynamic_cast<const Spotlight*>(child) != nullptr;
    });
  };
  EXPECT_TRUE(lightIn(*crowded.dock));
  crowded.dock->setFloating(false);
  settle();
  EXPECT_TRUE(lightIn(crowded));
  EXPECT_FALSE(lightIn(*crowded.dock));
}

TEST_F(Guides, KeepTheirControlsWhenOnlyDirectSubviewsAreAdopted) {
  walkThrough.setAdoption({.reading = toolkit::qt::Adoption::Reading::directSubviews});
  for (const bool inside : {false, true}) {
    show({.insideWindow = inside});
    play(threeSteps);
    EXPECT_EQ(panel().heading.text(), "Name");
    EXPECT_EQ(guide->target(), &name);
    EXPECT_EQ(log, Lines{});
  }
}

TEST_F(Guides, AreClearedByAHostThatRestoresOnlyTags) {
  walkThrough.setAdoption({.restoring = toolkit::qt::Adoption::Restoring::tags});
  walkThrough.whenOver([this] { guide->clear(); });
  show();
  play(threeSteps);
  walkThrough.end();
  settle();
  EXPECT_FALSE(panel().isVisible());
  EXPECT_EQ(guide->target(), nullptr);
}

TEST_F(Guides, StayInsideTheWindowIfTheHostWantsThat) {
  show({.insideWindow = true});
  form->resize(500, 400);
  play(threeSteps);
  EXPECT_FALSE(panel().isWindow());
  EXPECT_TRUE(form->rect().contains(panel().geometry()));
  EXPECT_FALSE(panel().geometry().intersects(name.geometry()));
  click(panel().next);
  EXPECT_EQ(guide->target(), &send);
  EXPECT_FALSE(panel().geometry().intersects(send.geometry()));
}

TEST_F(Guides, HaveLargerHeadingsInFontsOfPixelsToo) {
  QFont inPixels = form->font();
  inPixels.setPixelSize(20);
  for (const QFont& font : {form->font(), inPixels}) {
    form->setFont(font);
    show();
    play(threeSteps);
    const QFont text = panel().text.font();
    const QFont heading = panel().heading.font();
    EXPECT_EQ(text.pixelSize(), font.pixelSize());
    EXPECT_EQ(heading.pixelSize(), font.pixelSize() > 0 ? 24 : -1);
    EXPECT_GT(QFontMetrics(heading).height(), QFontMetrics(text).height());
    walkThrough.end();
  }
}

TEST_F(Guides, GrowWiderForLongTextsAndStayOnTheScreen) {
  show();
  std::string text;
  for (int i = 0; i < 300; ++i) text += "sentence ";
  play(("0 = ((SET_TEXT_FOR_OBJECT_ID, \"" + text + "\", 902), (SET_TEXT_FOR_OBJECT_ID, 1, 905));")
           .c_str());
  EXPECT_TRUE(panel().screen()->availableGeometry().contains(onScreen(panel())));
  EXPECT_GE(panel().text.height(), panel().text.heightForWidth(panel().text.width()))
      << "all of it is visible";
}

TEST_F(Guides, MirrorThemselvesInRightToLeftForms) {
  show();
  form->setLayoutDirection(Qt::RightToLeft);
  form->move(500, 100);
  play(threeSteps);
  EXPECT_EQ(panel().layoutDirection(), Qt::RightToLeft);
  EXPECT_LT(panel().next.x(), panel().skip.x());
  EXPECT_LT(onScreen(panel()).right(), onScreen(name).left());
}

int differingPixels(const QImage& a, const QImage& b) {
  int count = 0;
  for (int y = 0; y < a.height(); ++y) {
    for (int x = 0; x < a.width(); ++x) count += a.pixel(x, y) != b.pixel(x, y);
  }
  return count;
}

TEST_F(Guides, DimAndFrameOnlyAsTheHostWantsIt) {
  const struct {
    bool frame;
    bool dimming;
    bool hasHighContrast;
    bool isDimmed;
  } cases[] = {{true, true, false, true},  {true, false, false, false},
               {false, true, false, true}, {false, false, false, false},
               {true, true, true, false},  {false, true, true, false}};
  for (const auto& c : cases) {
    qApp->setProperty(toolkit::qt::highContrastProperty, c.hasHighContrast);
    show({.frame = c.frame, .dimming = c.dimming, .takesFocus = false});
    walkThrough.end();
    settle();
    const QImage before = form->grab().toImage();
    play(threeSteps);
    const QImage after = form->grab().toImage();
    const QPoint corner(2, form->height() - 3);
    const QPoint edge(spotlight()->lit().left(), spotlight()->lit().center().y());
    EXPECT_EQ(after.pixelColor(corner).lightness() < before.pixelColor(corner).lightness() - 40,
              c.isDimmed);
    EXPECT_EQ(after.pixelColor(edge) == hosts::qt::guideLineColor(form->palette()), c.frame);
    EXPECT_EQ(after.pixelColor(name.geometry().center()),
              before.pixelColor(name.geometry().center()));
    EXPECT_EQ(differingPixels(before, after) == 0, !c.frame && !c.isDimmed);
  }
  qApp->setProperty(toolkit::qt::highContrastProperty, QVariant());
}

TEST_F(Guides, LetTheLightGlideUnlessTheUserWantsNoMotion) {
  const auto edgeOf = [this](const QRect& lit) {
    return form->grab().toImage().pixelColor(lit.left(), lit.center().y());
  };
  const QColor line = hosts::qt::guideLineColor(form->palette());
  for (const bool moves : {true, false}) {
    qApp->setProperty(toolkit::qt::reducedMotionProperty, !moves);
    show();
    play(threeSteps);
    const QRect first = spotlight()->lit();
    EXPECT_EQ(edgeOf(first), line);
    click(panel().next);
    const QRect second = spotlight()->lit();
    EXPECT_NE(first, second);
    EXPECT_EQ(edgeOf(second) == line, !moves) << "it is on its way";
    EXPECT_TRUE(QTest::qWaitFor([&] { return edgeOf(second) == line; }));
  }
}

TEST_F(Guides, LetClicksThroughToTheForm) {
  show();
  play(
      "0 = ((SET_TEXT_FOR_OBJECT_ID, Hi, 901), (SET_TEXT_FOR_OBJECT_ID, 1, 905));"
      "2 = ((SET_TEXT_FOR_OBJECT_ID, Sent, 901));");
  QWidget* const hit = form->childAt(send.geometry().center());
  EXPECT_EQ(hit, &send);
  QTest::mouseClick(form->windowHandle(), Qt::LeftButton, {}, send.geometry().center());
  settle();
  EXPECT_EQ(panel().heading.text(), "Sent");
}

TEST_F(Guides, BelongToASheetToo) {
  QWidget host;
  host.show();
  guide = std::make_unique<hosts::qt::Guide>(toolkit, *form);
  std::ofstream(directory.filePath("script.plist").toStdString()) << "{" << threeSteps << "}";
  ASSERT_TRUE(walkThrough.playInSheet("script.plist", *form, host));
  settle();
  expectBeside(name);
  click(panel().next);
  expectBeside(send);
  click(panel().skip);
  EXPECT_FALSE(form->isVisible());
  EXPECT_FALSE(panel().isVisible());
}

TEST_F(Guides, SkipWhenTheUserClosesTheirPanel) {
  show();
  play(threeSteps);
  EXPECT_FALSE(panel().close());
  settle();
  EXPECT_FALSE(walkThrough.engine());
  EXPECT_FALSE(panel().isVisible());
}

TEST_F(Guides, AreHiddenWhileTheFormIsMinimized) {
  show();
  play(threeSteps);
  form->setWindowState(Qt::WindowMinimized);
  settle();
  EXPECT_FALSE(panel().isVisible());
  form->setWindowState(Qt::WindowNoState);
  settle();
  EXPECT_TRUE(panel().isVisible());
  EXPECT_TRUE(walkThrough.engine());
}

TEST_F(Guides, HideWithTheForm) {
  show();
  play(threeSteps);
  form->hide();
  EXPECT_FALSE(panel().isVisible());
  settle();
  EXPECT_FALSE(walkThrough.engine());
}

TEST_F(Guides, EndWithTheirForm) {
  show();
  play(threeSteps);
  form.reset();
  EXPECT_EQ(guide->panel(), nullptr);
  EXPECT_EQ(guide->target(), nullptr);
  settle();
  guide->clear();
}

TEST_F(Guides, MayEndInAPressOfTheirOwnButton) {
  walkThrough.whenOver([this] { guide.reset(); });
  show();
  play(threeSteps);
  const QPointer<QWidget> panelBefore = &panel();
  click(panel().skip);
  EXPECT_FALSE(guide);
  EXPECT_FALSE(panelBefore);
  EXPECT_FALSE(spotlight());
}

TEST_F(Guides, MayEndInTheMiddleOfAWalkThrough) {
  show();
  play(threeSteps);
  guide.reset();
  settle();
  EXPECT_FALSE(spotlight());
  EXPECT_TRUE(walkThrough.engine());
  EXPECT_EQ(form->findChildren<QDialog*>().size(), 0);
}

// What can happen to a form with a guide, in a form of its own.
struct Tour {
  toolkit::qt::QtToolkit& toolkit;
  const std::string script;
  std::unique_ptr<QWidget> form = std::make_unique<QWidget>();
  QPointer<QPushButton> first = new QPushButton("First", form.get());
  QPointer<QPushButton> second = new QPushButton("Second", form.get());
  hosts::qt::WalkThrough walkThrough{toolkit};
  std::unique_ptr<hosts::qt::Guide> guide;

  Tour(toolkit::qt::QtToolkit& used, std::string played, bool inside)
      : toolkit(used), script(std::move(played)) {
    first->setProperty("qzTag", 1);
    second->setProperty("qzTag", 2);
    second->move(0, 50);
    form->resize(300, 200);
    form->show();
    form->activateWindow();
    guide =
        std::make_unique<hosts::qt::Guide>(toolkit, *form, GuideOptions{.insideWindow = inside});
    walkThrough.play(script, *form);
    hosts::settle();
  }

  void press(const char* name) const {
    if (guide && guide->panel()) guide->panel()->findChild<QPushButton*>(name)->click();
  }
  void act(unsigned what) {
    switch (what) {
      case 0:
        return press("qz-guide-skip");
      case 1:
        return walkThrough.end();
      case 2:
        delete first;
        return;
      case 3:
        return guide.reset();
      case 4:
        return form.reset();
      case 5:
        if (form) form->close();
        return;
      case 6:
        if (form) walkThrough.play(script, *form);
        return;
      case 7:
        if (form && second) second->setParent(nullptr), second->deleteLater();
        return;
      case 8:
        if (form) form->move(form->pos() + QPoint(10, 10));
        return;
      case 9:
        return walkThrough.whenOver([this] { guide.reset(); });
      case 10:
        return press("qz-guide-back");
      default:
        return press("qz-guide-next");
    }
  }
};

TEST_F(Guides, SurviveWhateverHappensAtAnyMoment) {
  std::ofstream(directory.filePath("script.plist").toStdString()) << "{" << threeSteps << "}";
  std::mt19937 random(11);
  for (int round = 0; round < 300; ++round) {
    Tour tour(toolkit, "script.plist", round % 2 == 0);
    const QPointer<QWidget> panelOfTour = tour.guide->panel();
    for (int i = 0; i < 6; ++i) {
      tour.act(static_cast<unsigned>(random() % 14));
      if (random() % 2) hosts::settle();
    }
    tour.walkThrough.end();
    settle();
    const bool isOn = panelOfTour && panelOfTour->isVisible();
    EXPECT_FALSE(isOn) << round;
  }
}

TEST_F(Guides, ScrollsATextThatIsTooLongForTheScreen) {
  show();
  const QString text = QString("All of this must be readable. ").repeated(2000);
  play(qPrintable("0 = ((SET_TEXT_FOR_OBJECT_ID, Long, 901), (SET_TEXT_FOR_OBJECT_ID, \"" + text +
                  "\", 902)); 2000 = ((SET_TEXT_FOR_OBJECT_ID, \"" + text + "!\", 902));"));
  EXPECT_TRUE(form->screen()->availableGeometry().contains(onScreen(panel())));
  const auto isShown = [&](const QWidget& widget) {
    return onScreen(panel()).contains(onScreen(widget));
  };
  for (const QWidget* const part :
       {static_cast<const QWidget*>(&panel().heading), static_cast<const QWidget*>(&panel().scroll),
        static_cast<const QWidget*>(&panel().next)}) {
    EXPECT_TRUE(isShown(*part));
  }
  const QLabel& label = panel().text;
  EXPECT_GE(label.height(), label.heightForWidth(label.width())) << "all of it can be scrolled to";
  QScrollBar& bar = *panel().scroll.verticalScrollBar();
  ASSERT_GT(bar.maximum(), 0);
  QTest::keyClick(&panel().next, Qt::Key_PageDown);
  EXPECT_GT(bar.value(), 0);
  QTest::keyClick(&panel().next, Qt::Key_PageDown);
  QTest::keyClick(&panel().next, Qt::Key_PageUp);
  EXPECT_GT(bar.value(), 0);
  panel().next.click();
  settle();
  EXPECT_EQ(bar.value(), 0) << "a new step begins at its beginning";
}

}  // namespace

}  // namespace qz
