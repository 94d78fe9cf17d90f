// SPDX-License-Identifier: MIT
// The stand-in for a window that is not given, and the pictures of a stage.
#include <gtest/gtest.h>

#include "drivers/memory/memory_driver.hpp"
#include "play_files.hpp"
#include "tools/play/words.hpp"
#include "tools/support/input_file.hpp"
#include "tools/walkthrough/stage.hpp"
#include "tools/walkthrough/stand_in.hpp"
#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::play {
namespace {

toolkit::ValueRef<toolkit::Dictionary> script(std::string_view text) {
  const WorkingDirectory directory;
  directory.write("script.plist", text);
  return InputFile("script.plist", "a script").dictionary();
}

/// Returns the stand-in's controls, from top to bottom: "1 button, 7 image".
std::string standIn(std::string_view text) {
  std::string words;
  for (const HostControl& control : standInWindow(script(text)).controls) {
    if (!words.empty()) words += ", ";
    words += std::to_string(control.tag) + " " + std::string(rowOf(control.kind).word);
  }
  return words;
}

TEST(PlayStandIn, MakesAControlOfTheKindThatTheScriptTakesItFor) {
  const struct {
    std::string list;
    std::string controls;
  } cases[] = {
      {"IDLE_LOOP", ""},
      {"(SET_TEXT_FOR_OBJECT_ID, Hello, 7)", ", 7 text field"},
      {"(set_text_for_object_id, Hello, \"-7\")", "-7 text field, "},
      {"(LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID, disk, 7)", ", 7 image"},
      {"(SET_STATE_ON_FOR_OBJECT_ID, 7)", ", 7 check box"},
      {"(FLASH_ID, YES, 7)", ", 7 button"},
      {"(HIDE_OBJECT_WITH_ID, 7)", ", 7 text field"},
      {"(HIDE_OBJECT_WITH_ID, 7), (SET_TITLE_FOR_OBJECT_ID, Go, 7)", ", 7 button"},
      {"(SET_TITLE_FOR_OBJECT_ID, Go, 7), (HIDE_OBJECT_WITH_ID, 7)", ", 7 button"},
      {"(SET_TEXT_FOR_OBJECT_ID, Hello, 1)", ""},
      {"(SET_TEXT_FOR_OBJECT_ID, Hello)", ""},
      {"(SET_TEXT_FOR_OBJECT_ID, Hello, (7))", ""},
      {"(), (()), {}", ""},
  };
  for (const auto& c : cases) {
    const bool before = c.controls.ends_with(", ");
    EXPECT_EQ(standIn("{ 1 = (" + c.list + "); }"),
              before ? c.controls + "1 button" : "1 button" + c.controls)
        << c.list;
  }
}

TEST(PlayStandIn, TakesOnlyListsOfTagsForButtons) {
  EXPECT_EQ(standIn("{ 10 = (); 2 = text; 007 = (); abc = (); }"), "2 button, 7 button, 10 button");
}

TEST(PlayStage, PicturesSayWhatPressesReach) {
  drivers::MemoryDriver driver;
  const WorkingDirectory directory;
  directory.write("script.plist", "{ 1 = ((ALLOW_FLASHING, YES), (FLASH_ID, YES, 1)); 3 = (); }");
  directory.write("host.plist",
                  "({class = NSButton; tag = 1; frame = (0, 0, 1, 1);},"
                  " {class = NSButton; tag = 1; frame = (0, 0, 1, 1);},"
                  " {class = NSTextField; tag = 3; frame = (0, 0, 1, 1);})");
  StageOptions options;
  options.window = "host.plist";
  Stage stage(driver, planStage(options, InputFile("script.plist", "a script").dictionary(),
                                "script.plist"));
  stage.load(directory.path() + "/script.plist", "");
  const StepPicture picture = takePicture(driver, stage.engine(), "title");
  ASSERT_EQ(picture.controls.size(), 3U);
  EXPECT_TRUE(picture.controls[0].flashing);
  EXPECT_TRUE(picture.controls[0].hasList);
  EXPECT_FALSE(picture.controls[0].shadowed);
  EXPECT_TRUE(picture.controls[1].shadowed);
  EXPECT_FALSE(picture.controls[1].flashing);
  EXPECT_TRUE(picture.controls[2].hasList);
  EXPECT_FALSE(picture.controls[2].flashing);
  EXPECT_EQ(picture.title, "title");
  EXPECT_EQ(picture.lastList, "1");
}

TEST(PlayStage, NothingFlashesAfterTheEnd) {
  drivers::MemoryDriver driver;
  const WorkingDirectory directory;
  directory.write("script.plist", "{ 1 = ((ALLOW_FLASHING, YES), (FLASH_ID, YES, 1)); }");
  StageOptions options;
  Stage stage(driver, planStage(options, InputFile("script.plist", "a script").dictionary(),
                                "script.plist"));
  stage.load(directory.path() + "/script.plist", "1");
  EXPECT_TRUE(takePicture(driver, stage.engine(), "").controls[0].flashing);
  stage.engine().terminateParser();
  EXPECT_FALSE(takePicture(driver, stage.engine(), "").controls[0].flashing);
}

}  // namespace
}  // namespace qz::tools::play
