// SPDX-License-Identifier: MIT
// The compound commands: one row each, with the conversions of the parameters and the function to
// run.

#include <functional>
#include <iterator>
#include <tuple>
#include <utility>

#include "engine/commands.hpp"
#include "engine/state.hpp"
#include "engine/text_of.hpp"

namespace qz {

namespace {

using Engine = QZ_Plist_State_Parser;
using toolkit::asButton;
using toolkit::asImageView;
using toolkit::asTextField;

// The conversions of parameters to arguments. A parameter is given by its position after the name;
// a position beyond the end raises.
struct Call {
  Engine& engine;
  const Engine::Parameters& parameters;
  const Engine::ObjectId& id;
  toolkit::Toolkit& toolkit;

  const Engine::Value& at(std::size_t position) const {
    return parameters->objectAtIndex(position);
  }
};

template <std::size_t position>
Engine::Value asIs(const Call& call) {
  return call.at(position);
}
template <std::size_t position>
std::uint64_t integer(const Call& call) {  // a negative integer becomes a very large one
  return static_cast<std::uint64_t>(std::int64_t{call.at(position)->intValue()});
}
template <std::size_t position>
Engine::ObjectId tag(const Call& call) {
  return toolkit::Number::withLong(call.at(position)->intValue());
}
template <std::size_t position>
bool flag(const Call& call) {
  return call.at(position)->boolValue();
}

// Converts the parameters in the order written, which decides which missing one raises first, then
// runs.
template <auto processor, auto... conversions>
bool run(const Call& call) {
  std::tuple<decltype(conversions(call))...> arguments{conversions(call)...};
  return std::apply(
      [&](auto&... argument) {
        return std::invoke(processor, call.engine, std::move(argument)...);
      },
      arguments);
}

bool setToolTip(const Call& call) {
  return commands::setToolTip(call.engine, call.parameters, call.id);
}
bool loadGraphic(const Call& call) {
  return commands::loadGraphic(call.engine, call.toolkit, call.parameters);
}

// Returns the target of a control command: the tag that is its only parameter, or otherwise the
// list's own id.
toolkit::Tag targetTag(const Call& call) {
  return call.parameters->count() == 1 ? call.at(0)->intValue() : call.id->longValue();
}

bool enable(const Call& call) {
  const auto control = call.engine.findObjectWithTag(targetTag(call));
  if (!control) return false;
  control->setEnabled(true);
  control->needsDisplay();
  return true;
}

bool disable(const Call& call) {
  const auto control = call.engine.findObjectWithTag(targetTag(call));
  // Unlike enabling, this succeeds if the control of a parameter does not exist.
  if (!control) return call.parameters->count() == 1;
  control->setEnabled(false);
  control->needsDisplay();
  return true;
}

// Looks the control up again after every test of its class, so that changes of the window meanwhile
// take effect. A control of any class is hidden or shown.
template <bool hidden>
bool hide(const Call& call) {
  const toolkit::Tag tag = targetTag(call);
  const auto find = [&] { return call.engine.findObjectWithTag(tag); };
  const auto change = [](const Engine::Control& control) {
    control->setHidden(hidden);
    control->needsDisplay();
    return true;
  };
  const bool isButton = static_cast<bool>(asButton(find()));
  Engine::Control control = find();
  if (isButton) return control ? change(control) : false;
  const bool isTextField = static_cast<bool>(asTextField(control));
  control = find();
  if (isTextField) return change(control);
  const bool isImageView = static_cast<bool>(asImageView(control));
  control = find();
  control->setHidden(hidden);
  (isImageView ? control : find())->needsDisplay();
  return true;
}

bool loadBackground(const Call& call) {
  const auto image = call.toolkit.images().imageNamed(textOf(call.at(0)));
  const auto content = call.engine.tutorialWindow()->contentView();
  content->setWantsLayer(true);
  content->setLayerContents(image);
  return true;
}

// Reads the tag before the title, although the processor takes the title first.
bool setTitle(Engine& engine, Engine::ObjectId id, Engine::Value title) {
  return engine.QZ_Plist_State_Processor_SET_TITLE(std::move(title), std::move(id));
}

constexpr auto setTag = static_cast<bool (Engine::*)(Engine::ObjectId, Engine::ObjectId)>(
    &Engine::QZ_Plist_State_Processor_SET_TAG);
constexpr auto setTagWithTimer =
    static_cast<bool (Engine::*)(Engine::ObjectId, Engine::ObjectId, Engine::Value)>(
        &Engine::QZ_Plist_State_Processor_SET_TAG);

struct Command {
  const std::string& name;  // refers to the constant: a host may rename the command at any time
  bool (*run)(const Call& call);
};

// clang-format off
#define NAME(name) QZ_PLIST_STATE_PARSER_##name
#define PROCESSOR(name) &Engine::QZ_Plist_State_Processor_##name

// In order of recognition: if a host gives two commands the same name, the first row wins.
constexpr Command rows[] = {
    {NAME(SET_TOOL_TIP_FOR_ID),                  setToolTip},
    {NAME(LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID), loadGraphic},
    {NAME(DISABLE_OBJECT_WITH_ID),               disable},
    {NAME(ENABLE_OBJECT_WITH_ID),                enable},
    {NAME(HIDE_OBJECT_WITH_ID),                  hide<true>},
    {NAME(SHOW_OBJECT_WITH_ID),                  hide<false>},
    {NAME(LOAD_BACKGROUND_WITH_IMAGE),           loadBackground},
    {NAME(FLASH_ID),                             run<PROCESSOR(FLASH_ID), tag<1>, flag<0>>},
    {NAME(ALLOW_FLASHING),                       run<PROCESSOR(ALLOW_FLASHING), flag<0>>},
    {NAME(SET_TEXT_FOR_OBJECT_ID),               run<PROCESSOR(SET_TEXT), asIs<0>, tag<1>>},
    {NAME(PROCESS_COMMANDS_FOR_ID),              run<PROCESSOR(PROCESS_COMMANDS_FOR_ID), tag<0>>},
    {NAME(SET_BACKGROUND_COLOR_FOR_OBJECT_ID),   run<PROCESSOR(SET_BACKGROUND_COLOR), integer<0>, tag<1>>},
    {NAME(SET_TITLE_FOR_OBJECT_ID),              run<setTitle, tag<1>, asIs<0>>},
    {NAME(SET_STATE_ON_FOR_OBJECT_ID),           run<PROCESSOR(SET_STATE_ON), tag<0>>},
    {NAME(SET_STATE_OFF_FOR_OBJECT_ID),          run<PROCESSOR(SET_STATE_OFF), tag<0>>},
    {NAME(SET_TAG_FOR_OBJECT_ID),                run<setTag, tag<0>, tag<1>>},
    {NAME(SET_TAG_FOR_OBJECT_ID_WITH_TIMER),     run<setTagWithTimer, tag<0>, tag<1>, asIs<2>>},
    {NAME(SET_TIMER_FOR_ID),                     run<PROCESSOR(SET_TIMER), integer<0>, tag<1>>},
    {NAME(SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID),
     run<PROCESSOR(SET_ATTRIBUTED_STRING_AS_HTML), asIs<0>, asIs<1>, asIs<2>, tag<3>>},
    {NAME(SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID),
     run<PROCESSOR(SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER), asIs<0>, asIs<1>, asIs<2>, tag<3>>},
    {NAME(SET_ATTRIBUTED_STRING_AS_IS_WITH_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID),
     run<PROCESSOR(SET_ATTRIBUTED_STRING_AS_IS), flag<0>, asIs<1>, asIs<2>, asIs<3>, tag<4>>},
    {NAME(SET_FOREGROUND_COLOR_FOR_OBJECT_ID),   run<PROCESSOR(SET_FOREGROUND_COLOR), asIs<0>, tag<1>>},
};

#undef NAME
#undef PROCESSOR
// clang-format on

}  // namespace

bool commands::runCompound(Engine& engine, toolkit::Toolkit& toolkit, std::string_view name,
                           const Engine::Parameters& parameters, const Engine::ObjectId& id) {
  const Call call{engine, parameters, id, toolkit};
  // A loop over the rows that the compiler unrolls, because this runs for every command.
  const auto runFirstNamed = [&]<std::size_t... row>(std::index_sequence<row...>) {
    bool result = false;
    static_cast<void>(((name == rows[row].name && (result = rows[row].run(call), true)) || ...));
    return result;
  };
  return runFirstNamed(std::make_index_sequence<std::size(rows)>());
}

QZ_Plist_State_Parser::Parameters commands::ownList(const Engine::Parameters& parameters) {
  if (!parameters) return nullptr;
  const auto elements = parameters->elements();
  return toolkit::Array::make({elements.begin(), elements.end()});
}

// Does not copy the name, because it is not read after the command has started.
bool QZ_Plist_State_Parser::doCompoundCommand(std::string_view name, Parameters withParameters,
                                              ObjectId usingObject) {
  const auto kept = keepAlive();
  return commands::runCompound(*this, state_->toolkit, name, commands::ownList(withParameters),
                               usingObject);
}

}  // namespace qz
