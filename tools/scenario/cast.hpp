// SPDX-License-Identifier: MIT
// The windows and controls that a scenario names.
#pragma once

#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <variant>

#include "qz/toolkit/view.hpp"
#include "qz/toolkit/window.hpp"
#include "tools/scenario/engine_holder.hpp"

namespace qz::tools::scenario {

class Cast {
 public:
  using Window = toolkit::Ref<toolkit::Window>;
  using View = toolkit::Ref<toolkit::View>;

  /// `engines` must outlive the cast; its engine resolves #TAG, @INDEX and `tutorial`.
  explicit Cast(const EngineHolder& engines) : engines_(engines) {}

  void nameWindow(const std::string& name, toolkit::StoredRef<toolkit::Window> window);
  void nameControl(const std::string& name, toolkit::StoredRef<toolkit::View> control);

  /// Returns the window; throws an Unmet if there is none.
  Window window(const std::string& name) const;
  /// Returns the control; throws an Unmet if there is none.
  View control(const std::string& name) const;
  /// Returns the control, or absent.
  View findControl(const std::string& name) const;

  /// From now on, the host does not keep the window or control with this name alive.
  void letGo(const std::string& name);
  /// From now on, the host keeps the control alive.
  void keep(const std::string& controlName);

  bool namesWindow(const std::string& name) const;
  /// Returns the name of a window, else `tutorial` for the engine's and `an unnamed window` for any
  /// other; absent if `window` is.
  std::optional<std::string> nameOf(const Window& window) const;
  /// Returns the name of a control, else #TAG; absent if `control` is.
  std::optional<std::string> nameOf(const View& control) const;

 private:
  const EngineHolder& engines_;
  std::map<std::string, toolkit::StoredRef<toolkit::Window>> windows_;
  std::map<std::string, toolkit::StoredRef<toolkit::View>> controls_;
};

}  // namespace qz::tools::scenario
