// SPDX-License-Identifier: MIT
// Measures the time from a click on a button of a real window until everything that it changes is
// repainted, for a walk-through's list and for a host's slot that makes the same changes by hand;
// and how long a walk-through needs to begin and end in a form with many widgets.
#include <QApplication>
#include <QCheckBox>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QMouseEvent>
#include <QPixmap>
#include <QPushButton>
#include <QTabWidget>
#include <QTemporaryFile>
#include <QVBoxLayout>
#include <cstdio>
#include <cstdlib>
#include <memory>
#include <optional>
#include <utility>

#include "bench/measuring.hpp"
#include "qz/engine.hpp"
#include "qz/hosts/qt/walk_through.hpp"
#include "qz/property_list/reader.hpp"
#include "qz/toolkit/qt/adoption.hpp"
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

/// The form with a walk-through on it, which restores it at the end if the window is adopted.
struct Guided : Form {
  explicit Guided(bool adopts) {
    if (adopts) adopted.emplace(toolkit, window);
    toolkit.log().setSink([](std::string_view) {});
    toolkit.files().setResourcePath(EXAMPLE_IMAGES);
    engine->getGuiAssetsFromWindow(shown);
    engine->setPlistDictionary(toolkit::dictionaryFromPropertyList(script));
  }
  ~Guided() { engine->terminateParser(); }
  Guided(const Guided&) = delete;
  Guided& operator=(const Guided&) = delete;

  toolkit::qt::QtToolkit toolkit;
  std::optional<toolkit::qt::AdoptedWindow> adopted;
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

/// Measures a step forth and one back.
void measureSteps(const std::string& where, bool adopts) {
  Guided guided(adopts);
  ByHand byHand;
  const bench::Contender engine = click("engine", guided), slot = click("slot", byHand);
  for (const auto& contender : {engine, slot, engine, slot}) {
    contender.prepare();
    contender.run();
    if (contender.name == "slot") requireSame(guided, byHand);
  }
  const auto t = bench::leastTimes({engine, slot, engine, slot}, 500);
  for (const std::size_t i : {0U, 2U}) {
    bench::printRow({(i == 0 ? "forth" : "back") + where, bench::shownTime(t[i]),
                     bench::shownTime(t[i + 1]), bench::shownRatio(t[i] / t[i + 1])});
  }
}

/// A form with tabs of group boxes, of four controls each.
struct BigForm : QTabWidget {
  explicit BigForm(int controls) {
    for (int first = 0; first < controls; first += 20) {
      auto* const page = new QWidget;
      auto* const column = new QVBoxLayout(page);
      for (int box = 0; box < 5; ++box) column->addWidget(makeBox(first + 4 * box));
      addTab(page, QString::number(first));
    }
    show();
  }

  static QGroupBox* makeBox(int first) {
    auto* const box = new QGroupBox;
    auto* const column = new QVBoxLayout(box);
    int tag = first;
    for (QWidget* const widget :
         {static_cast<QWidget*>(new QPushButton("Press")), static_cast<QWidget*>(new QLineEdit),
          static_cast<QWidget*>(new QLabel("Label")),
          static_cast<QWidget*>(new QCheckBox("Check"))}) {
      widget->setProperty("qzTag", ++tag);
      column->addWidget(widget);
    }
    return box;
  }
};

struct Stay {
  double beginning;
  double end;
};

/// Returns the shortest times that a walk-through needs to begin and to end in a form.
Stay measureStay(int controls) {
  QTemporaryFile file;
  if (!file.open() || file.write("{ 0 = (IDLE_LOOP); }") < 0 || !file.flush()) std::exit(1);
  toolkit::qt::QtToolkit toolkit;
  toolkit.log().setSink([](std::string_view) {});
  BigForm form(controls);
  QCoreApplication::processEvents();
  hosts::qt::WalkThrough walkThrough(toolkit);
  const std::string path = file.fileName().toStdString();
  const auto begin = [&] {
    if (!walkThrough.play(path, form)) std::exit(1);
  };
  const auto end = [&] { walkThrough.end(); };
  const auto times = bench::leastTimes({{"begin", begin, end}, {"end", end, begin}}, 20);
  return {times[0], times[1]};
}

void printStays() {
  bench::printHead("A walk-through in a form with many tagged widgets",
                   {"tagged widgets", "beginning", "end"});
  for (const int controls : {100, 1000, 10000}) {
    const Stay stay = measureStay(controls);
    bench::printRow(
        {std::to_string(controls), bench::shownTime(stay.beginning), bench::shownTime(stay.end)});
  }
}

}  // namespace

}  // namespace qz

using namespace qz;

int main(int argc, char** argv) {
  if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
  qputenv("QT_SCALE_FACTOR", "1");  // the slot's images have only one resolution
  const QApplication application(argc, argv);
  qz::bench::printHead("From a click to the last changed widget repainted",
                       {"step", "this engine", "a slot by hand", "this : by hand"});
  measureSteps("", false);
  measureSteps(" in an adopted form", true);
  printStays();
  return 0;
}
