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

// About what the command that runs a shared list takes in a file.
constexpr std::size_t sizeOfProcess = 70;

/// What a press does in every scene, so that the button can have one tag in all of them.
enum class Everywhere { ends, doesNothing };

class Compiler {
 public:
  Compiler(const Tour& tour, Scenes scenes)
      : tour_(tour),
        scenes_(std::move(scenes)),
        initial_(initialLook(tour)),
        everyStep_(everyStepLook(tour)) {
    for (const Control& control : tour.controls) numbers_.reserve(control.tag);
    for (const Scene& scene : scenes_.list) addLook(scene);
    findWhatChanges();
    chooseOwnTags();
    chooseTags();
    chooseShared();
  }

  Built run() {
    for (std::size_t i = 0; i < scenes_.starts.size(); ++i) addStart(i);
    for (SceneIndex i = 0; i < scenes_.list.size(); ++i) addScene(i);
    for (const auto& [look, list] : shared_) {
      writer_.add(list.second, placeOf(list.first), sharedValues(list.first));
      built_.stepOfKey[std::to_string(list.second)] = scenes_.list[list.first].step;
    }
    built_.script = writer_.script();
    built_.offsets = writer_.offsets();
    return std::move(built_);
  }

 private:
  struct Varying {
    ControlIndex control;
    Property property;
  };

  void addLook(const Scene& scene) {
    const auto [known, isNew] =
        lookNumbers_.try_emplace({scene.step, scene.canGoBack}, looks_.size());
    if (isNew) looks_.push_back(lookOf(tour_, scene.step, scene.canGoBack));
    lookOfScene_.push_back(known->second);
  }

  const Look& lookAt(SceneIndex scene) const { return looks_[lookOfScene_[scene]]; }

  Place placeOf(SceneIndex scene) const { return tour_.steps[scenes_.list[scene].step].place; }

  std::string nameOf(SceneIndex index) const {
    const Scene& scene = scenes_.list[index];
    std::string name = tour_.steps[scene.step].name;
    if (!scene.cameFrom) return name;
    name += "\tfrom";
    for (const StepIndex step : *scene.cameFrom) name += '\n' + tour_.steps[step].name;
    return name;
  }

  std::string nameOfControl(ControlIndex control) const {
    const Control& known = tour_.controls[control];
    return known.name.empty() ? std::to_string(known.tag) : known.name;
  }

  std::optional<Wait> waitOf(SceneIndex scene) const {
    return scenes_.list[scene].wait ? waitAt(tour_, scenes_.list[scene].step) : std::nullopt;
  }

  bool isStateSaid(ControlIndex control) const {
    const auto says = [&](const StepWords& words) {
      return words.controls[control].isOn.has_value();
    };
    return says(tour_.everyStep) || std::any_of(tour_.steps.begin(), tour_.steps.end(),
                                                [&](const Step& step) { return says(step.words); });
  }

