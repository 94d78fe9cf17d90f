// SPDX-License-Identifier: MIT
// Makes the lists of a script from the scenes.
//
// The tags of the buttons say in which scene the walk-through is: a button that does something else
// in another scene has another tag there. So the list under a tag knows what every control shows,
// and has to set only what is different in the scene to which it leads.
#include "tools/steps/compiler.hpp"

#include <algorithm>
#include <set>

#include "tools/steps/numbers.hpp"
#include "tools/steps/scenes.hpp"
#include "tools/steps/script_writer.hpp"

namespace qz::tools::steps {
namespace {

using toolkit::Tag;

constexpr const char* process = "PROCESS_COMMANDS_FOR_ID";
constexpr const char* setTag = "SET_TAG_FOR_OBJECT_ID";
constexpr const char* setTimer = "SET_TIMER_FOR_ID";
constexpr const char* terminate = "TERMINATE_PARSER";

/// What a press does in every scene, so that the button can have one tag in all of them.
enum class Everywhere { ends, doesNothing };

class Compiler {
 public:
  Compiler(const Tour& tour, Scenes scenes)
      : tour_(tour), scenes_(std::move(scenes)), initial_(initialLook(tour)) {
    for (const Control& control : tour.controls) numbers_.reserve(control.tag);
    for (const Scene& scene : scenes_.list) looks_.push_back(lookOf(tour, scene.step, scene.canGoBack));
    findWhatChanges();
    chooseOwnTags();
    chooseTags();
  }

  Built run() {
    for (std::size_t i = 0; i < scenes_.starts.size(); ++i) addStart(i);
    for (SceneIndex i = 0; i < scenes_.list.size(); ++i) addScene(i);
    for (const auto& [scene, key] : bodies_) writer_.add(key, placeOf(scene), body(scene));
    built_.script = writer_.script();
    built_.offsets = writer_.offsets();
    return std::move(built_);
  }

 private:
  struct Varying {
    ControlIndex control;
    Property property;
  };

  Place placeOf(SceneIndex scene) const { return tour_.steps[scenes_.list[scene].step].place; }

  std::string nameOf(SceneIndex index) const {
    const Scene& scene = scenes_.list[index];
    std::string name = tour_.steps[scene.step].name;
    for (const StepIndex step : scene.way) name += '\n' + tour_.steps[step].name;
    return name;
  }

  std::string nameOfControl(ControlIndex control) const {
    const Control& known = tour_.controls[control];
    return known.name.empty() ? std::to_string(known.tag) : known.name;
  }

  const std::optional<Wait>& waitOf(SceneIndex scene) const {
    const auto& own = tour_.steps[scenes_.list[scene].step].words.wait;
    return own ? own : tour_.everyStep.wait;
  }

  /// Finds which properties are not the same in every scene and in the host's window.
  void findWhatChanges() {
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
      for (std::size_t p = 0; p < propertyCount; ++p) {
        const bool changes = std::any_of(looks_.begin(), looks_.end(), [&](const Look& look) {
          return look.controls[i].values[p] != initial_.controls[i].values[p];
        });
        if (changes) varying_.push_back({i, static_cast<Property>(p)});
      }
    }
    changesBackground_ = std::any_of(looks_.begin(), looks_.end(), [&](const Look& look) {
      return look.background != initial_.background;
    });
  }

  /// Returns what a press does, if it does it in every scene in which a press does that.
  std::optional<Everywhere> everywhere(SceneIndex scene, ControlIndex control) const {
    const auto& press = scenes_.list[scene].presses[control];
    if (!press || press->kind == Exit::Kind::scene) return std::nullopt;
    if (press->kind == Exit::Kind::end) return Everywhere::ends;
    const auto& wait = waitOf(scene);
    if (wait && wait->startsAgain) return std::nullopt;
    return Everywhere::doesNothing;
  }

  /// A button keeps its own tag where it does one thing that is the same in every scene.
  void chooseOwnTags() {
    ownUse_.resize(tour_.controls.size());
    for (SceneIndex scene = 0; scene < scenes_.list.size(); ++scene) {
      for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
        const auto use = everywhere(scene, i);
        if (!use || looks_[scene].controls[i].flashes) continue;
        if (ownUse_[i] != Everywhere::ends) ownUse_[i] = use;
      }
    }
  }

