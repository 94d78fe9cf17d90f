// SPDX-License-Identifier: MIT
// Defects of every code, each in as few controls and lists as it needs. Their tags are from 200
// on, which the rest of the script does not name.
#include <iterator>
#include <string>

#include "tests/check/draft.hpp"

namespace qz::naive {

namespace {

using drivers::ViewKind;
using toolkit::Tag;

constexpr Tag firstTag = 200;
constexpr Tag secondTag = 201;
constexpr Tag thirdTag = 202;
constexpr Tag helperTag = 300;
constexpr Tag otherHelperTag = 301;

Value hide(Tag tag) { return compound("HIDE_OBJECT_WITH_ID", {number(tag)}); }
Value setText(std::string_view shown, Tag tag) {
  return compound("SET_TEXT_FOR_OBJECT_ID", {text(shown), number(tag)});
}
Value setTimer(Tag seconds, Tag tag) {
  return compound("SET_TIMER_FOR_ID", {number(seconds), number(tag)});
}
Value run(Tag list) { return compound("PROCESS_COMMANDS_FOR_ID", {number(list)}); }
Value flash(bool flag, Tag tag) {
  return compound("FLASH_ID", {toolkit::Number::withBool(flag), number(tag)});
}

/// Adds a button whose press runs these commands.
void addButton(Draft& draft, Tag tag, Draft::List list = {text("IDLE_LOOP")}) {
  draft.addControl(ViewKind::button, tag);
  draft.lists[tag] = std::move(list);
}
void addEndButton(Draft& draft, Tag tag) { addButton(draft, tag, {text("TERMINATE_PARSER")}); }

/// Returns commands that hide every control of the rest of the script.
Draft::List hideTheRest(const Draft& draft) {
  Draft::List list;
  for (std::size_t i = 0; i < draft.host.controls.size(); ++i) {
    for (Tag tag = 0; tag < ownTags; ++tag) list.push_back(hide(tagsOfControl(i) + tag));
  }
  return list;
}

void plantEndlessChain(Draft& draft) {
  addButton(draft, firstTag, {run(helperTag)});
  draft.lists[helperTag] = {text("IDLE_LOOP"), text("PROCESS_COMMANDS_FOR_ID")};
}
void plantRaises(Draft& draft) {
  draft.addControl(ViewKind::box, firstTag);
  draft.addToStart(compound("DISABLE_OBJECT_WITH_ID", {number(firstTag)}));
}
void plantDeadEnd(Draft& draft) {
  auto list = hideTheRest(draft);
  list.push_back(text("HIDE_OBJECT_WITH_ID"));
  addButton(draft, firstTag, std::move(list));
}
void plantTrap(Draft& draft) {
  auto list = hideTheRest(draft);
  list.push_back(hide(secondTag));
  addButton(draft, firstTag, std::move(list));
  addEndButton(draft, secondTag);
}
void plantNothing(Draft&) {}  // the bounds do it
void plantNeverRuns(Draft& draft) { draft.lists[helperTag] = {text("IDLE_LOOP")}; }
void plantNoTarget(Draft& draft) { draft.addToStart(hide(firstTag)); }
void plantWrongTarget(Draft& draft) {
  draft.addControl(ViewKind::textField, firstTag);
  draft.addToStart(compound("SET_TITLE_FOR_OBJECT_ID", {text("Next"), number(firstTag)}));
}
void plantNoList(Draft& draft) { draft.addControl(ViewKind::button, firstTag); }
void plantTimerLost(Draft& draft) {
  draft.addControl(ViewKind::button, firstTag);
  draft.lists[helperTag] = {text("IDLE_LOOP")};
  draft.addToStart(setTimer(5, helperTag));
}
void plantNeverFires(Draft& draft) {
  draft.lists[helperTag] = {text("IDLE_LOOP")};
  draft.lists[otherHelperTag] = {text("IDLE_LOOP")};
  draft.addToStart(setTimer(2, helperTag));
  draft.addToStart(setTimer(9, otherHelperTag));
}
void plantSameTag(Draft& draft) {
  draft.addControl(ViewKind::textField, firstTag);
  draft.addControl(ViewKind::textField, firstTag);
  draft.addToStart(setText("Which?", firstTag));
}
void plantFlashDecided(Draft& draft) {
  addButton(draft, firstTag);
  draft.addToStart(flash(true, firstTag));
  draft.addToStart(flash(false, firstTag));
}
void plantLooksDiffer(Draft& draft) {
  draft.addControl(ViewKind::textField, firstTag);
  addButton(draft, secondTag, {setText("Then", firstTag)});
  addButton(draft, thirdTag);
  draft.addToStart(setText("First", firstTag));
}
void plantTooBrief(Draft& draft) {
  draft.addControl(ViewKind::textField, firstTag);
  draft.lists[helperTag] = {setText("Gone", firstTag)};
  draft.addToStart(setText("These are far too many words for one second", firstTag));
  draft.addToStart(setTimer(1, helperTag));
}
void plantTagLeft(Draft& draft) {
  draft.addControl(ViewKind::box, firstTag);
  draft.addToStart(compound("SET_TAG_FOR_OBJECT_ID", {number(210), number(firstTag)}));
  addEndButton(draft, secondTag);
}
void plantLeftBehind(Draft& draft) {
  draft.addControl(ViewKind::textField, firstTag);
  draft.addToStart(setText("Still here", firstTag));
  addEndButton(draft, secondTag);
}

void plantNotAList(Draft& draft) { draft.others.push_back({text("300"), text("IDLE_LOOP")}); }
void plantOddKey(Draft& draft) {
  draft.others.push_back({text("0300"), toolkit::Array::make({}, toolkit::Mutability::immutable)});
}
void plantUnknownCommand(Draft& draft) { draft.addToStart(text("HIDE_OBJEKT_WITH_ID")); }
void plantMalformedCommand(Draft& draft) {
  draft.addToStart(toolkit::Array::make({}, toolkit::Mutability::immutable));
}
void plantMissingParameter(Draft& draft) {
  draft.addToStart(compound("SET_TITLE_FOR_OBJECT_ID", {text("Next")}));
}
void plantExtraParameter(Draft& draft) {
  draft.addToStart(compound("ALLOW_FLASHING", {text("NO"), number(firstTag)}));
}
void plantWrongType(Draft& draft) {
  draft.addToStart(compound("ALLOW_FLASHING", {compound("NO", {})}));
}
void plantNotANumber(Draft& draft) {
  draft.addToStart(compound("SET_TIMER_FOR_ID", {text("soon"), number(Draft::start)}));
}
void plantUnknownColor(Draft& draft) {
  addButton(draft, firstTag);
  draft.addToStart(
      compound("SET_FOREGROUND_COLOR_FOR_OBJECT_ID", {text("grey"), number(firstTag)}));
}

void addHtml(Draft& draft, std::string_view html, std::string_view font) {
  draft.addControl(ViewKind::textField, firstTag);
  draft.addToStart(compound("SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID",
                            {text(html), text(font), number(12), number(firstTag)}));
}
void plantUnknownFont(Draft& draft) { addHtml(draft, "<b>Go</b>", "Helvetika"); }
void plantNotAscii(Draft& draft) { addHtml(draft, "caf\u00e9", "Helvetica"); }
void plantUnknownImage(Draft& draft) {
  draft.addControl(ViewKind::imageView, firstTag);
  draft.addToStart(
      compound("LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID", {text("no such image"), number(firstTag)}));
}
void plantUselessDelay(Draft& draft) {
  addButton(draft, firstTag);
  draft.addToStart(compound("SET_TAG_FOR_OBJECT_ID_WITH_TIMER",
                            {number(firstTag), number(firstTag), number(3)}));
}

struct Row {
  std::string_view code;
  void (*plant)(Draft& draft);
};

constexpr Row rows[] = {
    {"not-a-list", plantNotAList},
    {"odd-key", plantOddKey},
    {"unknown-command", plantUnknownCommand},
    {"malformed-command", plantMalformedCommand},
    {"missing-parameter", plantMissingParameter},
    {"extra-parameter", plantExtraParameter},
    {"wrong-type", plantWrongType},
    {"not-a-number", plantNotANumber},
    {"unknown-color", plantUnknownColor},
    {"unknown-font", plantUnknownFont},
    {"unknown-image", plantUnknownImage},
    {"not-ascii", plantNotAscii},
    {"useless-delay", plantUselessDelay},
    {"endless-chain", plantEndlessChain},
    {"raises", plantRaises},
    {"dead-end", plantDeadEnd},
    {"trap", plantTrap},
    {"no-end", plantNothing},
    {"never-runs", plantNeverRuns},
    {"no-target", plantNoTarget},
    {"wrong-target", plantWrongTarget},
    {"no-list", plantNoList},
    {"timer-lost", plantTimerLost},
    {"never-fires", plantNeverFires},
    {"same-tag", plantSameTag},
    {"flash-decided", plantFlashDecided},
    {"looks-differ", plantLooksDiffer},
    {"too-brief", plantTooBrief},
    {"tag-left", plantTagLeft},
    {"left-behind", plantLeftBehind},
};

}  // namespace

Bounds boundsFor(std::string_view code) {
  Bounds bounds{.controls = 3, .lists = 5, .startIsQuiet = true};
  bounds.ends = code != "no-end";
  return bounds;
}

void plant(std::string_view code, Draft& draft) {
  for (const Row& row : rows) {
    if (row.code == code) row.plant(draft);
  }
}

}  // namespace qz::naive
