// SPDX-License-Identifier: MIT
// A window for a script that is played without one: guesses each tag's kind from what the script
// does with it.
#include "tools/walkthrough/stand_in.hpp"

#include <map>
#include <string>

#include "qz/commands.hpp"
#include "qz/property_list/scalars.hpp"
#include "tools/walkthrough/parse_number.hpp"

namespace qz::tools::walkthrough {
namespace {

using drivers::ViewKind;

/// Returns the kind of control that a command of this target suggests.
ViewKind suggestedKind(TargetKind target) {
  switch (target) {
    case TargetKind::imageView:
      return ViewKind::imageView;
    case TargetKind::buttonWithState:
      return ViewKind::toggle;
    case TargetKind::button:
      return ViewKind::button;
    case TargetKind::none:
    case TargetKind::anyView:
    case TargetKind::anyControl:
    case TargetKind::textField:
      break;
  }
  return ViewKind::textField;
}

/// If commands suggest several kinds for a tag, the one with the highest rank wins.
int rank(ViewKind kind) {
  if (kind == ViewKind::imageView) return 3;
  if (kind == ViewKind::toggle) return 2;
  return kind == ViewKind::button ? 1 : 0;
}

using Kinds = std::map<toolkit::Tag, ViewKind>;

void take(Kinds& kinds, toolkit::Tag tag, ViewKind kind) {
  const auto [place, isNew] = kinds.emplace(tag, kind);
  if (!isNew && rank(kind) > rank(place->second)) place->second = kind;
}

void takeTarget(Kinds& kinds, const toolkit::ValueRef<toolkit::Array>& element) {
  const auto name = toolkit::asString(element->objectAtIndex(0));
  const Command* const command = compoundCommandNamed(name->text());
  if (!command) return;
  const auto position = command->positionOf(ParameterType::controlTag);
  if (!position || element->count() <= *position + 1) return;
  const auto tag = element->objectAtIndex(*position + 1);
  if (toolkit::asString(tag) || toolkit::asNumber(tag)) {
    take(kinds, tag->intValue(), suggestedKind(command->target));
  }
}

Kinds kindsByTag(const toolkit::ValueRef<toolkit::Dictionary>& script) {
  Kinds kinds;
  for (const std::string& key : script->allKeys()) {
    if (const auto tag = parseNumber<toolkit::Tag>(key)) take(kinds, *tag, ViewKind::button);
    for (const auto& element : toolkit::asArray(script->objectForKey(key))->elements()) {
      const auto command = toolkit::asArray(element);
      if (command->count() > 0) takeTarget(kinds, command);
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

}  // namespace qz::tools::walkthrough