  /// Finds which properties are not the same in every scene and in the host's window.
  void findWhatChanges() {
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
      for (std::size_t p = 0; p < propertyCount; ++p) {
        const bool changes =
            static_cast<Property>(p) == Property::state
                ? isStateSaid(i)  // the user changes it too
                : std::any_of(looks_.begin(), looks_.end(), [&](const Look& look) {
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
    const auto wait = waitOf(scene);
    if (wait && wait->startsAgain) return std::nullopt;
    return Everywhere::doesNothing;
  }

  /// A button keeps its own tag where it does one thing that is the same in every scene.
  void chooseOwnTags() {
    ownUse_.resize(tour_.controls.size());
    for (SceneIndex scene = 0; scene < scenes_.list.size(); ++scene) {
      for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
        const auto use = everywhere(scene, i);
        if (!use || lookAt(scene).controls[i].flashes) continue;
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
        if (lookAt(scene).controls[i].flashes) addOnce(flashing_, tag);
      }
    }
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) keepsTag_.push_back(keepsTag(i));
  }

  bool keepsTag(ControlIndex control) const {
    return std::all_of(tags_.begin(), tags_.end(), [&](const std::vector<Tag>& tags) {
      return tags[control] == tour_.controls[control].tag;
    });
  }

  static void addOnce(std::vector<Tag>& tags, Tag tag) {
    if (std::find(tags.begin(), tags.end(), tag) == tags.end()) tags.push_back(tag);
  }

  Tag tagFor(SceneIndex scene, ControlIndex control) {
    const Tag own = tour_.controls[control].tag;
    if (!scenes_.list[scene].presses[control]) return own;
    const bool flashes = lookAt(scene).controls[control].flashes;
    const auto use = everywhere(scene, control);
    if (use && !flashes && ownUse_[control] == use) return own;
    const std::string what =
        use ? (use == Everywhere::ends ? "ends" : "does nothing") : nameOf(scene);
    return numbers_.of(nameOfControl(control) + (flashes ? "\tflashing\t" : "\t") + what);
  }

  Tag timerKey(SceneIndex scene) { return numbers_.of("after\t" + nameOf(scene)); }

  static TaggedCommand tagged(const char* name,
                              std::vector<std::variant<std::string, int, bool>> parameters, Tag tag,
                              Place place) {
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

  /// Whether the value is not what every step has, in a control that keeps its tag: such a value
  /// can be set by a list that all moves to the step share.
  bool canBeShared(SceneIndex scene, const Varying& varying) const {
    const auto& [control, property] = varying;
    return keepsTag_[control] &&
           lookAt(scene).controls[control][property] != everyStep_.controls[control][property];
  }

  List sharedValues(SceneIndex scene) const {
    List list;
    for (const Varying& each : varying_) {
      if (!canBeShared(scene, each)) continue;
      setValues(list, lookAt(scene).controls[each.control][each.property],
                tour_.controls[each.control].tag, placeOf(scene));
    }
    return list;
  }

  /// Whether the value is not known to be there already when the user comes from another scene.
  bool mustBeSet(SceneIndex from, SceneIndex to, const Varying& varying) const {
    const auto& [control, property] = varying;
    if (property == Property::state) return true;  // the user may have changed it since
    return lookAt(from).controls[control][property] != lookAt(to).controls[control][property];
  }

  /// Chooses the steps whose values are in a list of their own, because several moves lead there.
  void chooseShared() {
    struct Sizes {
      std::size_t direct = 0;
      std::size_t shared = 0;
    };
    std::map<std::size_t, Sizes> sizes;  // by look
    for (SceneIndex from = 0; from < scenes_.list.size(); ++from) {
      for (const auto& exit : exitsOf(from)) {
        if (exit.kind != Exit::Kind::scene) continue;
        auto& [direct, shared] = sizes[lookOfScene_[exit.scene]];
        if (shared == 0) shared = sizeOf(sharedValues(exit.scene));
        direct += sizeOf(differences(from, exit.scene, true)) -
                  sizeOf(differences(from, exit.scene, false));
        shared += sizeOfProcess;
      }
    }
    for (SceneIndex scene = 0; scene < scenes_.list.size(); ++scene) {
      const auto& [direct, shared] = sizes[lookOfScene_[scene]];
      if (direct > shared) shared_.try_emplace(lookOfScene_[scene], scene, sharedKey(scene));
    }
  }

  Tag sharedKey(SceneIndex scene) {
    return numbers_.of("look\t" + tour_.steps[scenes_.list[scene].step].name +
                       (scenes_.list[scene].canGoBack ? "\tback" : ""));
  }

  std::vector<Exit> exitsOf(SceneIndex scene) const {
    std::vector<Exit> exits;
    for (const auto& press : scenes_.list[scene].presses) {
      if (press) exits.push_back(*press);
    }
    if (scenes_.list[scene].wait) exits.push_back(*scenes_.list[scene].wait);
    return exits;
  }

  bool flashesIn(SceneIndex scene) const {
    const auto& controls = lookAt(scene).controls;
    return std::any_of(controls.begin(), controls.end(), [](const auto& c) { return c.flashes; });
  }

  /// Enters a scene whose controls show and have what they should, but for flashing and the timer.
  void begin(List& list, SceneIndex scene, Place place) {
    if (flashesIn(scene)) list.push_back({{"ALLOW_FLASHING", {true}, place}, std::nullopt});
    const auto wait = waitOf(scene);
    if (wait) list.push_back(tagged(setTimer, {wait->seconds}, timerKey(scene), wait->place));
  }

  /// Sets what is different in another scene, whose controls have their tags already. `withShared`
  /// says whether that includes what can be shared.
  List differences(SceneIndex from, SceneIndex to, bool withShared) const {
    List list;
    for (const Varying& each : varying_) {
      if (!mustBeSet(from, to, each) || (!withShared && canBeShared(to, each))) continue;
      setValues(list, lookAt(to).controls[each.control][each.property], tags_[to][each.control],
                placeOf(to));
    }
    return list;
  }

  List lead(SceneIndex from, SceneIndex to, Place place) {
    List list;
    // Ends the pressed-in look, which would stay when the button gets another tag.
    if (flashesIn(from)) list.push_back({{"ALLOW_FLASHING", {false}, place}, std::nullopt});
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
      retag(list, tags_[from][i], tags_[to][i], place);
    }
    const auto shared = shared_.find(lookOfScene_[to]);
    const bool usesShared = shared != shared_.end() && lookOfScene_[from] != lookOfScene_[to];
    if (usesShared) list.push_back(tagged(process, {}, shared->second.second, place));
    const List values = differences(from, to, !usesShared);
    list.insert(list.end(), values.begin(), values.end());
    if (lookAt(to).background != lookAt(from).background) {
      setValues(list, lookAt(to).background, std::nullopt, placeOf(to));
    }
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
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
      retag(list, tour_.controls[i].tag, tags_[scene][i], place);
    }
    for (const auto& [control, property] : varying_) {
      setValues(list, lookAt(scene).controls[control][property], tags_[scene][control], place);
    }
    if (changesBackground_) setValues(list, lookAt(scene).background, std::nullopt, place);
    begin(list, scene, place);
    list.push_back({{"IDLE_LOOP", {}, place}, std::nullopt});
    const Tag key = startKey(number);
    writer_.add(key, place, list);
    built_.startKeys.push_back(std::to_string(key));
    built_.stepOfKey[built_.startKeys.back()] = scenes_.list[scene].step;
  }

