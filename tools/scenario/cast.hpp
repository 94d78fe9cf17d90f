// SPDX-License-Identifier: MIT
// The windows and controls that a scenario names.
#pragma once

#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <variant>

#include "toolkit/view.hpp"
#include "toolkit/window.hpp"
#include "tools/scenario/engine_holder.hpp"

namespace tools::scenario {

class Cast {
 public:
  using Window = toolkit::Ref<toolkit::Window>;
  using View = toolkit::Ref<toolkit::View>;

  /// `engines` outlives the cast; its engine knows #TAG, @INDEX and `tutorial`.
  explicit Cast(const EngineHolder& engines) : engines_(engines) {}

  void nameWindow(const std::string& name, toolkit::StoredRef<toolkit::Window> window);
  void nameControl(const std::string& name, toolkit::StoredRef<toolkit::View> control);

  /// The window; throws an Unmet when there is none.
  Window window(const std::string& name) const;
  /// The control; throws an Unmet when there is none.
  View control(const std::string& name) const;
  /// The control, or absent.
  View findControl(const std::string& name) const;

  /// From now on the host does not keep what it declared under the name.
  void letGo(const std::string& name);
  /// From now on the host keeps the control.
  void keep(const std::string& controlName);

  bool namesWindow(const std::string& name) const;
  /// The name of a window; `tutorial` for an unnamed one that is the engine's; nothing for none.
  std::optional<std::string> nameOf(const Window& window) const;
  /// The name of a control, or #TAG; nothing for none.
  std::optional<std::string> nameOf(const View& control) const;

 private:
  const EngineHolder& engines_;
  std::map<std::string, toolkit::StoredRef<toolkit::Window>> windows_;
  std::map<std::string, toolkit::StoredRef<toolkit::View>> controls_;
};

}  // namespace tools::scenario
