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

/// Reads the seconds of words such as "after 5 s".
std::optional<int> secondsOf(std::string_view key) {
  if (!key.ends_with(" s")) return std::nullopt;
  key.remove_prefix(words::after.size());
  key.remove_suffix(std::min<std::size_t>(2, key.size()));
  const auto seconds = walkthrough::parseNumber<int>(key);
  return seconds && *seconds >= 1 && *seconds <= mostSeconds ? seconds : std::nullopt;
}

template <Caption caption>
bool shows(const drivers::ViewKindRow& kind) {
  return kind.caption == caption;
}
bool showsText(const drivers::ViewKindRow& kind) {
  return kind.caption == Caption::text || kind.caption == Caption::title;
}
bool isAnything(const drivers::ViewKindRow& /*kind*/) { return true; }
bool isButtonKind(const drivers::ViewKindRow& kind) { return kind.isButton; }
bool hasState(const drivers::ViewKindRow& kind) { return kind.showsState; }
bool takesInput(const drivers::ViewKindRow& kind) { return kind.isControl; }

}  // namespace

StepReader::StepReader(const std::vector<Control>& controls,
                       const std::map<std::string, StepIndex>& steps, Texts& texts,
                       Mistakes& mistakes)
    : controls_(controls), steps_(steps), texts_(texts), mistakes_(mistakes) {
  for (ControlIndex i = 0; i < controls.size(); ++i) {
    if (!controls[i].name.empty()) names_.emplace(controls[i].name, i);
  }
}

