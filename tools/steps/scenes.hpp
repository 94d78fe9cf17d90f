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

/// So many pairs of a step and a way to it are followed. Each needs lists of its own unless they
/// can be joined, so a script of more would not be usable.
inline constexpr std::size_t mostUsableWays = 200000;

/// Finds all scenes that can be reached from the steps `starts`, to which no way leads. If there
/// are more than `mostWays` ways, that is a mistake, and there are no scenes.
Scenes findScenes(const Tour& tour, const std::vector<StepIndex>& starts, Mistakes& mistakes,
                  std::size_t mostWays = mostUsableWays);

}  // namespace qz::tools::steps