  void chooseTags() {
    tags_.resize(scenes_.list.size());
    for (SceneIndex scene = 0; scene < scenes_.list.size(); ++scene) {
      for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
        const Tag tag = tagFor(scene, i);
        tags_[scene].push_back(tag);
        built_.controlOfTag[tag] = i;
        if (looks_[scene].controls[i].flashes) addOnce(flashing_, tag);
      }
    }
  }

  static void addOnce(std::vector<Tag>& tags, Tag tag) {
    if (std::find(tags.begin(), tags.end(), tag) == tags.end()) tags.push_back(tag);
  }

  Tag tagFor(SceneIndex scene, ControlIndex control) {
    const Tag own = tour_.controls[control].tag;
    if (!scenes_.list[scene].presses[control]) return own;
    const bool flashes = looks_[scene].controls[control].flashes;
    const auto use = everywhere(scene, control);
    if (use && !flashes && ownUse_[control] == use) return own;
    const std::string what = use ? (use == Everywhere::ends ? "ends" : "does nothing") : nameOf(scene);
    return numbers_.of(nameOfControl(control) + (flashes ? "\tflashing\t" : "\t") + what);
  }

  Tag timerKey(SceneIndex scene) { return numbers_.of("after\t" + nameOf(scene)); }

  static TaggedCommand tagged(const char* name, std::vector<std::variant<std::string, int, bool>> parameters,
                              Tag tag, Place place) {
    return {{name, std::move(parameters), place}, tag};
  }

  static void retag(List& list, Tag from, Tag to, Place place) {
    if (from != to) list.push_back(tagged(setTag, {static_cast<int>(to)}, from, place));
  }

  void setValues(List& list, const Commands& values, std::optional<Tag> tag, Place fallback) const {
    for (Command command : values) {
      if (command.place == 0) command.place = fallback;
      list.push_back({std::move(command), tag});
    }
  }

  /// Sets everything that changes, in a window whose controls have their own tags.
  List body(SceneIndex scene) const {
    List list;
    for (const auto& [control, property] : varying_) {
      setValues(list, looks_[scene].controls[control][property], tour_.controls[control].tag, placeOf(scene));
    }
    if (changesBackground_) setValues(list, looks_[scene].background, std::nullopt, placeOf(scene));
    return list;
  }

  Tag bodyKey(SceneIndex scene) {
    const auto same = std::find_if(bodies_.begin(), bodies_.end(), [&](const auto& known) {
      return scenes_.list[known.first].step == scenes_.list[scene].step &&
             scenes_.list[known.first].canGoBack == scenes_.list[scene].canGoBack;
    });
    if (same != bodies_.end()) return same->second;
    const bool canGoBack = scenes_.list[scene].canGoBack;
    const Tag key = numbers_.of("look\t" + tour_.steps[scenes_.list[scene].step].name +
                                (canGoBack ? "\tback" : ""));
    bodies_.emplace_back(scene, key);
    return key;
  }

  bool flashesIn(SceneIndex scene) const {
    const auto& controls = looks_[scene].controls;
    return std::any_of(controls.begin(), controls.end(), [](const auto& c) { return c.flashes; });
  }

  /// Enters a scene whose controls show and have what they should, but for flashing and the timer.
  void begin(List& list, SceneIndex scene, Place place) {
    if (flashesIn(scene)) list.push_back({{"ALLOW_FLASHING", {true}, place}, std::nullopt});
    const auto& wait = waitOf(scene);
    if (wait) list.push_back(tagged(setTimer, {wait->seconds}, timerKey(scene), wait->place));
  }

  /// Leads from one scene to another by what both have in common with the host's window.
  List throughOwnTags(SceneIndex from, SceneIndex to, Tag key, Place place) const {
    List list;
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
      retag(list, tags_[from][i], tour_.controls[i].tag, place);
    }
    list.push_back(tagged(process, {}, key, place));
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
      retag(list, tour_.controls[i].tag, tags_[to][i], place);
    }
    return list;
  }

  /// Leads from one scene to another by what is different.
  List directly(SceneIndex from, SceneIndex to, Place place) {
    List list;
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
      retag(list, tags_[from][i], tags_[to][i], place);
    }
    for (const auto& [control, property] : varying_) {
      const Commands& values = looks_[to].controls[control][property];
      // The user may have changed the state since.
      if (property != Property::state && values == looks_[from].controls[control][property]) continue;
      setValues(list, values, tags_[to][control], placeOf(to));
    }
    if (looks_[to].background != looks_[from].background) {
      setValues(list, looks_[to].background, std::nullopt, placeOf(to));
    }
    return list;
  }

  List lead(SceneIndex from, SceneIndex to, Place place) {
    List list;
    // Ends the pressed-in look, which would stay when the button gets another tag.
    if (flashesIn(from)) list.push_back({{"ALLOW_FLASHING", {false}, place}, std::nullopt});
    List way = directly(from, to, place);
    const bool isKnown = std::any_of(bodies_.begin(), bodies_.end(), [&](const auto& known) {
      return known.first == to;
    });
    if (isKnown || sizeOf(way) > sizeOf(body(to)) + 200) {
      List shared = throughOwnTags(from, to, bodyKey(to), place);
      if (sizeOf(shared) < sizeOf(way)) way = std::move(shared);
    }
    list.insert(list.end(), way.begin(), way.end());
    begin(list, to, place);
    return list;
  }

  void addStart(std::size_t number) {
    const SceneIndex scene = scenes_.starts[number];
    const Place place = placeOf(scene);
    List list;
    for (const Tag tag : flashing_) {
      list.push_back(tagged("FLASH_ID", {true}, tag, place));
    }
    const List look = body(scene);
    list.insert(list.end(), look.begin(), look.end());
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
      retag(list, tour_.controls[i].tag, tags_[scene][i], place);
    }
    begin(list, scene, place);
    list.push_back({{"IDLE_LOOP", {}, place}, std::nullopt});
    const Tag key = startKey(number);
    writer_.add(key, place, list);
    built_.startKeys.push_back(std::to_string(key));
    built_.stepOfKey[built_.startKeys.back()] = scenes_.list[scene].step;
  }

  /// The smallest key of the script is that of the first start.
  Tag startKey(std::size_t number) {
    if (number > 0) return numbers_.of("start\t" + tour_.steps[scenes_.list[scenes_.starts[number]].step].name);
    Tag least = 1;
    for (const Control& control : tour_.controls) least = std::min(least, control.tag);
    return least - 1;
  }

  List exitList(SceneIndex from, const Exit& exit, Place place) {
    switch (exit.kind) {
      case Exit::Kind::end:
        return {{{terminate, {}, place}, std::nullopt}};
      case Exit::Kind::scene:
        return lead(from, exit.scene, place);
      case Exit::Kind::nowhere:
        break;
    }
    const auto& wait = waitOf(from);
    if (!wait || !wait->startsAgain) return {};
    return {tagged(setTimer, {wait->seconds}, timerKey(from), wait->place)};
  }

  void addScene(SceneIndex index) {
    const Scene scene = scenes_.list[index];
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
      const Tag tag = tags_[index][i];
      if (!scene.presses[i] || !written_.insert(tag).second) continue;
      const Lead& press = looks_[index].controls[i].press;
      const Place place = press.place == 0 ? placeOf(index) : press.place;
      writer_.add(tag, place, exitList(index, *scene.presses[i], place));
      if (scene.presses[i]->kind == Exit::Kind::scene) {
        built_.stepOfKey[std::to_string(tag)] = scenes_.list[scene.presses[i]->scene].step;
      }
    }
    const auto& wait = waitOf(index);
    if (!wait) return;
    const Tag key = timerKey(index);
    writer_.add(key, wait->place, exitList(index, *scene.wait, wait->place));
    if (scene.wait->kind == Exit::Kind::scene) {
      built_.stepOfKey[std::to_string(key)] = scenes_.list[scene.wait->scene].step;
    }
  }

  const Tour& tour_;
  const Scenes scenes_;
  Look initial_;
  std::vector<Look> looks_;  // of the scenes
  std::vector<Varying> varying_;
  bool changesBackground_ = false;
  Numbers numbers_;
  std::vector<std::optional<Everywhere>> ownUse_;  // of each control's own tag
  std::vector<std::vector<Tag>> tags_;             // of the controls, in each scene
  std::vector<Tag> flashing_;
  std::vector<std::pair<SceneIndex, Tag>> bodies_;  // lists that set a whole look
  std::set<Tag> written_;
  ScriptWriter writer_;
  Built built_;
};

void judgeReach(const Tour& tour, const Scenes& scenes, Mistakes& mistakes) {
  std::vector<bool> isReached(tour.steps.size(), false);
  for (const Scene& scene : scenes.list) isReached[scene.step] = true;
  for (StepIndex i = 0; i < tour.steps.size(); ++i) {
    if (isReached[i]) continue;
    mistakes.add(tour.steps[i].place, "nothing leads to the step “" + tour.steps[i].name +
                                          "”; expected a press or a wait that does");
  }
}

}  // namespace

Built build(const Tour& tour, const std::vector<StepIndex>& starts, Mistakes& mistakes) {
  judgeLooks(tour, mistakes);
  Scenes scenes = findScenes(tour, starts, mistakes);
  judgeReach(tour, scenes, mistakes);
  if (!mistakes.isEmpty()) return {};
  return Compiler(tour, std::move(scenes)).run();
}

}  // namespace qz::tools::steps