  /// The smallest key of the script is that of the first start.
  Tag startKey(std::size_t number) {
    if (number > 0)
      return numbers_.of("start\t" + tour_.steps[scenes_.list[scenes_.starts[number]].step].name);
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
    const auto wait = waitOf(from);
    if (!wait || !wait->startsAgain) return {};
    return {tagged(setTimer, {wait->seconds}, timerKey(from), wait->place)};
  }

  void addScene(SceneIndex index) {
    const Scene scene = scenes_.list[index];
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
      const Tag tag = tags_[index][i];
      if (!scene.presses[i] || !written_.insert(tag).second) continue;
      const Lead& press = lookAt(index).controls[i].press;
      const Place place = press.place == 0 ? placeOf(index) : press.place;
      writer_.add(tag, place, exitList(index, *scene.presses[i], place));
      if (scene.presses[i]->kind == Exit::Kind::scene) {
        built_.stepOfKey[std::to_string(tag)] = scenes_.list[scene.presses[i]->scene].step;
      }
    }
    const auto wait = waitOf(index);
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
  Look everyStep_;
  std::map<std::pair<StepIndex, bool>, std::size_t> lookNumbers_;
  std::vector<Look> looks_;
  std::vector<std::size_t> lookOfScene_;
  std::vector<Varying> varying_;
  bool changesBackground_ = false;
  Numbers numbers_;
  std::vector<std::optional<Everywhere>> ownUse_;  // of each control's own tag
  std::vector<std::vector<Tag>> tags_;             // of the controls, in each scene
  std::vector<Tag> flashing_;
  std::vector<bool> keepsTag_;  // of each control: it has its own tag in every scene
  std::map<std::size_t, std::pair<SceneIndex, Tag>> shared_;  // by look: one of its scenes, the key
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
