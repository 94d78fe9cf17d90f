// SPDX-License-Identifier: MIT
// What is decided before any list is written: what each scene shows, which of that changes, and
// which tags and keys there are.
#pragma once

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "tools/steps/looks.hpp"
#include "tools/steps/numbers.hpp"
#include "tools/steps/scenes.hpp"

namespace qz::tools::steps {

using toolkit::Tag;
using LookIndex = std::size_t;

/// A property that is not the same in every scene and in the host's window.
struct Varying {
  ControlIndex control = 0;
  Property property = Property::content;
};

/// The tags of the buttons say in which scene the walk-through is: a button that does something
/// else in another scene has another tag there.
class Plan {
 public:
  /// `tour` must outlive the plan.
  Plan(const Tour& tour, Scenes scenes);

  const Tour& tour() const { return tour_; }
  const Scenes& scenes() const { return scenes_; }
  /// Returns where the step of the scene is written.
  Place placeOf(SceneIndex scene) const { return stepOf(scene).place; }
  const Step& stepOf(SceneIndex scene) const { return tour_.steps[scenes_.list[scene].step]; }
  /// Returns the wait of the scene; absent if there is none, or if it leads nowhere.
  std::optional<Wait> waitOf(SceneIndex scene) const;

  /// Scenes that look the same have one look.
  LookIndex lookIndex(SceneIndex scene) const { return lookOfScene_[scene]; }
  const Look& look(SceneIndex scene) const { return looks_[lookOfScene_[scene]]; }
  /// Returns what a step shows that says nothing.
  const Look& everyStep() const { return everyStep_; }
  bool flashesIn(SceneIndex scene) const;
  const std::vector<Varying>& varying() const { return varying_; }
  bool changesBackground() const { return changesBackground_; }

  /// Returns the tag of a control in a scene.
  Tag tag(SceneIndex scene, ControlIndex control) const { return tags_[scene][control]; }
  /// Returns the tag that a control has where it needs no other: that of the window, unless
  /// another control has it too.
  Tag ownTag(ControlIndex control) const { return ownTags_[control]; }
  /// Whether the control has its own tag in every scene.
  bool keepsTag(ControlIndex control) const { return keepsTag_[control]; }
  /// Returns the tags that flash, in the order of the scenes.
  const std::vector<Tag>& flashing() const { return flashing_; }

  /// Returns the key of the list that a wait runs.
  Tag timerKey(SceneIndex scene);
  /// Returns the key of the list that sets what is particular to the look of the scene.
  Tag lookKey(SceneIndex scene);
  /// Returns the key of the list that starts the walk-through. That of the first start is smaller
  /// than all other keys.
  Tag startKey(std::size_t start);

 private:
  /// What a press does in every scene, so that the button can have one tag in all of them.
  enum class Everywhere : std::uint8_t { ends, doesNothing };

  void addLook(const Scene& scene);
  void findWhatChanges();
  bool changes(ControlIndex control, Property property) const;
  bool isStateSaid(ControlIndex control) const;
  void chooseOwnTags();
  void chooseOwnUses();
  bool sharesTagWithName(ControlIndex control) const;
  void chooseTags();
  std::optional<Everywhere> everywhere(SceneIndex scene, ControlIndex control) const;
  Tag tagFor(SceneIndex scene, ControlIndex control);
  bool hasOwnTagEverywhere(ControlIndex control) const;
  std::string nameOf(SceneIndex scene) const;
  std::string nameOfControl(ControlIndex control) const;

  const Tour& tour_;
  Scenes scenes_;
  Look initial_;
  Look everyStep_;
  std::map<std::pair<StepIndex, bool>, LookIndex> lookNumbers_;
  std::vector<Look> looks_;
  std::vector<LookIndex> lookOfScene_;
  std::vector<Varying> varying_;
  bool changesBackground_ = false;
  Numbers numbers_;
  std::vector<Tag> ownTags_;                       // of the controls
  std::vector<std::optional<Everywhere>> ownUse_;  // of each control's own tag
  std::vector<std::vector<Tag>> tags_;             // of the controls, in each scene
  std::vector<Tag> flashing_;
  std::vector<bool> keepsTag_;
};

}  // namespace qz::tools::steps