void StepReader::read(const Node& body, StepWords& words) const {
  words.controls.resize(controls_.size());
  for (const auto& [key, value] : body.entries) readEntry(*key, value, words);
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

/// A word of steps, which gives a property to the controls that it names.
struct StepReader::StepWordRow {
  std::string_view word;
  std::string_view property;
  void (StepReader::*read)(const NodeRef& value, const PropertyRow& row, StepWords& words) const;
};

const StepReader::StepWordRow StepReader::stepWords[] = {
    {"show", "shown", &StepReader::readNames<&ControlWords::isShown, true>},
    {"hide", "shown", &StepReader::readNames<&ControlWords::isShown, false>},
    {"enable", "enabled", &StepReader::readNames<&ControlWords::isEnabled, true>},
    {"disable", "enabled", &StepReader::readNames<&ControlWords::isEnabled, false>},
    {"flash", "flash", &StepReader::readNames<&ControlWords::flashes, true>},
    {"font", "font", &StepReader::readEach},
    {"align", "align", &StepReader::readEach},
};

/// A property of controls.
struct StepReader::PropertyRow {
  std::string_view word;
  std::string_view owners;  // for messages
  bool (*isOf)(const drivers::ViewKindRow& kind);
  void (StepReader::*read)(ControlIndex control, const Node& value, ControlWords& words) const;
};

const StepReader::PropertyRow StepReader::properties[] = {
    {"text", "text fields", shows<Caption::text>, &StepReader::readContent},
    {"title", "buttons", shows<Caption::title>, &StepReader::readContent},
    {"picture", "images", shows<Caption::imageName>, &StepReader::readContent},
    {"html", "text fields and buttons", showsText, &StepReader::readHtml},
    {"font", "text fields and buttons", showsText, &StepReader::readFont},
    {"align", "text fields and buttons", showsText, &StepReader::readAlign},
    {"tooltip", "all controls", isAnything, &StepReader::readToolTip},
    {"color", "buttons", isButtonKind, &StepReader::readColor},
    {"background", "buttons", isButtonKind, &StepReader::readRed},
    {"state", "check boxes", hasState, &StepReader::readState},
    {"shown", "all controls", isAnything, &StepReader::readFlag<&ControlWords::isShown>},
    {"enabled", "controls that take input", takesInput,
     &StepReader::readFlag<&ControlWords::isEnabled>},
    {"flash", "buttons", isButtonKind, &StepReader::readFlag<&ControlWords::flashes>},
    {"press", "buttons", isButtonKind, &StepReader::readPress},
};

void StepReader::readEntry(const Node& key, const NodeRef& value, StepWords& words) const {
  if (key.text == words::like || key.text == words::use) return;  // put in place already
  if (key.text.starts_with(words::after)) return readWait(key, value, words);
  if (key.text == words::background) {
    words.background = textOf(*value, "the name of an image", mistakes_);
    return;
  }
  if (key.text == words::passedOver) {
    words.isPassedOver = flagOf(*value, mistakes_);
    return;
  }
  for (const StepWordRow& row : stepWords) {
    if (row.word == key.text) return (this->*row.read)(value, *propertyNamed(row.property), words);
  }
  const auto control = names_.find(key.text);
  if (control == names_.end()) return refuseEntry(key);
  ControlWords& said = words.controls[control->second];
  said.isMentioned = true;
  said.place = key.place;
  readControl(control->second, value, words);
}

void StepReader::refuseEntry(const Node& key) const {
  std::vector<std::string_view> known = {words::like, words::use, words::background,
                                         words::passedOver};
  for (const StepWordRow& row : stepWords) known.push_back(row.word);
  for (const auto& [name, control] : names_) known.push_back(name);
  mistakes_.add(key.place, "expected the name of a control or a word such as “show”, found " +
                               foundWords(key) + didYouMean(key.text, known));
}

template <std::optional<bool> ControlWords::*flag, bool value>
void StepReader::readNames(const NodeRef& names, const PropertyRow& row, StepWords& words) const {
  if (names->kind == Node::Kind::list) {
    for (const NodeRef& name : names->elements) readNames<flag, value>(name, row, words);
    return;
  }
  const auto control = controlNamed(*names);
  if (control && has(*control, row, *names)) words.controls[*control].*flag = value;
}

void StepReader::readEach(const NodeRef& values, const PropertyRow& row, StepWords& words) const {
  for (const auto& [name, value] : entriesOf(*values, "a value for each control", mistakes_)) {
    const auto control = controlNamed(*name);
    if (control && has(*control, row, *name)) {
      (this->*row.read)(*control, *value, words.controls[*control]);
    }
  }
}

const StepReader::PropertyRow* StepReader::propertyNamed(std::string_view word) {
  const auto* const found = std::find_if(std::begin(properties), std::end(properties),
                                         [&](const PropertyRow& row) { return row.word == word; });
  return found == std::end(properties) ? nullptr : found;
}

bool StepReader::has(ControlIndex control, const PropertyRow& row, const Node& at) const {
  const drivers::ViewKindRow& kind = rowOf(controls_[control].kind);
  if (row.isOf(kind)) return true;
  mistakes_.add(at.place, quote(row.word) + " is a property of " + std::string(row.owners) +
                              "; the control " + quote(controls_[control].name) + " is a " +
                              std::string(kind.word));
  return false;
}

void StepReader::readControl(ControlIndex control, const NodeRef& value, StepWords& words) const {
  ControlWords& said = words.controls[control];
  if (value->kind == Node::Kind::nothing) return;  // `control:` alone shows it
  if (value->kind == Node::Kind::scalar) return readContent(control, *value, said);
  for (const auto& [key, property] : entriesOf(*value, "a text or a table", mistakes_)) {
    readProperty(control, *key, *property, said);
  }
}

void StepReader::readContent(ControlIndex control, const Node& value, ControlWords& words) const {
  const Caption caption = rowOf(controls_[control].kind).caption;
  if (caption == Caption::none) {
    mistakes_.add(value.place, "a " + std::string(rowOf(controls_[control].kind).word) +
                                   " shows no text; expected properties such as “shown”");
    return;
  }
  // The name of an image is for no translator.
  const auto text = caption == Caption::imageName
                        ? textOf(value, captionWord(caption), mistakes_)
                        : translatedText(control, captionWord(caption), value);
  if (!text) return;
  words.content = caption == Caption::text ? readMarkdown(*text) : Markup{true, *text};
}

std::optional<std::string> StepReader::translatedText(ControlIndex control,
                                                      std::string_view property,
                                                      const Node& value) const {
  const auto text = textOf(value, property, mistakes_);
  if (!text) return std::nullopt;
  return texts_.translated(*text, {.place = value.place,
                                   .control = controls_[control].name,
                                   .property = std::string(property)});
}

void StepReader::readProperty(ControlIndex control, const Node& key, const Node& value,
                              ControlWords& words) const {
  if (const PropertyRow* const row = propertyNamed(key.text)) {
    if (has(control, *row, key)) (this->*row->read)(control, value, words);
    return;
  }
  std::vector<std::string_view> known;
  for (const PropertyRow& row : properties) known.push_back(row.word);
  mistakes_.add(key.place,
                "no property is called " + foundWords(key) + didYouMean(key.text, known));
}

void StepReader::readHtml(ControlIndex control, const Node& value, ControlWords& words) const {
  if (const auto html = translatedText(control, "html", value)) {
    words.content = Markup{false, inAscii(*html)};
  }
}

void StepReader::readFont(ControlIndex /*control*/, const Node& value, ControlWords& words) const {
  // Names go into styles of HTML; those of fonts have none of these characters.
  const bool isName = value.text.find_first_of("\"'<>&;\\") == std::string::npos;
  const std::size_t space = std::min(value.text.rfind(' '), value.text.size());
  const std::string_view size = std::string_view(value.text).substr(space);
  const int points = size.empty() ? 0 : walkthrough::parseNumber<int>(size.substr(1)).value_or(0);
  if (isName && points >= 1 && points <= mostPoints) {
    words.font = Font{value.text.substr(0, space), points};
  } else {
    mistakes_.add(
        value.place,
        "expected a font and its size in points, such as Helvetica 13, found " + foundWords(value));
  }
}

void StepReader::readAlign(ControlIndex /*control*/, const Node& value, ControlWords& words) const {
  static constexpr std::string_view choices[] = {"natural", "center"};
  if (const auto choice = choiceOf(value, choices, mistakes_)) words.isCentered = *choice == 1;
}

void StepReader::readToolTip(ControlIndex control, const Node& value, ControlWords& words) const {
  words.toolTip = translatedText(control, "tooltip", value);
}

void StepReader::readColor(ControlIndex /*control*/, const Node& value, ControlWords& words) const {
  if (const auto choice = choiceOf(value, colors, mistakes_)) words.color = colors[*choice];
}

void StepReader::readState(ControlIndex /*control*/, const Node& value, ControlWords& words) const {
  static constexpr std::string_view choices[] = {"off", "on"};
  if (const auto choice = choiceOf(value, choices, mistakes_)) words.isOn = *choice == 1;
}

void StepReader::readRed(ControlIndex /*control*/, const Node& value, ControlWords& words) const {
  static constexpr std::string_view choices[] = {"red"};
  if (choiceOf(value, choices, mistakes_)) words.isRed = true;
}

template <std::optional<bool> ControlWords::*flag>
void StepReader::readFlag(ControlIndex /*control*/, const Node& value, ControlWords& words) const {
  words.*flag = flagOf(value, mistakes_);
}

void StepReader::readPress(ControlIndex /*control*/, const Node& value, ControlWords& words) const {
  words.press = readLead(value);
}

std::optional<Lead> StepReader::readLead(const Node& value) const {
  if (value.kind == Node::Kind::table) return readInstead(value);
  const std::string& text = value.text;
  if (text == words::nothing) return Lead{.place = value.place};
  if (text == words::back) return Lead{.kind = Lead::Kind::back, .place = value.place};
  if (text == words::end) return Lead{.kind = Lead::Kind::end, .place = value.place};
  const auto found = steps_.find(text);
  if (value.kind == Node::Kind::scalar && found != steps_.end()) {
    return Lead{.kind = Lead::Kind::step, .step = found->second, .place = value.place};
  }
  std::vector<std::string_view> known = {words::back, words::end, words::nothing};
  for (const auto& [name, step] : steps_) known.push_back(name);
  mistakes_.add(value.place, "expected the name of a step, “back”, “end” or “nothing”, found " +
                                 foundWords(value) + didYouMean(text, known));
  return std::nullopt;
}

std::optional<Lead> StepReader::readInstead(const Node& table) const {
  const auto entries = entriesOf(table, "a table", mistakes_);
  const bool isInstead = entries.size() == 1 && entries[0].first->text == words::instead;
  auto lead = isInstead ? readLead(*entries[0].second) : std::nullopt;
  if (lead && lead->kind == Lead::Kind::step) {
    lead->isInstead = true;
    return lead;
  }
  if (!isInstead || lead) {
    mistakes_.add(table.place, "expected “instead” with the name of a step");
  }
  return std::nullopt;
}

void StepReader::readWait(const Node& key, const NodeRef& value, StepWords& words) const {
  const auto seconds = secondsOf(key.text);
  if (!seconds) {
    mistakes_.add(key.place,
                  "expected whole seconds, such as “after 5 s”, found " + foundWords(key));
    return;
  }
  Wait wait{.seconds = *seconds, .place = key.place};
  const auto lead =
      value->kind == Node::Kind::table ? readWaitTable(*value, wait) : readLead(*value);
  if (!lead) return;
  wait.lead = *lead;
  words.wait = wait;
}

std::optional<Lead> StepReader::readWaitTable(const Node& table, Wait& wait) const {
  static constexpr std::string_view choices[] = {"give up", "start again"};
  std::optional<Lead> lead;
  for (const auto& [word, value] : entriesOf(table, "a table", mistakes_)) {
    if (word->text == "go") {
      lead = readLead(*value);
    } else if (word->text == "other presses") {
      if (const auto choice = choiceOf(*value, choices, mistakes_)) wait.startsAgain = *choice == 1;
    } else {
      mistakes_.add(word->place, "expected “go” or “other presses”, found " + foundWords(*word));
    }
  }
  if (!lead) mistakes_.add(table.place, "expected “go” with where the wait leads");
  return lead;
}

}  // namespace qz::tools::steps
