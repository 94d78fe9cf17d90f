// SPDX-License-Identifier: MIT
// The windows and controls that a scenario names.

#include "tools/scenario/cast.hpp"

#include <utility>

#include "tools/scenario/references.hpp"
#include "tools/scenario/unmet.hpp"

namespace qz::tools::scenario {

void Cast::nameWindow(const std::string& name, toolkit::StoredRef<toolkit::Window> window) {
  windows_.insert_or_assign(name, std::move(window));
}

void Cast::nameControl(const std::string& name, toolkit::StoredRef<toolkit::View> control) {
  controls_.insert_or_assign(name, std::move(control));
}

bool Cast::namesWindow(const std::string& name) const {
  return name == "tutorial" || windows_.contains(name);
}

Cast::Window Cast::window(const std::string& name) const {
  Window window;
  if (const auto named = windows_.find(name); named != windows_.end()) {
    window = named->second.get();
  } else if (name == "tutorial") {
    window = engines_.existing()->tutorialWindow();
  }
  if (!window) throw Unmet("the window " + name, "none");
  return window;
}

Cast::View Cast::control(const std::string& name) const {
  auto control = findControl(name);
  if (!control) throw Unmet("the control " + name, "none");
  return control;
}

Cast::View Cast::findControl(const std::string& name) const {
  if (const auto tag = tagIn(name)) return engines_.existing()->findObjectWithTag(*tag);
  if (const auto index = indexIn(name)) {
    const auto content = engines_.existing()->tutorialWindow()->contentView();
    return *index < content->subviews().size() ? content->subviews()[*index] : View();
  }
  const auto named = controls_.find(name);
  return named == controls_.end() ? View() : named->second.get();
}

void Cast::letGo(const std::string& name) {
  if (const auto window = windows_.find(name); window != windows_.end()) {
    window->second = toolkit::StoredRef<toolkit::Window>::refer(window->second.get());
  }
  if (const auto control = controls_.find(name); control != controls_.end()) {
    control->second = toolkit::StoredRef<toolkit::View>::refer(control->second.get());
  }
}

void Cast::keep(const std::string& controlName) {
  const auto control = controls_.find(controlName);
  if (control == controls_.end()) return;
  control->second = toolkit::StoredRef<toolkit::View>::own(control->second.get());
}

std::optional<std::string> Cast::nameOf(const Window& window) const {
  if (!window) return std::nullopt;
  for (const auto& [name, named] : windows_) {
    if (named.get() == window) return name;
  }
  const auto engine = engines_.current();
  return engine && engine->tutorialWindow() == window ? "tutorial" : "an unnamed window";
}

std::optional<std::string> Cast::nameOf(const View& control) const {
  if (!control) return std::nullopt;
  for (const auto& [name, named] : controls_) {
    if (named.get() == control) return name;
  }
  return "#" + std::to_string(control->tag());
}

}  // namespace qz::tools::scenario
