// SPDX-License-Identifier: MIT
// Playing scripts in windows: pictures of the steps, and a person who presses visible buttons.
#include "tools/play/play.hpp"

#include <gtest/gtest.h>
#include <unistd.h>

#include <QApplication>
#include <QImage>
#include <QPushButton>
#include <QTest>
#include <QTimer>
#include <filesystem>
#include <fstream>
#include <initializer_list>
#include <set>
#include <sstream>
#include <string>

#include "drivers/qt/qt_driver.hpp"
#include "tools/play/session.hpp"
#include "tools/support/input_file.hpp"

namespace qz::tools::play {
namespace {

namespace fs = std::filesystem;

/// A directory for one test, removed on destruction.
struct Directory {
  fs::path path = fs::temp_directory_path() / ("qz-play-" + std::to_string(::getpid()));

  Directory() { fs::create_directories(path); }
  ~Directory() { fs::remove_all(path); }
  Directory(const Directory&) = delete;
  Directory& operator=(const Directory&) = delete;

  std::string write(const std::string& name, const std::string& text) const {
    std::ofstream(path / name) << text;
    return (path / name).string();
  }
};

/// Returns the names of the files in `path`, sorted.
std::string namesIn(const fs::path& path) {
  std::set<std::string> names;
  for (const auto& entry : fs::directory_iterator(path)) names.insert(entry.path().filename());
  std::string list;
  for (const std::string& name : names) list += name + "\n";
  return list;
}

std::string contents(const fs::path& path) {
  std::ostringstream text;
  text << std::ifstream(path).rdbuf();
  return text.str();
}

/// Button 2 starts a timer of a second, whose list shows button 3, which ends the walk-through.
constexpr const char* script =
    "{ 1 = ((HIDE_OBJECT_WITH_ID, 3));"
    "  2 = ((SET_TITLE_FOR_OBJECT_ID, Pushed, 2), (SET_TIMER_FOR_ID, 1, 5));"
    "  5 = ((SHOW_OBJECT_WITH_ID, 3), (SET_TITLE_FOR_OBJECT_ID, End, 3));"
    "  3 = (TERMINATE_PARSER); }";

TEST(PlayInWindows, TakesAPictureOfEveryStep) {
  const Directory scripts;
  PlayOptions options;
  options.script = scripts.write("script.plist", script);
  options.toolkit = "qt";
  options.screenshots = (scripts.path / "made").string();
  options.steps = {Press{2}, Advance{1.25}, Press{2}, Advance{1}, Press{3}};
  fs::create_directories(*options.screenshots);
  std::ofstream(fs::path(*options.screenshots) / "07-press-9.png") << "old";
  std::ofstream(fs::path(*options.screenshots) / "mine.png") << "kept";

  std::istringstream in;
  std::ostringstream out;
  std::ostringstream log;
  EXPECT_EQ(play(options, {in, out, log, false, {}}), ExitStatus::fine);

  const fs::path made = *options.screenshots;
  EXPECT_EQ(namesIn(made),
            "00-start.png\n01-press-2.png\n02-list-5.png\n03-advance-1.25.png\n04-press-2.png\n"
            "05-list-5.png\nmine.png\ntranscript.txt\n");
  EXPECT_EQ(contents(made / "transcript.txt"), out.str());
  const QImage start(QString::fromStdString((made / "00-start.png").string()));
  EXPECT_EQ(start.width(), 640 * start.devicePixelRatio());
  const QImage pressed(QString::fromStdString((made / "01-press-2.png").string()));
  EXPECT_NE(start, pressed);
}

QPushButton* buttonTitled(const char* title) {
  for (QWidget* const widget : QApplication::allWidgets()) {
    auto* const button = qobject_cast<QPushButton*>(widget);
    if (button && button->isVisible() && button->text() == title) return button;
  }
  return nullptr;
}

/// A started session over the script's window, for a person to play.
class PlayedByAPerson : public testing::Test {
 protected:
  PlayedByAPerson() { session.start(options.script, ""); }

  PlayOptions optionsOfScript() const {
    PlayOptions made;
    made.script = directory.write("script.plist", script);
    return made;
  }

  void expectInOrder(std::initializer_list<const char*> headings) const {
    std::size_t at = 0;
    for (const char* const heading : headings) {
      at = out.str().find(heading, at);
      EXPECT_NE(at, std::string::npos) << heading << "\n" << out.str();
    }
  }

  const Directory directory;
  const PlayOptions options = optionsOfScript();
  const InputFile file{options.script, "a script"};
  drivers::QtDriver driver;
  Stage stage{driver, planStage(options.stage, file.dictionary(), options.script)};
  std::ostringstream out;
  Transcript transcript{out, {}};
  Session session{driver, stage, transcript};
};

TEST_F(PlayedByAPerson, WritesDownWhatAPersonDoes) {
  // The person presses each button as soon as it is visible.
  QTimer person;
  person.callOnTimeout([] {
    for (const char* title : {"2", "End"}) {
      if (auto* const button = buttonTitled(title)) {
        return QTest::mouseClick(button, Qt::LeftButton);
      }
    }
  });
  person.start(50);
  session.handOver();

  EXPECT_TRUE(session.picture().ended);
  EXPECT_TRUE(session.problems().empty());
  expectInOrder({"1. start", "2. press 2 (2)", "3. list 5 runs by its timer", "4. press 3 (End)"});
}

/// Presses the watched button at the moment when it is shown.
struct Eager : QObject {
  bool eventFilter(QObject* button, QEvent* event) override {
    if (event->type() == QEvent::Show) static_cast<QPushButton*>(button)->click();
    return false;
  }
};

TEST_F(PlayedByAPerson, IsNotTakenForTheTimerThatFiredRightBefore) {
  Eager eager;
  for (QWidget* const widget : QApplication::allWidgets()) {
    auto* const button = qobject_cast<QPushButton*>(widget);
    if (button && button->text() == "3") button->installEventFilter(&eager);
  }
  QTimer::singleShot(20, [] { buttonTitled("2")->click(); });
  session.handOver();
  expectInOrder({"1. start", "2. press 2 (2)", "3. list 5 runs by its timer", "4. press 3 (3)"});
}

TEST_F(PlayedByAPerson, EndsWhenThePersonClosesTheWindow) {
  QTimer::singleShot(20, [] { buttonTitled("2")->window()->close(); });
  session.handOver();
  EXPECT_FALSE(session.picture().ended);
  EXPECT_EQ(out.str().find("2. "), std::string::npos) << out.str();
}

}  // namespace
}  // namespace qz::tools::play
