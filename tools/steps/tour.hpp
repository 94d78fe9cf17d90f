// SPDX-License-Identifier: MIT
// A walk-through in steps, as its source says it.
#pragma once

#include <cstddef>
#include <limits>
#include <optional>
#include <string>
#include <vector>

#include "qz/drivers/view_kinds.hpp"
#include "qz/toolkit/tag.hpp"
#include "tools/steps/markup.hpp"
#include "tools/steps/place.hpp"

namespace qz::tools::steps {

using StepIndex = std::size_t;
using ControlIndex = std::size_t;

/// A control of the window, as its host made it.
struct Control {
  std::string name{};  ///< empty: the source does not name it
  toolkit::Tag tag = 0;
  drivers::ViewKind kind = drivers::ViewKind::plain;
  std::optional<std::string> caption{};  ///< title, text or name of the image
  std::string toolTip{};
  bool isShown = true;
  bool isEnabled = true;
  bool isOn = false;
  bool isMixed = false;  ///< a check box that is neither on nor off
};

struct Font {
  std::string name{};
  int size = 0;  ///< points
};

/// Where a press or the end of a wait leads.
struct Lead {
  enum class Kind { nowhere, step, back, end };
  Kind kind = Kind::nowhere;
  StepIndex step = 0;
  bool isInstead = false;  ///< the step takes the place of this one: Back does not lead here
  Place place = 0;
};

/// What a source says of a control at a step. What is absent it does not say.
struct ControlWords {
  bool isMentioned = false;  ///< at the step itself, with its contents
  Place place = 0;
  std::optional<Markup> content{};  ///< text, title, or name of the image
  std::optional<Font> font{};
  std::optional<bool> isCentered{};
  std::optional<std::string> toolTip{};
  std::optional<std::string> color{};
  std::optional<bool> isRed{};
  std::optional<bool> isOn{};
  std::optional<bool> isShown{};
  std::optional<bool> isEnabled{};
  std::optional<bool> flashes{};
  std::optional<Lead> press{};
};

/// What happens when the user does nothing.
struct Wait {
  int seconds = 0;
  Lead lead{};
  /// Whether a press that leads nowhere starts it again; otherwise such a press ends it.
  bool startsAgain = true;
  Place place = 0;
};

struct StepWords {
  std::vector<ControlWords> controls{};  ///< one for each control
  std::optional<Wait> wait{};
  std::optional<std::string> background{};  ///< the name of the image behind all controls
  std::optional<bool> isPassedOver{};       ///< Back never leads here
};

struct Step {
  std::string name{};
  Place place = 0;
  StepWords words{};
};

struct Tour {
  std::vector<Control> controls{};  ///< back to front
  StepWords everyStep{};
  std::vector<Step> steps{};  ///< at least one; the first is the start
  std::size_t mostStepsBack = std::numeric_limits<std::size_t>::max();
};

/// Returns the wait of a step: its own, or that of every step.
inline const std::optional<Wait>& waitAt(const Tour& tour, StepIndex step) {
  const auto& own = tour.steps[step].words.wait;
  return own ? own : tour.everyStep.wait;
}

}  // namespace qz::tools::steps
