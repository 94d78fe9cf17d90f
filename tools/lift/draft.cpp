// SPDX-License-Identifier: MIT
#include "tools/lift/draft.hpp"

#include <algorithm>
#include <cmath>
#include <map>

#include "tools/comparison/comparison.hpp"
#include "tools/lift/names.hpp"
#include "tools/lift/yaml_text.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::lift {
namespace {

using drivers::Caption;
using drivers::ViewKind;

constexpr std::size_t longestLine = 110;
constexpr double longestWait = 604800;  // seconds, as the language has it
constexpr const char* pressWord = "press";
constexpr const char* nowhereWord = "nothing";

bool isContentWord(const std::string& property) {
  return property == "text" || property == "title" || property == "html" || property == "picture";
}

template <class Entries>
auto findProperty(Entries& entries, bool (*isOf)(const std::string& property)) {
  return std::find_if(entries.begin(), entries.end(),
                      [&](const auto& entry) { return isOf(entry.first); });
}

template <class Entries>
bool hasProperty(const Entries& entries, bool (*isOf)(const std::string& property)) {
  return findProperty(entries, isOf) != entries.end();
}

bool isPressWord(const std::string& property) { return property == pressWord; }
bool isPictureWord(const std::string& property) { return property == "picture"; }

/// Returns how a source says which control of the window it is.
std::string tagWords(const std::vector<steps::Control>& controls, ControlIndex control) {
  std::string tag = std::to_string(controls[control].tag);
  const auto end = controls.begin() + static_cast<std::ptrdiff_t>(control);
  const auto behind = std::count_if(controls.begin(), end, [&](const steps::Control& each) {
    return each.tag == controls[control].tag;
  });
  if (behind == 0) return tag;
  return flowTable({{"tag", tag}, {"number", std::to_string(behind + 1)}});
}

/// Returns what follows the name of a control: its content alone if that is all.
std::string controlWords(const std::vector<std::pair<std::string, std::string>>& entries) {
  const bool isOnlyContent =
      entries.size() == 1 && isContentWord(entries[0].first) && entries[0].first != "html";
  return isOnlyContent ? entries[0].second : flowTable(entries);
}

/// Returns an entry of a block, on one line or, if that is too long, with each of its entries on a
/// line of its own.
std::string blockEntry(const std::string& key,
                       const std::vector<std::pair<std::string, std::string>>& entries,
                       const std::string& indent) {
  std::string line = indent + key + ": " + flowTable(entries) + "\n";
  if (line.size() <= longestLine) return line;
  std::string block = indent + key + ":\n";
  for (const auto& [name, value] : entries) block += indent + "  " + name + ": " + value + "\n";
  return block;
}

}  // namespace

Draft::Draft(const Behavior& behavior, const Walk& walk, const Stand& stand, Sayings& sayings)
    : behavior_(behavior),
      walk_(walk),
      controls_(stand.controls()),
      sayings_(sayings),
      said_(walk.steps.size(), std::vector<Entries>(controls_.size())),
      everywhere_(controls_.size()),
      isNamed_(controls_.size(), false),
      isHidden_(controls_.size(), false) {
  for (const auto& name : controlNames(behavior, walk, controls_)) {
    controlNames_.push_back(scalar(name));
  }
  for (const auto& name : stepNames(behavior, walk, controls_)) stepNames_.push_back(scalar(name));
  for (StepIndex step = 0; step < walk.steps.size(); ++step) readStep(step);
  chooseNamed();
  for (ControlIndex i = 0; i < controls_.size(); ++i) shareEntries(i);
  chooseHidden();
}

const comparison::Situation& Draft::situation(StepIndex step) const {
  return behavior_.situations()[walk_.steps[step].situation];
}

bool Draft::isShown(StepIndex step, ControlIndex control) const {
  return situation(step).controls[control].isShown;
}

void Draft::refuse(StepIndex step, std::optional<ControlIndex> control,
                   const std::string& what) const {
  throw Unsayable(walk_.steps[step].situation, control, what);
}

void Draft::readStep(StepIndex step) {
  for (ControlIndex i = 0; i < controls_.size(); ++i) {
    if (isShown(step, i)) said_[step][i] = entriesOf(step, i);
  }
  const auto& background = behavior_.looks().look(situation(step).background).view.layerContents;
  backgrounds_.push_back(background ? std::optional(scalar(background->name())) : std::nullopt);
}

