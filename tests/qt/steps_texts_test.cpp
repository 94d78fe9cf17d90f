// SPDX-License-Identifier: MIT
// What Qt does for walk-throughs in steps: forms as their windows, texts that are measured,
// pictures for translators.

#include <gtest/gtest.h>

#include <QApplication>
#include <QWidget>
#include <algorithm>
#include <filesystem>
#include <stdexcept>

#include "drivers/qt/qt_driver.hpp"
#include "tests/steps/source_folder.hpp"
#include "tests/tools/tool_run.hpp"
#include "tools/commands.hpp"
#include "tools/steps/each_step.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools {
namespace {

using drivers::MissingRoom;
using drivers::ViewKind;

/// A view of the kind in a window of its own, 100 points wide and 30 high.
class MeasuredView {
 public:
  explicit MeasuredView(ViewKind kind) {
    driver_.workOffScreen();
    window_ = driver_.makeWindow({0, 0, 200, 100});
    view_ = driver_.makeView(kind, 1, {10, 10, 100, 30}, window_->contentView());
  }
  MissingRoom with(const std::string& caption) {
    driver_.setCaption(view_, caption);
    return driver_.missingRoom(view_);
  }
  MissingRoom inFont(const std::string& title, double size) {
    toolkit::TextAttributes attributes;
    attributes.font = toolkit::Font{"Helvetica", size, false, false, false};
    toolkit::asButton(view_)->setAttributedTitle(toolkit::AttributedString(title, attributes));
    return driver_.missingRoom(view_);
  }

