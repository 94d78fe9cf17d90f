// SPDX-License-Identifier: MIT
// Writes the lists of a script. The tags say in which scene the walk-through is, so the list under
// a tag knows what every control shows, and sets only what is different in the scene to which it
// leads.
#include "tools/steps/compiler.hpp"

#include <algorithm>
#include <set>

#include "tools/steps/lasting_looks.hpp"
#include "tools/steps/plan.hpp"
#include "tools/steps/script_writer.hpp"

namespace qz::tools::steps {
namespace {

// About what the command that runs a shared list takes in a file.
constexpr std::size_t sizeOfProcess = 70;

TaggedCommand tagged(const char* name, std::vector<Parameter> parameters, Tag tag, Place place) {
  return {{name, std::move(parameters), place}, tag};
}

TaggedCommand untagged(const char* name, std::vector<Parameter> parameters, Place place) {
  return {{name, std::move(parameters), place}, std::nullopt};
}

void retag(List& list, Tag from, Tag to, Place place) {
  if (from == to) return;
  list.push_back(tagged("SET_TAG_FOR_OBJECT_ID", {static_cast<int>(to)}, from, place));
}

/// `fallback` is the place of values that the source does not mention.
void setValues(List& list, const Commands& values, std::optional<Tag> tag, Place fallback) {
  for (Command command : values) {
    if (command.place == 0) command.place = fallback;
    list.push_back({std::move(command), tag});
  }
}

std::vector<Exit> exitsOf(const Scene& scene) {
  std::vector<Exit> exits;
  for (const auto& press : scene.presses) {
    if (press) exits.push_back(*press);
  }
  if (scene.wait) exits.push_back(*scene.wait);
  return exits;
}

class Compiler {
 public:
  Compiler(const Tour& tour, Scenes scenes)
      : plan_(tour, std::move(scenes)), tour_(tour), scenes_(plan_.scenes().list) {
    chooseShared();
  }

  Built run() {
    for (std::size_t i = 0; i < plan_.scenes().starts.size(); ++i) addStart(i);
    for (SceneIndex i = 0; i < scenes_.size(); ++i) addScene(i);
    for (const auto& [look, scene] : shared_) {
      add(plan_.lookKey(scene), plan_.placeOf(scene), sharedValues(scene), scene);
    }
    built_.script = writer_.script();
    built_.offsets = writer_.offsets();
    return std::move(built_);
  }

 private:
  /// Adds a list. `leadsTo` is the scene to which it leads; absent: to none.
  void add(Tag key, Place place, const List& list, std::optional<SceneIndex> leadsTo) {
    writer_.add(key, place, list);
    if (leadsTo) built_.stepOfKey[std::to_string(key)] = scenes_[*leadsTo].step;
  }

  const Commands& valueAt(SceneIndex scene, const Varying& each) const {
    return plan_.look(scene).controls[each.control][each.property];
  }

  /// Whether the value is not what every step has, in a control that keeps its tag: such a value
  /// can be set by a list that all moves to the step share.
  bool canBeShared(SceneIndex scene, const Varying& each) const {
    return plan_.keepsTag(each.control) &&
           valueAt(scene, each) != plan_.everyStep().controls[each.control][each.property];
  }

  List sharedValues(SceneIndex scene) const {
    List list;
    for (const Varying& each : plan_.varying()) {
      if (!canBeShared(scene, each)) continue;
      setValues(list, valueAt(scene, each), plan_.ownTag(each.control), plan_.placeOf(scene));
    }
    return list;
  }

  /// Whether the value is not known to be there already when the user comes from another scene.
  bool mustBeSet(SceneIndex from, SceneIndex to, const Varying& each) const {
    if (each.property == Property::state) return true;  // the user may have changed it since
    return valueAt(from, each) != valueAt(to, each);
  }

  /// Returns what sets what is different in another scene, whose controls have their tags already.
  /// `withShared` says whether that includes what can be shared.
  List differences(SceneIndex from, SceneIndex to, bool withShared) const {
    List list;
    for (const Varying& each : plan_.varying()) {
      if (!mustBeSet(from, to, each) || (!withShared && canBeShared(to, each))) continue;
      setValues(list, valueAt(to, each), plan_.tag(to, each.control), plan_.placeOf(to));
    }
    return list;
  }

  /// Chooses the looks whose values are in a list of their own, because several moves lead there
  /// and the script becomes shorter.
  void chooseShared() {
    struct Sizes {
      std::size_t direct = 0;
      std::size_t shared = 0;
    };
    std::map<LookIndex, Sizes> sizes;
    for (SceneIndex from = 0; from < scenes_.size(); ++from) {
      for (const Exit& exit : exitsOf(scenes_[from])) {
        if (exit.kind != Exit::Kind::scene) continue;
        auto& [direct, shared] = sizes[plan_.lookIndex(exit.scene)];
        if (shared == 0) shared = sizeOf(sharedValues(exit.scene));
        direct += sizeOf(differences(from, exit.scene, true)) -
                  sizeOf(differences(from, exit.scene, false));
        shared += sizeOfProcess;
      }
    }
    for (SceneIndex scene = 0; scene < scenes_.size(); ++scene) {
      const auto& [direct, shared] = sizes[plan_.lookIndex(scene)];
      if (direct > shared) shared_.try_emplace(plan_.lookIndex(scene), scene);
    }
  }

