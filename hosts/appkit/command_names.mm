// SPDX-License-Identifier: MIT
// The names of the commands as strings of Objective-C. A change is noticed by the address of the
// string, which stays retained, so that another string cannot get the same address.

#import "hosts/appkit/command_names.hpp"

#include <string>

#import "QZ_Plist_State_Parser.h"
#include "qz/engine.hpp"
#import "toolkit/foundation/strings.hpp"

// Every constant with its first value.
// clang-format off
#define COMMAND_NAMES(DO) \
  DO(TERMINATE_PARSER, "TERMINATE_PARSER") \
  DO(RETURN_TO_IDLE_LOOP, "IDLE_LOOP") \
  DO(HIDE_OBJECT_WITH_ID, "HIDE_OBJECT_WITH_ID") \
  DO(SHOW_OBJECT_WITH_ID, "SHOW_OBJECT_WITH_ID") \
  DO(ENABLE_OBJECT_WITH_ID, "ENABLE_OBJECT_WITH_ID") \
  DO(DISABLE_OBJECT_WITH_ID, "DISABLE_OBJECT_WITH_ID") \
  DO(LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID, "LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID") \
  DO(PROCESS_COMMANDS_FOR_ID, "PROCESS_COMMANDS_FOR_ID") \
  DO(SET_TOOL_TIP_FOR_ID, "SET_TOOL_TIP_FOR_ID") \
  DO(SET_TEXT_FOR_OBJECT_ID, "SET_TEXT_FOR_OBJECT_ID") \
  DO(LOAD_BACKGROUND_WITH_IMAGE, "LOAD_BACKGROUND_WITH_IMAGE") \
  DO(BUTTON_WITH_ID_AT, "BUTTON_WITH_ID_AT") \
  DO(IMAGE_WITH_ID_AND_PATH_AT, "IMAGE_WITH_ID_AND_PATH_AT") \
  DO(ALLOW_FLASHING, "ALLOW_FLASHING") \
  DO(FLASH_ID, "FLASH_ID") \
  DO(HIGHLIGHT_ID, "HIGHLIGHT_ID") \
  DO(SET_STATE_ON_FOR_OBJECT_ID, "SET_STATE_ON_FOR_OBJECT_ID") \
  DO(SET_STATE_OFF_FOR_OBJECT_ID, "SET_STATE_OFF_FOR_OBJECT_ID") \
  DO(SET_BACKGROUND_COLOR_FOR_OBJECT_ID, "SET_BACKGROUND_COLOR_FOR_OBJECT_ID") \
  DO(SET_FOREGROUND_COLOR_FOR_OBJECT_ID, "SET_FOREGROUND_COLOR_FOR_OBJECT_ID") \
  DO(SET_TITLE_FOR_OBJECT_ID, "SET_TITLE_FOR_OBJECT_ID") \
  DO(SET_TAG_FOR_OBJECT_ID, "SET_TAG_FOR_OBJECT_ID") \
  DO(SET_TAG_FOR_OBJECT_ID_WITH_TIMER, "SET_TAG_FOR_OBJECT_ID_WITH_TIMER") \
  DO(SET_TIMER_FOR_ID, "SET_TIMER_FOR_ID") \
  DO(SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID, "SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID") \
  DO(SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID, "SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID") \
  DO(SET_ATTRIBUTED_STRING_AS_IS_WITH_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID, "SET_ATTRIBUTED_STRING_AS_IS_WITH_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID")
// clang-format on

#define DEFINE(constant, value) NSString* QZ_PLIST_STATE_PARSER_##constant = @value;
COMMAND_NAMES(DEFINE)
#undef DEFINE

namespace qz::hosts::appkit {

namespace {

struct CommandName {
  NSString** assigned;
  std::string* name;
  NSString* seen;  // retained
};

#define ROW(constant, value)                                                             \
  { &::QZ_PLIST_STATE_PARSER_##constant, &qz::QZ_PLIST_STATE_PARSER_##constant, @value } \
  ,
CommandName commandNames[] = {COMMAND_NAMES(ROW)};
#undef ROW

// No text of Foundation becomes this, so that no command has the name.
constexpr const char* noName = "\xFF";

void rename(CommandName& row) {
  [row.seen release];
  row.seen = [*row.assigned retain];
  *row.name = row.seen ? toolkit::foundation::utf8(row.seen) : noName;
}

}  // namespace

void readCommandNames() {
  for (CommandName& row : commandNames) {
    if (*row.assigned != row.seen) rename(row);
  }
}

}  // namespace qz::hosts::appkit