 private:
  drivers::QtDriver driver_;
  toolkit::Ref<toolkit::Window> window_;
  toolkit::Ref<toolkit::View> view_;
};

TEST(StepsTexts, AreMeasuredInTheirControls) {
  for (const ViewKind kind :
       {ViewKind::button, ViewKind::toggle, ViewKind::popUpButton, ViewKind::textField}) {
    MeasuredView view(kind);
    EXPECT_EQ(view.with("Next"), MissingRoom{}) << drivers::rowOf(kind).name;
    EXPECT_GT(view.with("Donaudampfschifffahrtsgesellschaft").width, 50)
        << drivers::rowOf(kind).name;
    EXPECT_EQ(view.with(""), MissingRoom{}) << drivers::rowOf(kind).name;
  }
  MeasuredView text(ViewKind::textField);
  EXPECT_EQ(text.with("one two three four five six seven eight nine ten").width, 0);
  EXPECT_GT(text.with("one two three four five six seven eight nine ten").height, 10);
  EXPECT_EQ(MeasuredView(ViewKind::imageView).with("no image"), MissingRoom{});
  MeasuredView button(ViewKind::button);
  EXPECT_EQ(button.inFont("Next", 12), MissingRoom{});
  EXPECT_GT(button.inFont("Next", 60).width, 20);
}

TEST(StepsTexts, OfWindowsOffTheScreenAreMeasured) {
  drivers::QtDriver driver;
  driver.workOffScreen();
  const auto window = driver.makeWindow({0, 0, 200, 100});
  bool isOffScreen = false;
  for (const QWidget* const widget : QApplication::topLevelWidgets()) {
    if (widget->isVisible()) isOffScreen = widget->testAttribute(Qt::WA_DontShowOnScreen);
  }
  EXPECT_TRUE(isOffScreen);
}

TEST(StepsTexts, ThatDoNotFitAreNamedWithTheirStep) {
  const steps::SourceFolder folder;
  folder.writeSource(
      "steps:\n  a: {text: Hello, next: {title: Go on, press: b}}\n"
      "  b: {text: Bye, next: {title: Go on, press: c}}\n  c: {next: {title: End, press: end}}\n");
  folder.write("de.po",
               "msgid \"Hello\"\nmsgstr \"Hallo\"\nmsgid \"Bye\"\nmsgstr \"Auf Wiedersehen\"\n"
               "msgid \"Go on\"\nmsgstr \"Mit dem nächsten Schritt fortfahren\"\n"
               "msgid \"End\"\nmsgstr \"Ende\"\n");
  const Result built = run(buildCommand, {"build", "tour.yaml", "--language", "de"});
  EXPECT_EQ(built.status, 0);
  EXPECT_TRUE(
      built.err.starts_with("tour.yaml:4:20: warning: “Mit dem nächsten Schritt "
                            "fortfahren” (a, next) does not fit: the control lacks "))
      << built.err;
  EXPECT_TRUE(built.err.ends_with(" points of width\n")) << built.err;
  EXPECT_EQ(std::count(built.err.begin(), built.err.end(), '\n'), 1) << built.err;
  const Result longer = run(buildCommand, {"build", "tour.yaml", "--language", "x-long"});
  EXPECT_EQ(longer.err, "") << "half as long again still fits";
}

TEST(StepsTexts, MayLackHeight) {
  const steps::SourceFolder folder;
  folder.writeSource("steps: {a: {text: Hello, next: {press: end}}}\n");
  folder.write("de.po", "msgid \"Hello\"\nmsgstr \"eins\\nzwei\\ndrei\\nvier\\nfünf\"\n");
  const std::string said = run(buildCommand, {"build", "tour.yaml", "--language", "de"}).err;
  EXPECT_TRUE(said.starts_with("tour.yaml:3:13: warning: “eins")) << said;
  EXPECT_TRUE(said.ends_with(" points of height\n")) << said;
  EXPECT_EQ(said.find("width"), std::string::npos) << said;
}

TEST(StepsTexts, AreMeasuredByNoToolkitThatCannotBeMade) {
  const auto fails = [](drivers::Driver&) -> bool { throw std::runtime_error("no display"); };
  EXPECT_EQ(steps::findDriver(fails), nullptr);
  EXPECT_NE(steps::findDriver([](drivers::Driver&) { return true; }), nullptr);
}

TEST(StepsTexts, PicturesShowTranslatorsWhereTheyAre) {
  const steps::SourceFolder folder;
  folder.writeSource(
      "every step: {text: Same}\nsteps:\n  a: {next: {title: Go on, press: b & c}}\n"
      "  b & c: {next: {title: End, press: end}}\n");
  const Result extracted =
      run(textsCommand, {"texts", "extract", "tour.yaml", "--screenshots", "pictures"});
  EXPECT_EQ(extracted.status, 0) << extracted.err;
  const std::string texts = wholeFile("tour.pot").value_or("");
  for (const char* const comment : {"#. every step: text of text, in pictures/01-a.png\n",
                                    "#. step b & c: title of next, in pictures/02-b-c.png\n"}) {
    EXPECT_NE(texts.find(comment), std::string::npos) << texts;
  }
  EXPECT_GT(std::filesystem::file_size("pictures/02-b-c.png"), 500U);
  folder.write("file", "");
  EXPECT_EQ(run(textsCommand, {"texts", "extract", "tour.yaml", "--screenshots", "file"}).err,
            "qz-walkthrough: --screenshots: file/01-a.png: cannot be written\n");
}

#ifdef QZ_FORMS

constexpr const char* stepsForm = R"(<ui version="4.0"><class>Form</class>
<widget class="QWidget" name="Form">
 <property name="geometry"><rect><x>0</x><y>0</y><width>300</width><height>200</height></rect></property>
 <layout class="QVBoxLayout">
  <item><widget class="QLabel" name="text"><property name="text"><string>Text</string></property>
   <property name="qzTag" stdset="0"><number>5</number></property></widget></item>
  <item><widget class="QPushButton" name="next"><property name="text"><string>Next</string></property>
   <property name="qzTag" stdset="0"><number>2</number></property></widget></item>
 </layout>
</widget></ui>)";

TEST(StepsTexts, AFormIsTheWindowOfSources) {
  const play::WorkingDirectory folder;
  folder.write("form.ui", stepsForm);
  const std::string source =
      "window: form.ui\ncontrols: {text: 5, next: 2}\n"
      "steps: {a: {text: Hello, next: {press: b}}, b: {text: Bye, next: {press: end}}}\n";
  folder.write("one.yaml", source);
  folder.write("two.yaml", source);
  const Result played =
      run(playCommand, {"play", "one.yaml", "--toolkit", "qt", "--press", "next", "next"});
  EXPECT_EQ(played.status, 0) << played.out << played.err;
  EXPECT_NE(played.out.find("“Hello” → “Bye”"), std::string::npos) << played.out;
  // Several at once: Qt reads forms on one thread only.
  const Result checked = run(checkCommand, {"check", "one.yaml", "two.yaml", "--threads", "2"});
  EXPECT_EQ(checked.status, 0) << checked.out << checked.err;
  const Result built = run(buildCommand, {"build", "one.yaml"});
  EXPECT_EQ(built.status, 0) << built.err;
  folder.write("one.yaml", "window: form.ui\ncontrols: {text: 7}\nsteps: {a: {}}\n");
  EXPECT_EQ(run(buildCommand, {"build", "one.yaml"}).err,
            "qz-walkthrough: one.yaml:2:18: the window has no control with the tag 7\n");
}

#endif

}  // namespace
}  // namespace qz::tools
