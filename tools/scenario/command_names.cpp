// SPDX-License-Identifier: MIT
// The exported command names.

#include "tools/scenario/command_names.hpp"

#include <algorithm>
#include <cassert>
#include <iterator>

#include "qz/engine.hpp"

namespace qz::tools::scenario {
namespace {

struct Constant {
  std::string_view name;
  std::string* value;
};

#define CONSTANT(name) \
  Constant { #name, &name }
const Constant constants[] = {
    CONSTANT(QZ_PLIST_STATE_PARSER_TERMINATE_PARSER),
    CONSTANT(QZ_PLIST_STATE_PARSER_RETURN_TO_IDLE_LOOP),
    CONSTANT(QZ_PLIST_STATE_PARSER_HIDE_OBJECT_WITH_ID),
    CONSTANT(QZ_PLIST_STATE_PARSER_SHOW_OBJECT_WITH_ID),
    CONSTANT(QZ_PLIST_STATE_PARSER_ENABLE_OBJECT_WITH_ID),
    CONSTANT(QZ_PLIST_STATE_PARSER_DISABLE_OBJECT_WITH_ID),
    CONSTANT(QZ_PLIST_STATE_PARSER_LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID),
    CONSTANT(QZ_PLIST_STATE_PARSER_PROCESS_COMMANDS_FOR_ID),
    CONSTANT(QZ_PLIST_STATE_PARSER_SET_TOOL_TIP_FOR_ID),
    CONSTANT(QZ_PLIST_STATE_PARSER_SET_TEXT_FOR_OBJECT_ID),
    CONSTANT(QZ_PLIST_STATE_PARSER_LOAD_BACKGROUND_WITH_IMAGE),
    CONSTANT(QZ_PLIST_STATE_PARSER_BUTTON_WITH_ID_AT),
    CONSTANT(QZ_PLIST_STATE_PARSER_IMAGE_WITH_ID_AND_PATH_AT),
    CONSTANT(QZ_PLIST_STATE_PARSER_ALLOW_FLASHING),
    CONSTANT(QZ_PLIST_STATE_PARSER_FLASH_ID),
    CONSTANT(QZ_PLIST_STATE_PARSER_HIGHLIGHT_ID),
    CONSTANT(QZ_PLIST_STATE_PARSER_SET_STATE_ON_FOR_OBJECT_ID),
    CONSTANT(QZ_PLIST_STATE_PARSER_SET_STATE_OFF_FOR_OBJECT_ID),
    CONSTANT(QZ_PLIST_STATE_PARSER_SET_BACKGROUND_COLOR_FOR_OBJECT_ID),
    CONSTANT(QZ_PLIST_STATE_PARSER_SET_FOREGROUND_COLOR_FOR_OBJECT_ID),
    CONSTANT(QZ_PLIST_STATE_PARSER_SET_TITLE_FOR_OBJECT_ID),
    CONSTANT(QZ_PLIST_STATE_PARSER_SET_TAG_FOR_OBJECT_ID),
    CONSTANT(QZ_PLIST_STATE_PARSER_SET_TAG_FOR_OBJECT_ID_WITH_TIMER),
    CONSTANT(QZ_PLIST_STATE_PARSER_SET_TIMER_FOR_ID),
    CONSTANT(
        QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID),
    CONSTANT(
        QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID),
    CONSTANT(
        QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_IS_WITH_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID),
};
#undef CONSTANT

}  // namespace

std::vector<std::string_view> commandConstants() {
  std::vector<std::string_view> names;
  for (const auto& constant : constants) names.push_back(constant.name);
  return names;
}

RenamedCommands::~RenamedCommands() {
  // In reverse, because a command may have been renamed twice.
  for (auto change = before_.rbegin(); change != before_.rend(); ++change) {
    *change->first = std::move(change->second);
  }
}

void RenamedCommands::rename(std::string_view constant, std::string name) {
  const auto* const found =
      std::find_if(std::begin(constants), std::end(constants),
                   [&](const Constant& known) { return known.name == constant; });
  assert(found != std::end(constants));
  before_.emplace_back(found->value, std::exchange(*found->value, std::move(name)));
}

}  // namespace qz::tools::scenario
