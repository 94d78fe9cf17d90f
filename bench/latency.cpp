// SPDX-License-Identifier: MIT
// Measures the time from a click on a button of a real window until everything that it changes is
// repainted, for a walk-through's list and for a host's slot that makes the same changes by hand.
#include <QApplication>
#include <QCheckBox>
#include <QLabel>
#include <QMouseEvent>
#include <QPixmap>
#include <QPushButton>
#include <cstdio>
#include <cstdlib>
#include <memory>
#include <utility>

#include "bench/measuring.hpp"
#include "qz/engine.hpp"
#include "qz/property_list/reader.hpp"
#include "qz/toolkit/qt/qt_toolkit.hpp"

namespace qz {

namespace {

/// A host's window: 480 × 320 points, seven controls.
struct Form {
  Form() {
    window.resize(480, 320);
    const std::pair<QWidget*, QRect> places[] = {
        {&heading, {140, 30, 320, 30}},  {&text, {140, 70, 320, 100}}, {&picture, {30, 60, 80, 80}},
        {&encrypt, {140, 210, 320, 20}}, {&skip, {20, 270, 90, 30}},   {&back, {250, 270, 90, 30}},
        {&next, {350, 270, 110, 30}},
    };
    int tag = 0;
    for (const auto& [widget, place] : places) {
      widget->setGeometry(place);
      widget->setProperty("qzTag", ++tag);
    }
    text.setWordWrap(true);
    text.setAlignment(Qt::AlignTop | Qt::AlignLeading);
    picture.setAlignment(Qt::AlignCenter);
    picture.setPixmap(disk);
    window.show();
  }

  QPixmap disk{EXAMPLE_IMAGES "/disk.png"}, done{EXAMPLE_IMAGES "/done.png"};
  QWidget window;
  QLabel heading{&window}, text{&window}, picture{&window};
  QCheckBox encrypt{"Encrypt the backup", &window};
  QPushButton skip{"Skip", &window}, back{"Back", &window}, next{"Next", &window};
};

/// Two steps, forth and back.
constexpr auto script = R"({
  7 = (
    (SET_TAG_FOR_OBJECT_ID, 8, 7),
    (SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID,
      "Keep it to yourself", "Helvetica", 18, 1),
    (SET_TEXT_FOR_OBJECT_ID, "Whoever finds the disk can read it, unless you encrypt it.", 2),
    (LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID, done, 3),
    (SHOW_OBJECT_WITH_ID, 4), (SET_STATE_ON_FOR_OBJECT_ID, 4),
    (ENABLE_OBJECT_WITH_ID, 6),
    (SET_TOOL_TIP_FOR_ID, "What is copied so far stays", 5),
    (SET_TITLE_FOR_OBJECT_ID, "Back up now", 8)
  );
  8 = (
    (SET_TAG_FOR_OBJECT_ID, 7, 8),
    (SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID,
      "Your first backup", "Helvetica", 18, 1),
    (SET_TEXT_FOR_OBJECT_ID, "In two minutes all your files will be safe on another disk.", 2),
    (LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID, disk, 3),
    (SET_STATE_OFF_FOR_OBJECT_ID, 4), (HIDE_OBJECT_WITH_ID, 4),
    (DISABLE_OBJECT_WITH_ID, 6),
    (SET_TOOL_TIP_FOR_ID, "Leave without a backup", 5),
    (SET_TITLE_FOR_OBJECT_ID, "Next", 7)
  );
})";

/// The form with a walk-through on it.
struct Guided : Form {
  Guided() {
    toolkit.log().setSink([](std::string_view) {});
    toolkit.files().setResourcePath(EXAMPLE_IMAGES);
    engine->getGuiAssetsFromWindow(shown);
    engine->setPlistDictionary(toolkit::dictionaryFromPropertyList(script));
  }
  ~Guided() { engine->terminateParser(); }
  Guided(const Guided&) = delete;
  Guided& operator=(const Guided&) = delete;

