// SPDX-License-Identifier: MIT
// Makes walk-throughs in steps at random. A draft that the language refuses, or that has too many
// places, is thrown away.
#include "tests/steps/source_generator.hpp"

#include <algorithm>
#include <iterator>

#include "tests/steps/source_writer.hpp"

namespace qz::meaning {

namespace {

constexpr std::size_t mostPlaces = 120;

const std::vector<std::string> stepNames = {"hello", "plug in", "größe",      "copy",  "ask me",
                                            "done",  "step 7",  "a-b (c), d", "sheet", "Later: 2"};
const std::vector<std::string> markdown = {"Hello",
                                           "*look* here",
                                           "**All** of it",
                                           "Größe",
                                           "R&D",
                                           "a < b",
                                           "<b>tags</b>",
                                           "2 \\* 3",
                                           "日本 😀",
                                           "it's \"so\"",
                                           "back\\\\slash",
                                           "100 %",
                                           "snake_case_too",
                                           "**two *kinds* here**",
                                           "[more](https://example.org/a?b=1&c=2)"};
const std::vector<std::string> html = {
    "<b>bold</b>", "plain",    "<i>it</i>", "caf&eacute;",
    "R&amp;D",     "1 &lt; 2", "Größe 😀",   "<a href=\"https://example.org/\">link</a>"};
const std::vector<std::string> plain = {"Next",       "*not* here", "<b>",  "R&amp;D", "Größe",
                                        "日本 😀",     "a\\b",       "“Y”",  "1. x",    "# no",
                                        "it's \"x\"", "a: b",       "- no", "Stop"};
const std::vector<std::string> fonts = {"Helvetica 13", "Helvetica-Bold 18", "Times New Roman 14",
                                        "Georgia-Italic 11"};
const std::vector<std::string> colors = {"red",   "white",  "blue", "green",
                                         "black", "orange", "gray"};

class Maker {
 public:
  explicit Maker(Dice& dice) : dice_(dice) {}

  Tour make();

 private:
  // Controls
  void addControl(ViewKind kind, const std::string& name);
  void addControls();
  // What parts say
  std::string some(const std::vector<std::string>& pieces);
  std::string words(const std::vector<std::string>& pieces);
  Words wordsFor(ViewKind kind);
  void sayOfContent(ViewKind kind, Words& words);
  void sayOfButton(ViewKind kind, Words& words);
  Part partOf(std::size_t oneInControls);
  std::string target();
  void addWait(Part& part);
  // Sharing
  void addFragments();
  Use useOf(const std::string& fragment, bool isNested = false);
  void addSharing();
  // The ways between the steps
  void addSteps();
  void addLeads();
  void lead(std::size_t from, const std::string& to);
  void givePresses();
  const HostControl& anyPushButton();