Draft::Entries Draft::entriesOf(StepIndex step, ControlIndex control) {
  const Step& here = walk_.steps[step];
  const auto& seen = situation(step).controls[control];
  const auto& look = sayings_.of(control, seen.look);
  if (!look) refuse(step, control, "no words of the language make it look so");
  if (seen.flashes && !seen.isEnabled) {
    refuse(step, control, "it flashes while the user cannot press it");
  }
  Entries entries;
  for (const auto& [property, value] : *look) entries.emplace_back(property, scalar(value));
  if (const auto& state = here.states[control]) {
    entries.emplace_back("state", *state == toolkit::State::on ? "on" : "off");
  }
  const auto& press = here.presses[control];
  // A button that leads back is enabled exactly while there is a way back.
  const bool leadsBack = press && press->kind == Lead::Kind::back;
  if (!leadsBack && seen.isEnabled != controls_[control].isEnabled) {
    entries.emplace_back("enabled", seen.isEnabled ? "yes" : "no");
  }
  const bool needsPress = controls_[control].kind == ViewKind::button;
  if (press && (needsPress || press->kind != Lead::Kind::nowhere)) {
    entries.emplace_back(pressWord, lead(*press));
  }
  if (seen.flashes) entries.emplace_back("flash", "yes");
  return entries;
}

std::string Draft::lead(const Lead& lead) const {
  switch (lead.kind) {
    case Lead::Kind::nowhere:
      return nowhereWord;
    case Lead::Kind::back:
      return "back";
    case Lead::Kind::end:
      return "end";
    case Lead::Kind::step:
      break;
  }
  return stepNames_[lead.step];
}

/// A control needs a name if something must be said of it.
void Draft::chooseNamed() {
  const Entries onlyNowhere = {{pressWord, nowhereWord}};
  for (ControlIndex i = 0; i < controls_.size(); ++i) {
    for (StepIndex step = 0; step < walk_.steps.size(); ++step) {
      const Entries& entries = said_[step][i];
      const bool saysNothing = entries.empty() || entries == onlyNowhere;
      if (!saysNothing || isShown(step, i) != isShownUnsaid(step, i)) isNamed_[i] = true;
    }
    if (isNamed_[i]) continue;
    for (auto& step : said_) step[i].clear();
  }
}

/// Moves to every step what every step that shows the control says, as most of them say it.
void Draft::shareEntries(ControlIndex control) {
  shareProperty(control, isContentWord);
  for (const auto property :
       {+[](const std::string& word) { return word == "font"; },
        +[](const std::string& word) { return word == "align"; },
        +[](const std::string& word) { return word == "tooltip"; },
        +[](const std::string& word) { return word == "color"; },
        +[](const std::string& word) { return word == "background"; },
        +[](const std::string& word) { return word == "enabled"; }, +isPressWord}) {
    shareProperty(control, property);
  }
}

void Draft::shareProperty(ControlIndex control, bool (*isOf)(const std::string& property)) {
  std::map<std::pair<std::string, std::string>, std::size_t> counts;
  std::size_t shows = 0;
  for (StepIndex step = 0; step < walk_.steps.size(); ++step) {
    if (!isShown(step, control)) continue;
    const auto found = findProperty(said_[step][control], isOf);
    if (found == said_[step][control].end()) return;
    ++counts[*found];
    ++shows;
  }
  if (counts.empty()) return;
  const auto isRarer = [](const auto& a, const auto& b) { return a.second < b.second; };
  const auto& [common, count] = *std::max_element(counts.begin(), counts.end(), isRarer);
  if (count < 2 || (2 * count <= shows && count < shows)) return;
  everywhere_[control].push_back(common);
  for (auto& step : said_) std::erase(step[control], common);
}

/// Every step hides what most steps hide that would show it otherwise.
void Draft::chooseHidden() {
  for (ControlIndex i = 0; i < controls_.size(); ++i) {
    std::size_t hides = 0;
    std::size_t shows = 0;
    for (StepIndex step = 0; step < walk_.steps.size(); ++step) {
      hides += !isShown(step, i) && isShownUnsaid(step, i);
      shows += isShown(step, i) && said_[step][i].empty();
    }
    isHidden_[i] = hides > shows && hides > 1;
  }
}

