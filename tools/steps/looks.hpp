// SPDX-License-Identifier: MIT
// What every control shows at a step, completely: what the step says, else what every step says,
// else what the host's window has.
#pragma once

#include <string>
#include <variant>
#include <vector>

#include "tools/steps/tour.hpp"

namespace qz::tools::steps {

using Parameter = std::variant<std::string, int, bool>;

/// A command of the script without the tag, which is its last parameter.
struct Command {
  std::string name{};
  std::vector<Parameter> parameters{};
  Place place = 0;

  /// Two commands are equal if they do the same, wherever they come from.
  friend bool operator==(const Command& a, const Command& b) {
    return a.name == b.name && a.parameters == b.parameters;
  }
};

/// The commands that give a property its value. Empty for a value that no command can set.
using Commands = std::vector<Command>;

/// The properties of a control that commands set, each independent of the others.
enum class Property : std::size_t { content, toolTip, background, state, enabled, shown };
inline constexpr std::size_t propertyCount = 6;

struct ControlLook {
  Commands values[propertyCount];
  bool flashes = false;
  bool canBePressed = false;
  Lead press{};

  Commands& operator[](Property property) { return values[static_cast<std::size_t>(property)]; }
  const Commands& operator[](Property property) const {
    return values[static_cast<std::size_t>(property)];
  }
};

struct Look {
  std::vector<ControlLook> controls{};
  Commands background{};
};

/// Returns what the window shows as its host made it.
Look initialLook(const Tour& tour);

/// Returns what it shows at a step. A button that leads back is disabled if `canGoBack` is NO.
Look lookOf(const Tour& tour, StepIndex step, bool canGoBack);

/// Returns what it would show at a step that says nothing.
Look everyStepLook(const Tour& tour);

/// Adds a mistake for every button that a user can press in vain, and for every state that cannot
/// be set again.
void judgeLooks(const Tour& tour, Mistakes& mistakes);

}  // namespace qz::tools::steps
