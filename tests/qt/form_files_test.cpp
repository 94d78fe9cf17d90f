// SPDX-License-Identifier: MIT
// Files of Qt Designer's as windows of the tools.

#include <gtest/gtest.h>

#include "tests/tools/play_files.hpp"
#include "tests/tools/tool_run.hpp"
#include "tools/commands.hpp"
#include "tools/support/failure.hpp"
#include "tools/walkthrough/host_window.hpp"

namespace qz::tools {

namespace {

using drivers::ViewKind;
using play::WorkingDirectory;
using walkthrough::HostControl;
using walkthrough::HostWindow;

/// A form with a text field on a tab that is not shown at first.
constexpr auto form = R"(<ui version="4.0"><class>Form</class>
<widget class="QMainWindow" name="Form">
 <property name="geometry"><rect><x>0</x><y>0</y><width>400</width><height>300</height></rect></property>
 <property name="windowTitle"><string>Orders</string></property>
 <widget class="QTabWidget" name="tabs">
  <widget class="QWidget" name="first"><attribute name="title"><string>First</string></attribute>
   <layout class="QVBoxLayout">
    <item><widget class="QPushButton" name="send"><property name="text"><string>Send</string></property>
     <property name="qzTag" stdset="0"><number>2</number></property></widget></item>
   </layout></widget>
  <widget class="QWidget" name="second"><attribute name="title"><string>Second</string></attribute>
   <layout class="QVBoxLayout">
    <item><widget class="QLineEdit" name="name"><property name="text"><string>Ada</string></property>
     <property name="qzTag" stdset="0"><number>5</number></property></widget></item>
   </layout></widget>
 </widget>
</widget></ui>)";

std::string refusal(const std::string& path) {
  try {
    walkthrough::readHostWindow(path);
  } catch (const Failure& failure) {
    EXPECT_EQ(failure.status(), ExitStatus::badInput);
    return failure.what();
  }
  return "accepted";
}

#ifdef QZ_FORMS

TEST(FormFiles, AreTheWindowThatTheirProgramShows) {
  const WorkingDirectory directory;
  directory.write("form.ui", form);
  const HostWindow window = walkthrough::readHostWindow("form.ui");
  EXPECT_EQ(window.title, "Orders");
  EXPECT_EQ(window.content.width, 400);
  ASSERT_EQ(window.controls.size(), 2U);
  const HostControl& button = window.controls[0];
  const HostControl& edit = window.controls[1];
  EXPECT_EQ(button.kind, ViewKind::button);
  EXPECT_EQ(button.tag, 2);
  EXPECT_EQ(button.caption, "Send");
  EXPECT_EQ(edit.kind, ViewKind::textField);
  EXPECT_EQ(edit.tag, 5);
  EXPECT_EQ(edit.caption, "Ada");
  EXPECT_GT(edit.frame.width, 300) << "its page is laid out, too";
}

TEST(FormFiles, ArePlayedAndTestedOnEveryToolkit) {
  const WorkingDirectory directory;
  directory.write("form.ui", form);
  directory.write("script.plist", "{ 1 = (); 2 = ((SET_TEXT_FOR_OBJECT_ID, Sent, 5)); }");
  directory.write("form.walk",
                  "copy script.plist script.plist\n"
                  "host w form.ui\n"
                  "engine\n"
                  "adopt w => YES\n"
                  "ignore log\n"
                  "load script.plist => YES\n"
                  "scenario a press sends\n"
                  "press #2\n"
                  "ignore log\n"
                  "expect #5.text Sent\n");
  for (const char* const toolkit : {"memory", "qt"}) {
    const Result played = run(playCommand, {"play", "script.plist", "--window", "form.ui",
                                            "--toolkit", toolkit, "--press", "2"});
    EXPECT_EQ(played.status, 0) << played.err;
    EXPECT_NE(played.out.find("Sent"), std::string::npos) << played.out;
    const Result tested = run(testCommand, {"test", "--toolkit", toolkit, "form.walk"});
    EXPECT_EQ(tested.status, 0) << tested.out << tested.err;
  }
}

TEST(FormFiles, ThatHoldNoFormAreRefused) {
  const WorkingDirectory directory;
  directory.write("text.ui", "Hello");
  directory.write("other.ui", "<plist/>");
  directory.write("untagged.ui", "<ui version=\"4.0\"><widget class=\"QWidget\" name=\"w\"/></ui>");
  EXPECT_EQ(refusal("none.ui"), "none.ui: no such file; expected a form of Qt Designer's");
  EXPECT_EQ(
      refusal("text.ui"),
      "text.ui: An error has occurred while reading the UI file at line 1, column 1: Start tag "
      "expected. (read as a form of Qt Designer's)");
  EXPECT_EQ(refusal("other.ui"),
            "other.ui: Invalid UI file: The root element <ui> is missing. (read as a form of Qt "
            "Designer's)");
  EXPECT_EQ(refusal("untagged.ui"),
            "untagged.ui: expected widgets with the dynamic property qzTag, found none");
}

#else

TEST(FormFiles, NeedQtsFormLoader) {
  const WorkingDirectory directory;
  directory.write("form.ui", form);
  const std::string said = refusal("form.ui");
  EXPECT_TRUE(said.starts_with("form.ui: this build does not read forms: ")) << said;
}

#endif

}  // namespace

}  // namespace qz::tools