  Dice& dice_;
  Tour tour_{};
  std::vector<std::string> names_{};  // of the steps
  std::size_t backgrounds_ = 0;       // one step in so many has its own; 0: none has one
};

void Maker::addControl(ViewKind kind, const std::string& name) {
  HostControl control;
  control.name = name;
  control.kind = kind;
  control.tag = static_cast<toolkit::Tag>(10 * (tour_.controls.size() + 1) + dice_.below(10));
  const auto caption = rowOf(kind).caption;
  if (caption == drivers::Caption::imageName && dice_.oneIn(2)) control.caption = "disk";
  if (caption == drivers::Caption::text || caption == drivers::Caption::title) {
    control.caption = dice_.oneIn(5) ? "" : some(plain);
  }
  if (dice_.oneIn(5)) control.toolTip = some(plain);
  control.isShown = !dice_.oneIn(6);
  control.isEnabled = !rowOf(kind).isControl || !dice_.oneIn(7);
  if (rowOf(kind).showsState && dice_.oneIn(3)) control.state = toolkit::State::on;
  if (rowOf(kind).hasMixedState && name.empty() && dice_.oneIn(2)) {
    control.state = toolkit::State::mixed;  // no command gives a box this state
  }
  tour_.controls.push_back(control);
}

void Maker::addControls() {
  constexpr ViewKind more[] = {ViewKind::toggle,    ViewKind::toggle,      ViewKind::mixed,
                               ViewKind::imageView, ViewKind::popUpButton, ViewKind::box,
                               ViewKind::plain,     ViewKind::textField,   ViewKind::button};
  addControl(ViewKind::textField, "text");
  addControl(ViewKind::button, "go on");
  addControl(ViewKind::button, "zurück");
  if (dice_.oneIn(2)) addControl(ViewKind::button, "other");
  for (std::size_t i = dice_.below(4); i > 0; --i) {
    const bool isNamed = !dice_.oneIn(6);
    addControl(dice_.oneOf(more), isNamed ? "c" + std::to_string(i) : "");
  }
  for (std::size_t i = tour_.controls.size(); i > 1; --i) {
    std::swap(tour_.controls[i - 1], tour_.controls[dice_.below(i)]);
  }
}

std::string Maker::some(const std::vector<std::string>& pieces) { return dice_.oneOf(pieces); }

std::string Maker::words(const std::vector<std::string>& pieces) {
  if (dice_.oneIn(12)) return "";
  std::string words = some(pieces);
  while (dice_.oneIn(3)) words += " " + some(pieces);
  return words;
}

void Maker::sayOfContent(ViewKind kind, Words& words) {
  const auto caption = rowOf(kind).caption;
  if (caption == drivers::Caption::none) return;
  if (caption == drivers::Caption::imageName) {
    words.content = {dice_.oneOf(pictures)};
    return;
  }
  const bool isHtml = dice_.oneIn(6);
  const bool isText = caption == drivers::Caption::text;
  words.content = {this->words(isHtml ? html : isText ? markdown : plain), isHtml};
}

void Maker::sayOfButton(ViewKind kind, Words& words) {
  if (dice_.oneIn(5)) words.color = some(colors);
  if (rowOf(kind).showsState && dice_.oneIn(4)) words.isOn = dice_.oneIn(2);
  if (dice_.oneIn(4)) words.flashes = !dice_.oneIn(4);
  if (dice_.oneIn(rowOf(kind).showsState ? 5 : 2)) words.press = target();
}

Words Maker::wordsFor(ViewKind kind) {
  Words words;
  if (!dice_.oneIn(3)) sayOfContent(kind, words);
  if (drivers::isButton(kind)) sayOfButton(kind, words);
  if (rowOf(kind).isControl && kind != ViewKind::imageView) {
    if (dice_.oneIn(7)) words.font = some(fonts);
    if (dice_.oneIn(9)) words.isCentered = dice_.oneIn(2);
  }
  if (dice_.oneIn(8)) words.toolTip = dice_.oneIn(4) ? "" : some(plain);
  if (dice_.oneIn(8)) words.isShown = dice_.oneIn(2);
  if (rowOf(kind).isControl && dice_.oneIn(10)) words.isEnabled = dice_.oneIn(2);
  words.isEntry = words.content || words.toolTip || words.color || words.isOn || words.press ||
                  (words.flashes && !*words.flashes) || dice_.oneIn(3);
  return words;
}

Part Maker::partOf(std::size_t oneInControls) {
  Part part;
  for (const HostControl& control : tour_.controls) {
    if (control.name.empty() || !dice_.oneIn(oneInControls)) continue;
    part.controls[control.name] = wordsFor(control.kind);
  }
  return part;
}

std::string Maker::target() {
  if (dice_.oneIn(5)) return "back";
  if (dice_.oneIn(8)) return "end";
  return dice_.oneIn(12) ? "nothing" : some(names_);
}

void Maker::addWait(Part& part) {
  part.wait = Wait{1 + static_cast<int>(dice_.below(9)), target(), dice_.oneIn(2)};
  if (part.wait->go == "nothing") part.wait->go = "back";
}

// Fragments have the parameters "word" and "place".
void Maker::addFragments() {
  for (const char* name : {"part 2", "question"}) {
    if (!dice_.oneIn(2)) continue;
    Part part = partOf(3);
    for (auto& [control, words] : part.controls) {
      if (words.content && words.content->written.size() > 6 && dice_.oneIn(2)) {
        words.content->written += " {word}";
      }
      if (words.press && dice_.oneIn(2)) words.press = "{place}";
    }
    if (dice_.oneIn(6)) part.wait = Wait{3, "{place}", dice_.oneIn(2)};
    if (!tour_.fragments.empty() && dice_.oneIn(3)) part.uses.push_back(useOf("part 2", true));
    tour_.fragments[name] = part;
  }
}

/// Whether the part has the parameter.
bool takes(const Part& part, const std::string& parameter) {
  const auto has = [&](const std::string& text) {
    return text.find(parameter) != std::string::npos;
  };
  return (part.wait && has(part.wait->go)) ||
         std::any_of(part.controls.begin(), part.controls.end(),
                     [&](const auto& said) {
                       const Words& words = said.second;
                       return (words.content && has(words.content->written)) ||
                              (words.press && has(*words.press));
                     }) ||
         std::any_of(part.uses.begin(), part.uses.end(), [&](const Use& use) {
           return std::any_of(use.arguments.begin(), use.arguments.end(),
                              [&](const auto& argument) { return has(argument.second); });
         });
}

/// Gives exactly the arguments that the fragment takes; `isNested`: from another fragment.
Use Maker::useOf(const std::string& fragment, bool isNested) {
  Use use{fragment};
  const bool passesOn = isNested && dice_.oneIn(2);
  const Part& part = tour_.fragments.at(fragment);
  if (takes(part, "{word}")) {
    use.arguments["word"] = passesOn ? "{word}" : dice_.oneIn(2) ? "Größe" : "two words";
  }
  if (takes(part, "{place}")) use.arguments["place"] = passesOn ? "{place}" : some(names_);
  return use;
}

void Maker::addSharing() {
  for (auto& [name, part] : tour_.steps) {
    for (const auto& fragment : tour_.fragments) {
      if (dice_.oneIn(3)) part.uses.push_back(useOf(fragment.first));
    }
    const std::string& other = some(names_);
    if (dice_.oneIn(5) && other < name) part.like = other;
  }
  if (dice_.oneIn(6) && tour_.fragments.contains("part 2")) {
    tour_.everyStep.uses.push_back(useOf("part 2"));
  }
}

void Maker::addSteps() {
  for (const std::string& name : names_) {
    Part part = partOf(2);
    if (dice_.oneIn(4)) addWait(part);
    if (dice_.oneIn(8)) part.isPassedOver = !dice_.oneIn(4);
    if (backgrounds_ > 0 && dice_.oneIn(backgrounds_)) part.background = dice_.oneOf(pictures);
    tour_.steps.emplace_back(name, part);
  }
}

const HostControl& Maker::anyPushButton() {
  for (;;) {
    const HostControl& control = dice_.oneOf(tour_.controls);
    if (control.kind == ViewKind::button && !control.name.empty()) return control;
  }
}

void Maker::lead(std::size_t from, const std::string& to) {
  Part& part = tour_.steps[from].second;
  if (dice_.oneIn(5) && !part.wait) {
    part.wait = Wait{2 + static_cast<int>(dice_.below(8)), to, dice_.oneIn(2)};
    return;
  }
  Words& words = part.controls[anyPushButton().name];
  words.isEntry = true;
  words.press = to != "end" && dice_.oneIn(4) ? std::string(instead) + to : to;
  words.isShown.reset();
  words.isEnabled.reset();
}

// Each step is reached from one before it, unless a later choice takes that away.
void Maker::addLeads() {
  for (std::size_t i = 1; i < names_.size(); ++i) lead(dice_.below(i), names_[i]);
  if (!dice_.oneIn(6)) lead(dice_.below(names_.size()), "end");
  for (std::size_t i = 0; i < names_.size(); ++i) {
    if (dice_.oneIn(2)) lead(i, some(names_));
  }
}

// A push button that a step shows and enables needs a press.
void Maker::givePresses() {
  const Interpreter meaning(tour_);
  for (auto& [name, part] : tour_.steps) {
    const State state = meaning.startAt(name);
    for (const std::size_t i : meaning.pressable(state)) {
      const HostControl& control = tour_.controls[i];
      if (control.kind != ViewKind::button || control.name.empty()) continue;
      if (meaning.pressOf(name, i)) continue;
      part.controls[control.name].isEntry = true;
      part.controls[control.name].press = target();
    }
  }
}

Tour Maker::make() {
  names_ = stepNames;
  for (std::size_t i = names_.size(); i > 1; --i) std::swap(names_[i - 1], names_[dice_.below(i)]);
  names_.resize(1 + dice_.below(6));
  addControls();
  if (dice_.oneIn(2)) tour_.backOver = 1 + dice_.below(3);
  if (dice_.oneIn(2)) tour_.everyStep = partOf(3);
  if (dice_.oneIn(2)) {
    Words& back = tour_.everyStep.controls["zurück"];
    back.isEntry = true;
    back.press = "back";
  }
  if (dice_.oneIn(12)) addWait(tour_.everyStep);
  if (dice_.oneIn(8)) backgrounds_ = 1 + dice_.below(2);
  if (backgrounds_ > 1) tour_.everyStep.background = dice_.oneOf(pictures);
  if (dice_.oneIn(12)) {
    Words& red = tour_.everyStep.controls[anyPushButton().name];
    red.isEntry = red.isRed.emplace(true);
  }
  addFragments();
  addSteps();
  addLeads();
  addSharing();
  givePresses();
  return tour_;
}

bool reachesEveryStep(const Tour& tour, const Places& places) {
  std::set<std::string> steps;
  for (const auto& place : places) steps.insert(place.first.step);
  steps.erase("");  // the end
  return steps.size() == tour.steps.size();
}

/// Whether an image view is shown without a picture somewhere, and has one elsewhere: no command
/// takes a picture away.
bool losesPicture(const Tour& tour) {
  const Interpreter meaning(tour);
  for (std::size_t i = 0; i < tour.controls.size(); ++i) {
    if (tour.controls[i].kind != ViewKind::imageView) continue;
    bool hasSome = false;
    bool lacksOne = false;
    for (const auto& step : tour.steps) {
      const ControlLook look = meaning.look(meaning.startAt(step.first)).controls[i];
      hasSome |= !look.reading.empty();
      lacksOne |= look.reading.empty() && look.isShown;
    }
    if (hasSome && lacksOne) return true;
  }
  return false;
}

}  // namespace

std::optional<Generated> sourceOf(const Tour& tour, Dice& dice) {
  const auto places = placesOf(Interpreter(tour), mostPlaces);
  if (!places || !reachesEveryStep(tour, *places) || losesPicture(tour)) return std::nullopt;
  return Generated{tour, *places, yamlOf(tour, dice), windowOf(tour)};
}

Generated generate(std::uint64_t seed) {
  Dice dice(seed);
  for (;;) {
    if (auto source = sourceOf(Maker(dice).make(), dice)) return *source;
  }
}

}  // namespace qz::meaning
