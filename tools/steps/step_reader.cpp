// SPDX-License-Identifier: MIT
// Reads what a source says of one step: the words of steps, then the properties of controls.
#include "tools/steps/step_reader.hpp"

#include <algorithm>
#include <array>

#include "tools/steps/words.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/walkthrough/parse_number.hpp"

namespace qz::tools::steps {
namespace {

using drivers::Caption;

// The engine reads seconds as an int; a week is more than a user waits.
constexpr int mostSeconds = 604800;
constexpr int mostPoints = 1000;

constexpr std::string_view stepWords[] = {"show",  "hide", "enable",     "disable",
                                          "flash", "font", "align",      "background",
                                          "use",   "like", "back passes over"};

constexpr std::string_view propertyWords[] = {"text",  "title",      "picture", "html",
                                              "font",  "align",      "tooltip", "color",
                                              "state", "background", "shown",   "enabled",
                                              "flash", "press"};

constexpr std::string_view colors[] = {"red", "white", "blue", "green", "black", "orange", "gray"};

std::string_view captionWord(Caption caption) {
  switch (caption) {
    case Caption::title:
      return "title";
    case Caption::text:
      return "text";
    case Caption::imageName:
      return "picture";
    case Caption::none:
      break;
  }
  return "";
}

}  // namespace

StepReader::StepReader(const std::vector<Control>& controls,
                       const std::map<std::string, StepIndex>& steps, Mistakes& mistakes)
    : controls_(controls), steps_(steps), mistakes_(mistakes) {
  for (ControlIndex i = 0; i < controls.size(); ++i) {
    if (!controls[i].name.empty()) names_.emplace(controls[i].name, i);
  }
}

void StepReader::read(const Node& body, StepWords& words) const {
  words.controls.resize(controls_.size());
  for (const auto& [key, value] : body.entries) readEntry(*key, value, words);
}

template <class Set>
void StepReader::forEachName(const Node& value, const Set& set) const {
  if (value.kind == Node::Kind::list) {
    for (const NodeRef& element : value.elements) forEachName(*element, set);
  } else if (const auto control = controlNamed(value)) {
    set(*control);
  }
}

template <class Set>
void StepReader::forEachEntry(const NodeRef& value, const Set& set) const {
  for (const auto& [name, each] : entriesOf(value, "a value for each control", mistakes_)) {
    if (const auto control = controlNamed(*name)) set(*control, *each);
  }
}

std::optional<ControlIndex> StepReader::controlNamed(const Node& name) const {
  const auto found = names_.find(name.text);
  if (name.kind == Node::Kind::scalar && found != names_.end()) return found->second;
  std::vector<std::string_view> known;
  for (const auto& [each, control] : names_) known.push_back(each);
  mistakes_.add(name.place, "expected the name of a control, found " + foundWords(name) +
                                didYouMean(name.text, known));
  return std::nullopt;
}

void StepReader::readEntry(const Node& key, const NodeRef& value, StepWords& words) const {
  const std::string& word = key.text;
  const auto setFlag = [&](std::optional<bool> ControlWords::*flag, bool on) {
    forEachName(*value, [&](ControlIndex i) { words.controls[i].*flag = on; });
  };
  if (word == "show") return setFlag(&ControlWords::isShown, true);
  if (word == "hide") return setFlag(&ControlWords::isShown, false);
  if (word == "enable") return setFlag(&ControlWords::isEnabled, true);
  if (word == "disable") return setFlag(&ControlWords::isEnabled, false);
  if (word == "flash") return setFlag(&ControlWords::flashes, true);
  if (word == "font") {
    return forEachEntry(
        value, [&](ControlIndex i, const Node& font) { readFont(font, words.controls[i]); });
  }
  if (word == "align") {
    return forEachEntry(value, [&](ControlIndex i, const Node& align) {
      static constexpr std::string_view choices[] = {"natural", "center"};
      if (const auto choice = choiceOf(align, choices, mistakes_)) {
        words.controls[i].isCentered = *choice == 1;
      }
    });
  }
  if (word == "background") {
    words.background = textOf(*value, "the name of an image", mistakes_);
    return;
  }
  if (word == "back passes over") {
    words.isPassedOver = flagOf(*value, mistakes_);
    return;
  }
  if (word == words::like || word == words::use) return;  // put in place already
  if (word.starts_with(words::after)) return readWait(key, value, words);
  if (const auto control = names_.find(word); control != names_.end()) {
    ControlWords& said = words.controls[control->second];
    said.isMentioned = true;
    said.place = key.place;
    return readControl(control->second, value, words);
  }
  std::vector<std::string_view> known(std::begin(stepWords), std::end(stepWords));
  for (const auto& [name, control] : names_) known.push_back(name);
  mistakes_.add(key.place, "expected the name of a control or a word such as “show”, found " +
                               foundWords(key) + didYouMean(word, known));
}

void StepReader::readControl(ControlIndex control, const NodeRef& value, StepWords& words) const {
  ControlWords& said = words.controls[control];
  if (value->kind == Node::Kind::nothing) return;  // `control:` alone shows it
  if (value->kind == Node::Kind::scalar) return readContent(control, *value, said);
  for (const auto& [key, property] : entriesOf(value, "a text or a table", mistakes_)) {
    readProperty(control, *key, property, said);
  }
}

void StepReader::readContent(ControlIndex control, const Node& value, ControlWords& words) const {
  const Caption caption = rowOf(controls_[control].kind).caption;
  if (caption == Caption::none) {
    mistakes_.add(value.place, "a " + std::string(rowOf(controls_[control].kind).word) +
                                   " shows no text; expected properties such as “shown”");
    return;
  }
  const auto text = textOf(value, captionWord(caption), mistakes_);
  if (!text) return;
  words.content = caption == Caption::text ? readMarkdown(*text) : Markup{true, *text};
}

void StepReader::readFont(const Node& value, ControlWords& words) const {
  const std::size_t space = value.text.rfind(' ');
  const auto size = space == std::string::npos
                        ? std::nullopt
                        : walkthrough::parseNumber<int>(value.text.substr(space + 1));
  if (!size || *size < 1 || *size > mostPoints) {
    mistakes_.add(value.place, "expected a font and its size in points, such as Helvetica 13, found " +
                                   foundWords(value));
    return;
  }
  words.font = Font{value.text.substr(0, space), *size};
}

void StepReader::readProperty(ControlIndex control, const Node& key, const NodeRef& value,
                              ControlWords& words) const {
  const drivers::ViewKindRow& row = rowOf(controls_[control].kind);
  const std::string& word = key.text;
  const auto refuse = [&](std::string_view kinds) {
    mistakes_.add(key.place, quote(word) + " is a property of " + std::string(kinds) +
                                 "; the control " + quote(controls_[control].name) + " is a " +
                                 std::string(row.word));
  };
  const bool isContent = word == "text" || word == "title" || word == "picture";
  if (isContent) {
    if (word != captionWord(row.caption)) {
      return refuse(word == "text"    ? "text fields"
                    : word == "title" ? "buttons"
                                      : "images");
    }
    return readContent(control, *value, words);
  }
  if (word == "html") {
    if (row.caption != Caption::text && row.caption != Caption::title) {
      return refuse("text fields and buttons");
    }
    if (const auto html = textOf(*value, "HTML", mistakes_)) {
      words.content = Markup{false, inAscii(*html)};
    }
    return;
  }
  if (word == "font") return readFont(*value, words);
  if (word == "align") {
    static constexpr std::string_view choices[] = {"natural", "center"};
    if (const auto choice = choiceOf(*value, choices, mistakes_)) words.isCentered = *choice == 1;
    return;
  }
  if (word == "tooltip") {
    words.toolTip = textOf(*value, "a text", mistakes_);
    return;
  }
  if (word == "shown") {
    words.isShown = flagOf(*value, mistakes_);
    return;
  }
  if (word == "enabled") {
    if (!row.isControl) return refuse("controls that take input");
    words.isEnabled = flagOf(*value, mistakes_);
    return;
  }
  const bool isForButtons = word == "color" || word == "state" || word == "background" ||
                            word == "flash" || word == "press";
  if (!isForButtons) {
    mistakes_.add(key.place, "no property is called " + foundWords(key) +
                                 didYouMean(word, {std::begin(propertyWords), std::end(propertyWords)}));
    return;
  }
  if (!row.isButton) return refuse("buttons");
  if (word == "flash") words.flashes = flagOf(*value, mistakes_);
  if (word == "press") words.press = readLead(*value);
  if (word == "color") {
    if (const auto choice = choiceOf(*value, colors, mistakes_)) words.color = colors[*choice];
  }
  if (word == "state") {
    static constexpr std::string_view choices[] = {"off", "on"};
    if (const auto choice = choiceOf(*value, choices, mistakes_)) words.isOn = *choice == 1;
  }
  if (word == "background") {
    static constexpr std::string_view choices[] = {"red"};
    if (choiceOf(*value, choices, mistakes_)) words.isRed = true;
  }
}

std::optional<Lead> StepReader::readLead(const Node& value) const {
  if (value.text == words::nothing) return Lead{Lead::Kind::nowhere, 0, value.place};
  if (value.text == words::back) return Lead{Lead::Kind::back, 0, value.place};
  if (value.text == words::end) return Lead{Lead::Kind::end, 0, value.place};
  const auto found = steps_.find(value.text);
  if (value.kind == Node::Kind::scalar && found != steps_.end()) {
    return Lead{Lead::Kind::step, found->second, value.place};
  }
  std::vector<std::string_view> known = {words::back, words::end, words::nothing};
  for (const auto& [name, step] : steps_) known.push_back(name);
  mistakes_.add(value.place, "expected the name of a step, “back”, “end” or “nothing”, found " +
                                 foundWords(value) + didYouMean(value.text, known));
  return std::nullopt;
}

void StepReader::readWait(const Node& key, const NodeRef& value, StepWords& words) const {
  std::string_view seconds = std::string_view(key.text).substr(words::after.size());
  if (seconds.ends_with(" s")) seconds.remove_suffix(2);
  const auto number = walkthrough::parseNumber<int>(seconds);
  if (!key.text.ends_with(" s") || !number || *number < 1 || *number > mostSeconds) {
    mistakes_.add(key.place, "expected whole seconds, such as “after 5 s”, found " + foundWords(key));
    return;
  }
  Wait wait{.seconds = *number, .place = key.place};
  std::optional<Lead> lead;
  if (value->kind == Node::Kind::table) {
    for (const auto& [word, each] : entriesOf(value, "a table", mistakes_)) {
      static constexpr std::string_view choices[] = {"give up", "start again"};
      if (word->text == "go") {
        lead = readLead(*each);
      } else if (word->text == "other presses") {
        if (const auto choice = choiceOf(*each, choices, mistakes_)) wait.startsAgain = *choice == 1;
      } else {
        mistakes_.add(word->place, "expected “go” or “other presses”, found " + foundWords(*word));
      }
    }
  } else {
    lead = readLead(*value);
  }
  if (!lead) return;
  wait.lead = *lead;
  words.wait = wait;
}

}  // namespace qz::tools::steps
