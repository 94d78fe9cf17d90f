// SPDX-License-Identifier: MIT
// Makes windows and lists of random commands.
#include <algorithm>
#include <string>
#include <utility>

#include "tests/check/draft.hpp"
#include "tests/check/script_reading.hpp"

namespace qz::naive {

namespace {

using drivers::ViewKind;
using toolkit::Tag;

constexpr Tag firstHelperList = 101;  // of the lists that other lists run, or timers

class Filler {
 public:
  Filler(Draft& draft, const Bounds& bounds, Dice& dice)
      : draft_(draft), bounds_(bounds), dice_(dice) {}

  void fill();

 private:
  void addControls();
  void addLists();
  void addEnd();
  Value command(Tag list);
  bool isStep(Tag list) const;
  void addStep(Tag tag, Draft::List& list);
  bool isWanted(const Command& command, Tag list);
  void chooseRetagging(Tag list);
  Tag nextTag();
  Value simpleForm(const Command& command);
  Value compoundForm(const Command& command, Tag list);
  Value parameter(const Command& command, ParameterType type, Tag list);
  Value written(Tag value);
  Value flag();
  Tag targetOf(TargetKind kind, bool takesAway = false);
  bool takesAway(const Command& command);
  Tag laterList(Tag list);
  Tag ownTag(std::size_t control) {
    return tagsOfControl(control) + static_cast<Tag>(dice_.below(ownTags));
  }