  toolkit::qt::QtToolkit toolkit;
  toolkit::Ref<toolkit::Window> shown = toolkit.application().window(window);
  std::shared_ptr<QZ_Plist_State_Parser> engine =
      QZ_Plist_State_Parser::initWithWindow(toolkit, shown);
};

/// The form with a slot that makes the same changes.
struct ByHand : Form {
  ByHand() {
    QObject::connect(&next, &QPushButton::clicked, [this] { step(); });
  }

  void step() {
    const bool on = std::exchange(isOn, !isOn);
    heading.setText(QString("<p align=\"center\"><span style=\"font-family:'Liberation Sans'; "
                            "font-size:18px\">%1</span></p>")
                        .arg(on ? "Your first backup" : "Keep it to yourself"));
    text.setText(on ? "In two minutes all your files will be safe on another disk."
                    : "Whoever finds the disk can read it, unless you encrypt it.");
    picture.setPixmap(on ? disk : done);
    encrypt.setVisible(!on);
    encrypt.setChecked(!on);
    back.setEnabled(!on);
    skip.setToolTip(on ? "Leave without a backup" : "What is copied so far stays");
    next.setText(on ? "Next" : "Back up now");
  }

  bool isOn = false;
};

void sendMouse(QWidget& widget, QEvent::Type type, Qt::MouseButtons held) {
  const QPointF local = widget.rect().center();
  QMouseEvent event(type, local, widget.mapTo(widget.window(), local), widget.mapToGlobal(local),
                    Qt::LeftButton, held, Qt::NoModifier);
  QCoreApplication::sendEvent(&widget, &event);
}

/// Measures from the release of the button, which is already held down, until nothing is left to
/// paint.
bench::Contender click(const char* name, Form& form) {
  return {name,
          [&] {
            sendMouse(form.next, QEvent::MouseButtonRelease, Qt::NoButton);
            QCoreApplication::processEvents();
          },
          [&] {
            form.window.activateWindow();  // Qt paints widgets of inactive windows more slowly
            QCoreApplication::processEvents();
            sendMouse(form.next, QEvent::MouseButtonPress, Qt::LeftButton);
            QCoreApplication::processEvents();
          }};
}

/// Returns the share of pixels in which the two windows differ.
double difference(Form& one, Form& other) {
  const QImage a = one.window.grab().toImage(), b = other.window.grab().toImage();
  int count = 0;
  for (int y = 0; y < a.height(); ++y) {
    for (int x = 0; x < a.width(); ++x) count += a.pixel(x, y) != b.pixel(x, y);
  }
  return count / static_cast<double>(a.width() * a.height());
}

void requireSame(Guided& guided, ByHand& byHand) {
  const double differing = difference(guided, byHand);
  if (differing <= 0.001) return;
  std::fprintf(stderr, "bench-latency: by hand %.2f%% of the window looks otherwise\n",
               100 * differing);
  std::exit(1);
}

}  // namespace

}  // namespace qz

using namespace qz;

int main(int argc, char** argv) {
  if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
  qputenv("QT_SCALE_FACTOR", "1");  // the slot's images have only one resolution
  const QApplication application(argc, argv);
  Guided guided;
  ByHand byHand;
  const qz::bench::Contender engine = click("engine", guided), slot = click("slot", byHand);
  for (const auto& contender : {engine, slot, engine, slot}) {
    contender.prepare();
    contender.run();
    if (contender.name == "slot") requireSame(guided, byHand);
  }
  // Forth and back, measured separately.
  const auto t = qz::bench::leastTimes({engine, slot, engine, slot}, 500);
  qz::bench::printHead("From a click to the last changed widget repainted",
                       {"step", "this engine", "a slot by hand", "this : by hand"});
  for (const std::size_t i : {0U, 2U}) {
    qz::bench::printRow({i == 0 ? "forth" : "back", qz::bench::shownTime(t[i]),
                         qz::bench::shownTime(t[i + 1]), qz::bench::shownRatio(t[i] / t[i + 1])});
  }
  return 0;
}
