// SPDX-License-Identifier: MIT
// The guide at every step of the example, as pictures in the folder guide-pictures of the build.
// Beside what is asserted here, somebody has to look at them.

#include <QDir>
#include <QMenu>
#include <QPainter>
#include <QScreen>
#include <QStyle>
#include <QToolBar>
#include <QTranslator>
#include <utility>

#include "examples/qt-host/guided_form.hpp"
#include "hosts/qt/guide_panel.hpp"
#include "hosts/qt/guide_spotlight.hpp"
#include "tests/qt/support.hpp"
#include "toolkit/qt/contrast.hpp"
#include "toolkit/qt/user_preferences.hpp"

namespace qz {

namespace {

using hosts::qt::GuidePanel;
using hosts::qt::Spotlight;

QPalette nightPalette() {
  QPalette palette(QColor(45, 45, 48));
  palette.setColor(QPalette::Base, QColor(30, 30, 32));
  palette.setColor(QPalette::Highlight, QColor(70, 150, 220));
  return palette;
}

QPalette contrastPalette() {
  QPalette palette(Qt::white, Qt::black, Qt::white, Qt::white, Qt::white, Qt::white, Qt::white,
                   Qt::black, Qt::black);
  palette.setColor(QPalette::Highlight, Qt::yellow);
  palette.setColor(QPalette::HighlightedText, Qt::black);
  return palette;
}

struct Variant {
  const char* name;
  QPalette palette;
  Qt::LayoutDirection direction = Qt::LeftToRight;
  bool hasHighContrast = false;
  QLocale locale = QLocale(QLocale::English);
};

struct GuidePictures : testing::Test {
  std::unique_ptr<GuidedForm> form;
  QTranslator words;
  const QPalette before = QApplication::palette();
  const QLocale localeBefore;
  std::vector<QImage> steps;  // of one walk-through

  GuidePictures() { qApp->setProperty(toolkit::qt::reducedMotionProperty, true); }
  ~GuidePictures() override {
    form.reset();
    QApplication::setPalette(before);
    QLocale::setDefault(localeBefore);
    QApplication::setLayoutDirection(Qt::LeftToRight);
    qApp->setProperty(toolkit::qt::reducedMotionProperty, QVariant());
    qApp->setProperty(toolkit::qt::highContrastProperty, QVariant());
  }

  void begin(const Variant& variant, const QPoint& place) {
    form.reset();
    QApplication::setPalette(variant.palette);
    QApplication::setLayoutDirection(variant.direction);
    qApp->setProperty(toolkit::qt::highContrastProperty, variant.hasHighContrast);
    QLocale::setDefault(variant.locale);
    QCoreApplication::removeTranslator(&words);
    const bool isTranslated = words.load(variant.locale, "parcels", "_", ":/i18n");
    ASSERT_EQ(isTranslated, variant.locale.language() == QLocale::German);
    if (isTranslated) QCoreApplication::installTranslator(&words);
    form = std::make_unique<GuidedForm>();
    form->move(place);
    form->show();
    form->activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(form.get()));
    form->menuBar()->actions()[0]->menu()->actions()[0]->trigger();
    hosts::settle();
  }

  GuidePanel& panel() const {
    return static_cast<GuidePanel&>(*form->findChild<QWidget*>("qz-guide"));
  }
  const Spotlight& spotlight() const {
    for (const QObject* const child : form->children()) {
      if (const auto* const found = dynamic_cast<const Spotlight*>(child)) return *found;
    }
    throw std::runtime_error("nothing is lit");
  }
  static QRect onScreen(const QWidget& widget) {
    return {widget.mapToGlobal(QPoint()), widget.size()};
  }
  QRect target() const { return spotlight().lit().translated(form->mapToGlobal(QPoint())); }

  /// Returns what the screen shows, at `ratio` pixels a point.
  QImage picture(double ratio) const {
    const QRect screen = form->screen()->geometry();
    QImage image((screen.size() * ratio), QImage::Format_RGB32);
    image.setDevicePixelRatio(ratio);
    image.fill(QColor(96, 125, 139));
    QPainter painter(&image);
    for (QWidget* const window :
         {static_cast<QWidget*>(form.get()), static_cast<QWidget*>(&panel())}) {
      painter.save();
      painter.translate(window->mapToGlobal(QPoint()) - screen.topLeft());
      window->render(&painter, QPoint(), QRegion(),
                     QWidget::DrawWindowBackground | QWidget::DrawChildren);
      painter.restore();
    }
    return image;
  }

