// SPDX-License-Identifier: MIT
// The commands that change the appearance of one control (colours, title, tooltip, image), its
// state, or the window's background.

#include "engine/command_calls.hpp"
#include "engine/state.hpp"
#include "engine/text_of.hpp"
#include "qz/commands.hpp"

namespace qz {

using toolkit::asButton;

namespace {

constexpr std::string_view titleColors[] = {"red",   "white",  "blue", "green",
                                            "black", "orange", "gray"};
constexpr toolkit::Color colorsOfTheNames[] = {
    toolkit::colors::red,   toolkit::colors::white,  toolkit::colors::blue, toolkit::colors::green,
    toolkit::colors::black, toolkit::colors::orange, toolkit::colors::gray};

std::optional<toolkit::Color> colorNamed(std::string_view name) {
  for (std::size_t i = 0; i < std::size(titleColors); ++i) {
    if (name == titleColors[i]) return colorsOfTheNames[i];
  }
  return std::nullopt;
}

// Returns a copy of the title; raises if there is none.
toolkit::AttributedString titleOf(const QZ_Plist_State_Parser::Control& control) {
  auto title = control->attributedTitle();
  if (!title) throw toolkit::InvalidArgumentException("there is no title to copy");
  return *std::move(title);
}

}  // namespace

std::span<const std::string_view> titleColorNames() { return titleColors; }

// Always red, whatever colour is given; on purpose.
bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_BACKGROUND_COLOR(std::uint64_t color,
                                                                          ObjectId forId) {
  if (const auto other = state_->overridden(
          "QZ_Plist_State_Processor_SET_BACKGROUND_COLOR:forId:", color, forId)) {
    return other->yes;
  }
  const auto kept = keepAlive();
  const auto button = asButton(findObjectWithTag(forId->longValue()));
  if (!button) return false;
  button->setBackgroundColor(toolkit::colors::red);
  return true;
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_FOREGROUND_COLOR(Value name,
                                                                          ObjectId FOR_OBJECT_ID) {
  if (const auto other = state_->overridden(
          "QZ_Plist_State_Processor_SET_FOREGROUND_COLOR:FOR_OBJECT_ID:", name, FOR_OBJECT_ID)) {
    return other->yes;
  }
  const auto kept = keepAlive();
  const auto color = colorNamed(textOf(name));
  try {
    const Control control = findObjectWithTag(FOR_OBJECT_ID->longValue());
    toolkit::AttributedString title = titleOf(control);
    title.addForegroundColor(color, {0, title.length()});
    control->setAttributedTitle(title);
    return true;
  } catch (const toolkit::Exception&) {
    state_->toolkit.log().write("Unable to set the foreground color");
    return false;
  }
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_TITLE(Value title, ObjectId forId) {
  if (const auto other =
          state_->overridden("QZ_Plist_State_Processor_SET_TITLE:forId:", title, forId)) {
    return other->yes;
  }
  const auto kept = keepAlive();
  const auto button = asButton(findObjectWithTag(forId->longValue()));
  if (!button) return false;
  button->setTitle(textOf(title));
  return true;
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_STATE_ON(ObjectId id) {
  if (const auto other = state_->overridden("QZ_Plist_State_Processor_SET_STATE_ON:", id)) {
    return other->yes;
  }
  return setState(id, toolkit::State::on);
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_STATE_OFF(ObjectId id) {
  if (const auto other = state_->overridden("QZ_Plist_State_Processor_SET_STATE_OFF:", id)) {
    return other->yes;
  }
  return setState(id, toolkit::State::off);
}

// Does not send the action or record the state: only a press does.
bool QZ_Plist_State_Parser::setState(const ObjectId& id, toolkit::State state) {
  const auto kept = keepAlive();
  const auto button = asButton(findObjectWithTag(id->longValue()));
  if (!button) return false;
  button->setState(state);
  return true;
}

namespace {

bool showToolTip(const commands::CompoundCall& call) {
  const std::size_t count = call.parameters->count();
  if (count == 0) return false;
  const std::string_view text = textOf(call.at(0));
  // The second parameter is the target only if it is the last one; otherwise the list's own control
  // is.
  const toolkit::Tag tag = count == 2 ? call.at(1)->intValue() : call.id->longValue();
  const QZ_Plist_State_Parser::Control control = call.engine.findObjectWithTag(tag);
  if (!control) return false;
  control->setToolTip(text);
  control->needsDisplay();
  return true;
}

}  // namespace

// Calls the processor only if a subclass may have overridden it.
bool commands::setToolTip(const CompoundCall& call) {
  return call.engine.subclass()
             ? call.engine.QZ_Plist_State_Processor_SET_TOOL_TIP(call.parameters, call.id)
             : showToolTip(call);
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_TOOL_TIP(Parameters parameters,
                                                                  ObjectId forObject) {
  if (const auto other = state_->overridden(
          "QZ_Plist_State_Processor_SET_TOOL_TIP:forObject:", parameters, forObject)) {
    return other->yes;
  }
  const auto kept = keepAlive();
  const Parameters own = commands::ownList(parameters);
  return showToolTip({*this, own, forObject, state_->toolkit});
}

namespace {

bool showGraphic(const commands::CompoundCall& call) {
  if (call.parameters->count() != 2) return false;
  const toolkit::Tag tag = call.at(1)->intValue();
  // Two diagnostics that the test of the count above makes unreachable; their place is kept on
  // purpose.
  if (!call.parameters) call.toolkit.log().write("No commandInfo found.");
  if (call.parameters->count() == 0) call.toolkit.log().write("commandInfo count is zero.");
  // A resource name, not a path, despite the command's name.
  const auto image = call.toolkit.images().imageNamed(textOf(call.at(0)));
  const auto imageView = toolkit::asImageView(call.engine.findObjectWithTag(tag));
  if (!imageView) return false;
  imageView->setImage(image);
  imageView->needsDisplay();
  return true;
}

}  // namespace

// The same.
bool commands::loadGraphic(const CompoundCall& call) {
  return call.engine.subclass()
             ? call.engine.QZ_Plist_State_Processor_LOAD_GRAPHIC_OBJECT_WITH_PATH(call.parameters,
                                                                                  call.id)
             : showGraphic(call);
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_LOAD_GRAPHIC_OBJECT_WITH_PATH(
    Parameters parameters, ObjectId forObject) {
  if (const auto other = state_->overridden(
          "QZ_Plist_State_Processor_LOAD_GRAPHIC_OBJECT_WITH_PATH:forObject:", parameters,
          forObject)) {
    return other->yes;
  }
  const auto kept = keepAlive();
  const Parameters own = commands::ownList(parameters);
  return showGraphic({*this, own, forObject, state_->toolkit});
}

bool commands::loadBackground(const CompoundCall& call) {
  const auto image = call.toolkit.images().imageNamed(textOf(call.at(0)));
  const auto content = call.engine.tutorialWindow()->contentView();
  content->setWantsLayer(true);
  content->setLayerContents(image);
  return true;
}

}  // namespace qz