/// Whether the control is shown at a step that does not mention it.
bool Draft::isShownUnsaid(StepIndex step, ControlIndex control) const {
  if (isHidden_[control]) return false;
  const steps::Control& host = controls_[control];
  const bool isHiddenHere = !isShown(step, control);  // the step says nothing of it then
  const auto says = [&](bool (*isOf)(const std::string& property)) {
    return hasProperty(everywhere_[control], isOf) ||
           (!isHiddenHere && hasProperty(said_[step][control], isOf));
  };
  if (host.kind == ViewKind::button && isNamed_[control] && !says(isPressWord)) return false;
  if (rowOf(host.kind).caption == Caption::imageName && !host.caption && !says(isPictureWord)) {
    return false;
  }
  return host.isShown;
}

std::optional<std::pair<std::string, std::string>> Draft::waitWords(StepIndex step) const {
  const Step& here = walk_.steps[step];
  if (!here.seconds) return std::nullopt;
  const double seconds = *here.seconds;
  if (seconds < 1 || seconds > longestWait || std::floor(seconds) != seconds) {
    refuse(
        step, std::nullopt,
        comparison::waitWords(here.seconds) + " is not a whole number of seconds from 1 to 604800");
  }
  const std::string key = "after " + std::to_string(static_cast<int>(seconds)) + " s";
  const std::string go = lead(here.wait);
  if (!here.givesUp) return std::pair(key, go);
  return std::pair(key, flowTable({{"go", go}, {"other presses", "give up"}}));
}

/// Whether the background is the same at all steps.
bool Draft::hasOneBackground() const {
  return std::all_of(backgrounds_.begin(), backgrounds_.end(),
                     [&](const auto& each) { return each == backgrounds_[0]; });
}

std::vector<std::pair<std::string, std::string>> Draft::stepWords(StepIndex step) const {
  std::vector<std::pair<std::string, std::string>> words;
  std::vector<std::string> shown;
  std::vector<std::string> hidden;
  for (ControlIndex i = 0; i < controls_.size(); ++i) {
    const Entries& entries = said_[step][i];
    if (!entries.empty()) {
      words.emplace_back(controlNames_[i], controlWords(entries));
    } else if (isShown(step, i) && !isShownUnsaid(step, i)) {
      shown.push_back(controlNames_[i]);
    } else if (!isShown(step, i) && isShownUnsaid(step, i)) {
      hidden.push_back(controlNames_[i]);
    }
  }
  if (!shown.empty()) words.emplace_back("show", flowList(shown));
  if (!hidden.empty()) words.emplace_back("hide", flowList(hidden));
  if (backgrounds_[step] && !hasOneBackground())
    words.emplace_back("background", *backgrounds_[step]);
  if (const auto wait = waitWords(step)) words.push_back(*wait);
  return words;
}

std::vector<std::pair<std::string, std::string>> Draft::everyStepWords() const {
  std::vector<std::pair<std::string, std::string>> words;
  std::vector<std::string> hidden;
  for (ControlIndex i = 0; i < controls_.size(); ++i) {
    if (isHidden_[i]) hidden.push_back(controlNames_[i]);
    if (!everywhere_[i].empty()) {
      words.emplace_back(controlNames_[i], controlWords(everywhere_[i]));
    }
  }
  if (!hidden.empty()) words.emplace_back("hide", flowList(hidden));
  if (hasOneBackground() && backgrounds_[0]) words.emplace_back("background", *backgrounds_[0]);
  return words;
}

std::string Draft::text(const std::string& window) const {
  std::string text = window + "\n";
  std::vector<std::pair<std::string, std::string>> named;
  for (ControlIndex i = 0; i < controls_.size(); ++i) {
    if (isNamed_[i]) named.emplace_back(controlNames_[i], tagWords(controls_, i));
  }
  text += blockEntry("controls", named, "");
  const auto every = everyStepWords();
  if (!every.empty()) text += blockEntry("every step", every, "");
  if (!walk_.goesBack) text += "back over: 0\n";
  text += "steps:\n";
  for (StepIndex step = 0; step < walk_.steps.size(); ++step) {
    text += blockEntry(stepNames_[step], stepWords(step), "  ");
  }
  return text;
}

}  // namespace qz::tools::lift