  Draft& draft_;
  const Bounds& bounds_;
  Dice& dice_;
  std::size_t retagged_ = 0;  // the control of a re-tagging command
  Tag tagNow_ = 0;            // and the tag that the control may have by then
};

void Filler::fill() {
  addControls();
  addLists();
  for (auto& [tag, list] : draft_.lists) {
    if (isStep(tag) && !dice_.oneIn(10)) addStep(tag, list);
    const std::size_t count = 1 + dice_.below(tag == Draft::start ? 2 : 4);
    for (std::size_t i = 0; i < count; ++i) list.push_back(command(tag));
  }
  if (bounds_.ends && !dice_.oneIn(4)) addEnd();
  if (dice_.oneIn(2)) draft_.addToStart(text("IDLE_LOOP"));
}

// The first two controls are buttons, the next two are none.
void Filler::addControls() {
  constexpr ViewKind buttons[] = {ViewKind::button, ViewKind::button, ViewKind::toggle,
                                  ViewKind::popUpButton, ViewKind::mixed};
  constexpr ViewKind others[] = {ViewKind::textField, ViewKind::textField, ViewKind::textField,
                                 ViewKind::imageView, ViewKind::box,       ViewKind::plain};
  const std::size_t least = std::min<std::size_t>(bounds_.controls, 4);
  const std::size_t count =
      dice_.oneIn(8) ? 1 + dice_.below(3) : least + dice_.below(bounds_.controls - least + 1);
  for (std::size_t i = 0; i < count; ++i) {
    const bool isTwin = bounds_.isWild && i > 0 && dice_.oneIn(5);
    const ViewKind kind =
        i == 2 || i == 3 || dice_.oneIn(2) ? dice_.oneOf(others) : dice_.oneOf(buttons);
    draft_.addControl(i < 2 ? ViewKind::button : kind, tagsOfControl(isTwin ? i - 1 : i));
    auto& control = draft_.host.controls.back();
    control.hidden = dice_.oneIn(isButton(control.kind) ? 16 : 4);
    control.enabled = !rowOf(control.kind).isControl || !dice_.oneIn(16);
  }
}

// Two buttons get lists for two or all of their steps; then come other steps, the other buttons and
// helpers.
void Filler::addLists() {
  const std::size_t steps = 2 + dice_.below(ownTags - 1);
  const std::size_t count = bounds_.lists - 1 - dice_.below(bounds_.lists / 3);
  std::vector<Tag> buttons;
  for (const auto& control : draft_.host.controls) {
    if (isButton(control.kind)) buttons.push_back(control.tag);
  }
  Tag helpers = firstHelperList;
  for (std::size_t i = 0; i < count; ++i) {
    const Tag button = buttons[i / steps % buttons.size()];
    if (i < 2 * steps && !dice_.oneIn(10)) {
      draft_.lists[button + static_cast<Tag>(i % steps)];
    } else if (dice_.oneIn(2)) {
      draft_.lists[helpers++];
    } else {
      draft_.lists[dice_.oneIn(2) ? dice_.oneOf(buttons) : button + 2];
    }
  }
}

// The end is mostly the last command of a list that is not the first.
void Filler::addEnd() {
  const bool isAnywhere = bounds_.isWild && dice_.oneIn(3);
  auto list = std::next(draft_.lists.begin(),
                        static_cast<std::ptrdiff_t>(dice_.below(draft_.lists.size())));
  // Mostly no button that can be pressed at once.
  const bool isEarly = list->first % tagsOfControl(0) == 0;
  if (isEarly && std::next(list) != draft_.lists.end() && !dice_.oneIn(4)) ++list;
  if (list->first == Draft::start && !isAnywhere) return;
  list->second.push_back(text("TERMINATE_PARSER"));
  if (isAnywhere) std::reverse(list->second.begin(), list->second.end());
}

/// Whether the list is one of several that one button runs in turn.
bool Filler::isStep(Tag list) const {
  if (list < tagsOfControl(0) || list >= firstHelperList) return false;
  const Tag from = list - list % tagsOfControl(0);
  return std::distance(draft_.lists.lower_bound(from), draft_.lists.lower_bound(from + ownTags)) >
         1;
}

/// Gives the pressed button the tag of its next step. Mostly also changes another control: steps
/// that show and hide in turn have many places between them.
void Filler::addStep(Tag tag, Draft::List& list) {
  constexpr std::string_view changes[] = {"HIDE_OBJECT_WITH_ID", "SHOW_OBJECT_WITH_ID",
                                          "DISABLE_OBJECT_WITH_ID"};
  retagged_ = static_cast<std::size_t>(tag / tagsOfControl(0) - 1);
  tagNow_ = tag;
  list.push_back(compound("SET_TAG_FOR_OBJECT_ID", {written(nextTag()), written(tag)}));
  if (dice_.oneIn(4)) return;
  const Command& change = *compoundCommandNamed(changes[tag % tagsOfControl(0)]);
  list.push_back(compound(change.name, {written(targetOf(change.target, true))}));
}

Value Filler::command(Tag list) {
  // What changes places is more interesting than what changes looks, and comes up more often.
  constexpr std::string_view favourites[] = {"HIDE_OBJECT_WITH_ID",     "SHOW_OBJECT_WITH_ID",
                                             "HIDE_OBJECT_WITH_ID",     "SHOW_OBJECT_WITH_ID",
                                             "DISABLE_OBJECT_WITH_ID",  "ENABLE_OBJECT_WITH_ID",
                                             "SET_TIMER_FOR_ID",        "SET_TIMER_FOR_ID",
                                             "PROCESS_COMMANDS_FOR_ID", "SET_TEXT_FOR_OBJECT_ID"};
  for (;;) {
    const Command& command = dice_.oneIn(4) ? dice_.oneOf(commandCatalogue())
                                            : *compoundCommandNamed(dice_.oneOf(favourites));
    if (!isWanted(command, list)) continue;
    chooseRetagging(list);
    const bool isSimple = command.form == CommandForm::simple ||
                          (command.form == CommandForm::both && dice_.oneIn(4)) ||
                          (command.form == CommandForm::none && dice_.oneIn(2));
    return isSimple ? simpleForm(command) : compoundForm(command, list);
  }
}

bool Filler::isWanted(const Command& command, Tag list) {
  const bool isStart = list == Draft::start;
  if (command.flow == CommandFlow::endsWalkThrough) return false;  // see addEnd
  if (command.form == CommandForm::none && !dice_.oneIn(6)) return false;
  if (command.flow == CommandFlow::runsList) {
    if (isStart && bounds_.startIsQuiet) return false;
    return bounds_.isWild || list != draft_.lists.rbegin()->first;
  }
  // A start that leaves nothing to press is soon explored.
  return !isStart || !takesAway(command) || dice_.oneIn(4);
}

bool Filler::takesAway(const Command& command) {
  return command.name.starts_with("HIDE") || command.name.starts_with("DISABLE");
}

// The control that a re-tagging command is about, and its tags: seldom once more the list's own.
void Filler::chooseRetagging(Tag list) {
  const auto controls = static_cast<Tag>(draft_.host.controls.size());
  const Tag owner = list / tagsOfControl(0) - 1;
  const bool isOwned = list >= tagsOfControl(0) && owner < controls;
  const bool movesOn = isOwned && dice_.oneIn(3);
  retagged_ = movesOn ? static_cast<std::size_t>(owner) : dice_.below(draft_.host.controls.size());
  tagNow_ = movesOn ? list : ownTag(retagged_);
}

// Another tag of the same control, one that has a list if there is one.
Tag Filler::nextTag() {
  const Tag from = tagsOfControl(retagged_);
  const Tag step = 1 + static_cast<Tag>(dice_.below(2));
  const Tag next = from + (tagNow_ - from + step) % ownTags;
  const Tag other = from + (tagNow_ - from + ownTags - step) % ownTags;
  return draft_.lists.contains(next) || !draft_.lists.contains(other) ? next : other;
}

// The simple form of running a list is an endless chain, which only planting makes.
Value Filler::simpleForm(const Command& command) {
  if (command.flow == CommandFlow::runsList) return text("IDLE_LOOP");
  if (takesAway(command) && !dice_.oneIn(4)) return text("SHOW_OBJECT_WITH_ID");
  return text(command.name);
}

Value Filler::compoundForm(const Command& command, Tag list) {
  std::vector<Value> parameters;
  for (const CommandParameter& row : command.parameters) {
    if (row.isOptional && dice_.oneIn(6)) break;
    parameters.push_back(parameter(command, row.type, list));
  }
  if (bounds_.isWild && dice_.oneIn(12)) parameters.push_back(number(5));
  if (bounds_.isWild && dice_.oneIn(12) && !parameters.empty()) parameters.pop_back();
  return compound(command.name, std::move(parameters));
}

Value Filler::parameter(const Command& command, ParameterType type, Tag list) {
  constexpr std::string_view texts[] = {"Next", "Well done", "", "Press Next to go on"};
  constexpr std::string_view fragments[] = {"<b>Go</b>", "caf&eacute;", "<i>two</i> words"};
  constexpr std::string_view colors[] = {"red", "blue", "green"};
  switch (type) {
    case ParameterType::controlTag: {
      const bool retags = command.positionOf(ParameterType::newTag).has_value();
      return written(retags ? tagNow_ : targetOf(command.target, takesAway(command)));
    }
    case ParameterType::newTag:
      return written(bounds_.isWild && dice_.oneIn(4) ? targetOf(TargetKind::anyView) : nextTag());
    case ParameterType::listTag:
      return written(laterList(list));
    case ParameterType::controlOrListTag:
      return written(dice_.oneIn(3) ? targetOf(TargetKind::button) : laterList(Draft::start));
    case ParameterType::seconds:
      return written(bounds_.isWild && dice_.oneIn(10) ? -1 : 2 + static_cast<Tag>(dice_.below(3)));
    case ParameterType::points:
    case ParameterType::integer:
    case ParameterType::anything:
      return number(static_cast<Tag>(dice_.below(20)));
    case ParameterType::flag:
      return flag();
    case ParameterType::text:
      return text(dice_.oneOf(texts));
    case ParameterType::html:
      return text(dice_.oneOf(fragments));
    case ParameterType::fontName:
      return text("Helvetica");
    case ParameterType::imageName:
      return text("meadow");
    case ParameterType::colorName:
      return text(dice_.oneOf(colors));
  }
  return nullptr;
}

Value Filler::written(Tag value) {
  return dice_.oneIn(4) ? text(std::to_string(value)) : number(value);
}

Value Filler::flag() {
  const bool isSet = dice_.oneIn(2);
  if (dice_.oneIn(2)) return text(isSet ? "YES" : "NO");
  return toolkit::Number::withBool(isSet);
}

/// Returns a tag of a control that suits, if one of a few tries does; mostly the tag that it has at
/// first.
Tag Filler::targetOf(TargetKind kind, bool takesAway) {
  std::size_t control = 0;
  const bool wantsButton = dice_.oneIn(takesAway ? 16 : 8);
  for (int tries = 0; tries < 6; ++tries) {
    control = dice_.below(draft_.host.controls.size());
    const ViewKind found = draft_.host.controls[control].kind;
    const bool suitsWell = kind != TargetKind::anyView && kind != TargetKind::anyControl;
    if (suits(kind, found) && (suitsWell || isButton(found) == wantsButton)) break;
    if (bounds_.isWild && dice_.oneIn(3)) break;
  }
  return dice_.oneIn(10) ? ownTag(control) : draft_.host.controls[control].tag;
}

/// Returns a list behind `list`, mostly a helper, so that lists do not run each other without end;
/// `list` itself if it is the last. A wild script also runs lists in front, and missing ones.
Tag Filler::laterList(Tag list) {
  if (bounds_.isWild && dice_.oneIn(10)) return ownTag(0);
  const auto behind = dice_.oneIn(4) ? list : std::max(list, firstHelperList - 1);
  auto first = draft_.lists.upper_bound(behind);
  if (first == draft_.lists.end()) first = draft_.lists.upper_bound(list);
  const auto count = static_cast<std::size_t>(std::distance(first, draft_.lists.end()));
  if (count == 0) return list;
  return std::next(first, static_cast<std::ptrdiff_t>(dice_.below(count)))->first;
}

}  // namespace

toolkit::ValueRef<toolkit::Dictionary> Draft::script() const {
  std::vector<toolkit::Dictionary::Entry> entries;
  for (const auto& [tag, list] : lists) {
    entries.push_back(
        {text(std::to_string(tag)), toolkit::Array::make(list, toolkit::Mutability::immutable)});
  }
  entries.insert(entries.end(), others.begin(), others.end());
  return toolkit::Dictionary::make(std::move(entries), toolkit::Mutability::immutable);
}

void fillAtRandom(Draft& draft, const Bounds& bounds, Dice& dice) {
  Filler(draft, bounds, dice).fill();
}

}  // namespace qz::naive
