// SPDX-License-Identifier: MIT
// A window for a script that is played without one: guesses each tag's kind from what the script
// does with it.
#include "tools/play/stand_in.hpp"

#include <map>
#include <string>

#include "qz/engine.hpp"
#include "qz/property_list/scalars.hpp"
#include "text/uppercase.hpp"
#include "tools/play/parse_number.hpp"

namespace qz::tools::play {
namespace {

using drivers::ViewKind;

/// Which element of a compound command is a tag, and which kind of control the command suggests.
struct TagUse {
  const std::string& command;
  std::size_t element;
  drivers::ViewKind kind;
};

constexpr auto anything = drivers::ViewKind::textField;

const TagUse tagUses[] = {
    {QZ_PLIST_STATE_PARSER_LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID, 2, drivers::ViewKind::imageView},
    {QZ_PLIST_STATE_PARSER_SET_STATE_ON_FOR_OBJECT_ID, 1, drivers::ViewKind::toggle},
    {QZ_PLIST_STATE_PARSER_SET_STATE_OFF_FOR_OBJECT_ID, 1, drivers::ViewKind::toggle},
    {QZ_PLIST_STATE_PARSER_FLASH_ID, 2, drivers::ViewKind::button},
    {QZ_PLIST_STATE_PARSER_SET_TITLE_FOR_OBJECT_ID, 2, drivers::ViewKind::button},
    {QZ_PLIST_STATE_PARSER_SET_BACKGROUND_COLOR_FOR_OBJECT_ID, 2, drivers::ViewKind::button},
    {QZ_PLIST_STATE_PARSER_SET_FOREGROUND_COLOR_FOR_OBJECT_ID, 2, drivers::ViewKind::button},
    {QZ_PLIST_STATE_PARSER_SET_TEXT_FOR_OBJECT_ID, 2, drivers::ViewKind::textField},
    {QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID, 4,
     drivers::ViewKind::textField},
    {QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID,
     4, drivers::ViewKind::textField},
    {QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_IS_WITH_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID,
     5, drivers::ViewKind::textField},
    {QZ_PLIST_STATE_PARSER_HIDE_OBJECT_WITH_ID, 1, anything},
    {QZ_PLIST_STATE_PARSER_SHOW_OBJECT_WITH_ID, 1, anything},
    {QZ_PLIST_STATE_PARSER_ENABLE_OBJECT_WITH_ID, 1, anything},
    {QZ_PLIST_STATE_PARSER_DISABLE_OBJECT_WITH_ID, 1, anything},
    {QZ_PLIST_STATE_PARSER_SET_TOOL_TIP_FOR_ID, 2, anything},
    {QZ_PLIST_STATE_PARSER_SET_TAG_FOR_OBJECT_ID, 2, anything},
    {QZ_PLIST_STATE_PARSER_SET_TAG_FOR_OBJECT_ID_WITH_TIMER, 2, anything},
};

/// If commands suggest several kinds for a tag, the one with the highest rank wins.
int rank(drivers::ViewKind kind) {
  if (kind == drivers::ViewKind::imageView) return 3;
  if (kind == drivers::ViewKind::toggle) return 2;
  return kind == drivers::ViewKind::button ? 1 : 0;
}

using Kinds = std::map<toolkit::Tag, drivers::ViewKind>;

void take(Kinds& kinds, toolkit::Tag tag, drivers::ViewKind kind) {
  const auto [place, isNew] = kinds.emplace(tag, kind);
  if (!isNew && rank(kind) > rank(place->second)) place->second = kind;
}

void takeTargets(Kinds& kinds, const toolkit::ValueRef<toolkit::Array>& command) {
  const auto name = text::uppercased(toolkit::asString(command->objectAtIndex(0))->text());
  for (const TagUse& use : tagUses) {
    if (name != use.command || command->count() <= use.element) continue;
    const auto tag = command->objectAtIndex(use.element);
    if (toolkit::asString(tag) || toolkit::asNumber(tag)) take(kinds, tag->intValue(), use.kind);
  }
}

Kinds kindsByTag(const toolkit::ValueRef<toolkit::Dictionary>& script) {
  Kinds kinds;
  for (const std::string& key : script->allKeys()) {
    if (const auto tag = parseNumber<toolkit::Tag>(key))
      take(kinds, *tag, drivers::ViewKind::button);
    for (const auto& element : toolkit::asArray(script->objectForKey(key))->elements()) {
      const auto command = toolkit::asArray(element);
      if (command->count() > 0) takeTargets(kinds, command);
    }
  }
  return kinds;
}

}  // namespace

HostWindow standInWindow(const toolkit::ValueRef<toolkit::Dictionary>& script) {
  constexpr double rowHeight = 30;
  constexpr double controlHeight = 24;
  const Kinds kinds = kindsByTag(script);
  HostWindow host;
  host.title = "stand-in";
  host.content.height = rowHeight * static_cast<double>(kinds.size());
  double y = host.content.height;
  for (const auto& [tag, kind] : kinds) {
    y -= rowHeight;
    HostControl control;
    control.kind = kind;
    control.tag = tag;
    control.frame = {0, y, host.content.width, controlHeight};
    if (rank(kind) == 1 || rank(kind) == 2) control.caption = std::to_string(tag);
    host.controls.push_back(control);
  }
  return host;
}

}  // namespace qz::tools::play
