// SPDX-License-Identifier: MIT
// Scenes: a step, together with the steps to which Back leads from there.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "tools/steps/looks.hpp"

namespace qz::tools::steps {

using SceneIndex = std::size_t;

/// Where a move out of a scene leads.
struct Exit {
  enum class Kind { nowhere, scene, end };
  Kind kind = Kind::nowhere;
  SceneIndex scene = 0;
};

/// Two scenes of one step differ in where their moves lead.
struct Scene {
  StepIndex step = 0;
  /// What tells the scene from the others of its step: the steps that the user last came from, the
  /// latest last. Absent for the first scene of a step.
  std::optional<std::vector<StepIndex>> cameFrom{};
  bool canGoBack = false;
  std::vector<std::optional<Exit>> presses{};  ///< of each control that can be pressed
  std::optional<Exit> wait{};
};

struct Scenes {
  std::vector<Scene> list{};  ///< the start is the first
  /// The scene with which each step begins that was asked for.
  std::vector<SceneIndex> starts{};
};

/// Finds all scenes that can be reached from the steps `starts`, to which no way leads. Too many
/// are a mistake.
Scenes findScenes(const Tour& tour, const std::vector<StepIndex>& starts, Mistakes& mistakes);

}  // namespace qz::tools::steps
