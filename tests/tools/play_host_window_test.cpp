// SPDX-License-Identifier: MIT
// Files that describe a host's window.
#include <gtest/gtest.h>

#include "drivers/memory/memory_driver.hpp"
#include "play_files.hpp"
#include "tools/support/failure.hpp"
#include "tools/walkthrough/host_window.hpp"

namespace qz::tools::play {
namespace {

using drivers::ViewKind;
using toolkit::State;

HostWindow read(std::string_view text) {
  const WorkingDirectory directory;
  directory.write("host.plist", text);
  return parseHostWindow(InputFile("host.plist", "a host's window"));
}

/// Returns the error message for a file of this text, or "accepted".
std::string refusal(std::string_view text) {
  try {
    read(text);
  } catch (const Failure& failure) {
    EXPECT_EQ(failure.status(), ExitStatus::badInput);
    return failure.what();
  }
  return "accepted";
}

TEST(PlayHostWindow, ReadsTheWindowAndItsControls) {
  const HostWindow host = read(
      "({class = NSWindow; frame = (1, 2, 300, 200); title = Backup;},"
      " {class = \"NSButton:mixed\"; tag = \"-7\"; frame = (1, 2.5, 3, 4); title = Go;"
      "  state = mixed; enabled = NO; hidden = YES; toolTip = Help;})");
  EXPECT_EQ(host.title, "Backup");
  EXPECT_EQ(host.content, (toolkit::Rect{1, 2, 300, 200}));
  ASSERT_EQ(host.controls.size(), 1U);
  const HostControl& control = host.controls[0];
  EXPECT_EQ(control.kind, drivers::ViewKind::mixed);
  EXPECT_EQ(control.tag, -7);
  EXPECT_EQ(control.frame, (toolkit::Rect{1, 2.5, 3, 4}));
  EXPECT_EQ(control.caption, "Go");
  EXPECT_EQ(control.state, State::mixed);
  EXPECT_TRUE(control.hidden);
  EXPECT_FALSE(control.enabled);
  EXPECT_EQ(control.toolTip, "Help");
}

TEST(PlayHostWindow, ReadsNumbersAndFlagsOfXml) {
  const HostWindow host = read(
      "<plist><array><dict><key>class</key><string>NSTextField</string>"
      "<key>tag</key><integer>4</integer><key>hidden</key><true/>"
      "<key>frame</key><array><integer>1</integer><real>2.5</real><integer>3</integer>"
      "<integer>4</integer></array></dict></array></plist>");
  EXPECT_EQ(host.controls[0].tag, 4);
  EXPECT_EQ(host.controls[0].frame, (toolkit::Rect{1, 2.5, 3, 4}));
  EXPECT_TRUE(host.controls[0].hidden);
}

TEST(PlayHostWindow, WhatIsAbsentHasADefault) {
  const HostWindow host = read("({class = NSTextField; frame = (0, 0, 1, 1);})");
  EXPECT_EQ(host.title, "");
  EXPECT_EQ(host.content, (toolkit::Rect{100, 100, 640, 480}));
  EXPECT_EQ(host.controls[0].tag, 0);
  EXPECT_EQ(host.controls[0].caption, std::nullopt);
  EXPECT_TRUE(host.controls[0].enabled);
  EXPECT_FALSE(host.controls[0].hidden);
}

// The names of the kinds of view, as the message lists them after another word.
std::string namesOfKinds() {
  std::string names;
  for (const std::string_view name : drivers::viewKindNames()) names += ", " + std::string(name);
  return names;
}

TEST(PlayHostWindow, SaysWhatIsWrongWithTheList) {
  const struct {
    std::string text;
    std::string message;
  } cases[] = {
      {"{}", "1:1: expected an array of controls, found an empty dictionary"},
      {"(text)", "1:2: entry 1: expected a dictionary, found the string “text”"},
      {"({frame = (0, 0, 1, 1);})", "1:2: entry 1: class: expected a string, found nothing"},
      {"({class = NSView; frame = (0, 0, 1, 1);},\n {class = NSWindow;})",
       "2:11: entry 2: class: expected a control (the window is the first entry), found the string "
       "“NSWindow”"},
      {"({class = NSButon; frame = (0, 0, 1, 1);})",
       "1:11: entry 1: class: expected one of NSWindow" + namesOfKinds() +
           ", found the string “NSButon”"},
      {"({class = NSWindow; frame = (0, 0, 1, 1); tag = 1;})",
       "1:43: entry 1: unknown key “tag”; expected class, frame, title"},
  };
  for (const auto& c : cases) EXPECT_EQ(refusal(c.text), "host.plist:" + c.message) << c.text;
}

TEST(PlayHostWindow, SaysWhatIsWrongWithAField) {
  const struct {
    std::string kind;
    std::string field;
    std::string message;
  } cases[] = {
      {"NSBox", "title = x;", "unknown key “title”; expected class, tag, frame, hidden, toolTip"},
      {"NSButton", "tittle = x;",
       "unknown key “tittle”; expected class, tag, frame, hidden, toolTip, title, state, enabled; "
       "did you mean \"title\"?"},
      {"NSButton", "tag = 1.5;", "tag: expected a whole number, found the string “1.5”"},
      {"NSButton", "hidden = perhaps;", "hidden: expected YES or NO, found the string “perhaps”"},
      {"NSButton", "state = mixed;", "state: expected “on” or “off”, found the string “mixed”"},
      {"\"NSButton:mixed\"", "state = half;",
       "state: expected “on”, “off” or “mixed”, found the string “half”"},
      {"NSButton", "title = (x);", "title: expected a string, found an array of 1"},
  };
  for (const auto& c : cases) {
    const std::string text = "({ class = " + c.kind + "; frame = (0, 0, 1, 1);\n" + c.field + "})";
    const std::string message = refusal(text);
    EXPECT_TRUE(message.starts_with("host.plist:2:")) << message;
    EXPECT_TRUE(message.ends_with(": entry 1: " + c.message)) << message;
  }
}

TEST(PlayHostWindow, SaysWhatIsWrongWithAFrame) {
  const std::string four = ": expected four numbers (x, y, width, height), found ";
  const std::string length = ": expected a number of 0 or more, found ";
  const struct {
    std::string frame;
    std::string place;
    std::string message;
  } cases[] = {
      {"", "1:2", four + "nothing"},
      {"frame = wide;", "1:27", four + "the string “wide”"},
      {"frame = (0, 0, 1);", "1:27", four + "an array of 3"},
      {"frame = (0, nan, 1, 1);", "1:31", "[1]: expected a number, found the string “nan”"},
      {"frame = (0, 0, 1, x);", "1:37", "[3]" + length + "the string “x”"},
      {"frame = (0, 0, \"-1\", 1);", "1:34", "[2]" + length + "the string “-1”"},
  };
  for (const auto& c : cases) {
    EXPECT_EQ(refusal("({class = NSView; " + c.frame + "})"),
              "host.plist:" + c.place + ": entry 1: frame" + c.message)
        << c.frame;
  }
}

TEST(PlayHostWindow, PutsItOnTheScreen) {
  const auto driver = drivers::makeMemoryDriver();
  const HostWindow host = read(
      "({class = NSWindow; frame = (1, 2, 300, 200);},"
      " {class = \"NSButton:toggle\"; tag = 7; frame = (1, 2, 3, 4); title = Go; state = on;"
      "  enabled = NO; toolTip = Help;},"
      " {class = NSTextField; frame = (0, 0, 1, 1); title = Hello; hidden = YES;})");
  const auto window = makeHostWindow(*driver, host, "host.plist");
  EXPECT_EQ(driver->look(window).content, host.content);
  EXPECT_TRUE(driver->look(window).visible);
  const auto& views = window->contentView()->subviews();
  ASSERT_EQ(views.size(), 2U);
  const auto button = driver->look(views[0]);
  EXPECT_EQ(button.kind, drivers::ViewKind::toggle);
  EXPECT_EQ(button.tag, 7);
  EXPECT_EQ(button.title.string(), "Go");
  EXPECT_EQ(button.state, State::on);
  EXPECT_FALSE(button.enabled);
  EXPECT_EQ(button.toolTip, "Help");
  EXPECT_EQ(driver->look(views[1]).text.string(), "Hello");
  EXPECT_TRUE(driver->look(views[1]).hidden);
}

TEST(PlayHostWindow, AnImageMustBeKnown) {
  const WorkingDirectory directory;
  const auto driver = drivers::makeMemoryDriver();
  driver->setResourcePath(directory.path());
  const HostWindow host = read("({class = NSImageView; frame = (0, 0, 1, 1); image = disk;})");
  EXPECT_THROW(makeHostWindow(*driver, host, "host.plist"), Failure);
  directory.write("disk.png", "not looked into");
  const auto window = makeHostWindow(*driver, host, "host.plist");
  EXPECT_EQ(driver->look(window->contentView()->subviews()[0]).image, "disk");
}

}  // namespace
}  // namespace qz::tools::play
