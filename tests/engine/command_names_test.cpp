// SPDX-License-Identifier: MIT
// The exported command names: all of them, and their values before a host changes them.

#include <gtest/gtest.h>

#include <set>
#include <string>

#include "qz/engine.hpp"

namespace qz {

namespace {

struct Name {
  const char* constant;  // without the common prefix
  const std::string& value;
};

#define NAME(name) \
  { #name, QZ_PLIST_STATE_PARSER_##name }
const Name names[] = {
    NAME(TERMINATE_PARSER),
    NAME(RETURN_TO_IDLE_LOOP),
    NAME(HIDE_OBJECT_WITH_ID),
    NAME(SHOW_OBJECT_WITH_ID),
    NAME(ENABLE_OBJECT_WITH_ID),
    NAME(DISABLE_OBJECT_WITH_ID),
    NAME(LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID),
    NAME(PROCESS_COMMANDS_FOR_ID),
    NAME(SET_TOOL_TIP_FOR_ID),
    NAME(SET_TEXT_FOR_OBJECT_ID),
    NAME(LOAD_BACKGROUND_WITH_IMAGE),
    NAME(BUTTON_WITH_ID_AT),
    NAME(IMAGE_WITH_ID_AND_PATH_AT),
    NAME(ALLOW_FLASHING),
    NAME(FLASH_ID),
    NAME(HIGHLIGHT_ID),
    NAME(SET_STATE_ON_FOR_OBJECT_ID),
    NAME(SET_STATE_OFF_FOR_OBJECT_ID),
    NAME(SET_BACKGROUND_COLOR_FOR_OBJECT_ID),
    NAME(SET_FOREGROUND_COLOR_FOR_OBJECT_ID),
    NAME(SET_TITLE_FOR_OBJECT_ID),
    NAME(SET_TAG_FOR_OBJECT_ID),
    NAME(SET_TAG_FOR_OBJECT_ID_WITH_TIMER),
    NAME(SET_TIMER_FOR_ID),
    NAME(SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID),
    NAME(SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID),
    NAME(SET_ATTRIBUTED_STRING_AS_IS_WITH_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID),
};
#undef NAME

TEST(CommandNames, Are27AndAllDifferent) {
  EXPECT_EQ(std::size(names), 27U);
  std::set<std::string> values;
  for (const Name& name : names) values.insert(name.value);
  EXPECT_EQ(values.size(), std::size(names));
}

TEST(CommandNames, HoldTheirOwnNameButForTheIdleCommand) {
  for (const Name& name : names) {
    const std::string constant = name.constant;
    EXPECT_EQ(name.value, constant == "RETURN_TO_IDLE_LOOP" ? "IDLE_LOOP" : constant);
  }
}

}  // namespace

}  // namespace qz