  /// Leads from one scene to another.
  List lead(SceneIndex from, SceneIndex to, Place place) {
    List list;
    // Ends the pressed-in look, which would stay when the button gets another tag.
    if (plan_.flashesIn(from)) list.push_back(untagged("ALLOW_FLASHING", {false}, place));
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
      retag(list, plan_.tag(from, i), plan_.tag(to, i), place);
    }
    const bool usesShared =
        shared_.contains(plan_.lookIndex(to)) && plan_.lookIndex(from) != plan_.lookIndex(to);
    if (usesShared) {
      list.push_back(tagged("PROCESS_COMMANDS_FOR_ID", {}, plan_.lookKey(to), place));
    }
    const List values = differences(from, to, !usesShared);
    list.insert(list.end(), values.begin(), values.end());
    if (plan_.look(to).background != plan_.look(from).background) {
      setValues(list, plan_.look(to).background, std::nullopt, plan_.placeOf(to));
    }
    begin(list, to, place);
    return list;
  }

  /// Begins what goes on in a scene by itself: the flashing and the wait. All else must be set.
  void begin(List& list, SceneIndex scene, Place place) {
    if (plan_.flashesIn(scene)) list.push_back(untagged("ALLOW_FLASHING", {true}, place));
    if (plan_.waitOf(scene)) list.push_back(wait(scene));
  }

  TaggedCommand wait(SceneIndex scene) {
    const Wait wait = *plan_.waitOf(scene);
    return tagged("SET_TIMER_FOR_ID", {wait.seconds}, plan_.timerKey(scene), wait.place);
  }

  /// The start is in the host's window, whose controls have their own tags.
  void addStart(std::size_t start) {
    const SceneIndex scene = plan_.scenes().starts[start];
    const Place place = plan_.placeOf(scene);
    List list;
    for (const Tag tag : plan_.flashing()) list.push_back(tagged("FLASH_ID", {true}, tag, place));
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
      retag(list, tour_.controls[i].tag, plan_.tag(scene, i), place);
    }
    for (const Varying& each : plan_.varying()) {
      setValues(list, valueAt(scene, each), plan_.tag(scene, each.control), place);
    }
    if (plan_.changesBackground()) {
      setValues(list, plan_.look(scene).background, std::nullopt, place);
    }
    begin(list, scene, place);
    list.push_back(untagged("IDLE_LOOP", {}, place));
    const Tag key = plan_.startKey(start);
    add(key, place, list, scene);
    built_.startKeys.push_back(std::to_string(key));
  }

  List exitList(SceneIndex from, const Exit& exit, Place place) {
    switch (exit.kind) {
      case Exit::Kind::end:
        return {untagged("TERMINATE_PARSER", {}, place)};
      case Exit::Kind::scene:
        return lead(from, exit.scene, place);
      case Exit::Kind::nowhere:
        break;
    }
    const auto waiting = plan_.waitOf(from);
    return waiting && waiting->startsAgain ? List{wait(from)} : List{};
  }

  void addExit(Tag key, Place place, SceneIndex from, const Exit& exit) {
    const bool leads = exit.kind == Exit::Kind::scene;
    add(key, place, exitList(from, exit, place), leads ? std::optional(exit.scene) : std::nullopt);
  }

  void addScene(SceneIndex scene) {
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
      const Tag tag = plan_.tag(scene, i);
      built_.controlOfTag[tag] = i;
      const auto& press = scenes_[scene].presses[i];
      if (!press || !written_.insert(tag).second) continue;
      const Place place = plan_.look(scene).controls[i].press.place;
      addExit(tag, place == 0 ? plan_.placeOf(scene) : place, scene, *press);
    }
    if (const auto wait = plan_.waitOf(scene)) {
      addExit(plan_.timerKey(scene), wait->place, scene, *scenes_[scene].wait);
    }
  }

  Plan plan_;
  const Tour& tour_;
  const std::vector<Scene>& scenes_;
  std::map<LookIndex, SceneIndex> shared_;  // looks with a list of their own: a scene of each
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

Built build(const Tour& tour, const std::vector<StepIndex>& starts, Mistakes& mistakes,
            std::size_t mostWays) {
  judgeLooks(tour, mistakes);
  Scenes scenes = findScenes(tour, starts, mistakes, mostWays);
  if (scenes.list.empty()) return {};
  judgeReach(tour, scenes, mistakes);
  judgeLastingLooks(tour, scenes, mistakes);
  if (!mistakes.isEmpty()) return {};
  return Compiler(tour, std::move(scenes)).run();
}

}  // namespace qz::tools::steps