  /// Returns what is around the form and the panel.
  QImage pictureAround(int ratio) const {
    const QRect screen = form->screen()->geometry();
    const QRect part = (onScreen(*form) | onScreen(panel())).adjusted(-20, -20, 20, 20) & screen;
    QImage image =
        picture(ratio).copy({(part.topLeft() - screen.topLeft()) * ratio, part.size() * ratio});
    image.setDevicePixelRatio(1);
    return image;
  }

  static void save(const QImage& image, const QString& name) {
    const QDir folder(QT_TESTCASE_BUILDDIR "/guide-pictures");
    QDir().mkpath(folder.path());
    EXPECT_TRUE(image.save(folder.filePath(name + ".png")));
  }

  /// Returns the pictures side by side.
  static QImage sheetOf(const std::vector<QImage>& images) {
    QSize size;
    for (const QImage& image : images) {
      size = QSize(size.width() + image.width(), std::max(size.height(), image.height()));
    }
    QImage sheet(size, QImage::Format_RGB32);
    sheet.fill(Qt::black);
    QPainter painter(&sheet);
    int x = 0;
    for (const QImage& image : images) {
      painter.drawImage(std::exchange(x, x + image.width()), 0, image);
    }
    return sheet;
  }

  /// Expects what must hold at every step; returns whether the guide points at a control.
  bool expectWellPlaced(const QString& name) const {
    const QRect place = onScreen(panel());
    EXPECT_TRUE(panel().isVisible()) << name.toStdString();
    EXPECT_TRUE(form->screen()->availableGeometry().contains(place)) << name.toStdString();
    EXPECT_FALSE(place.intersects(target())) << name.toStdString();
    for (const auto* const label : {&panel().heading, &panel().text}) {
      EXPECT_GE(label->height(), label->heightForWidth(label->width())) << name.toStdString();
    }
    EXPECT_GE(panel().scroll.viewport()->height(), panel().text.height()) << name.toStdString();
    return !target().isEmpty();
  }

  /// Expects a line in the guide's colour at the left edge of the lit rectangle.
  void expectFrame(const QString& name) const {
    const QPoint edge(target().left(), target().center().y());
    if (!form->screen()->geometry().contains(edge)) return;
    const QColor line = hosts::qt::guideLineColor(form->palette());
    EXPECT_EQ(picture(1).pixelColor(edge), line) << name.toStdString();
    EXPECT_GE(toolkit::qt::contrast(line, form->palette().color(QPalette::Window)), 3);
  }

  /// Pictures the present step at 1 pixel a point for the sheet, and at 2 as a file of its own.
  void look(const QString& name) {
    if (expectWellPlaced(name)) expectFrame(name);
    save(pictureAround(2), QString("%1-step-%2-2x").arg(name).arg(steps.size()));
    steps.push_back(pictureAround(1));
  }

  /// Goes through all steps; each is pictured.
  void walk(const QString& name) {
    steps.clear();
    for (int step = 0; step < 3; ++step) {
      look(name);
      click(panel().next);
    }
    look(name);
    click(*form->findChild<QToolBar*>()->widgetForAction(form->order));
    look(name);
    click(panel().next);
    EXPECT_FALSE(panel().isVisible());
    save(sheetOf(steps), name + "-1x");
  }

  static void click(QWidget& widget) {
    QTest::mouseClick(&widget, Qt::LeftButton);
    hosts::settle();
    hosts::settle();
  }
};

TEST_F(GuidePictures, ShowEveryStepOfTheExample) {
  const Variant variants[] = {{"light", QApplication::style()->standardPalette()},
                              {"dark", nightPalette()},
                              {"right-to-left", before, Qt::RightToLeft},
                              {"high-contrast", contrastPalette(), Qt::LeftToRight, true},
                              {"german", before, Qt::LeftToRight, false, QLocale::German}};
  for (const Variant& variant : variants) {
    begin(variant, {40, 120});
    walk(variant.name);
  }
}

// The form is in the corners of the screen, and hangs over its edges.
TEST_F(GuidePictures, ShowTheEdgesOfTheScreen) {
  const QRect screen = QGuiApplication::primaryScreen()->availableGeometry();
  const QSize room = screen.size() - QSize(480, 440);
  const struct {
    const char* name;
    QPoint place;
  } cases[] = {{"top-left", {0, 0}},
               {"top-right", {room.width(), 0}},
               {"bottom-left", {0, room.height()}},
               {"bottom-right", {room.width(), room.height()}},
               {"over-the-right", {room.width() + 150, 60}},
               {"over-the-left", {-150, 60}},
               {"over-the-bottom", {40, room.height() + 100}}};
  for (const auto& c : cases) {
    begin({"edge", before}, screen.topLeft() + c.place);
    walk(QString("%1x%2-%3").arg(screen.width()).arg(screen.height()).arg(c.name));
  }
}

}  // namespace

}  // namespace qz
