// SPDX-License-Identifier: MIT
// What every control shows at a step.
#include "tools/steps/looks.hpp"

#include <algorithm>

#include "tools/support/text_layout.hpp"

namespace qz::tools::steps {
namespace {

using drivers::Caption;
using drivers::ViewKind;

constexpr const char* setText = "SET_TEXT_FOR_OBJECT_ID";
constexpr const char* setTitle = "SET_TITLE_FOR_OBJECT_ID";
constexpr const char* setStyled =
    "SET_ATTRIBUTED_STRING_AS_IS_WITH_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID";
constexpr const char* setCentered =
    "SET_ATTRIBUTED_STRING_AS_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID";
constexpr const char* setInFont =
    "SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID";

// Of styled text that names no font. The reader of HTML would use Times.
const Font standardFont{"Helvetica", 12};

template <class T>
void overlay(std::optional<T>& below, const std::optional<T>& above) {
  if (above) below = above;
}

/// Returns what a step says of a control, or else what every step says.
ControlWords merged(ControlWords words, const ControlWords& own) {
  overlay(words.content, own.content);
  overlay(words.font, own.font);
  overlay(words.isCentered, own.isCentered);
  overlay(words.toolTip, own.toolTip);
  overlay(words.color, own.color);
  overlay(words.isRed, own.isRed);
  overlay(words.isOn, own.isOn);
  overlay(words.isEnabled, own.isEnabled);
  overlay(words.flashes, own.flashes);
  overlay(words.press, own.press);
  // A step shows what it mentions, also if every step hides it.
  if (own.isMentioned) words.isShown = true;
  overlay(words.isShown, own.isShown);
  if (own.place != 0) words.place = own.place;
  return words;
}

/// Returns styled text in a font. Only a block can be centred.
std::string inFont(const std::string& html, const Font& font, bool isCentered) {
  const std::string style =
      "font-family: " + font.name + "; font-size: " + std::to_string(font.size) + "pt";
  if (isCentered) return "<div style=\"text-align: center; " + style + "\">" + html + "</div>";
  return "<font style=\"" + style + "\">" + html + "</font>";
}

/// Returns the commands for a text or title.
Commands textCommands(const Control& control, const ControlWords& words) {
  const bool isTitle = rowOf(control.kind).caption == Caption::title;
  const Markup content = words.content.value_or(Markup{true, control.caption.value_or("")});
  const bool isCentered = words.isCentered.value_or(false);
  Commands commands;
  const Font font = words.font.value_or(standardFont);
  if (!content.isPlain) {
    const std::string text = inFont(content.text, font, isCentered);
    commands.push_back({setStyled, {true, text, standardFont.name, 0}, words.place});
  } else if (words.font || isCentered) {
    commands.push_back({isCentered ? setCentered : setInFont,
                        {asHtml(content.text), font.name, font.size},
                        words.place});
  } else {
    commands.push_back({isTitle ? setTitle : setText, {content.text}, words.place});
  }
  if (words.color)
    commands.push_back({"SET_FOREGROUND_COLOR_FOR_OBJECT_ID", {*words.color}, words.place});
  return commands;
}

Commands contentCommands(const Control& control, const ControlWords& words) {
  const Caption caption = rowOf(control.kind).caption;
  if (caption == Caption::none) return {};
  if (caption != Caption::imageName) return textCommands(control, words);
  const auto image = words.content ? words.content->text : control.caption;
  if (!image) return {};
  return {{"LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID", {*image}, words.place}};
}

Commands flagCommand(bool on, const char* yes, const char* no, Place place) {
  return {{on ? yes : no, {}, place}};
}

/// Whether a control is seen if the source does not say so: a button needs something to do, an
/// image view an image.
bool isShownByItself(const Control& control, const ControlWords& words) {
  if (rowOf(control.kind).caption == Caption::imageName) {
    return control.isShown && (words.content || control.caption);
  }
  const bool isIdle = control.kind == ViewKind::button && !control.name.empty() && !words.press;
  return control.isShown && !isIdle;
}

ControlLook controlLook(const Control& control, const ControlWords& words, bool canGoBack) {
  const drivers::ViewKindRow& row = rowOf(control.kind);
  const bool isShown = words.isShown.value_or(isShownByItself(control, words));
  const bool leadsBack = words.press && words.press->kind == Lead::Kind::back;
  const bool isInVain = leadsBack && !canGoBack;
  const bool isEnabled = words.isEnabled.value_or(leadsBack ? canGoBack : control.isEnabled);
  ControlLook look;
  look[Property::content] = contentCommands(control, words);
  look[Property::toolTip] = {
      {"SET_TOOL_TIP_FOR_ID", {words.toolTip.value_or(control.toolTip)}, words.place}};
  look[Property::shown] =
      flagCommand(isShown, "SHOW_OBJECT_WITH_ID", "HIDE_OBJECT_WITH_ID", words.place);
  if (row.isControl) {
    look[Property::enabled] =
        flagCommand(isEnabled, "ENABLE_OBJECT_WITH_ID", "DISABLE_OBJECT_WITH_ID", words.place);
  }
  if (row.isButton) {
    look[Property::state] =
        flagCommand(words.isOn.value_or(control.isOn), "SET_STATE_ON_FOR_OBJECT_ID",
                    "SET_STATE_OFF_FOR_OBJECT_ID", words.place);
    if (words.isRed) {
      look[Property::background] = {{"SET_BACKGROUND_COLOR_FOR_OBJECT_ID", {0}, words.place}};
    }
    look.canBePressed = isShown && isEnabled;
    look.flashes = look.canBePressed && words.flashes.value_or(false);
    if (words.press) look.press = *words.press;
    if (isInVain) look.press = {};
  }
  return look;
}

Look completeLook(const Tour& tour, const StepWords& own, bool canGoBack) {
  Look look;
  for (ControlIndex i = 0; i < tour.controls.size(); ++i) {
    const ControlWords words = merged(tour.everyStep.controls[i], own.controls[i]);
    look.controls.push_back(controlLook(tour.controls[i], words, canGoBack));
  }
  const auto background = own.background ? own.background : tour.everyStep.background;
  if (background) look.background = {{"LOAD_BACKGROUND_WITH_IMAGE", {*background}, 0}};
  return look;
}

}  // namespace

Look initialLook(const Tour& tour) {
  Look look;
  for (const Control& control : tour.controls) {
    Control unnamed = control;  // what the source calls it changes nothing
    unnamed.name.clear();
    ControlWords words;
    words.isShown = control.isShown;
    look.controls.push_back(controlLook(unnamed, words, true));
  }
  return look;
}

Look lookOf(const Tour& tour, StepIndex step, bool canGoBack) {
  return completeLook(tour, tour.steps[step].words, canGoBack);
}

Look everyStepLook(const Tour& tour) {
  StepWords nothing;
  nothing.controls.resize(tour.controls.size());
  return completeLook(tour, nothing, true);
}

namespace {

/// A state that the host made neither on nor off cannot be set again.
void judgeStates(const Tour& tour, Mistakes& mistakes) {
  for (ControlIndex i = 0; i < tour.controls.size(); ++i) {
    if (!tour.controls[i].isMixed || tour.everyStep.controls[i].isOn) continue;
    const auto isSaid = [&](const Step& step) { return step.words.controls[i].isOn.has_value(); };
    const auto silent = std::find_if_not(tour.steps.begin(), tour.steps.end(), isSaid);
    if (silent == tour.steps.end() || std::none_of(tour.steps.begin(), tour.steps.end(), isSaid)) {
      continue;
    }
    mistakes.add(silent->place, "at the step " + quote(silent->name) + " the state of " +
                                    quote(tour.controls[i].name) +
                                    " is mixed, as in the host's window, which no command sets; "
                                    "expected “state” here or under “every step”");
  }
}

/// A push button with a name that the user can press must lead somewhere.
void judgePresses(const Tour& tour, Mistakes& mistakes) {
  for (StepIndex i = 0; i < tour.steps.size(); ++i) {
    const Step& step = tour.steps[i];
    const Look look = lookOf(tour, i, true);
    for (ControlIndex c = 0; c < tour.controls.size(); ++c) {
      const Control& control = tour.controls[c];
      const bool needsPress = !control.name.empty() && control.kind == ViewKind::button;
      const ControlWords words = merged(tour.everyStep.controls[c], step.words.controls[c]);
      if (!needsPress || words.press || !look.controls[c].canBePressed) continue;
      mistakes.add(words.place == 0 ? step.place : words.place,
                   "at the step " + quote(step.name) + " a press of " + quote(control.name) +
                       " leads nowhere; expected “press” with a step, “back”, “end” or “nothing”");
    }
  }
}

}  // namespace

void judgeLooks(const Tour& tour, Mistakes& mistakes) {
  judgeStates(tour, mistakes);
  judgePresses(tour, mistakes);
}

}  // namespace qz::tools::steps
