// SPDX-License-Identifier: MIT
// The commands of the script: their names, and one row each that says everything about the command.
// The engine recognises and runs commands by these rows; hosts and tools read them through
// "qz/commands.hpp".

#include <algorithm>
#include <iterator>
#include <utility>
#include <vector>

#include "engine/command_calls.hpp"
#include "engine/conversions.hpp"
#include "qz/commands.hpp"

namespace qz {

inline namespace command_names {

// A host may assign other names at any time.
std::string QZ_PLIST_STATE_PARSER_TERMINATE_PARSER = "TERMINATE_PARSER";
std::string QZ_PLIST_STATE_PARSER_RETURN_TO_IDLE_LOOP = "IDLE_LOOP";
std::string QZ_PLIST_STATE_PARSER_HIDE_OBJECT_WITH_ID = "HIDE_OBJECT_WITH_ID";
std::string QZ_PLIST_STATE_PARSER_SHOW_OBJECT_WITH_ID = "SHOW_OBJECT_WITH_ID";
std::string QZ_PLIST_STATE_PARSER_ENABLE_OBJECT_WITH_ID = "ENABLE_OBJECT_WITH_ID";
std::string QZ_PLIST_STATE_PARSER_DISABLE_OBJECT_WITH_ID = "DISABLE_OBJECT_WITH_ID";
std::string QZ_PLIST_STATE_PARSER_LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID =
    "LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID";
std::string QZ_PLIST_STATE_PARSER_PROCESS_COMMANDS_FOR_ID = "PROCESS_COMMANDS_FOR_ID";
std::string QZ_PLIST_STATE_PARSER_SET_TOOL_TIP_FOR_ID = "SET_TOOL_TIP_FOR_ID";
std::string QZ_PLIST_STATE_PARSER_SET_TEXT_FOR_OBJECT_ID = "SET_TEXT_FOR_OBJECT_ID";
std::string QZ_PLIST_STATE_PARSER_LOAD_BACKGROUND_WITH_IMAGE = "LOAD_BACKGROUND_WITH_IMAGE";
std::string QZ_PLIST_STATE_PARSER_BUTTON_WITH_ID_AT = "BUTTON_WITH_ID_AT";
std::string QZ_PLIST_STATE_PARSER_IMAGE_WITH_ID_AND_PATH_AT = "IMAGE_WITH_ID_AND_PATH_AT";
std::string QZ_PLIST_STATE_PARSER_ALLOW_FLASHING = "ALLOW_FLASHING";
std::string QZ_PLIST_STATE_PARSER_FLASH_ID = "FLASH_ID";
std::string QZ_PLIST_STATE_PARSER_HIGHLIGHT_ID = "HIGHLIGHT_ID";
std::string QZ_PLIST_STATE_PARSER_SET_STATE_ON_FOR_OBJECT_ID = "SET_STATE_ON_FOR_OBJECT_ID";
std::string QZ_PLIST_STATE_PARSER_SET_STATE_OFF_FOR_OBJECT_ID = "SET_STATE_OFF_FOR_OBJECT_ID";
std::string QZ_PLIST_STATE_PARSER_SET_BACKGROUND_COLOR_FOR_OBJECT_ID =
    "SET_BACKGROUND_COLOR_FOR_OBJECT_ID";
std::string QZ_PLIST_STATE_PARSER_SET_FOREGROUND_COLOR_FOR_OBJECT_ID =
    "SET_FOREGROUND_COLOR_FOR_OBJECT_ID";
std::string QZ_PLIST_STATE_PARSER_SET_TITLE_FOR_OBJECT_ID = "SET_TITLE_FOR_OBJECT_ID";
std::string QZ_PLIST_STATE_PARSER_SET_TAG_FOR_OBJECT_ID = "SET_TAG_FOR_OBJECT_ID";
std::string QZ_PLIST_STATE_PARSER_SET_TAG_FOR_OBJECT_ID_WITH_TIMER =
    "SET_TAG_FOR_OBJECT_ID_WITH_TIMER";
std::string QZ_PLIST_STATE_PARSER_SET_TIMER_FOR_ID = "SET_TIMER_FOR_ID";
std::string
    QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID =
        "SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID";
std::string
    QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID =
        "SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID";
std::string
    QZ_PLIST_STATE_PARSER_SET_ATTRIBUTED_STRING_AS_IS_WITH_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID =
        "SET_ATTRIBUTED_STRING_AS_IS_WITH_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID";

}  // namespace command_names

// Named, so that the short names of parameters hide nothing of other files.
namespace catalogue {

namespace {

using namespace commands;
using Engine = QZ_Plist_State_Parser;
using Extra = ExtraParameters;
using Flow = CommandFlow;
using Target = TargetKind;
using Type = ParameterType;

/// What runs a command; null in a form that the command does not have.
struct Functions {
  bool (*compound)(const CompoundCall& call) = nullptr;
  bool (*simple)(const SimpleCall& call) = nullptr;
};

struct Row {
  std::string_view constant;
  std::string& name;
  std::string_view summary;
  CommandParameter parameters[5];  // those without a name are not there
  TargetKind target;
  Functions run;
  ExtraParameters extraParameters = Extra::ignored;
  CommandFlow flow = Flow::continues;
};

constexpr CommandParameter tag = {"tag", Type::controlTag, "the tag of the control"};
constexpr CommandParameter tagIfAny = {
    "tag", Type::controlTag, "the tag of the control; without it, the key of the list", true};
constexpr CommandParameter tagNow = {"tag", Type::controlTag, "the tag that the control has now"};
constexpr CommandParameter newTag = {"new tag", Type::newTag, "the tag that the control gets"};
constexpr CommandParameter listTag = {"tag", Type::listTag, "the key of the list"};
constexpr CommandParameter timerTag = {
    "tag", Type::controlOrListTag, "the tag of the button to press, or the key of the list to run"};
constexpr CommandParameter seconds = {
    "seconds", Type::seconds, "the time until then; 0 cancels the timer of a control's tag"};
constexpr CommandParameter noDelay = {
    "anything", Type::anything, "not used as a number: the delay is very long whatever it is"};
constexpr CommandParameter tip = {"text", Type::text, "the tooltip; an empty one removes it"};
constexpr CommandParameter plainText = {"text", Type::text, "the text to show"};
constexpr CommandParameter title = {"title", Type::text, "the title to show"};
constexpr CommandParameter asIs = {
    "as-is", Type::flag, "YES for the HTML's own fonts and alignment, NO for one font, centred"};
constexpr CommandParameter html = {"html", Type::html, "the text to show, as a fragment of HTML"};
constexpr CommandParameter font = {"font", Type::fontName, "the font of the whole text"};
constexpr CommandParameter size = {"size", Type::points, "the size of the font; 0 for 12"};
constexpr CommandParameter color = {"colour name", Type::colorName, "the colour of the title"};
constexpr CommandParameter anyNumber = {"number", Type::integer, "not used: every one means red"};
constexpr CommandParameter image = {"image name", Type::imageName,
                                    "the image to show; an unknown one shows none"};
constexpr CommandParameter allow = {"flag", Type::flag, "YES to let buttons flash, NO to stop all"};
constexpr CommandParameter flashes = {"flag", Type::flag, "YES to flash, NO to never flash"};

constexpr auto setTag = static_cast<bool (Engine::*)(Engine::ObjectId, Engine::ObjectId)>(
    &Engine::QZ_Plist_State_Processor_SET_TAG);
constexpr auto setTagWithTimer =
    static_cast<bool (Engine::*)(Engine::ObjectId, Engine::ObjectId, Engine::Value)>(
        &Engine::QZ_Plist_State_Processor_SET_TAG);

// Reads the tag before the title, although the processor takes the title first.
bool setTitle(Engine& engine, Engine::ObjectId id, Engine::Value text) {
  return engine.QZ_Plist_State_Processor_SET_TITLE(std::move(text), std::move(id));
}

// clang-format off
#define NAME(name) "QZ_PLIST_STATE_PARSER_" #name, QZ_PLIST_STATE_PARSER_##name
#define PROCESSOR(name) &Engine::QZ_Plist_State_Processor_##name

// In order of recognition: if a host gives two commands the same name, the first row wins.
constexpr Row rows[] = {
    {NAME(TERMINATE_PARSER), "ends the walk-through",
     {}, Target::none, {.simple = terminate}, Extra::ignored, Flow::endsWalkThrough},
    {NAME(SET_TOOL_TIP_FOR_ID), "sets the tooltip of a control",
     {tip, tagIfAny}, Target::anyView, {setToolTip}, Extra::overrideTheTag},
    {NAME(LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID), "sets the image of an image view",
     {image, tag}, Target::imageView, {loadGraphic}, Extra::preventTheCommand},
    {NAME(DISABLE_OBJECT_WITH_ID), "makes a control ignore input",
     {tagIfAny}, Target::anyControl, {disable, disable}, Extra::overrideTheTag},
    {NAME(ENABLE_OBJECT_WITH_ID), "makes a control take input",
     {tagIfAny}, Target::anyControl, {enable, enable}, Extra::overrideTheTag},
    {NAME(HIDE_OBJECT_WITH_ID), "hides a control",
     {tagIfAny}, Target::anyView, {hide, hide}, Extra::overrideTheTag},
    {NAME(SHOW_OBJECT_WITH_ID), "shows a hidden control",
     {tagIfAny}, Target::anyView, {show, show}, Extra::overrideTheTag},
    {NAME(RETURN_TO_IDLE_LOOP), "does nothing, with the result YES",
     {}, Target::none, {.simple = idle}},
    {NAME(LOAD_BACKGROUND_WITH_IMAGE), "sets the image behind all controls",
     {image}, Target::none, {loadBackground}},
    {NAME(FLASH_ID), "marks a button as flashing, or as never flashing",
     {flashes, tag}, Target::button, {run<PROCESSOR(FLASH_ID), tagAt<1>, flagAt<0>>}},
    {NAME(ALLOW_FLASHING), "turns all flashing on or off",
     {allow}, Target::none, {run<PROCESSOR(ALLOW_FLASHING), flagAt<0>>}},
    {NAME(SET_TEXT_FOR_OBJECT_ID), "sets the plain text of a text field",
     {plainText, tag}, Target::textField, {run<PROCESSOR(SET_TEXT), valueAt<0>, tagAt<1>>}},
    {NAME(PROCESS_COMMANDS_FOR_ID), "runs another list, then continues",
     {listTag}, Target::none, {run<PROCESSOR(PROCESS_COMMANDS_FOR_ID), tagAt<0>>, processCommands},
     Extra::ignored, Flow::runsList},
    {NAME(SET_BACKGROUND_COLOR_FOR_OBJECT_ID), "makes a button red",
     {anyNumber, tag}, Target::button,
     {run<PROCESSOR(SET_BACKGROUND_COLOR), integerAt<0>, tagAt<1>>}},
    {NAME(SET_TITLE_FOR_OBJECT_ID), "sets the title of a button",
     {title, tag}, Target::button, {run<setTitle, tagAt<1>, valueAt<0>>}},
    {NAME(SET_STATE_ON_FOR_OBJECT_ID), "turns a button on",
     {tag}, Target::buttonWithState, {run<PROCESSOR(SET_STATE_ON), tagAt<0>>}},
    {NAME(SET_STATE_OFF_FOR_OBJECT_ID), "turns a button off",
     {tag}, Target::buttonWithState, {run<PROCESSOR(SET_STATE_OFF), tagAt<0>>}},
    {NAME(SET_TAG_FOR_OBJECT_ID), "gives a control another tag",
     {newTag, tagNow}, Target::anyView, {run<setTag, tagAt<0>, tagAt<1>>}},
    {NAME(SET_TAG_FOR_OBJECT_ID_WITH_TIMER), "gives a control another tag; its delay is useless",
     {newTag, tagNow, noDelay}, Target::anyView,
     {run<setTagWithTimer, tagAt<0>, tagAt<1>, valueAt<2>>}},
    {NAME(SET_TIMER_FOR_ID), "presses a button or runs a list later",
     {seconds, timerTag}, Target::none, {run<PROCESSOR(SET_TIMER), integerAt<0>, tagAt<1>>}},
    {NAME(SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID),
     "sets styled text, centred, in one font",
     {html, font, size, tag}, Target::anyControl,
     {run<PROCESSOR(SET_ATTRIBUTED_STRING_AS_HTML), valueAt<0>, valueAt<1>, valueAt<2>, tagAt<3>>}},
    {NAME(SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID),
     "sets styled text in one font",
     {html, font, size, tag}, Target::anyControl,
     {run<PROCESSOR(SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER),
          valueAt<0>, valueAt<1>, valueAt<2>, tagAt<3>>}},
    {NAME(SET_ATTRIBUTED_STRING_AS_IS_WITH_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID),
     "sets styled text with the HTML's own fonts and alignment",
     {asIs, html, font, size, tag}, Target::anyControl,
     {run<PROCESSOR(SET_ATTRIBUTED_STRING_AS_IS),
          flagAt<0>, valueAt<1>, valueAt<2>, valueAt<3>, tagAt<4>>}},
    {NAME(SET_FOREGROUND_COLOR_FOR_OBJECT_ID), "colours the title of a button",
     {color, tag}, Target::button, {run<PROCESSOR(SET_FOREGROUND_COLOR), valueAt<0>, tagAt<1>>}},
    {NAME(HIGHLIGHT_ID), "a name without a command", {}, Target::none, {}},
    {NAME(BUTTON_WITH_ID_AT), "a name without a command", {}, Target::none, {}},
    {NAME(IMAGE_WITH_ID_AND_PATH_AT), "a name without a command", {}, Target::none, {}},
};

#undef NAME
#undef PROCESSOR
// clang-format on

// Runs the first command that has the name and the form. Calls itself for each next row instead of
// looping over the rows: this runs for every command of every list, and so the compiler makes one
// chain of comparisons and direct calls of it.
template <auto form, std::size_t index = 0>
bool runFirstNamed(std::string_view name, const auto& call) {
  if constexpr (index == std::size(rows)) {
    return false;
  } else {
    constexpr const Row& row = rows[index];
    const auto function = row.run.*form;
    if (function != nullptr && name == row.name) return function(call);
    return runFirstNamed<form, index + 1>(name, call);
  }
}

CommandForm formOf(const Functions& run) {
  if (run.simple) return run.compound ? CommandForm::both : CommandForm::simple;
  return run.compound ? CommandForm::compound : CommandForm::none;
}

Command described(const Row& row) {
  const auto end = std::find_if(std::begin(row.parameters), std::end(row.parameters),
                                [](const auto& parameter) { return parameter.name.empty(); });
  return {.constant = row.constant,
          .name = row.name,
          .summary = row.summary,
          .form = formOf(row.run),
          .parameters = {std::begin(row.parameters), end},
          .target = row.target,
          .extraParameters = row.extraParameters,
          .flow = row.flow};
}

}  // namespace

}  // namespace catalogue

bool commands::runCompound(std::string_view name, const CompoundCall& call) {
  return catalogue::runFirstNamed<&catalogue::Functions::compound>(name, call);
}

// On purpose, an unknown name looks up the control too, which observers and windows can notice.
bool commands::runSimple(std::string_view name, QZ_Plist_State_Parser& engine,
                         const QZ_Plist_State_Parser::ObjectId& id) {
  const auto control = engine.findObjectWithTag(id->longValue());
  const SimpleCall call{engine, control, id};
  return catalogue::runFirstNamed<&catalogue::Functions::simple>(name, call);
}

std::span<const Command> commandCatalogue() {
  static const auto commands = [] {
    std::vector<Command> described;
    for (const auto& row : catalogue::rows) described.push_back(catalogue::described(row));
    return described;
  }();
  return commands;
}

}  // namespace qz
